// SPDX-License-Identifier: MIT
// The strokes of a canvas as finished pixels, mended where they change.
#pragma once

#include "content/CanvasContent.h"
#include "content/EntryListChange.h"
#include "strokes/CoverageMask.h"
#include "strokes/PixelLayer.h"

#include <QColor>
#include <QRect>
#include <QRegion>

namespace penwick {

class StrokeIndex;

/// What a list of strokes looks like, oldest first, each one shape in its colour.
///
/// The pixels are kept, and mended where the list changes; they are always the very pixels that
/// painting everything anew would give. A further segment of the newest stroke costs the pixels
/// that it covers. Removing the newest stroke costs the pixels around it, as long as it is still
/// kept apart from those below. Adding or removing any other stroke costs the search for it in the
/// list, and painting every stroke that touches the rectangle around it. GUI thread only.
class StrokePicture
{
public:
    /// Takes `strokes` as the list to be shown. It must be called after every change, the growth of
    /// the newest stroke included; no other stroke may grow. Returns the pixels that this growth
    /// has changed.
    QRect follow(const EntryList<StrokeEntry> &strokes);

    /// Brings the pixels up to date for a canvas of `size` device pixels with `scale` pixels a
    /// point, on `paper`. `index` is of these strokes, or of more that came after them.
    void update(
        const StrokeIndex &index, QSize size, double scale, const QColor &paper = Qt::transparent);

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
    void paintMarked(const StrokeIndex &index);
    void paintPart(const StrokeIndex &index, const QRect &part);
    [[nodiscard]] QColor newestColor() const;

    EntryList<StrokeEntry> m_strokes;
    double m_scale = 0.0; // pixels a point
    QColor m_paper = Qt::transparent;
    PixelLayer m_finished;
    QRegion m_marked; // to be painted anew, because strokes came or went there

    // While the newest stroke grows it is kept apart: its coverage, and what lies below it.
    bool m_isNewestApart = false;
    PixelLayer m_below;
    CoverageMask m_newest;
    QRect m_newestArea; // outside of it m_newest covers nothing
    int m_newestElements = 0; // how many elements of the newest stroke's path are painted

    CoverageMask m_scratch;
};

} // namespace penwick
