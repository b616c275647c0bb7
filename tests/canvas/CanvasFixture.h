// SPDX-License-Identifier: MIT
// A window with a canvas and its controller, a pointer to draw with, and eyes on what is painted.
#pragma once

#include "appearance/PenwickBundle.h"
#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "history/NotificationNames.h"
#include "history/SubviewOperation.h"
#include "history/UndoRedoManager.h"
#include "platform/window/WindowContent.h"
#include "support/NotificationRecorder.h"
#include "textbox/TnTextBox.h"

#include <penwick/platform/NotificationCenter.h>
#include <penwick/platform/Window.h>

#include <gtest/gtest.h>

#include <QCoreApplication>
#include <QImage>
#include <QMouseEvent>
#include <QPaintEvent>
#include <QPixmap>
#include <QScreen>
#include <QTest>

#include <algorithm>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace penwick::test {

using platform::Point;
using platform::Rect;
using Ids = std::vector<std::int64_t>;
using Posts = std::vector<std::string>;

inline Ids idsOf(const EntryList<StrokeEntry> &entries)
{
    Ids identifiers;
    for (const StrokeEntry &entry : entries)
        identifiers.push_back(entry.pathId);
    return identifiers;
}

inline Ids idsOf(const EntryList<TextBoxEntry> &entries)
{
    Ids identifiers;
    for (const TextBoxEntry &entry : entries)
        identifiers.push_back(entry.textId);
    return identifiers;
}

/// A view that is no text box.
class PlainView final : public platform::ViewOf<QWidget>
{
public:
    using ViewOf::ViewOf;
};

/// The parts of a widget that were painted, each as Qt counts: pixels from the top left corner.
class PaintRecorder final : public QObject
{
public:
    explicit PaintRecorder(QWidget &widget) { widget.installEventFilter(this); }

    /// What was painted since the last call.
    [[nodiscard]] std::vector<QRect> take() { return std::exchange(m_painted, {}); }

    bool eventFilter(QObject * /*watched*/, QEvent *event) override
    {
        if (event->type() == QEvent::Paint)
            m_painted.push_back(static_cast<QPaintEvent *>(event)->region().boundingRect());
        return false;
    }

private:
    std::vector<QRect> m_painted;
};

/// A key window on the screen, 300 wide and 200 high, whose content is an empty canvas.
class CanvasFixture : public ::testing::Test
{
protected:
    static constexpr int width = 300;
    static constexpr int height = 200;
    static constexpr int paper = 255; // white
    static constexpr int ink = 105; // (41, 41, 41) at alpha 0.7 over white

    CanvasFixture()
    {
        setPenwickBundle(std::make_shared<platform::Bundle>(QStringLiteral(":/penwick/images")));
        window.setFrame({ 100, 100, width, height });
        canvas = new DrawingCanvasView(&window);
        contentOf(window).adoptScene();
        auto content = std::make_unique<DrawViewController>();
        controller = content.get();
        controller->setDrawingView(canvas);
        controller->setView(*canvas);
        contentOf(window).setContentViewController(std::move(content));
        window.show();
        activate(window);
        window.resize(width, height); // a frame would have the title bar in it
        // The desktop's last answers bring repaints of their own.
        PaintRecorder painted(*canvas);
        do {
            settle();
        } while (!painted.take().empty());
    }

    static void activate(platform::Window &which)
    {
        which.activateWindow();
        static_cast<void>(QTest::qWaitForWindowActive(&which));
        QCoreApplication::processEvents();
    }

    /// Lets everything that is marked be painted.
    static void settle() { QCoreApplication::processEvents(); }

    /// The pointer; places are in the canvas's coordinates, y up.
    void press(Point point, Qt::MouseButton button = Qt::LeftButton)
    {
        send(QEvent::MouseButtonPress, point, button, button);
    }
    void drag(Point point, Qt::MouseButton button = Qt::LeftButton)
    {
        send(QEvent::MouseMove, point, Qt::NoButton, button);
    }
    void release(Point point, Qt::MouseButton button = Qt::LeftButton)
    {
        send(QEvent::MouseButtonRelease, point, button, Qt::NoButton);
    }
    void click(Point point)
    {
        press(point);
        release(point);
    }

    /// Draws through `points` with the brush, lets it be painted and returns the new stroke.
    std::int64_t stroke(const std::vector<Point> &points)
    {
        press(points.front());
        for (std::size_t index = 1; index < points.size(); ++index)
            drag(points[index]);
        release(points.back());
        settle();
        return model().pathArray().last().pathId;
    }

    /// Places an empty text box with the text tool, then goes back to the tool that there was.
    std::int64_t textBox(Point point)
    {
        const QString tool = canvas->currentSelectedTool();
        canvas->setCurrentSelectedTool(QStringLiteral("text"));
        contentOf(window).makeFirstResponder(canvas);
        click(point);
        canvas->setCurrentSelectedTool(tool);
        settle();
        return model().textBoxArray().last().textId;
    }

    /// The same with text in it, and still edited.
    std::int64_t writtenTextBox(Point point)
    {
        const std::int64_t id = textBox(point);
        QTest::keyClicks(model().textBoxArray().last().textBox.get(), QStringLiteral("Text"));
        settle();
        return id;
    }

    /// The same, and then left. The box stays because it has text; its delete button is a hidden
    /// subview from then on.
    std::int64_t placedTextBox(Point point)
    {
        const std::int64_t id = writtenTextBox(point);
        contentOf(window).makeFirstResponder(canvas);
        settle();
        return id;
    }

    [[nodiscard]] DrawingCanvasModel &model() const { return *controller->drawingCanvasModel(); }
    [[nodiscard]] UndoRedoManager &history() const { return *model().undoRedoManager(); }

    /// What is on the screen now.
    [[nodiscard]] QImage onScreen() const
    {
        const QPixmap picture = window.screen()->grabWindow(window.winId());
        return picture.toImage().convertToFormat(QImage::Format_RGB32);
    }

    /// The grey at the pixel of which `point` is the middle or the bottom left corner.
    static int greyAt(const QImage &picture, Point point)
    {
        const int row = height - 1 - static_cast<int>(point.y);
        return qRed(picture.pixel(static_cast<int>(point.x), row));
    }

    /// The darkest grey of a picture.
    static int darkest(const QImage &picture)
    {
        int grey = paper;
        for (int row = 0; row < picture.height(); ++row) {
            for (int column = 0; column < picture.width(); ++column)
                grey = std::min(grey, qRed(picture.pixel(column, row)));
        }
        return grey;
    }

    /// What is on the screen while nothing is on the canvas.
    [[nodiscard]] QImage blank() const
    {
        QImage picture(onScreen().size(), QImage::Format_RGB32);
        picture.fill(Qt::white);
        return picture;
    }

    static void post(const QString &name, const QVariant &object = QVariant())
    {
        platform::NotificationCenter::defaultCenter().postNotification(name, object);
    }

    static void postSubviewOperation(const SubviewOperation &operation)
    {
        post(drawingCanvasSubviewUpdateNotification(), operation.toVariant());
    }

    /// What choosing `tool` prints.
    std::string printedBy(const QString &tool)
    {
        ::testing::internal::CaptureStdout();
        controller->handleToolSelection(tool);
        return ::testing::internal::GetCapturedStdout();
    }

    /// What choosing `option` prints.
    std::string printedByOption(const QString &option)
    {
        ::testing::internal::CaptureStdout();
        controller->handleToolOptionSelection(option);
        return ::testing::internal::GetCapturedStdout();
    }

    std::shared_ptr<PlainView> addPlainView()
    {
        auto view = platform::makeView<PlainView>();
        canvas->addSubview(view);
        return view;
    }

    static std::vector<QRect> paintedAfterNow(PaintRecorder &painted)
    {
        settle();
        return painted.take();
    }

    platform::Window window;
    DrawingCanvasView *canvas = nullptr;
    DrawViewController *controller = nullptr;
    NotificationRecorder recorder;

private:
    void send(QEvent::Type type, Point point, Qt::MouseButton button, Qt::MouseButtons buttons)
    {
        const QPointF position(point.x, canvas->QWidget::height() - point.y);
        QMouseEvent event(
            type, position, canvas->mapToGlobal(position), button, buttons, Qt::NoModifier);
        QCoreApplication::sendEvent(canvas, &event);
    }
};

} // namespace penwick::test
