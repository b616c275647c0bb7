// SPDX-License-Identifier: MIT
// What stands for what is below a transparent window on a desktop that cannot show it.
#pragma once

#include <QPixmap>

class QPainter;

namespace penwick::platform {

class Window;

/// Without a compositing manager, transparent pixels are black. A layer over the screen then shows
/// a picture of what was there when it opened, and a small window has its corners cut off.
class WindowBackdrop
{
public:
    /// Makes ready for `window`, which has its frame and is about to be shown. Says each time that
    /// it takes a picture that the desktop is one that cannot.
    void prepare(Window &window);
    /// Cuts off the corners of `window` again, which has come to a screen of another scale.
    static void rescale(Window &window);
    /// Paints the picture, if there is one.
    [[nodiscard]] bool paint(QPainter &painter) const;

private:
    QPixmap m_picture;
};

} // namespace penwick::platform
