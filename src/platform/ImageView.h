// SPDX-License-Identifier: MIT
// Shows a still image at its own size.
#pragma once

#include "platform/ViewOf.h"

#include <QImage>
#include <QWidget>

namespace penwick::platform {

enum class ImageFrameStyle
{
    None = 0,
    Photo = 1
};

/// An image in the bottom left corner of its view.
class ImageView final : public ViewOf<QWidget>
{
    Q_OBJECT

public:
    explicit ImageView(QWidget *parent = nullptr);

    [[nodiscard]] const QImage &image() const { return m_image; }
    void setImage(const QImage &image);
    [[nodiscard]] ImageFrameStyle imageFrameStyle() const { return m_imageFrameStyle; }
    void setImageFrameStyle(ImageFrameStyle style);

    void draw(const Rect &dirtyRect) override;
    /// The image without its frame.
    void drawContent(QPainter &painter) override;

private:
    [[nodiscard]] QRectF imagePlace() const; // as Qt counts

    QImage m_image;
    ImageFrameStyle m_imageFrameStyle = ImageFrameStyle::None;
};

} // namespace penwick::platform
