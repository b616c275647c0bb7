// SPDX-License-Identifier: MIT
// Shows a still image at its own size.
#pragma once

#include "platform/ViewOf.h"

#include <QImage>
#include <QWidget>

namespace penwick::platform {

/// An image in the bottom left corner of its view.
class ImageView final : public ViewOf<QWidget>
{
    Q_OBJECT

public:
    explicit ImageView(QWidget *parent = nullptr);

    [[nodiscard]] const QImage &image() const { return m_image; }
    void setImage(const QImage &image);

    void draw(const Rect &dirtyRect) override;

private:
    QImage m_image;
};

} // namespace penwick::platform
