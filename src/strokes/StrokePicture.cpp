// SPDX-License-Identifier: MIT
#include "strokes/StrokePicture.h"

#include "strokes/StrokeIndex.h"
#include "strokes/StrokePainter.h"

#include <penwick/platform/BezierPath.h>

#include <utility>

namespace penwick {

using platform::Rect;

namespace {

// Layers are a little larger than the canvas, so that resizing it by hand seldom needs new ones.
constexpr int layerStep = 64; // pixels

// If more strokes than this come or go at once, the one rectangle around them all is painted.
constexpr int mostApart = 16;

QSize roundedUp(QSize size)
{
    const auto up = [](int length) { return (length + layerStep - 1) / layerStep * layerStep; };
    return { up(size.width()), up(size.height()) };
}

Rect inPoints(const QRect &pixels, double scale)
{
    return { pixels.x() / scale, pixels.y() / scale, pixels.width() / scale,
        pixels.height() / scale };
}

} // namespace

QRect StrokePicture::follow(const EntryList<StrokeEntry> &strokes)
{
    if (strokes.isEmpty())
        forgetPixels();
    if (m_finished.area().isEmpty()) { // nothing is painted yet, so there is nothing to mend
        m_strokes = strokes;
        return strokes.isEmpty() ? QRect() : pixelsOf(strokes.last(), m_scale);
    }
    const QRect grown = addGrowth();
    const EntryList<StrokeEntry> before = std::exchange(m_strokes, strokes);
    const EntryListChange change = changeBetween(before, m_strokes, isSameStroke);
    if (!change.isNothing())
        followChange(change, before);
    return grown | addGrowth();
}

void StrokePicture::followChange(
    const EntryListChange &change, const EntryList<StrokeEntry> &before)
{
    int lastGone = change.first + change.removed;
    if (m_isNewestApart && lastGone == before.size()) {
        if (change.removed > 0) {
            dropNewest(); // which mends its pixels
            --lastGone;
        } else {
            settleNewest();
        }
    }
    mark(before, change.first, lastGone);

    int lastCome = change.first + change.added;
    const bool isNewestNew = change.added > 0 && lastCome == m_strokes.size();
    if (isNewestNew)
        --lastCome;
    mark(m_strokes, change.first, lastCome);
    // A stroke without a colour takes the colour of one before it, which may be another one now.
    if (lastCome < m_strokes.size() && !m_strokes[lastCome].bPathParams.pathColor)
        m_marked = m_finished.area();
    if (isNewestNew)
        takeNewestApart();
    else if (!m_isNewestApart && !m_strokes.isEmpty())
        m_newestElements = m_strokes.last().bPath->elementCount();
}

void StrokePicture::mark(const EntryList<StrokeEntry> &strokes, int from, int to)
{
    QRect all;
    for (int index = from; index < to; ++index) {
        const QRect touched = pixelsOf(strokes[index], m_scale) & m_finished.area();
        if (to - from <= mostApart)
            m_marked += touched;
        else
            all |= touched;
    }
    m_marked += all;
}

void StrokePicture::takeNewestApart()
{
    m_isNewestApart = true;
    m_newestElements = 0;
}

void StrokePicture::settleNewest()
{
    m_below.copy(m_finished, m_newestArea);
    forgetNewest();
}

void StrokePicture::dropNewest()
{
    m_finished.copy(m_below, m_newestArea);
    forgetNewest();
}

void StrokePicture::forgetNewest()
{
    m_newest.clear(m_newestArea);
    m_newestArea = {};
    m_isNewestApart = false;
}

QColor StrokePicture::newestColor() const
{
    return colorOf(m_strokes, m_strokes.size() - 1);
}

QRect StrokePicture::addGrowth()
{
    if (m_strokes.isEmpty())
        return {};
    const StrokeEntry &newest = m_strokes.last();
    const int elements = newest.bPath->elementCount();
    if (elements == m_newestElements)
        return {};
    if (!m_isNewestApart) { // it was painted with those below, but is growing again
        mark(m_strokes, m_strokes.size() - 1, m_strokes.size());
        takeNewestApart();
    }
    const int linesPainted = m_newestElements / 2;
    m_newestElements = elements;
    const QRect grown = addStroke(m_newest, newest, m_scale, static_cast<std::size_t>(linesPainted))
        & m_finished.area();
    m_newestArea |= grown;
    m_finished.copy(m_below, grown);
    m_finished.blend(m_newest, newestColor(), grown);
    return grown;
}

void StrokePicture::update(const StrokeIndex &index, QSize size, double scale, const QColor &paper)
{
    if (m_strokes.isEmpty()) {
        m_scale = scale;
        return;
    }
    resize(size, scale, paper);
    addGrowth();
    paintMarked(index);
}

void StrokePicture::forgetPixels()
{
    m_finished = {};
    m_below = {};
    m_newest = {};
    m_newestArea = {};
    m_isNewestApart = false;
    m_marked = {};
}

void StrokePicture::resize(QSize size, double scale, const QColor &paper)
{
    const QSize wanted = roundedUp(size);
    const bool isSameGround = scale == m_scale && paper == m_paper;
    if (wanted == m_finished.area().size() && isSameGround)
        return;
    PixelLayer finished(wanted, paper);
    if (isSameGround && !m_finished.area().isEmpty()) {
        if (m_isNewestApart)
            settleNewest();
        finished.copy(m_finished, m_finished.area());
        m_marked += QRegion(finished.area()) - m_finished.area();
        m_marked &= finished.area();
    } else {
        m_newestArea = {};
        m_marked = finished.area();
        takeNewestApart();
    }
    m_scale = scale;
    m_paper = paper;
    m_finished = finished;
    m_below = m_finished;
    m_newest.reset(m_finished.area());
}

void StrokePicture::paintMarked(const StrokeIndex &index)
{
    for (const QRect &part : m_marked)
        paintPart(index, part);
    m_marked = {};
}

void StrokePicture::paintPart(const StrokeIndex &index, const QRect &part)
{
    m_below.clear(part);
    const int settled = m_strokes.size() - (m_isNewestApart ? 1 : 0);
    for (const int at : index.touching(inPoints(part.adjusted(-1, -1, 1, 1), m_scale))) {
        if (at < settled)
            paintStroke(m_below, m_strokes[at], colorOf(m_strokes, at), m_scale, part, m_scratch);
    }
    m_finished.copy(m_below, part);
    const QRect common = part & m_newestArea;
    if (m_isNewestApart && !common.isEmpty())
        m_finished.blend(m_newest, newestColor(), common);
}

} // namespace penwick
