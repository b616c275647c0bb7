// SPDX-License-Identifier: MIT
// Where views are: frames from the bottom left, and their conversion.
#include "platform/ViewFixture.h"
#include "platform/window/WindowContent.h"

namespace penwick::platform {

namespace {

class ViewFrame : public ViewFixture
{ };

/// A view whose own coordinates run downwards.
class FlippedView final : public RecordingView
{
public:
    using RecordingView::RecordingView;
    [[nodiscard]] bool isFlipped() const override { return true; }
};

} // namespace

TEST_F(ViewFrame, frameCountsFromTheBottomLeftOfTheSuperview)
{
    const auto view = added({ 10.0, 20.0, 30.0, 40.0 });

    EXPECT_EQ(view->geometry(), QRect(10, 40, 30, 40));
    EXPECT_EQ(view->bounds(), (Rect { 0.0, 0.0, 30.0, 40.0 }));
}

TEST_F(ViewFrame, superviewThatIsResizedKeepsItsSubviewsFrames)
{
    const auto view = added({ 10.0, 20.0, 30.0, 40.0 });

    m_content.setFrame({ 0.0, 0.0, 200.0, 150.0 });

    EXPECT_EQ(view->frame(), (Rect { 10.0, 20.0, 30.0, 40.0 }));
    EXPECT_EQ(view->geometry(), QRect(10, 90, 30, 40));
}

TEST_F(ViewFrame, superviewThatIsResizedTellsItsSubviewsItsSizeBefore)
{
    class Listener final : public RecordingView
    {
    public:
        void superviewDidResize(Size former) override { told.push_back(former); }
        std::vector<Size> told;
    };
    const auto view = makeView<Listener>();
    m_content.addSubview(view);

    m_content.setFrame({ 0.0, 0.0, 200.0, 150.0 });
    m_content.setFrame({ 0.0, 0.0, 180.0, 150.0 });

    EXPECT_EQ(view->told, (std::vector<Size> { { 200.0, 100.0 }, { 200.0, 150.0 } }));
}

TEST_F(ViewFrame, superviewThatIsResizedMovesWhatLiesDeeper)
{
    const auto view = added({ 10.0, 20.0, 30.0, 40.0 });
    const auto inner = makeView<RecordingView>();
    inner->setFrame({ 1.0, 2.0, 3.0, 4.0 });
    view->addSubview(inner);

    view->setFrame({ 10.0, 20.0, 30.0, 60.0 });

    EXPECT_EQ(inner->frame(), (Rect { 1.0, 2.0, 3.0, 4.0 }));
    EXPECT_EQ(inner->geometry(), QRect(1, 54, 3, 4));
}

TEST_F(ViewFrame, frameSetBeforeAddingHoldsAfterIt)
{
    const auto view = makeView<RecordingView>();
    view->setFrame({ 10.0, 20.0, 30.0, 40.0 });

    m_content.addSubview(view);

    EXPECT_EQ(view->frame(), (Rect { 10.0, 20.0, 30.0, 40.0 }));
    EXPECT_EQ(view->geometry(), QRect(10, 40, 30, 40));
}

TEST_F(ViewFrame, originIsSetWithoutTheSize)
{
    const auto view = added({ 10.0, 20.0, 30.0, 40.0 });

    view->setFrameOrigin({ -5.0, 7.0 });

    EXPECT_EQ(view->frame(), (Rect { -5.0, 7.0, 30.0, 40.0 }));
    EXPECT_EQ(view->geometry(), QRect(-5, 53, 30, 40));
}

TEST_F(ViewFrame, fractionsAreKeptAndPlacedOnTheNearestPixel)
{
    const auto view = added({ 10.4, 20.5, 30.5, 40.4 });

    EXPECT_EQ(view->frame(), (Rect { 10.4, 20.5, 30.5, 40.4 }));
    EXPECT_EQ(view->geometry(), QRect(10, 39, 31, 40));
}

TEST_F(ViewFrame, viewThatIsMovedByFractionsKeepsItsSizeInPixels)
{
    const auto view = added({ 10.0, 20.0, 30.25, 40.75 });
    std::vector<QSize> sizes;

    for (int step = 0; step < 20; ++step) {
        view->setFrameOrigin({ 10.0 + step * 0.1, 20.0 + step * 0.15 });
        sizes.push_back(view->size());
    }

    EXPECT_EQ(sizes, std::vector<QSize>(20, QSize(30, 41)));
}

TEST_F(ViewFrame, viewThatIsPlacedByItsWindowKeepsItsPlaceFromTheBottom)
{
    auto *const beside = new RecordingView(&m_window);
    beside->setFrame({ 5.0, 6.0, 7.0, 8.0 });

    m_window.setFrame({ 300.0, 300.0, 200.0, 160.0 });

    EXPECT_TRUE(QTest::qWaitFor([this] { return m_content.bounds().height == 160.0; }));
    EXPECT_EQ(beside->frame(), (Rect { 5.0, 6.0, 7.0, 8.0 }));
    EXPECT_EQ(beside->geometry(), QRect(5, 146, 7, 8));
}

TEST_F(ViewFrame, pointIsConvertedToTheWindow)
{
    const auto view = added({ 10.0, 20.0, 30.0, 40.0 });
    const auto inner = makeView<RecordingView>();
    inner->setFrame({ 1.0, 2.0, 3.0, 4.0 });
    view->addSubview(inner);

    EXPECT_EQ(inner->convertTo({ 0.5, 0.25 }, nullptr), (Point { 11.5, 22.25 }));
    EXPECT_EQ(inner->convertFrom({ 11.5, 22.25 }, nullptr), (Point { 0.5, 0.25 }));
}

TEST_F(ViewFrame, pointIsConvertedBetweenViews)
{
    const auto one = added({ 10.0, 20.0, 30.0, 40.0 });
    const auto other = added({ 100.0, 50.0, 30.0, 40.0 });

    EXPECT_EQ(one->convertTo({ 1.0, 2.0 }, other.get()), (Point { -89.0, -28.0 }));
    EXPECT_EQ(one->convertFrom({ -89.0, -28.0 }, other.get()), (Point { 1.0, 2.0 }));
}

TEST_F(ViewFrame, pointOfAFlippedViewCountsFromItsTop)
{
    const auto view = makeView<FlippedView>();
    view->setFrame({ 10.0, 20.0, 30.0, 40.0 });
    m_content.addSubview(view);

    EXPECT_EQ(view->convertTo({ 1.0, 2.0 }, nullptr), (Point { 11.0, 58.0 }));
    EXPECT_EQ(view->convertFrom({ 11.0, 58.0 }, nullptr), (Point { 1.0, 2.0 }));
}

TEST_F(ViewFrame, sceneGivesFramesFromThePlacesOfItsWidgets)
{
    Window window;
    window.resize(100, 80);
    auto *const outer = new RecordingView(&window);
    outer->setGeometry(10, 5, 60, 50);
    auto *const inner = new RecordingView(outer);
    inner->setGeometry(1, 2, 20, 30);

    contentOf(window).adoptScene();

    EXPECT_EQ(outer->frame(), (Rect { 10.0, 25.0, 60.0, 50.0 }));
    EXPECT_EQ(inner->frame(), (Rect { 1.0, 18.0, 20.0, 30.0 }));
}

} // namespace penwick::platform
