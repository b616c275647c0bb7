// SPDX-License-Identifier: MIT
// Shows a still image.
#pragma once

#include "platform/view/ViewOf.h"

#include <QImage>
#include <QWidget>

namespace penwick::platform {

enum class ImageFrameStyle
{
    None = 0,
    Photo = 1
};

/// An image in the bottom left corner of its view, at its own size; scaled down in its own shape
/// where the view is smaller than that.
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
    [[nodiscard]] const QImage &scaledTo(QSize pixels);

    QImage m_image;
    QImage m_scaled; // m_image as it was last scaled down; null until then
    ImageFrameStyle m_imageFrameStyle = ImageFrameStyle::None;
};

} // namespace penwick::platform
