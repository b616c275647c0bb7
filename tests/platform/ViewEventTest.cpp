// SPDX-License-Identifier: MIT
// Which of Qt's events reach a view, and what they say there.
#include "platform/ViewFixture.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QTextEdit>

#include <optional>

namespace penwick::platform {

namespace {

constexpr auto none = Qt::NoButton;
constexpr auto left = Qt::LeftButton;

class ViewEvent : public ViewFixture
{
protected:
    /// Sends one mouse event to the content; answers whether it was accepted.
    bool send(QEvent::Type type, QPointF position, Qt::MouseButton button, Qt::MouseButtons buttons)
    {
        QMouseEvent event(
            type, position, m_content.mapToGlobal(position), button, buttons, Qt::NoModifier);
        event.ignore();
        QCoreApplication::sendEvent(&m_content, &event);
        return event.isAccepted();
    }

    void sendKey(QEvent::Type type, int key, bool isRepeated = false,
        Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QKeyEvent event(type, key, modifiers, QString(), isRepeated);
        QCoreApplication::sendEvent(&m_content, &event);
    }
};

/// A text editor that is a view and overrides nothing.
class PlainEditor final : public ViewOf<QTextEdit>
{
public:
    using ViewOf::ViewOf;
};

} // namespace

TEST_F(ViewEvent, pointIsInTheWindowAndCountsUpwards)
{
    send(QEvent::MouseButtonPress, { 3, 43 }, left, left);

    EXPECT_EQ(m_content.take(), Log { "down 3,57 x1" });
}

TEST_F(ViewEvent, pointOfASubviewIsInTheWindowToo)
{
    const auto view = added({ 10.0, 20.0, 30.0, 40.0 });

    QTest::mousePress(view.get(), left, Qt::NoModifier, QPoint(3, 4));

    EXPECT_EQ(view->take(), Log { "down 13,56 x1" });
    EXPECT_EQ(m_content.take(), Log {});
}

TEST_F(ViewEvent, strokeIsAPressDragsAndARelease)
{
    send(QEvent::MouseButtonPress, { 0, 0 }, left, left);
    send(QEvent::MouseMove, { 5, 10 }, none, left);
    send(QEvent::MouseMove, { 300, 120 }, none, left);
    send(QEvent::MouseButtonRelease, { 300, 120 }, left, none);

    EXPECT_EQ(m_content.take(),
        (Log { "down 0,100 x1", "drag 5,90 x1", "drag 300,-20 x1", "up 300,-20 x1" }));
}

TEST_F(ViewEvent, moveWithoutAButtonIsAMove)
{
    send(QEvent::MouseMove, { 5, 10 }, none, none);

    EXPECT_EQ(m_content.take(), Log { "move 5,90 x0" });
}

TEST_F(ViewEvent, dragBeginsWithTheMoveThatGotFarEnoughAndThenGoesOnBackAtThePress)
{
    m_content.setDragDistance(10.0);

    send(QEvent::MouseButtonPress, { 50, 50 }, left, left);
    send(QEvent::MouseMove, { 55, 46 }, none, left); // five and four are nine
    send(QEvent::MouseMove, { 44, 53 }, none, left);
    send(QEvent::MouseMove, { 44, 54 }, none, left);
    send(QEvent::MouseMove, { 51, 50 }, none, left);
    send(QEvent::MouseButtonRelease, { 51, 50 }, left, none);

    EXPECT_EQ(m_content.take(),
        (Log { "down 50,50 x1", "drag 44,46 x1", "drag 51,50 x1", "up 51,50 x1" }));
}

TEST_F(ViewEvent, everyPressHasItsDragDistanceAhead)
{
    m_content.setDragDistance(10.0);
    send(QEvent::MouseButtonPress, { 50, 50 }, left, left);
    send(QEvent::MouseMove, { 80, 50 }, none, left);
    send(QEvent::MouseButtonRelease, { 80, 50 }, left, none);
    static_cast<void>(m_content.take());

    send(QEvent::MouseButtonPress, { 80, 50 }, left, left);
    send(QEvent::MouseMove, { 85, 50 }, none, left);
    send(QEvent::MouseButtonRelease, { 85, 50 }, left, none);

    EXPECT_EQ(m_content.take(), (Log { "down 80,50 x1", "up 85,50 x1" }));
}

TEST_F(ViewEvent, dragThatWasNotPressedHereIsNotDelivered)
{
    const bool isAccepted = send(QEvent::MouseMove, { 5, 10 }, none, left);

    EXPECT_TRUE(isAccepted);
    EXPECT_EQ(m_content.take(), Log {});
}

TEST_F(ViewEvent, releaseThatWasNotPressedHereIsNotDelivered)
{
    const bool isAccepted = send(QEvent::MouseButtonRelease, { 5, 10 }, left, none);

    EXPECT_TRUE(isAccepted);
    EXPECT_EQ(m_content.take(), Log {});
}

TEST_F(ViewEvent, secondClickOfADoubleClickCountsTwo)
{
    QTest::mouseClick(&m_content, left, Qt::NoModifier, QPoint(1, 1));
    send(QEvent::MouseButtonDblClick, { 1, 1 }, left, left);
    send(QEvent::MouseMove, { 2, 2 }, none, left);
    send(QEvent::MouseButtonRelease, { 2, 2 }, left, none);

    EXPECT_EQ(m_content.take(),
        (Log { "down 1,99 x1", "up 1,99 x1", "down 1,99 x2", "drag 2,98 x2", "up 2,98 x2" }));
}

TEST_F(ViewEvent, clickAfterADoubleClickCountsOneAgain)
{
    QTest::mouseDClick(&m_content, left, Qt::NoModifier, QPoint(1, 1));
    static_cast<void>(m_content.take());

    QTest::mouseClick(&m_content, left, Qt::NoModifier, QPoint(50, 50));

    EXPECT_EQ(m_content.take(), (Log { "down 50,50 x1", "up 50,50 x1" }));
}

TEST_F(ViewEvent, keyWithoutAMeaningIsZero)
{
    sendKey(QEvent::KeyPress, Qt::Key_A);
    sendKey(QEvent::KeyRelease, Qt::Key_A);
    sendKey(QEvent::KeyRelease, Qt::Key_Return);

    EXPECT_EQ(m_content.take(), (Log { "key 0", "key 0" }));
}

TEST_F(ViewEvent, backspaceAndDeleteAreKeyFiftyOne)
{
    sendKey(QEvent::KeyRelease, Qt::Key_Backspace);
    sendKey(QEvent::KeyRelease, Qt::Key_Delete);
    sendKey(QEvent::KeyRelease, Qt::Key_Delete, false, Qt::KeypadModifier);

    EXPECT_EQ(m_content.take(), (Log { "key 51", "key 51", "key 51" }));
}

TEST_F(ViewEvent, backspaceAndDeleteWithAModifierAreNot)
{
    for (const auto modifier :
        { Qt::ControlModifier, Qt::ShiftModifier, Qt::AltModifier, Qt::MetaModifier }) {
        sendKey(QEvent::KeyRelease, Qt::Key_Backspace, false, modifier);
        sendKey(QEvent::KeyRelease, Qt::Key_Delete, false, modifier);
    }

    EXPECT_EQ(m_content.take(), Log(8, "key 0"));
}

TEST_F(ViewEvent, deleteWhoseModifierIsLetGoFirstIsNot)
{
    sendKey(QEvent::KeyPress, Qt::Key_Delete, false, Qt::ControlModifier);
    sendKey(QEvent::KeyRelease, Qt::Key_Control);
    sendKey(QEvent::KeyRelease, Qt::Key_Delete);
    EXPECT_EQ(m_content.take(), (Log { "key 0", "key 0" }));

    sendKey(QEvent::KeyPress, Qt::Key_Delete);
    sendKey(QEvent::KeyRelease, Qt::Key_Delete);
    EXPECT_EQ(m_content.take(), Log { "key 51" });
}

TEST_F(ViewEvent, keyThatIsHeldDownIsReleasedOnce)
{
    for (int repetition = 0; repetition < 3; ++repetition) {
        sendKey(QEvent::KeyRelease, Qt::Key_Backspace, true);
        sendKey(QEvent::KeyPress, Qt::Key_Backspace, true);
    }
    sendKey(QEvent::KeyRelease, Qt::Key_Backspace);

    EXPECT_EQ(m_content.take(), Log { "key 51" });
}

TEST_F(ViewEvent, pointerEntersAndExits)
{
    QEnterEvent enter(QPointF(1, 1), QPointF(1, 1), QPointF(1, 1));
    QCoreApplication::sendEvent(&m_content, &enter);
    QEvent leave(QEvent::Leave);
    QCoreApplication::sendEvent(&m_content, &leave);

    EXPECT_EQ(m_content.take(), (Log { "entered", "exited" }));
}

TEST_F(ViewEvent, editorThatOverridesNothingDoesWhatItsBaseDoes)
{
    const auto editor = makeView<PlainEditor>();
    editor->setFrame({ 0.0, 0.0, 200.0, 100.0 });
    editor->setPlainText(QStringLiteral("word"));
    m_content.addSubview(editor);
    const QPoint onTheWord(8, 10);

    QTest::mouseClick(editor->viewport(), left, Qt::NoModifier, onTheWord);
    QTest::mouseDClick(editor->viewport(), left, Qt::NoModifier, onTheWord);

    EXPECT_EQ(editor->textCursor().selectedText(), QStringLiteral("word"));
    EXPECT_EQ(&editor->surface(), editor->viewport());
}

/// A button that is not the pointer's.
class OtherButton : public ViewEvent, public testing::WithParamInterface<Qt::MouseButton>
{ };

TEST_P(OtherButton, isTakenAndIgnored)
{
    const bool press = send(QEvent::MouseButtonPress, { 5, 10 }, GetParam(), GetParam());
    const bool drag = send(QEvent::MouseMove, { 6, 10 }, none, GetParam());
    const bool release = send(QEvent::MouseButtonRelease, { 6, 10 }, GetParam(), none);
    const bool second = send(QEvent::MouseButtonDblClick, { 5, 10 }, GetParam(), GetParam());

    EXPECT_TRUE(press && drag && release && second);
    EXPECT_EQ(m_content.take(), Log {});
}

TEST_P(OtherButton, doesNotInterruptAStroke)
{
    send(QEvent::MouseButtonPress, { 0, 0 }, left, left);
    send(QEvent::MouseButtonPress, { 1, 0 }, GetParam(), left | GetParam());
    send(QEvent::MouseMove, { 5, 0 }, none, left | GetParam());
    send(QEvent::MouseButtonRelease, { 5, 0 }, GetParam(), left);
    send(QEvent::MouseMove, { 6, 0 }, none, left);
    send(QEvent::MouseButtonRelease, { 6, 0 }, left, none);

    EXPECT_EQ(m_content.take(),
        (Log { "down 0,100 x1", "drag 5,100 x1", "drag 6,100 x1", "up 6,100 x1" }));
}

TEST_P(OtherButton, doesNotDragWhatTheLeftButtonHasLetGo)
{
    send(QEvent::MouseButtonPress, { 0, 0 }, GetParam(), GetParam());
    send(QEvent::MouseButtonPress, { 0, 0 }, left, left | GetParam());
    send(QEvent::MouseButtonRelease, { 0, 0 }, left, GetParam());
    static_cast<void>(m_content.take());

    send(QEvent::MouseMove, { 5, 0 }, none, GetParam());

    EXPECT_EQ(m_content.take(), Log {});
}

INSTANTIATE_TEST_SUITE_P(ViewEvent, OtherButton,
    testing::Values(Qt::RightButton, Qt::MiddleButton, Qt::BackButton, Qt::ForwardButton),
    [](const auto &button) { return "button" + std::to_string(static_cast<int>(button.param)); });

} // namespace penwick::platform
