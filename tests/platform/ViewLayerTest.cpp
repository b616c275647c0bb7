// SPDX-License-Identifier: MIT
// Which views have a layer, and what it puts around their content.
#include "platform/ViewFixture.h"

#include <QImage>

namespace penwick::platform {

namespace {

class ViewLayer : public ViewFixture
{ };

/// Content of one colour, painted in the view's own coordinates.
class FilledView final : public RecordingView
{
public:
    using RecordingView::RecordingView;

    /// The lower half of the bounds is red.
    void draw(const Rect &dirtyRect) override
    {
        m_dirtyRect = dirtyRect;
        Painter painter(*this);
        painter.fillRect(QRectF(0.0, 0.0, bounds().width, bounds().height / 2), QColor(255, 0, 0));
    }

    [[nodiscard]] const Rect &dirtyRect() const { return m_dirtyRect; }

private:
    Rect m_dirtyRect;
};

} // namespace

TEST_F(ViewLayer, viewThatAskedForNoneHasNone)
{
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });

    EXPECT_EQ(view->layer(), nullptr);
    EXPECT_FALSE(view->wantsLayer());
}

TEST_F(ViewLayer, viewThatAskedHasOne)
{
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });

    view->setWantsLayer(true);

    EXPECT_NE(view->layer(), nullptr);
    EXPECT_EQ(m_content.layer(), nullptr);
}

TEST_F(ViewLayer, viewInsideOneThatAskedHasOneOfItsOwn)
{
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });

    m_content.setWantsLayer(true);

    ASSERT_NE(view->layer(), nullptr);
    EXPECT_NE(view->layer(), m_content.layer());
    EXPECT_FALSE(view->wantsLayer());
}

TEST_F(ViewLayer, viewThatLeavesTheOneThatAskedHasNone)
{
    m_content.setWantsLayer(true);
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });

    view->removeFromSuperview();

    EXPECT_EQ(view->layer(), nullptr);
}

TEST_F(ViewLayer, layerThatComesBackLooksAsItDid)
{
    m_content.setWantsLayer(true);
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });
    view->layer()->borderWidth = 3.0;

    view->removeFromSuperview();
    m_content.addSubview(view);

    EXPECT_EQ(view->layer()->borderWidth, 3.0);
}

TEST_F(ViewLayer, backgroundLiesUnderTheContentAndTheBorderOverIt)
{
    const auto view = makeView<FilledView>();
    view->setFrame({ 0.0, 0.0, 20.0, 20.0 });
    m_content.addSubview(view);
    view->setWantsLayer(true);
    *view->layer() = { Qt::white, QColor(0, 0, 255), 3.0, 0.0 };

    const QImage picture = view->grab().toImage();

    EXPECT_EQ(picture.pixelColor(10, 5), QColor(Qt::white));
    EXPECT_EQ(picture.pixelColor(10, 15), QColor(255, 0, 0));
    EXPECT_EQ(picture.pixelColor(10, 2), QColor(0, 0, 255));
    EXPECT_EQ(picture.pixelColor(10, 17), QColor(0, 0, 255));
    EXPECT_EQ(picture.pixelColor(0, 10), QColor(0, 0, 255));
    EXPECT_EQ(picture.pixelColor(3, 15), QColor(255, 0, 0));
}

TEST_F(ViewLayer, viewWithoutALayerShowsItsContentAlone)
{
    const auto view = makeView<FilledView>();
    view->setFrame({ 0.0, 0.0, 20.0, 20.0 });
    m_content.addSubview(view);

    const QImage picture = view->grab().toImage();

    EXPECT_EQ(picture.pixelColor(0, 15), QColor(255, 0, 0));
    EXPECT_NE(picture.pixelColor(0, 5), QColor(255, 0, 0));
}

TEST_F(ViewLayer, dirtyRectangleIsInTheViewsOwnCoordinates)
{
    const auto view = makeView<FilledView>();
    view->setFrame({ 10.0, 10.0, 60.0, 50.0 });
    m_content.addSubview(view);
    ASSERT_TRUE(QTest::qWaitFor([&] { return view->dirtyRect().width == 60.0; }));

    view->setNeedsDisplay({ 5.0, 6.0, 7.0, 8.0 });

    EXPECT_TRUE(QTest::qWaitFor([&] { return view->dirtyRect().width != 60.0; }));
    EXPECT_EQ(view->dirtyRect(), (Rect { 5.0, 6.0, 7.0, 8.0 }));
}

TEST_F(ViewLayer, fractionOfAPointIsDrawnAsTheWholePixelsAroundIt)
{
    const auto view = makeView<FilledView>();
    view->setFrame({ 10.0, 10.0, 60.0, 50.0 });
    m_content.addSubview(view);
    ASSERT_TRUE(QTest::qWaitFor([&] { return view->dirtyRect().width == 60.0; }));

    view->setNeedsDisplay({ 5.5, 6.5, 1.0, 1.0 });

    EXPECT_TRUE(QTest::qWaitFor([&] { return view->dirtyRect().width != 60.0; }));
    EXPECT_EQ(view->dirtyRect(), (Rect { 5.0, 6.0, 2.0, 2.0 }));
}

} // namespace penwick::platform
