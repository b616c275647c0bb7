// SPDX-License-Identifier: MIT
// Stands in for what should be seen through a transparent window, on a desktop that cannot show it.
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
    /// Prepares the showing of `window`, which has its frame. Each time that it takes a picture, it
    /// tells the log why.
    void prepare(Window &window);
    /// Cuts off the corners of `window` again, which has come to a screen of another scale.
    static void rescale(Window &window);
    /// Paints the picture, if there is one.
    [[nodiscard]] bool paint(QPainter &painter) const;

private:
    QPixmap m_picture;
};

} // namespace penwick::platform
