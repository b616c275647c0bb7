// SPDX-License-Identifier: MIT
// The picture of the drawing that a host takes: all that was drawn, nothing of how it is shown.
#include "session/SessionFixture.h"

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/window/WindowContent.h"
#include "textbox/TnTextBox.h"

#include <QScrollBar>
#include <QTest>

namespace penwick::test {

namespace {

constexpr QColor white { 255, 255, 255 };
constexpr QColor pictureColor { 0, 120, 60 };
constexpr QPoint onStroke { 300, 250 }; // points from the top left corner
constexpr int inkOnWhite = 105; // (41, 41, 41) at alpha 0.7
constexpr int opaque = 255;
constexpr int inkAlpha = 179; // of 255: 0.7

class ContentImage : public SessionFixture
{
protected:
    platform::Window &open(WindowType type, const std::optional<QImage> &image = std::nullopt)
    {
        m_controller = m_penwick.createDrawingWindowController(type, primary(), image);
        m_controller->showWindow(nullptr);
        EXPECT_TRUE(QTest::qWaitForWindowActive(m_controller->drawingWindow()));
        return window();
    }

    [[nodiscard]] platform::Window &window() const { return *m_controller->drawingWindow(); }
    [[nodiscard]] DrawingCanvasView &canvas() const
    {
        return dynamic_cast<DrawingCanvasView &>(*contentOf(window()).contentView());
    }
    [[nodiscard]] DrawViewController &drawing() const
    {
        return dynamic_cast<DrawViewController &>(*contentOf(window()).contentViewController());
    }

    void drag(QPoint from, QPoint to) const
    {
        send(QEvent::MouseButtonPress, from, Qt::LeftButton);
        send(QEvent::MouseMove, to, Qt::LeftButton);
        send(QEvent::MouseButtonRelease, to, Qt::NoButton);
    }

    void drawStroke() const
    {
        drawing().handleToolSelection(QStringLiteral("brush"));
        canvas().setBrushThickness(8.0);
        drag(onStroke - QPoint(100, 0), onStroke + QPoint(100, 0));
    }

    /// A text box, still edited, with its top left corner at `place`.
    TnTextBox &edit(QPoint place, const QString &text) const
    {
        drawing().handleToolSelection(QStringLiteral("text"));
        contentOf(window()).makeFirstResponder(&canvas());
        send(QEvent::MouseButtonPress, place, Qt::LeftButton);
        send(QEvent::MouseButtonRelease, place, Qt::NoButton);
        TnTextBox &box = *drawing().drawingCanvasModel()->textBoxArray().last().textBox;
        QTest::keyClicks(&box, text);
        return box;
    }

    void leave() const { contentOf(window()).makeFirstResponder(&canvas()); }

    /// The content without the outermost points, where the canvas has its border.
    [[nodiscard]] QRect insideBorder() const
    {
        constexpr int border = 3;
        return window().rect().adjusted(border, border, -border, -border);
    }
    /// What the window has painted on the screen in `area`, of points.
    [[nodiscard]] QImage onScreen(const QRect &area) const
    {
        return window().grab(area).toImage().convertToFormat(QImage::Format_RGB32);
    }

private:
    void send(QEvent::Type type, QPoint place, Qt::MouseButtons held) const
    {
        const Qt::MouseButton button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(type, place, canvas().mapToGlobal(place), button, held, Qt::NoModifier);
        QCoreApplication::sendEvent(&canvas(), &event);
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
};

// What `image` has in `area` of its points.
QImage part(const QImage &image, const QRect &area)
{
    const double scale = image.devicePixelRatio();
    return image.copy(QRectF(QPointF(area.topLeft()) * scale, QSizeF(area.size()) * scale).toRect())
        .convertToFormat(QImage::Format_RGB32);
}

QColor colorAt(const QImage &image, QPoint point)
{
    return image.pixelColor(point * image.devicePixelRatio());
}

QImage picture()
{
    QImage image(640, 400, QImage::Format_RGB32);
    image.fill(pictureColor);
    return image;
}

int darkestIn(const QImage &image)
{
    int grey = opaque;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            grey = std::min(grey, qGray(image.pixel(x, y)));
    }
    return grey;
}

} // namespace

TEST_F(ContentImage, newBoardIsPaperAloneAsLargeAsTheContent)
{
    open(WindowType::whiteboard);

    const QImage image = window().contentImage();

    EXPECT_EQ(image.size(), window().size() * window().devicePixelRatio());
    EXPECT_EQ(image.devicePixelRatio(), window().devicePixelRatio());
    QImage paper(image.size(), image.format());
    paper.fill(white);
    EXPECT_EQ(image, paper) << "the board's border is no part of it";
}

TEST_F(ContentImage, hasTheStrokesPixelForPixelAsOnTheScreen)
{
    open(WindowType::whiteboard);
    drawStroke();

    const QImage image = window().contentImage();

    EXPECT_EQ(colorAt(image, onStroke), QColor(inkOnWhite, inkOnWhite, inkOnWhite));
    EXPECT_EQ(part(image, insideBorder()), onScreen(insideBorder()));
}

TEST_F(ContentImage, strokeThatIsBeingDrawnIsInIt)
{
    open(WindowType::whiteboard);
    canvas().setBrushThickness(8.0);
    QMouseEvent press(QEvent::MouseButtonPress, QPointF(250, 250), QPointF(250, 250),
        Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
    QMouseEvent move(QEvent::MouseMove, QPointF(350, 250), QPointF(350, 250), Qt::NoButton,
        Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(&canvas(), &press);
    QCoreApplication::sendEvent(&canvas(), &move);

    EXPECT_EQ(
        colorAt(window().contentImage(), onStroke), QColor(inkOnWhite, inkOnWhite, inkOnWhite));
}

TEST_F(ContentImage, layersPaperIsTransparent)
{
    open(WindowType::annotation);
    drawStroke();

    const QImage image = window().contentImage();

    EXPECT_EQ(colorAt(image, { 10, 10 }).alpha(), 0);
    EXPECT_EQ(colorAt(image, onStroke).alpha(), inkAlpha);
}

TEST_F(ContentImage, pictureThatIsDrawnOnIsInItWithoutItsFrame)
{
    open(WindowType::imageAnnotation, picture());
    drag({ 100, 200 }, { 300, 200 });

    const QImage image = window().contentImage();

    EXPECT_EQ(image.pixelColor(0, image.height() - 1), pictureColor) << "a corner of it";
    EXPECT_EQ(colorAt(image, { 20, 50 }), pictureColor);
    EXPECT_NE(colorAt(image, { 200, 200 }), pictureColor) << "a stroke";
}

TEST_F(ContentImage, textIsTheSameWhetherItIsEditedSelectedOrPlaced)
{
    open(WindowType::whiteboard);
    TnTextBox &box = edit({ 200, 60 }, QStringLiteral("Words"));

    const QImage edited = window().contentImage();
    box.selectAll();
    const QImage selected = window().contentImage();
    leave();
    const QImage placed = window().contentImage();

    constexpr int lightInk = 60;
    EXPECT_LT(darkestIn(part(placed, box.geometry())), lightInk) << "the text itself";
    EXPECT_EQ(edited, placed) << "no caret, no dashes, no delete button";
    EXPECT_EQ(selected, placed);
    constexpr int placedBorder = 4;
    const QRect text
        = box.geometry().adjusted(placedBorder, placedBorder, -placedBorder, -placedBorder);
    EXPECT_EQ(part(placed, text), onScreen(text));
    EXPECT_EQ(colorAt(placed, box.geometry().topLeft()), white) << "no border";
}

TEST_F(ContentImage, placeholderOfAnEmptyBoxIsNotInIt)
{
    open(WindowType::whiteboard);
    const QImage before = window().contentImage();

    edit({ 200, 60 }, QString());

    EXPECT_EQ(window().contentImage(), before);
}

TEST_F(ContentImage, textThatIsScrolledShowsWhatItsBoxShows)
{
    open(WindowType::whiteboard);
    TnTextBox &box = edit({ 200, 60 }, QString());
    QString lines;
    for (int line = 0; line < 60; ++line)
        lines += QStringLiteral("line\n");
    box.insertPlainText(lines + QStringLiteral("a last and longer line"));
    leave();

    box.verticalScrollBar()->setValue(100);
    ASSERT_EQ(box.verticalScrollBar()->value(), 100);

    const QImage image = window().contentImage();

    constexpr int border = 4;
    const QRect text = box.geometry().adjusted(border, border, -border, -border)
        & window().rect().adjusted(border, border, -border, -border);
    EXPECT_EQ(part(image, text), onScreen(text));
}

TEST_F(ContentImage, isTheSameWhileTheWindowIsHiddenOrMinimised)
{
    open(WindowType::whiteboard);
    drawStroke();
    edit({ 200, 60 }, QStringLiteral("Words"));
    const QImage shown = window().contentImage();

    window().showMinimized();
    EXPECT_EQ(window().contentImage(), shown);
    window().orderOut();
    EXPECT_EQ(window().contentImage(), shown);
}

TEST_F(ContentImage, whatWasDrawnOrUndoneWhileTheWindowIsHiddenCounts)
{
    open(WindowType::whiteboard);
    edit({ 200, 60 }, QStringLiteral("Words"));
    leave();
    const QImage full = window().contentImage();
    drawing().handleToolSelection(QStringLiteral("undo"));
    const QImage empty = window().contentImage();
    window().orderOut();

    drawing().handleToolSelection(QStringLiteral("redo"));

    EXPECT_NE(full, empty);
    EXPECT_EQ(window().contentImage(), full);
}

TEST_F(ContentImage, canBeTakenInsideTheEndNotificationAndAfterIt)
{
    open(WindowType::whiteboard);
    drawStroke();
    edit({ 200, 60 }, QStringLiteral("Words"));
    const QImage before = window().contentImage();
    QImage atEnd;
    setReaction([&] { atEnd = window().contentImage(); });

    window().close();

    EXPECT_EQ(ends().size(), 1U);
    EXPECT_EQ(atEnd, before);
    EXPECT_EQ(window().contentImage(), before);
}

TEST_F(ContentImage, clickThatDropsAnEntryOfTheViewsCopyTakesNothingAway)
{
    open(WindowType::whiteboard);
    drawStroke();
    const QImage before = window().contentImage();

    QTest::mouseClick(&canvas(), Qt::LeftButton, {}, { 500, 100 });

    EXPECT_EQ(window().contentImage(), before);
}

} // namespace penwick::test
