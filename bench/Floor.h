// SPDX-License-Identifier: MIT
// The least that drawing with a pointer can cost.
#pragma once

#include <penwick/platform/Geometry.h>

#include "strokes/CoverageMask.h"
#include "strokes/PixelLayer.h"

#include <QWidget>

namespace penwick::bench {

/// A bare widget that fills one new capsule into an image and repaints its rectangle: no model, no
/// history, no window around it.
class Floor final : public QWidget
{
    Q_OBJECT

public:
    Floor();

    void press(platform::Point point);
    void drag(platform::Point point);

protected:
    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void paintEvent(QPaintEvent *event) override;

private:
    [[nodiscard]] platform::Point pixelAt(QPointF position) const;

    PixelLayer m_pixels;
    CoverageMask m_mask;
    platform::Point m_from; // pixels, counted upwards
};

} // namespace penwick::bench
