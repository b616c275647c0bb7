// SPDX-License-Identifier: MIT
// A white board whose tool bar is used, with the pointer, as a user would.
#pragma once

#include "desktop/support/BoardFixture.h"

#include <QColor>

namespace penwick::desktop {

/// Base of the tests that use the tool bar.
class ToolBarTest : public BoardTest
{
protected:
    static constexpr QColor normal { 246, 248, 250 };
    static constexpr QColor selected { 18, 168, 241 };
    static constexpr QColor selectedInContrast { 7, 69, 149 };
    static constexpr QColor end { 239, 71, 111 };
    static constexpr QColor endInContrast { 190, 41, 76 };

    /// Presses a button of the tool bar and takes the pointer away to the board.
    void press(const char *tool);
    /// Presses an option of the popover, which must be on the screen, and takes the pointer away.
    void choose(const char *option);
    /// Takes the pointer to the board, away from every button.
    void leave() { desktop().pointer().moveTo(onScreen({ 600, 40 })); }

    /// The popover, once it is on the screen.
    [[nodiscard]] WindowState popover() { return host().waitForWindow(QStringLiteral("popover")); }
    [[nodiscard]] bool isPopoverHidden();

    /// The middle of a button of the tool bar on the screen.
    [[nodiscard]] QPoint centre(const char *tool);
    /// The background of a button of the tool bar.
    [[nodiscard]] QColor background(const char *tool);
    /// Whether the background comes to be `color`.
    [[nodiscard]] bool turns(const char *tool, const QColor &color);
    /// Whether the button comes to be drawn as one that can (or cannot) be pressed.
    [[nodiscard]] bool turnsEnabled(const char *tool, bool isEnabled);

    /// Takes the tool bar by its handle and drops it so much further right and down.
    void dragBar(QPoint way);
    /// Whether the tool bar comes to stand so far right of and below the board's window's corner,
    /// a pixel more or less.
    [[nodiscard]] bool comesToStandAt(QPoint place);
};

} // namespace penwick::desktop
