// SPDX-License-Identifier: MIT
// A picture of an X11 screen without some of its windows.
#pragma once

#include <QImage>
#include <QWindow>

#include <vector>

// NOLINTNEXTLINE(bugprone-reserved-identifier): X's own name for what a Display points at
struct _XDisplay;

/// Puts the screen together window by window, the undermost first, as a compositing manager does,
/// so that whatever lies below a window that is left out is whole. Has its own connection to the
/// server.
class ScreenCapture final
{
public:
    /// From now on the server keeps the pixels of each window apart. Throws a runtime_error where
    /// there is no X server, or one that cannot.
    ScreenCapture();
    ~ScreenCapture();
    ScreenCapture(const ScreenCapture &) = delete;
    ScreenCapture &operator=(const ScreenCapture &) = delete;

    /// What is on the screen now but for the windows `leftOut` and their frames, in device pixels;
    /// black where there is no window at all. Identifiers that no window has are passed over.
    [[nodiscard]] QImage picture(const std::vector<WId> &leftOut) const;

private:
    [[nodiscard]] unsigned long childOfRootAround(unsigned long window) const;
    [[nodiscard]] std::vector<unsigned long> childrenOfRoot() const;

    _XDisplay *const m_display;
};
