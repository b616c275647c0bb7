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
    QPoint place; ///< on the frame of a new board, on the screen
    QPoint way;
};

const Grip rightEdge { "rightEdge", { boardFrame.right(), 500 }, { -240, 0 } };
const Grip leftEdge { "leftEdge", { boardFrame.left(), 500 }, { 160, 0 } };
const Grip bottomEdge { "bottomEdge", { 1000, boardFrame.bottom() - 1 }, { 0, -120 } };
const Grip topEdge { "topEdge", { 1000, boardFrame.top() }, { 0, 90 } };
const Grip corner { "corner", boardFrame.bottomRight() - QPoint(1, 1), { 160, 90 } };
const Grip inwards { "cornerInwards", boardFrame.bottomRight() - QPoint(1, 1), { -300, -200 } };

class Resizing : public BoardTest,
                 public testing::WithParamInterface<std::tuple<WindowManager, Grip>>
{
protected:
    static constexpr int rounding = 2; // pixels, by the window manager

    Resizing()
        : BoardTest(std::get<WindowManager>(GetParam()), { 1920, 1080 })
    { }

    [[nodiscard]] static const Grip &grip() { return std::get<Grip>(GetParam()); }
    [[nodiscard]] QRect frameOnScreen() { return desktop().windows().outerFrame(window()); }

    /// How far `size` is from having the shape of `wanted`, in pixels of height.
    [[nodiscard]] static double offShape(QSize size, QSize wanted)
    {
        return std::abs(size.width() * double(wanted.height()) / wanted.width() - size.height());
    }
};

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
    pointer.moveTo(grip().place);
    pointer.press();
    pointer.glideTo(grip().place + grip().way / 2);
    require([&] { return windows.clientArea(board).size() != content; }, "the first half");
    const QSize halfway = windows.clientArea(board).size();
    pointer.glideTo(grip().place + grip().way);
    require([&] { return windows.clientArea(board).size() != halfway; }, "the second half");
    const QSize atEnd = windows.clientArea(board).size();
    pointer.release();

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

    desktop().pointer().drag({ grip().place, grip().place + grip().way });
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
        // What is above the bottom edge by so much has not enough room in a lower board.
        const int highest = frame.height() - titleAllowance - toolBar().frame.height();
        wanted = { before.x(), -std::min(-before.y(), highest) };
        seen = toolBar().frame.bottomLeft() - frame.bottomLeft();
        const QPoint off = seen - wanted;
        return std::abs(off.x()) <= 1 && std::abs(off.y()) <= 1;
    })) << "it stands at "
        << testing::PrintToString(seen) << " instead of " << testing::PrintToString(wanted);
}

INSTANTIATE_TEST_SUITE_P(Grips, Resizing,
    testing::Combine(testing::Values(WindowManager::Openbox, WindowManager::Xfwm4),
        testing::Values(rightEdge, leftEdge, bottomEdge, topEdge, corner, inwards)),
    gripName);

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
    pointer.moveTo(title);
    pointer.press();

    pointer.glideTo(title + QPoint(-120, 80));

    require([&] { return windows.outerFrame(board).topLeft() != boardFrame.topLeft(); },
        "the board to follow the hand");
    EXPECT_TRUE(barFollows()) << "while the button is held";
    pointer.glideTo(title + QPoint(150, -60));
    EXPECT_TRUE(barFollows()) << "while the button is held";
    pointer.release();
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

INSTANTIATE_TEST_SUITE_P(WindowManagers, MovedBoard,
    testing::Values(WindowManager::Openbox, WindowManager::Xfwm4), managerName);

} // namespace penwick::desktop
