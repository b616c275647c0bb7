// SPDX-License-Identifier: MIT
#include "canvas/DrawingCanvasView.h"

#include "appearance/Theme.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/ToolSelectionDelegate.h"
#include "platform/foundation/FatalError.h"
#include "platform/view/ViewHost.h"
#include "textbox/TextBoxPlace.h"
#include "textbox/TnTextBox.h"

#include <QGuiApplication>
#include <QStyleHints>

#include <utility>

namespace penwick {

namespace {

using platform::Point;
using platform::require;

constexpr double initialThickness = 5.0; // points
constexpr double initialFontSize = 24.0; // points
constexpr double widestHairline = 1.5; // pixels
constexpr float strokeOpacity = 0.7F; // of every stroke, whatever its colour

} // namespace

DrawingCanvasView::DrawingCanvasView(QWidget *parent)
    : ViewOf(parent)
    , m_brushThickness(initialThickness)
    , m_textFontSize(initialFontSize)
    , m_brushColor(TnhColors::blackColor)
    , m_currentSelectedTool(Tools::brush)
    , m_lastSelecedTool(Tools::brush)
{ }

DrawingCanvasView::DrawingCanvasView(const platform::Rect &frame)
    : DrawingCanvasView(nullptr)
{
    setFrame(frame);
}

DrawingCanvasView::~DrawingCanvasView() = default;

void DrawingCanvasView::setPathArray(const EntryList<StrokeEntry> &strokes)
{
    m_pathArray = strokes;
    markHairline(m_picture.follow(m_pathArray));
    m_hasDroppedEntry = false;
}

// For a new segment the controller marks an area that is as wide as the line on each side. The
// smooth edge of a very thin line reaches farther than that, so its pixels are marked here.
void DrawingCanvasView::markHairline(const QRect &pixels)
{
    const double scale = QWidget::devicePixelRatioF();
    if (pixels.isEmpty() || m_pathArray.last().bPath->lineWidth() * scale > widestHairline)
        return;
    const double height = QWidget::height();
    const QRectF area(pixels.x() / scale, height - (pixels.bottom() + 1) / scale,
        pixels.width() / scale, pixels.height() / scale);
    surface().update(area.toAlignedRect());
}

void DrawingCanvasView::setTextBoxArray(const EntryList<TextBoxEntry> &boxes)
{
    m_textBoxArray = boxes;
}

void DrawingCanvasView::setLastSelecedTool(const QString &tool)
{
    m_lastSelecedTool = tool;
    m_toolBeforeEraserEnd.clear(); // the choice stays when the pen's tip is put down
}

DrawingCanvasDelegate *DrawingCanvasView::drawingCanvasDelegate() const
{
    return m_drawingCanvasDelegate.get();
}

void DrawingCanvasView::setDrawingCanvasDelegate(DrawingCanvasDelegate *delegate)
{
    m_drawingCanvasDelegate = delegate;
}

DrawingCanvasDelegate &DrawingCanvasView::controller() const
{
    return *require(m_drawingCanvasDelegate.get(), "the canvas has no delegate");
}

DrawingCanvasModel &DrawingCanvasView::model() const
{
    return *require(controller().drawingCanvasModel(), "the canvas's controller has no model");
}

// With the text tool, a click with a trembling hand must not count as a drag: the drag would end
// the editing of a box, and the release would at once begin a new one.
double DrawingCanvasView::dragDistance() const
{
    return m_currentSelectedTool == Tools::text ? QGuiApplication::styleHints()->startDragDistance()
                                                : 0.0;
}

// The toolkit tells the application object alone, which is the host's, which end of a pen comes
// near. The canvas learns of the end only when it is put down.
void DrawingCanvasView::followPenEnd(platform::PenEnd end)
{
    if (end == platform::PenEnd::Tip && !m_toolBeforeEraserEnd.isEmpty()) {
        chooseTool(std::exchange(m_toolBeforeEraserEnd, {}));
    } else if (end == platform::PenEnd::Eraser && m_currentSelectedTool != Tools::eraser) {
        const QString before = m_lastSelecedTool;
        chooseTool(Tools::eraser);
        m_toolBeforeEraserEnd = before;
    }
}

void DrawingCanvasView::chooseTool(const QString &tool)
{
    if (ToolChooser *const chooser = m_toolChooser.get())
        return chooser->chooseTool(tool);
    if (auto *const selection
        = dynamic_cast<ToolSelectionDelegate *>(m_drawingCanvasDelegate.get()))
        selection->handleToolSelection(tool);
}

void DrawingCanvasView::mouseDown(const platform::MouseEvent &event)
{
    platform::ViewHost &ownWindow = *require(window(), "a canvas was pressed outside a window");
    m_eraserPlace = convertTo(event.locationInWindow, nullptr);
    followPenEnd(event.penEnd);
    if (ownWindow.isKeyWindow() && m_popoverWindow) {
        m_popoverWindow->orderOut();
        m_currentSelectedTool = m_lastSelecedTool; // the user has not chosen a colour after all
    }
    if (m_currentSelectedTool != Tools::brush)
        return;
    ownWindow.makeFirstResponder(this);
    m_startPoint = convertTo(event.locationInWindow, nullptr);
    beginStroke();
}

void DrawingCanvasView::beginStroke()
{
    QColor color = m_brushColor;
    color.setAlphaF(strokeOpacity);
    model().createPathWithParam(color, m_brushThickness, m_startPoint);
}

// A pointer in the top row of pixels has the y of the canvas's top edge, which Rect::contains()
// does not count as inside.
bool DrawingCanvasView::isOver(Point point) const
{
    const platform::Rect area = bounds();
    return area.contains(point)
        || (point.y == area.maxY() && point.x >= area.x && point.x < area.maxX());
}

void DrawingCanvasView::mouseDragged(const platform::MouseEvent &event)
{
    const Point point = convertFrom(event.locationInWindow, this);
    if (m_currentSelectedTool == Tools::eraser && !dragEraserTo(point))
        takePointer(point);
    else
        dragTo(point);
}

// However fast the eraser moves, it erases each stroke that its way crosses, at the place where it
// meets the stroke. Only the oldest stroke at a place is erased, so the way is searched again until
// no stroke is met or none goes any more. Returns whether a stroke lies at the end of the way,
// which is left to the caller.
bool DrawingCanvasView::dragEraserTo(Point point)
{
    const Way way { std::exchange(m_eraserPlace, point).value_or(point), point };
    int strokesLeft = -1;
    for (;;) {
        const Meetings met = model().strokeIndex().meetingsOn(way);
        if (met.places.empty() || model().pathArray().size() == strokesLeft)
            return met.isAtEnd;
        strokesLeft = model().pathArray().size();
        for (const Point &place : met.places)
            dragTo(place);
    }
}

void DrawingCanvasView::takePointer(Point point)
{
    if (window())
        window()->makeFirstResponder(this);
    if (isOver(point) && !(platform::Cursor::currentCursor() == m_cursorType))
        m_cursorType.set(surface());
}

void DrawingCanvasView::dragTo(Point point)
{
    takePointer(point);
    if (m_currentSelectedTool == Tools::brush) {
        m_lastPoint = point;
        m_isDragged = true;
        if (DrawingCanvasDelegate *const delegate = m_drawingCanvasDelegate.get())
            delegate->didBeginDrawing(m_lastPoint);
        m_startPoint = m_lastPoint;
    } else if (m_currentSelectedTool == Tools::eraser) {
        eraseAt(point);
    }
}

void DrawingCanvasView::eraseAt(Point point)
{
    if (!model().performEraseOperationAtLocation(point))
        return;
    controller().updateDrawingCanvasElements();
    require(controller().drawingView(), "the canvas's controller has no canvas")->setNeedsDisplay();
}

void DrawingCanvasView::mouseUp(const platform::MouseEvent &event)
{
    const Point point = convertTo(event.locationInWindow, nullptr);
    if (!isOver(point) && platform::Cursor::currentCursor() == m_cursorType)
        platform::Cursor::arrow().set(surface());
    if (m_currentSelectedTool == Tools::brush) {
        endStroke(point);
    } else if (m_currentSelectedTool == Tools::eraser) {
        if (dragEraserTo(point))
            eraseAt(point);
        setNeedsDisplay();
    } else if (m_currentSelectedTool == Tools::text) {
        placeTextBox(point);
    }
    m_eraserPlace.reset();
}

void DrawingCanvasView::endStroke(Point point)
{
    m_lastPoint = point;
    if (m_startPoint == point && !m_isDragged) {
        dropEntryOfClick();
        return;
    }
    m_isDragged = false;
    setNeedsDisplay();
}

// The model keeps the empty stroke that a click without a drag has begun. The copy here may not
// have received it yet; the entry that is dropped is then an earlier stroke. So that this stroke
// does not vanish from the screen, draw() takes the arrays from the model again.
void DrawingCanvasView::dropEntryOfClick()
{
    if (m_pathArray.isEmpty())
        return;
    m_pathArray.removeLast();
    m_hasDroppedEntry = true;
    QMetaObject::invokeMethod(this, &DrawingCanvasView::takeArraysAnew, Qt::QueuedConnection);
}

void DrawingCanvasView::takeArraysAnew()
{
    if (m_hasDroppedEntry && m_drawingCanvasDelegate.get())
        m_drawingCanvasDelegate.get()->updateDrawingCanvasElements();
}

void DrawingCanvasView::placeTextBox(Point point)
{
    platform::ViewHost *const ownWindow = window();
    if (!ownWindow || ownWindow->firstResponder() != this) {
        if (ownWindow)
            ownWindow->makeFirstResponder(this); // the click only ends the editing of a box
        return;
    }
    auto *const owner = dynamic_cast<QObject *>(&controller());
    model().createTextBox(point, m_brushColor, m_textFontSize, owner);
    controller().createTextBoxOnCanvas(point);
    if (m_textBoxArray.isEmpty())
        platform::fatalError("a new text box has not reached the canvas");
    const auto box = m_textBoxArray.last().textBox;
    addSubview(box);
    if (!isOver(point)) // pressed here and let go elsewhere: who writes in it wants to see where
        box->setFrame(frameInReach(box->frame(), bounds().size()));
    ownWindow->makeFirstResponder(box.get());
}

void DrawingCanvasView::resetCursorRects()
{
    addCursorRect(bounds(), m_cursorType);
}

bool DrawingCanvasView::isTextEdited() const
{
    const auto *const box
        = dynamic_cast<TnTextBox *>(window() ? window()->firstResponder() : nullptr);
    return box && box->superview() == this && box->isEditable();
}

bool DrawingCanvasView::hasPlacedTextBox(const platform::View &view) const
{
    const auto *const box = dynamic_cast<const TnTextBox *>(&view);
    return box && box->superview() == this && !box->isEditable();
}

void DrawingCanvasView::setCoversWindow(bool covers)
{
    m_coversWindow = covers;
    surface().setAttribute(Qt::WA_OpaquePaintEvent, covers);
    setNeedsDisplay();
}

QColor DrawingCanvasView::paper() const
{
    return m_coversWindow && window() ? window()->backgroundColor() : Qt::transparent;
}

QSize DrawingCanvasView::pixelSize() const
{
    return (QSizeF(QWidget::size()) * QWidget::devicePixelRatioF()).toSize();
}

const PixelLayer &DrawingCanvasView::finishedPixels()
{
    DrawingCanvasDelegate *const delegate = m_drawingCanvasDelegate.get();
    const std::shared_ptr<DrawingCanvasModel> content
        = delegate ? delegate->drawingCanvasModel() : nullptr;
    if (content) { // whose strokes begin with those of the copy here
        const double scale = QWidget::devicePixelRatioF();
        m_picture.update(content->strokeIndex(), pixelSize(), scale, paper());
    }
    return m_picture.pixels();
}

void DrawingCanvasView::showStrokes(const platform::Rect &dirtyRect)
{
    const double scale = QWidget::devicePixelRatioF();
    const QSize size = pixelSize();
    const PixelLayer &pixels = finishedPixels();

    QPainter painter(&surface());
    if (m_coversWindow)
        painter.setCompositionMode(QPainter::CompositionMode_Source);
    if (pixels.area().isEmpty()) {
        painter.fillRect(surface().rect(), paper());
        return;
    }
    // One point more than was marked, on every side, so that no pixel at the edge is left out; the
    // painter clips what is too much.
    const platform::Rect dirty = dirtyRect.grownBy(1.0);
    const QRect area
        = QRectF(dirty.x * scale, dirty.y * scale, dirty.width * scale, dirty.height * scale)
              .toAlignedRect()
        & QRect(QPoint(), size);
    painter.scale(1 / scale, 1 / scale); // so that the picture is copied pixel for pixel
    painter.drawImage(QPoint(area.x(), size.height() - area.y() - area.height()), pixels.image(),
        pixels.inImage(area));
}

void DrawingCanvasView::draw(const platform::Rect &dirtyRect)
{
    takeArraysAnew();
    showStrokes(dirtyRect);
    bringBackTextBoxes();
}

// Undo brings a text box back into the array only; here it becomes a view on the canvas again.
void DrawingCanvasView::bringBackTextBoxes()
{
    const EntryList<TextBoxEntry> boxes = m_textBoxArray; // adding a box may change the list
    for (const TextBoxEntry &entry : boxes)
        addSubview(entry.textBox);
}

void DrawingCanvasView::drawContent(QPainter &painter)
{
    takeArraysAnew();
    const PixelLayer &pixels = finishedPixels();
    const double scale = QWidget::devicePixelRatioF();
    painter.scale(1 / scale, 1 / scale); // pixel for pixel, as on the screen
    if (!pixels.area().isEmpty())
        painter.drawImage(QPoint(), pixels.image(), pixels.inImage(QRect(QPoint(), pixelSize())));
    bringBackTextBoxes(); // nothing may have been painted since undo brought them back
}

} // namespace penwick
