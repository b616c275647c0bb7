// SPDX-License-Identifier: MIT
// Random drawings: what is painted piece by piece is, pixel for pixel, the full repaint.
#include "appearance/PenwickBundle.h"
#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "canvas/StrokePainter.h"

#include <penwick/platform/Window.h>

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <QBackingStore>
#include <QCoreApplication>
#include <QImage>
#include <QMouseEvent>
#include <QPainter>
#include <QPixmap>

#include <array>
#include <cmath>
#include <memory>

namespace penwick::test {
namespace {

using platform::BezierPath;
using platform::Point;
using platform::Rect;

constexpr int side = 160; // points
constexpr std::array scales { 1.0, 1.25, 1.5, 2.0 };

// Between pixels too, and over every edge of the canvas.
double anyCoordinate()
{
    return *rc::gen::inRange(-20 * 4, (side + 20) * 4) / 4.0;
}

Point anyPoint()
{
    return { anyCoordinate(), anyCoordinate() };
}

// Near the last point mostly, as a pointer moves; now and then far away, or not at all.
Point pointAfter(Point last)
{
    const int kind = *rc::gen::inRange(0, 10);
    if (kind == 0)
        return last;
    if (kind == 1)
        return anyPoint();
    return { last.x + *rc::gen::inRange(-60, 61) / 4.0, last.y + *rc::gen::inRange(-60, 61) / 4.0 };
}

double anyWidth()
{
    return *rc::gen::element(1.0, 3.0, 5.0, 7.5, 8.0, 12.0, 30.0);
}

QColor anyColor()
{
    return { *rc::gen::inRange(0, 256), *rc::gen::inRange(0, 256), *rc::gen::inRange(0, 256),
        *rc::gen::element(178, 255, 60) };
}

StrokeEntry anyStroke()
{
    auto path = std::make_shared<BezierPath>();
    path->setLineCapStyle(platform::LineCapStyle::Round); // as every stroke that is drawn
    path->setLineJoinStyle(platform::LineJoinStyle::Round);
    path->setLineWidth(*rc::gen::inRange(0, 5) == 0 ? 0.5 : anyWidth());
    Point point = anyPoint();
    for (int left = *rc::gen::inRange(0, 12); left > 0; --left) {
        path->moveToPoint(point);
        point = pointAfter(point);
        path->lineToPoint(point);
    }
    const std::int64_t id = path->hash();
    const bool hasColor = *rc::gen::inRange(0, 8) > 0;
    return { path,
        { point, std::nullopt, hasColor ? std::optional<QColor>(anyColor()) : std::nullopt }, id };
}

/// A part of the canvas, as Qt counts.
QRect anyPart()
{
    const int x = *rc::gen::inRange(-5, side);
    const int y = *rc::gen::inRange(-5, side);
    return { x, y, *rc::gen::inRange(1, side), *rc::gen::inRange(1, side) };
}

/// The device pixels that `part` touches.
QRect inPixels(const QRect &part, double scale)
{
    const QRectF exact(
        part.x() * scale, part.y() * scale, part.width() * scale, part.height() * scale);
    return exact.toAlignedRect();
}

/// A picture of a canvas at one scale.
class Picture
{
public:
    explicit Picture(double scale)
        : m_scale(scale)
        , m_image(static_cast<int>(side * scale), static_cast<int>(side * scale),
              QImage::Format_ARGB32_Premultiplied)
    {
        m_image.setDevicePixelRatio(scale);
        m_image.fill(Qt::white);
    }

    /// Paints the background and `strokes` anew inside `part`, and nothing outside of it.
    void repaint(const EntryList<StrokeEntry> &strokes, const QRect &part)
    {
        QImage pixels = m_image; // the same without a scale, to clip exactly
        pixels.setDevicePixelRatio(1.0);
        QPainter painter(&pixels);
        painter.setClipRect(inPixels(part, m_scale));
        painter.setCompositionMode(QPainter::CompositionMode_Source);
        painter.fillRect(pixels.rect(), Qt::white);
        painter.setCompositionMode(QPainter::CompositionMode_SourceOver);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.scale(m_scale, m_scale);
        painter.translate(0.0, side);
        painter.scale(1.0, -1.0);
        paintStrokes(painter, strokes,
            { static_cast<double>(part.x()), static_cast<double>(side - part.y() - part.height()),
                static_cast<double>(part.width()), static_cast<double>(part.height()) });
        painter.end();
        m_image = pixels;
    }

    friend bool operator==(const Picture &a, const Picture &b) { return a.m_image == b.m_image; }

private:
    double m_scale;
    QImage m_image;
};

constexpr QRect whole { 0, 0, side, side };

RC_GTEST_PROP(StrokePainterProperties, pictureMendedInAnyPartsIsTheFullRepaint, ())
{
    EntryList<StrokeEntry> strokes;
    for (int left = *rc::gen::inRange(1, 8); left > 0; --left)
        strokes.append(anyStroke());
    const double scale = *rc::gen::elementOf(scales);
    Picture expected(scale);
    expected.repaint(strokes, whole);

    Picture mended = expected;
    for (int left = *rc::gen::inRange(1, 6); left > 0; --left) {
        mended.repaint(strokes, anyPart());
        RC_ASSERT(mended == expected);
    }
}

/// A canvas in a window on the screen, and a pointer.
class Board
{
public:
    Board()
    {
        setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
        m_window.setFrame({ 20, 20, side, side });
        m_canvas = new DrawingCanvasView(&m_window);
        m_window.adoptScene();
        auto content = std::make_unique<DrawViewController>();
        m_controller = content.get();
        content->setDrawingView(m_canvas);
        content->setView(*m_canvas);
        m_window.setContentViewController(std::move(content));
        m_window.show();
        QCoreApplication::processEvents();
        m_window.resize(side, side); // a frame would have the title bar in it
        QCoreApplication::processEvents();
    }

    void doSomething()
    {
        switch (*rc::gen::inRange(0, 12)) {
        case 0:
            choose("undo");
            break;
        case 1:
            choose("redo");
            break;
        case 2:
            choose("eraser");
            point(anyPoint());
            drag(anyPoint());
            end();
            choose("brush");
            break;
        case 3: // a click without a drag
            point(anyPoint());
            end();
            break;
        default:
            draw();
        }
        QCoreApplication::processEvents();
    }

    [[nodiscard]] bool showsTheFullRepaint()
    {
        // What the screen has of it; without a screen nothing else reads it at every scale.
        const auto &shown = dynamic_cast<const QImage &>(*m_window.backingStore()->paintDevice());
        return shown.convertToFormat(QImage::Format_RGB32)
            == m_window.grab().toImage().convertToFormat(QImage::Format_RGB32);
    }

private:
    void choose(const char *tool) { m_controller->handleToolSelection(QString::fromLatin1(tool)); }

    void draw()
    {
        m_canvas->setBrushThickness(anyWidth());
        m_canvas->setBrushColor(anyColor());
        point(anyPoint());
        for (int left = *rc::gen::inRange(1, 10); left > 0; --left) {
            drag(pointAfter(m_last));
            if (*rc::gen::inRange(0, 2) == 0)
                QCoreApplication::processEvents();
        }
        // Before the release, which repaints everything.
        QCoreApplication::processEvents();
        RC_ASSERT(showsTheFullRepaint());
        if (*rc::gen::inRange(0, 4) > 0)
            end();
    }

    void point(Point place) { send(QEvent::MouseButtonPress, place, Qt::LeftButton); }
    void drag(Point place) { send(QEvent::MouseMove, place, Qt::NoButton); }
    void end() { send(QEvent::MouseButtonRelease, m_last, Qt::LeftButton); }

    void send(QEvent::Type type, Point place, Qt::MouseButton button)
    {
        m_last = place;
        const QPointF position(place.x, m_canvas->QWidget::height() - place.y);
        const bool isEnd = type == QEvent::MouseButtonRelease;
        QMouseEvent event(type, position, m_canvas->mapToGlobal(position), button,
            isEnd ? Qt::NoButton : Qt::LeftButton, Qt::NoModifier);
        QCoreApplication::sendEvent(m_canvas, &event);
    }

    platform::Window m_window;
    DrawingCanvasView *m_canvas = nullptr;
    DrawViewController *m_controller = nullptr;
    Point m_last;
};

// At the scale at which the process was started.
RC_GTEST_PROP(CanvasProperties, screenShowsTheFullRepaintAfterWhateverWasDone, ())
{
    Board board;
    for (int left = *rc::gen::inRange(1, 12); left > 0; --left) {
        board.doSomething();
        RC_ASSERT(board.showsTheFullRepaint());
    }
}

} // namespace
} // namespace penwick::test
