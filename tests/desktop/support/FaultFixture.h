// SPDX-License-Identifier: MIT
// Windows of each kind on a desktop that fails them.
#pragma once

#include "desktop/support/BoardFixture.h"

#include <tuple>

namespace penwick::desktop {

/// Base of the tests in which something of the desktop fails while a window is open: afterwards it
/// can still be drawn on and ended.
class FaultTest : public BoardTest
{
protected:
    using BoardTest::BoardTest;

    /// Starts a window of that kind, as penwick-host calls it, and its tool bar.
    void startKind(const std::string &kind, const std::vector<std::string> &arguments = {},
        const std::vector<std::string> &variables = {});

    /// Draws a stroke where there is none yet; fails if it leaves no ink.
    void expectInk();
    /// The frames of the board and its tool bar: where the server shows them, and then where the
    /// program believes them to be. More or less than four while they come or go.
    [[nodiscard]] std::vector<QRect> places();
    /// Waits until the program believes what the server shows; fails if it never does.
    void expectPlacesKnown();
    /// Presses END; fails if the program does not end well.
    void expectEndByTool();
    /// Fails if it has written anything that is not its log.
    void expectNothingSaid();

private:
    WindowId m_window = 0; // asked for once: the log may be late on a desktop that fails
    int m_strokes = 0;
};

/// The same for each kind of window.
class FaultOfEachKind : public FaultTest, public testing::WithParamInterface<const char *>
{
protected:
    using FaultTest::FaultTest;
};

using ManagerAndKind = std::tuple<WindowManager, const char *>;

/// Both in the name of a test.
[[nodiscard]] std::string managerAndKindName(const testing::TestParamInfo<ManagerAndKind> &info);

/// "whiteboard", "annotation" and "imageAnnotation".
[[nodiscard]] std::vector<const char *> allKinds();
/// The kind in the name of a test.
[[nodiscard]] std::string kindName(const testing::TestParamInfo<const char *> &kind);

} // namespace penwick::desktop
