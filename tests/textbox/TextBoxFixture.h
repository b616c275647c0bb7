// SPDX-License-Identifier: MIT
// Text boxes on a canvas on the screen, with hands to write and to point.
#pragma once

#include "appearance/Theme.h"
#include "canvas/CanvasFixture.h"
#include "platform/window/WindowContent.h"

#include <QApplication>
#include <QClipboard>
#include <QMimeData>

namespace penwick::test {

/// Writes down who reported its end.
class RecordingOwner final : public QObject, public TextBoxDelegate
{
public:
    void shouldDeleteTheTextBox(std::int64_t withHash) override { reports.push_back(withHash); }

    Ids reports;
};

/// The canvas asks for a layer, as the one of the drawing window does; the caret does not blink.
class TextBoxFixture : public CanvasFixture
{
protected:
    /// The grey of text, and of the placeholder, on white.
    static constexpr int textGrey = 41;
    static constexpr int placeholderGrey = 148;

    TextBoxFixture()
    {
        QApplication::setCursorFlashTime(0);
        canvas->setWantsLayer(true);
        settle();
    }
    ~TextBoxFixture() override
    {
        QApplication::setCursorFlashTime(m_flashTime);
        QApplication::clipboard()->clear();
    }

    /// What a click with the text tool makes: 200 x 30, edited, its frame's origin at (20, 100).
    std::shared_ptr<TnTextBox> newBox(Point clicked = { 20, 124 })
    {
        textBox(clicked);
        return model().textBoxArray().last().textBox;
    }

    /// The same with `text` in it, and left.
    std::shared_ptr<TnTextBox> placedBox(
        Point clicked = { 20, 124 }, const QString &text = QStringLiteral("Hello"))
    {
        auto box = newBox(clicked);
        QTest::keyClicks(box.get(), text);
        leave();
        return box;
    }

    /// Ends whatever is edited.
    void leave()
    {
        contentOf(window).makeFirstResponder(canvas);
        settle();
    }

    static void paste(TnTextBox &box, const QString &text)
    {
        QApplication::clipboard()->setText(text);
        box.paste();
        settle();
    }

    /// The pointer on a view; `place` is in its pixels from the top left corner.
    static void pressOn(platform::View &view, QPointF place,
        QEvent::Type type = QEvent::MouseButtonPress, Qt::MouseButton button = Qt::LeftButton)
    {
        sendTo(view, type, place, button, button);
    }
    static void dragOn(platform::View &view, QPointF place)
    {
        sendTo(view, QEvent::MouseMove, place, Qt::NoButton, Qt::LeftButton);
    }
    static void moveOver(platform::View &view, QPointF place)
    {
        sendTo(view, QEvent::MouseMove, place, Qt::NoButton, Qt::NoButton);
    }
    static void releaseOn(
        platform::View &view, QPointF place, Qt::MouseButton button = Qt::LeftButton)
    {
        sendTo(view, QEvent::MouseButtonRelease, place, button, Qt::NoButton);
    }
    static void clickOn(
        platform::View &view, QPointF place, Qt::MouseButton button = Qt::LeftButton)
    {
        pressOn(view, place, QEvent::MouseButtonPress, button);
        releaseOn(view, place, button);
    }
    static void doubleClickOn(platform::View &view, QPointF place)
    {
        clickOn(view, place);
        pressOn(view, place, QEvent::MouseButtonDblClick);
        releaseOn(view, place);
    }

    /// The box as it is on the screen.
    [[nodiscard]] QImage pictureOf(const TnTextBox &box) const
    {
        return onScreen().copy(box.geometry());
    }

    static double borderWidth(TnTextBox &box) { return box.layer()->borderWidth; }

private:
    static void sendTo(platform::View &view, QEvent::Type type, QPointF place,
        Qt::MouseButton button, Qt::MouseButtons buttons)
    {
        QMouseEvent event(
            type, place, view.surface().mapToGlobal(place), button, buttons, Qt::NoModifier);
        QCoreApplication::sendEvent(&view.surface(), &event);
    }

    const int m_flashTime = QApplication::cursorFlashTime();
};

} // namespace penwick::test
