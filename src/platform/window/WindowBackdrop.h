// SPDX-License-Identifier: MIT
// Stands in for what should be seen through a transparent window, on a desktop that cannot show it.
#pragma once

#include <QPixmap>

class QPainter;
class QWidget;

namespace penwick::platform {

/// Without a compositing manager, transparent pixels are black. A layer over the screen then shows
/// a picture of what was there when it opened, and a small window has its corners cut off.
class WindowBackdrop
{
public:
    /// Leaves neither the picture nor cut corners to `window`.
    void clear(QWidget &window);
    /// Takes a picture of `area`, in Qt's desktop coordinates, which a window is about to cover.
    /// Tells the log each time why.
    void takePicture(const QRect &area);
    /// Cuts off the corners of `window`, which is to have `size`.
    static void cutCorners(QWidget &window, QSize size, double radius);
    /// Cuts them off again after `window` has come to a screen of another scale.
    static void rescale(QWidget &window);
    /// Paints the picture, if there is one.
    [[nodiscard]] bool paint(QPainter &painter) const;

private:
    QPixmap m_picture;
};

} // namespace penwick::platform
