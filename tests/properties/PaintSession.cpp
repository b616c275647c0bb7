// SPDX-License-Identifier: MIT
#include "properties/PaintSession.h"

#include "appearance/PenwickBundle.h"
#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/foundation/FatalError.h"
#include "platform/window/WindowContent.h"
#include "strokes/CoverageMask.h"
#include "strokes/PixelLayer.h"
#include "strokes/StrokePainter.h"
#include "textbox/TnTextBox.h"

#include <QBackingStore>
#include <QCoreApplication>
#include <QMouseEvent>
#include <QPainter>
#include <QPixmap>

#include <utility>

namespace penwick::test {

namespace {

using platform::Point;

constexpr int side = 160; // points, at first
constexpr int mostStrokes = 40; // then everything is cleared, so that steps stay quick

} // namespace

PaintSession::PaintSession(std::uint32_t seed)
    : m_random(seed)
    , m_coversWindow(seed % 2 == 0)
{
    setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
    m_window.setFrame({ 20, 20, side, side });
    m_canvas = new DrawingCanvasView(&m_window);
    contentOf(m_window).adoptScene();
    auto content = std::make_unique<DrawViewController>();
    m_controller = content.get();
    content->setDrawingView(m_canvas);
    content->setView(*m_canvas);
    m_canvas->setCoversWindow(m_coversWindow);
    contentOf(m_window).setContentViewController(std::move(content));
    m_window.show();
    QCoreApplication::processEvents();
    m_window.resize(side, side); // a frame would have the title bar in it
    QCoreApplication::processEvents();
    m_paper = onScreen().pixel(0, 0);
}

PaintSession::~PaintSession() = default;

std::string PaintSession::doSomething()
{
    std::string done;
    const int kind = anyFrom(0, 99);
    if (m_controller->drawingCanvasModel()->pathArray().size() > mostStrokes) {
        if (m_isPressed)
            release();
        choose(QStringLiteral("clear"));
        done = "clear";
    } else if (kind < 12) {
        done = m_isPressed ? release() : press();
    } else if (kind < 80) {
        done = m_isPressed ? drag() : press();
    } else if (kind < 90) {
        done = chooseAnything();
    } else if (kind < 97) {
        done = changePen();
    } else {
        done = resize();
    }
    if (anyFrom(0, 3) > 0) // several events may come before anything is painted
        QCoreApplication::processEvents();
    return done;
}

std::string PaintSession::press()
{
    m_pointer = anyPoint();
    m_isPressed = true;
    send(QEvent::MouseButtonPress, Qt::LeftButton);
    return "press";
}

std::string PaintSession::drag()
{
    m_pointer = nextPoint();
    send(QEvent::MouseMove, Qt::NoButton);
    return "drag";
}

std::string PaintSession::release()
{
    m_isPressed = false;
    send(QEvent::MouseButtonRelease, Qt::LeftButton);
    return "release";
}

// Chooses a tool; while the pointer is pressed it is released instead.
std::string PaintSession::chooseAnything()
{
    if (m_isPressed)
        return release();
    const char *const tool = oneOf({ "undo", "undo", "undo", "undo", "redo", "redo", "redo",
        "eraser", "eraser", "brush", "brush", "brush", "text", "clear", "color" });
    choose(QString::fromLatin1(tool));
    return tool;
}

std::string PaintSession::changePen()
{
    m_canvas->setBrushThickness(
        oneOf({ 0.2, 0.5, 0.5, 0.8, 1.0, 1.3, 3.0, 5.0, 7.5, 8.0, 12.0, 30.0 }));
    m_canvas->setBrushColor(
        QColor(anyFrom(0, 255), anyFrom(0, 255), anyFrom(0, 255), oneOf({ 255, 178, 60 })));
    return "another pen";
}

std::string PaintSession::resize()
{
    m_window.resize(anyFrom(60, 240), anyFrom(60, 240));
    return "another size";
}

void PaintSession::choose(const QString &tool)
{
    m_controller->handleToolSelection(tool);
}

int PaintSession::anyFrom(int first, int last)
{
    // Not the library's distribution, which may differ from one library to the next.
    return first + static_cast<int>(m_random() % static_cast<std::uint32_t>(last - first + 1));
}

template <class T>
T PaintSession::oneOf(std::initializer_list<T> choices)
{
    return *(choices.begin() + anyFrom(0, static_cast<int>(choices.size()) - 1));
}

// Between pixels too, and over every edge of the canvas.
double PaintSession::anyCoordinate(double length)
{
    return anyFrom(-20 * 4, (static_cast<int>(length) + 20) * 4) / 4.0;
}

Point PaintSession::anyPoint()
{
    const double x = anyCoordinate(m_canvas->frame().width);
    return { x, anyCoordinate(m_canvas->frame().height) };
}

// Near the last point mostly, as a pointer moves; now and then far away, or not at all.
Point PaintSession::nextPoint()
{
    const int kind = anyFrom(0, 9);
    if (kind == 0)
        return m_pointer;
    if (kind == 1)
        return anyPoint();
    const double x = m_pointer.x + anyFrom(-60, 60) / 4.0;
    return { x, m_pointer.y + anyFrom(-60, 60) / 4.0 };
}

void PaintSession::send(QEvent::Type type, Qt::MouseButton button)
{
    const QPointF position(m_pointer.x, m_canvas->QWidget::height() - m_pointer.y);
    QMouseEvent event(type, position, m_canvas->mapToGlobal(position), button,
        m_isPressed ? Qt::LeftButton : Qt::NoButton, Qt::NoModifier);
    QCoreApplication::sendEvent(m_canvas, &event);
}

QImage PaintSession::onScreen()
{
    // Twice, because a text box shows its button, a view of its own, when it is painted; and
    // without waiting until it is time for the next frame.
    for (int turn = 0; turn < 2; ++turn) {
        QCoreApplication::processEvents();
        QEvent paintWhatIsMarked(QEvent::UpdateRequest);
        QCoreApplication::sendEvent(&m_window, &paintWhatIsMarked);
    }
    // The window's backing store is what would be on the screen. Without a screen there is no other
    // way to read it in device pixels at every scale.
    const auto &shown = dynamic_cast<const QImage &>(*m_window.backingStore()->paintDevice());
    return shown.convertToFormat(QImage::Format_RGB32);
}

QImage PaintSession::paintedAnew() const
{
    const double scale = m_window.devicePixelRatioF();
    const QSize size = (QSizeF(m_canvas->QWidget::size()) * scale).toSize();
    PixelLayer layer(size, m_coversWindow ? QColor(m_paper) : QColor(Qt::transparent));
    CoverageMask scratch;
    const auto &strokes = m_controller->drawingCanvasModel()->pathArray();
    for (int index = 0; index < strokes.size(); ++index)
        paintStroke(layer, strokes[index], colorOf(strokes, index), scale, layer.area(), scratch);

    QImage picture(size, QImage::Format_RGB32);
    picture.fill(m_paper);
    QPainter(&picture).drawImage(0, 0, layer.image());
    picture.setDevicePixelRatio(scale);
    return withoutTextBoxes(picture);
}

QImage PaintSession::withoutTextBoxes(QImage picture) const
{
    picture.setDevicePixelRatio(m_window.devicePixelRatioF());
    QPainter painter(&picture);
    for (const platform::View *const view : m_canvas->subviews()) {
        // The delete button hangs over the edge of its box.
        const QRect place = view->widget().geometry()
            | view->widget().childrenRect().translated(view->widget().pos());
        painter.fillRect(place.adjusted(-2, -2, 2, 2), Qt::white);
    }
    painter.end();
    return picture;
}

QImage PaintSession::content() const
{
    return withoutTextBoxes(m_window.contentImage().convertToFormat(QImage::Format_RGB32));
}

QImage PaintSession::paintedByWindow()
{
    return m_window.grab().toImage().convertToFormat(QImage::Format_RGB32);
}

} // namespace penwick::test
