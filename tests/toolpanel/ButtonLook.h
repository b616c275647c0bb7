// SPDX-License-Identifier: MIT
// What a button of the tool bar looks like at the moment, in a form that can be compared.
#pragma once

#include "toolpanel/ToolPanelButton.h"

#include <QColor>
#include <QIcon>
#include <QImage>
#include <QPixmap>

#include <ostream>
#include <string>

namespace penwick::test {

enum class Shown
{
    NoImage,
    Image,
    AlternateImage
};

struct ButtonLook
{
    QColor background;
    Shown image = Shown::NoImage;
    QColor triangle; ///< kept by every button, painted by two

    friend bool operator==(const ButtonLook &, const ButtonLook &) = default;
};

inline void PrintTo(const ButtonLook &look, std::ostream *stream)
{
    const char *const images[] = { "no image", "the image", "the alternate image" };
    *stream << look.background.name().toStdString() << ", " << images[static_cast<int>(look.image)]
            << ", triangle " << look.triangle.name().toStdString();
}

/// An image of one colour.
inline QIcon iconOf(const QColor &color)
{
    QPixmap pixmap(8, 8);
    pixmap.fill(color);
    return QIcon(pixmap);
}

inline ButtonLook lookOf(const ToolPanelButton &button)
{
    ButtonLook look { button.backgroundColor(), Shown::NoImage, button.setArrowColor() };
    if (!button.image().isNull() && button.image().cacheKey() == button.buttonImage().cacheKey())
        look.image = Shown::Image;
    else if (!button.image().isNull()
        && button.image().cacheKey() == button.buttonAltImage().cacheKey())
        look.image = Shown::AlternateImage;
    return look;
}

/// What the button paints, without what lies below it; `scale` device pixels to a point.
inline QImage paintedBy(QWidget &button, double scale = 1.0)
{
    QImage picture(button.size() * scale, QImage::Format_ARGB32_Premultiplied);
    picture.setDevicePixelRatio(scale);
    picture.fill(Qt::transparent);
    button.render(&picture, QPoint(), QRegion(), QWidget::RenderFlags());
    return picture;
}

inline const QColor normalTriangle { 86, 98, 113 };
inline const QColor whiteTriangle { 255, 255, 255 };

} // namespace penwick::test
