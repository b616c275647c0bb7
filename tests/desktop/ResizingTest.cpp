// SPDX-License-Identifier: MIT
// The board under the user's hand: its shape while it is resized, and where its tool bar goes.
#include "desktop/support/BoardFixture.h"

#include <cmath>

namespace penwick::desktop {

namespace {

constexpr QRect boardFrame { 320, 180, 1280, 720 };

/// A part of the frame that the user can take hold of, and where it is dragged.
struct Grip
{
    const char *name;
    QPoint side; ///< as gripOf() takes it
    QPoint way;
};

const Grip rightEdge { "rightEdge", { 1, 0 }, { -240, 0 } };
const Grip leftEdge { "leftEdge", { -1, 0 }, { 160, 0 } };
const Grip bottomEdge { "bottomEdge", { 0, 1 }, { 0, -120 } };
const Grip topEdge { "topEdge", { 0, -1 }, { 0, 90 } };
const Grip corner { "corner", { 1, 1 }, { 160, 90 } };
const Grip inwards { "cornerInwards", { 1, 1 }, { -300, -200 } };

class Resizing : public BoardTest,
                 public testing::WithParamInterface<std::tuple<WindowManager, Grip>>
{
protected:
    static constexpr int rounding = 2; // pixels, by the window manager

    Resizing()
        : BoardTest(std::get<WindowManager>(GetParam()), { 1920, 1080 })
    { }

    [[nodiscard]] static const Grip &grip() { return std::get<Grip>(GetParam()); }
    /// Where the mouse takes hold of the frame of a new board.
    [[nodiscard]] QPoint place() { return gripOf(boardFrame, grip().side); }

    /// How far `size` is from having the shape of `wanted`, in pixels of height.
    [[nodiscard]] static double offShape(QSize size, QSize wanted)
    {
        return std::abs(size.width() * double(wanted.height()) / wanted.width() - size.height());
    }
};

/// A part of an image window's frame that is pulled outward or inward.
struct Pull
{
    const char *name;
    int x; ///< -1: the left edge; 1: the right one
    int y; ///< -1: the top edge, 1: the bottom one
};

class PulledImage : public BoardTest,
                    public testing::WithParamInterface<std::tuple<WindowManager, Pull>>
{
protected:
    static constexpr int rounding = 2; // pixels, by the window manager
    static constexpr int wherever = 1000;

    PulledImage()
        : BoardTest(std::get<WindowManager>(GetParam()))
    { }

    void startOn(QSize size)
    {
        const std::string file = desktop().file("picture.png");
        QImage image(size, QImage::Format_RGB32);
        image.fill(Qt::yellow);
        ASSERT_TRUE(image.save(QString::fromStdString(file)));
        start({ "--window", "imageAnnotation", "--image", file });
        m_window = window(); // kept: the log says late where to look for it
        ASSERT_EQ(frameOnScreen().size(), size);
    }

    [[nodiscard]] static const Pull &edges() { return std::get<Pull>(GetParam()); }
    [[nodiscard]] QRect frameOnScreen() { return desktop().windows().outerFrame(m_window); }

    /// Where the mouse takes hold of the frame.
    [[nodiscard]] QPoint grip() { return gripOf(frameOnScreen(), { edges().x, edges().y }); }

    [[nodiscard]] static QPoint way(int length)
    {
        return { edges().x * length, edges().y * length };
    }

    /// Whether the window comes to rest 16:9.
    [[nodiscard]] bool comesToRest()
    {
        return waitUntil([this] {
            const QSize size = frameOnScreen().size();
            return std::abs(size.width() * 9.0 / 16 - size.height()) <= rounding
                && host().window(QStringLiteral("drawing")).frame == frameOnScreen();
        });
    }

    /// The edges that were not pulled.
    void expectOtherEdgesKept(const QRect &before)
    {
        const QRect after = frameOnScreen();
        const int sideways
            = edges().x < 0 ? after.right() - before.right() : after.left() - before.left();
        const int upright
            = edges().y < 0 ? after.bottom() - before.bottom() : after.top() - before.top();
        EXPECT_LE(std::abs(sideways), edges().x ? rounding : wherever);
        EXPECT_LE(std::abs(upright), edges().y ? rounding : wherever);
    }

private:
    WindowId m_window = 0;
};

std::string pullName(const testing::TestParamInfo<PulledImage::ParamType> &parameters)
{
    const auto &[manager, pull] = parameters.param;
    return managerName({ manager, 0 }) + '_' + pull.name;
}

class MovedBoard : public BoardUnderEachManager
{
protected:
    MovedBoard()
        : BoardUnderEachManager({ 1920, 1080 })
    { }
};

std::string gripName(const testing::TestParamInfo<Resizing::ParamType> &parameters)
{
    const auto &[manager, grip] = parameters.param;
    return managerName({ manager, 0 }) + '_' + grip.name;
}

} // namespace

TEST_P(Resizing, contentKeepsItsShapeUnderTheHandAndTheFrameIsSixteenToNineAfterIt)
{
    open();
    const WindowId board = window();
    const Windows &windows = desktop().windows();
    ASSERT_EQ(windows.outerFrame(board), boardFrame);
    const QSize content = windows.clientArea(board).size();

    Pointer &pointer = desktop().pointer();
    pointer.takeHold(place());
    pointer.glideTo(place() + grip().way / 2);
    require([&] { return windows.clientArea(board).size() != content; }, "the first half");
    const QSize halfway = windows.clientArea(board).size();
    pointer.glideTo(place() + grip().way);
    require([&] { return windows.clientArea(board).size() != halfway; }, "the second half");
    const QSize atEnd = windows.clientArea(board).size();
    pointer.letGo();

    EXPECT_LE(offShape(halfway, content), rounding);
    EXPECT_LE(offShape(atEnd, content), rounding);
    EXPECT_TRUE(waitUntil([&] {
        const QSize frame = windows.outerFrame(board).size();
        return frame != boardFrame.size() && offShape(frame, { 16, 9 }) <= rounding
            && host().window(QStringLiteral("drawing")).frame == windows.outerFrame(board);
    })) << windows.outerFrame(board).width()
        << " x " << windows.outerFrame(board).height();
}

TEST_P(Resizing, toolBarKeepsItsPlaceFromTheBottomLeftCornerOrIsPulledInside)
{
    constexpr int titleAllowance = 25;
    open();
    const WindowId board = window();
    const Windows &windows = desktop().windows();
    const QPoint before = toolBar().frame.bottomLeft() - boardFrame.bottomLeft();

    pull(place(), grip().way);
    require(
        [&] {
            const QSize frame = windows.outerFrame(board).size();
            return frame != boardFrame.size() && offShape(frame, { 16, 9 }) <= rounding
                && host().window(QStringLiteral("drawing")).frame == windows.outerFrame(board);
        },
        "the board to come to rest");

    QPoint wanted;
    QPoint seen;
    EXPECT_TRUE(waitUntil([&] {
        const QRect frame = windows.outerFrame(board); // it may still move by a few pixels
        // In a board that has become lower, the tool bar stands no higher than it has room for.
        const int highest = frame.height() - titleAllowance - toolBar().frame.height();
        wanted = { before.x(), -std::min(-before.y(), highest) };
        seen = toolBar().frame.bottomLeft() - frame.bottomLeft();
        const QPoint off = seen - wanted;
        return std::abs(off.x()) <= 1 && std::abs(off.y()) <= 1;
    })) << "it stands at "
        << testing::PrintToString(seen) << " instead of " << testing::PrintToString(wanted);
}

INSTANTIATE_TEST_SUITE_P(Grips, Resizing,
    testing::Combine(testing::ValuesIn(eachManager()),
        testing::Values(rightEdge, leftEdge, bottomEdge, topEdge, corner, inwards)),
    gripName);

TEST_P(PulledImage, outwardIsNeverSmallerAndHoldsWhatWasPulled)
{
    constexpr int length = 14; // some begin after as much as a click may tremble
    startOn({ 560, 420 });
    const QRect before = frameOnScreen();

    pull(grip(), way(length));

    require([&] { return frameOnScreen().size() != before.size(); }, "the edge to follow");
    EXPECT_TRUE(comesToRest()) << testing::PrintToString(frameOnScreen());
    const QRect after = frameOnScreen();
    EXPECT_GE(after.width(), before.width() + std::abs(edges().x) * (length - rounding));
    EXPECT_GE(after.height(), before.height() + std::abs(edges().y) * (length - rounding));
    expectOtherEdgesKept(before);
}

// A window that has the shape already is kept in it by the window manager while it is pulled, which
// also decides whether the width or the height of a pulled corner counts.
TEST_P(PulledImage, outwardIsNeverSmallerWhereItHasTheShapeAlready)
{
    startOn({ 640, 360 });
    const QRect before = frameOnScreen();

    pull(grip(), way(14));

    require([&] { return frameOnScreen().size() != before.size(); }, "the edge to follow");
    EXPECT_TRUE(comesToRest()) << testing::PrintToString(frameOnScreen());
    EXPECT_GE(frameOnScreen().width(), before.width());
    EXPECT_GE(frameOnScreen().height(), before.height());
}

TEST_P(PulledImage, inwardFitsIntoWhatWasPulled)
{
    constexpr int length = 60;
    startOn({ 560, 420 });
    const QRect before = frameOnScreen();

    pull(grip(), -way(length));

    require([&] { return frameOnScreen().size() != before.size(); }, "the edge to follow");
    EXPECT_TRUE(comesToRest()) << testing::PrintToString(frameOnScreen());
    const QRect after = frameOnScreen();
    EXPECT_LE(after.width(), before.width() - std::abs(edges().x) * (length - rounding));
    EXPECT_LE(after.height(), before.height() - std::abs(edges().y) * (length - rounding));
    expectOtherEdgesKept(before);
}

TEST_P(PulledImage, isNotCorrectedUnderARestingHandAndCountsFromTheFirstFrame)
{
    constexpr std::chrono::milliseconds longerThanARest { 500 };
    startOn({ 560, 420 });
    const QRect before = frameOnScreen();
    Pointer &pointer = desktop().pointer();
    const QPoint place = grip();
    pointer.takeHold(place);
    pointer.glideTo(place + way(24));
    require([&] { return frameOnScreen().size() != before.size(); }, "the edge to follow");
    const QRect pulled = frameOnScreen();

    EXPECT_FALSE(waitUntil(
        [&] {
            return std::abs(frameOnScreen().width() - pulled.width()) > 24
                || std::abs(frameOnScreen().height() - pulled.height()) > 24;
        },
        longerThanARest));
    pointer.glideTo(place + way(12));
    pointer.letGo();

    EXPECT_TRUE(comesToRest()) << testing::PrintToString(frameOnScreen());
    EXPECT_GE(frameOnScreen().width(), before.width());
    EXPECT_GE(frameOnScreen().height(), before.height());
}

INSTANTIATE_TEST_SUITE_P(Edges, PulledImage,
    testing::Combine(testing::ValuesIn(eachManager()),
        testing::Values(Pull { "right", 1, 0 }, Pull { "left", -1, 0 }, Pull { "top", 0, -1 },
            Pull { "bottom", 0, 1 }, Pull { "bottomRight", 1, 1 }, Pull { "bottomLeft", -1, 1 })),
    pullName);

TEST_P(MovedBoard, takesItsToolBarAlongWhileItIsDragged)
{
    open();
    const WindowId board = window();
    const WindowId bar = toolBarWindow();
    const Windows &windows = desktop().windows();
    const QPoint inBoard = windows.outerFrame(bar).topLeft() - boardFrame.topLeft();
    const auto barFollows = [&] {
        return waitUntil([&] {
            return windows.outerFrame(bar).topLeft() - windows.outerFrame(board).topLeft()
                == inBoard;
        });
    };
    const QPoint title(900, boardFrame.top() + 10);
    Pointer &pointer = desktop().pointer();
    pointer.takeHold(title);

    pointer.glideTo(title + QPoint(-120, 80));

    require([&] { return windows.outerFrame(board).topLeft() != boardFrame.topLeft(); },
        "the board to follow the hand");
    EXPECT_TRUE(barFollows()) << "while the button is held";
    pointer.glideTo(title + QPoint(150, -60));
    EXPECT_TRUE(barFollows()) << "while the button is held";
    pointer.letGo();
    EXPECT_TRUE(
        waitUntil([&] { return windows.outerFrame(board) == boardFrame.translated(150, -60); }));
    EXPECT_TRUE(barFollows());
}

TEST_P(MovedBoard, overlayAndImagesOfAnotherShapeHaveNoHintForTheirShape)
{
    constexpr unsigned long aspect = 1 << 7;
    const std::string file = desktop().file("picture.png");
    QImage image(600, 400, QImage::Format_RGB32);
    image.fill(Qt::white);
    ASSERT_TRUE(image.save(QString::fromStdString(file)));
    const auto hints
        = [this] { return desktop().windows().numbers(window(), "WM_NORMAL_HINTS").at(0); };

    open();
    EXPECT_EQ(hints() & aspect, aspect);
    start({ "--window", "imageAnnotation", "--image", file });
    EXPECT_EQ(hints() & aspect, 0U);
    start({ "--window", "annotation" });
    EXPECT_EQ(hints() & aspect, 0U);
}

INSTANTIATE_TEST_SUITE_P(WindowManagers, MovedBoard, testing::ValuesIn(eachManager()), managerName);

} // namespace penwick::desktop
