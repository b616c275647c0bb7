// SPDX-License-Identifier: MIT
// The strokes of a canvas as finished pixels, mended where they change.
#pragma once

#include "strokes/CoverageMask.h"
#include "strokes/PixelLayer.h"
#include "strokes/StrokeIndex.h"

#include <QColor>
#include <QRect>
#include <QRegion>

namespace penwick {

/// What a list of strokes looks like, oldest first, each one shape in its colour.
///
/// Painting copies finished pixels. A segment more of the newest stroke costs what the segment
/// covers; so does taking the newest stroke back, once, by the stroke. Any other stroke that comes
/// or goes costs the strokes that touch the rectangle around it, and finding it in the list. The
/// pixels are those of painting everything anew. GUI thread only.
class StrokePicture
{
public:
    /// Takes `strokes` for what is to be seen. To be told of every change, the growth of the newest
    /// stroke included; no other may grow. Gives the pixels that such growth has changed.
    QRect follow(const EntryList<StrokeEntry> &strokes);

    /// Brings the pixels up to date for a canvas of `size` device pixels with `scale` pixels a
    /// point, on `paper`.
    void update(QSize size, double scale, const QColor &paper = Qt::transparent);

    /// The finished pixels, at least as large as the canvas, after update(); none at all where
    /// there are no strokes.
    [[nodiscard]] const PixelLayer &pixels() const { return m_finished; }

private:
    void followChange(const EntryListChange &change, const EntryList<StrokeEntry> &before);
    void mark(const EntryList<StrokeEntry> &strokes, int from, int to);
    void takeNewestApart();
    void settleNewest();
    void dropNewest();
    void forgetNewest();
    QRect addGrowth();
    void forgetPixels();
    void resize(QSize size, double scale, const QColor &paper);
    void paintMarked();
    void paintPart(const QRect &part);
    [[nodiscard]] const EntryList<StrokeEntry> &strokes() const { return m_index.strokes(); }
    [[nodiscard]] QColor newestColor() const;

    StrokeIndex m_index;
    double m_scale = 0.0; // pixels a point
    QColor m_paper = Qt::transparent;
    PixelLayer m_finished;
    QRegion m_marked; // where strokes came or went since they were painted

    // While the newest stroke grows it is kept apart: its coverage, and what lies below it.
    bool m_isNewestApart = false;
    PixelLayer m_below;
    CoverageMask m_newest;
    QRect m_newestArea; // what m_newest covers
    int m_newestElements = 0; // so much of the newest stroke is painted

    CoverageMask m_scratch;
};

} // namespace penwick
