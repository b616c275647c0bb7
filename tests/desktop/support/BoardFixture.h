// SPDX-License-Identifier: MIT
// A white board open on a private desktop, for tests that draw on it.
#pragma once

#include "desktop/support/Desktop.h"
#include "desktop/support/HostProcess.h"
#include "desktop/support/Printing.h"

#include <gtest/gtest.h>

#include <memory>

namespace penwick::desktop {

/// Base of the tests that use a white board. Places on the board are canvas pixels from the top
/// left corner of the window's content, at scale factor 1.
class BoardTest : public testing::Test
{
protected:
    explicit BoardTest(
        WindowManager windowManager = chosenManager(), QSize screenSize = { 1280, 800 })
        : m_desktop(windowManager, screenSize)
    { }

    /// What the brush leaves on white: (41, 41, 41) at alpha 0.7, in each channel.
    static constexpr int inkOnWhite = 105;
    /// The same where two strokes cross.
    static constexpr int inkOnInk = 60;

    /// Opens a drawing window, by default a white board, and returns once it is shown and at rest.
    void start(const std::vector<std::string> &arguments = {},
        HostProgram program = HostProgram::AsShipped,
        const std::vector<std::string> &variables = {});
    /// Opens a white board and returns once it can be seen.
    void open(HostProgram program = HostProgram::AsShipped,
        const std::vector<std::string> &arguments = {},
        const std::vector<std::string> &variables = {});

    Desktop &desktop() { return m_desktop; }
    HostProcess &host() { return *m_host; }
    /// The board's window.
    [[nodiscard]] WindowId window();
    /// The window's content on the screen.
    [[nodiscard]] QRect canvas();
    /// The screen's place of a place on the board.
    [[nodiscard]] QPoint onScreen(QPoint place) { return canvas().topLeft() + place; }

    /// The tool bar on the screen. It stands on the board, 20 points from its left edge. The server
    /// is asked for its place; where its buttons are in it is known from the log.
    [[nodiscard]] WindowState toolBar();
    /// The tool bar's window, which must be on the screen.
    [[nodiscard]] WindowId toolBarWindow();

    /// Where the mouse takes hold of a window's frame to pull it by that side: x -1 for the left
    /// edge and 1 for the right one, y -1 for the top edge and 1 for the bottom one, 0 for neither.
    [[nodiscard]] QPoint gripOf(const QRect &frame, QPoint side) const;

    /// Pulls at a frame, so much further right and down.
    void pull(QPoint grip, QPoint way);

    /// Draws, or erases, along `places` on the board.
    void drag(const std::vector<QPoint> &places, MouseButton button = MouseButton::Left);
    void click(QPoint place, MouseButton button = MouseButton::Left);

    /// The board without its coloured border and with paper where the tool bar stands.
    [[nodiscard]] QImage picture();
    /// The grey level at a place on the board.
    [[nodiscard]] int level(QPoint place);
    /// Waits until the board shows `wanted` there, one level more or less; throws if it does not.
    void waitForLevel(QPoint place, int wanted);
    /// Draws a short stroke right of the tool bar's lower end, each time in another place, and
    /// waits for it: whatever was done before has then been dealt with and painted.
    void settle();
    /// Where settle() draws.
    static constexpr QRect settlingArea { 80, 280, 80, 160 };

    /// The smallest rectangle that holds all pixels in which the two differ; null if none does.
    [[nodiscard]] static QRect difference(const QImage &one, const QImage &other);
    /// The darkest level in `image`.
    [[nodiscard]] static int darkest(const QImage &image);

private:
    /// A window manager that composes shows a window later than the server has it, and may let it
    /// come by and by; until then it takes no press on the frame.
    void awaitPainted();

    Desktop m_desktop;
    std::unique_ptr<HostProcess> m_host;
    int m_settlingStrokes = 0;
};

/// Base of the tests that run under each window manager.
class BoardUnderEachManager : public BoardTest, public testing::WithParamInterface<WindowManager>
{
protected:
    explicit BoardUnderEachManager(QSize screenSize = { 1280, 800 })
        : BoardTest(GetParam(), screenSize)
    { }
};

/// The name of a window manager in that of a test.
[[nodiscard]] std::string managerName(const testing::TestParamInfo<WindowManager> &manager);

} // namespace penwick::desktop
