// SPDX-License-Identifier: MIT
#include "strokes/StrokePicture.h"

#include "strokes/StrokePainter.h"

#include <penwick/platform/BezierPath.h>

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
        m_index.follow(strokes);
        return strokes.isEmpty() ? QRect() : pixelsOf(strokes.last(), m_scale);
    }
    const QRect grown = addGrowth();
    const EntryList<StrokeEntry> before = m_index.strokes();
    const EntryListChange change = m_index.follow(strokes);
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
    const bool isNewestNew = change.added > 0 && lastCome == strokes().size();
    if (isNewestNew)
        --lastCome;
    mark(strokes(), change.first, lastCome);
    // A stroke without a colour takes the colour of one before it, which may be another one now.
    if (lastCome < strokes().size() && !strokes()[lastCome].bPathParams.pathColor)
        m_marked = m_finished.area();
    if (isNewestNew)
        takeNewestApart();
    else if (!m_isNewestApart && !strokes().isEmpty())
        m_newestElements = strokes().last().bPath->elementCount();
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
    return colorOf(strokes(), strokes().size() - 1);
}

QRect StrokePicture::addGrowth()
{
    if (strokes().isEmpty())
        return {};
    const StrokeEntry &newest = strokes().last();
    const int elements = newest.bPath->elementCount();
    if (elements == m_newestElements)
        return {};
    if (!m_isNewestApart) { // it was painted with those below, but is growing again
        mark(strokes(), strokes().size() - 1, strokes().size());
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

void StrokePicture::update(QSize size, double scale, const QColor &paper)
{
    if (strokes().isEmpty()) {
        m_scale = scale;
        return;
    }
    resize(size, scale, paper);
    addGrowth();
    paintMarked();
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

void StrokePicture::paintMarked()
{
    for (const QRect &part : m_marked)
        paintPart(part);
    m_marked = {};
}

void StrokePicture::paintPart(const QRect &part)
{
    m_below.clear(part);
    const int settled = strokes().size() - (m_isNewestApart ? 1 : 0);
    for (const int index : m_index.touching(inPoints(part.adjusted(-1, -1, 1, 1), m_scale))) {
        if (index < settled)
            paintStroke(
                m_below, strokes()[index], colorOf(strokes(), index), m_scale, part, m_scratch);
    }
    m_finished.copy(m_below, part);
    const QRect common = part & m_newestArea;
    if (m_isNewestApart && !common.isEmpty())
        m_finished.blend(m_newest, newestColor(), common);
}

} // namespace penwick
