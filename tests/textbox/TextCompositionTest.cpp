// SPDX-License-Identifier: MIT
// What an input method composes in a box.
#include "textbox/TextComposition.h"

#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"

#include <QInputMethodEvent>
#include <QTextBlock>
#include <QTextLayout>

namespace penwick::test {
namespace {

class TextCompositionTest : public TextBoxFixture
{
protected:
    static void compose(TnTextBox &box, const QString &text)
    {
        QInputMethodEvent event(text, {});
        QCoreApplication::sendEvent(&box, &event);
    }

    /// What is composed underlined, as input methods do.
    static void composeUnderlined(TnTextBox &box, const QString &text)
    {
        QTextCharFormat underlined;
        underlined.setFontUnderline(true);
        const int length = static_cast<int>(text.size());
        QInputMethodEvent event(text, { { QInputMethodEvent::TextFormat, 0, length, underlined } });
        QCoreApplication::sendEvent(&box, &event);
    }

    /// Puts the insertion point elsewhere without ending what is composed.
    static void moveTo(TnTextBox &box, int position)
    {
        QTextCursor caret = box.textCursor();
        caret.setPosition(position);
        box.setTextCursor(caret);
    }

    static void commit(TnTextBox &box, const QString &text)
    {
        QInputMethodEvent event;
        event.setCommitString(text);
        QCoreApplication::sendEvent(&box, &event);
    }

    const QString m_half = QStringLiteral("kanj");
};

TEST_F(TextCompositionTest, isNotYetPartOfTheText)
{
    const auto box = newBox();

    compose(*box, m_half);

    EXPECT_EQ(compositionIn(*box), m_half);
    EXPECT_EQ(box->toPlainText(), QString());
}

TEST_F(TextCompositionTest, isReplacedByWhatTheInputMethodCommits)
{
    const auto box = newBox();
    compose(*box, m_half);

    commit(*box, QStringLiteral("漢字"));

    EXPECT_EQ(compositionIn(*box), QString());
    EXPECT_EQ(box->toPlainText(), QStringLiteral("漢字"));
    EXPECT_EQ(box->textColor(), box->textFontColor());
}

TEST_F(TextCompositionTest, isPartOfTheTextOnceTheBoxIsLeft)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    compose(*box, m_half);

    leave();

    EXPECT_EQ(box->toPlainText(), QStringLiteral("akanj"));
    EXPECT_EQ(compositionIn(*box), QString());
    EXPECT_EQ(box->superview(), canvas);
}

TEST_F(TextCompositionTest, isEndedByEscapeFirstAndTheEditingOnlyThen)
{
    const auto box = newBox();
    compose(*box, m_half);

    QTest::keyClick(box.get(), Qt::Key_Escape);
    EXPECT_EQ(compositionIn(*box), QString());
    EXPECT_EQ(box->toPlainText(), m_half); // the input method has let the key through
    EXPECT_TRUE(box->isEditable());
    EXPECT_EQ(contentOf(window).firstResponder(), box.get());

    QTest::keyClick(box.get(), Qt::Key_Escape);
    EXPECT_FALSE(box->isEditable());
}

TEST_F(TextCompositionTest, thatIsCutShortKeepsItsLook)
{
    using Attribute = QInputMethodEvent::Attribute;
    const QList<Attribute> whole { { QInputMethodEvent::TextFormat, 1, 4, {} },
        { QInputMethodEvent::TextFormat, 5, 2, {} }, { QInputMethodEvent::Cursor, 6, 1, {} },
        { QInputMethodEvent::Selection, 9, 2, {} } };

    const QList<Attribute> cut = attributesWithin(whole, 3);

    ASSERT_EQ(cut.size(), 4);
    const auto placesOf
        = [&](int number) { return std::pair(cut[number].start, cut[number].length); };
    EXPECT_EQ(placesOf(0), std::pair(1, 2));
    EXPECT_EQ(placesOf(1), std::pair(3, 0));
    EXPECT_EQ(placesOf(2), std::pair(3, 1)); // its length says whether it is seen
    EXPECT_EQ(placesOf(3), std::pair(9, 2)); // counts in the text
}

TEST_F(TextCompositionTest, isPartOfTheTextOnceThePointerPressesInTheBox)
{
    const auto box = newBox();
    compose(*box, m_half);

    pressOn(*box, { 30, 15 }, QEvent::MouseButtonPress, Qt::RightButton); // for the menu
    releaseOn(*box, { 30, 15 }, Qt::RightButton);
    EXPECT_EQ(compositionIn(*box), m_half);

    clickOn(*box, { 30, 15 });
    EXPECT_EQ(compositionIn(*box), QString());
    EXPECT_EQ(box->toPlainText(), m_half);
    EXPECT_TRUE(box->isEditable());
}

TEST_F(TextCompositionTest, isPartOfTheTextOnceThePointerDragsOverIt)
{
    const auto box = newBox();
    pressOn(*box, { 30, 15 });
    compose(*box, m_half);

    dragOn(*box, { 60, 15 });
    releaseOn(*box, { 60, 15 });

    EXPECT_EQ(compositionIn(*box), QString());
    EXPECT_EQ(box->toPlainText(), m_half);
}

TEST_F(TextCompositionTest, keepsABoxThatHasNothingElseFromBeingDeleted)
{
    const auto box = newBox();
    compose(*box, m_half);

    QTest::keyClick(box.get(), Qt::Key_Tab);

    EXPECT_EQ(box->toPlainText(), m_half);
    EXPECT_EQ(box->superview(), canvas);
    EXPECT_FALSE(box->isEditable());
}

TEST_F(TextCompositionTest, inALineThatTheCaretHasLeftIsPartOfTheTextOnceTheBoxIsLeft)
{
    const auto box = newBox();
    compose(*box, m_half);
    QTextCursor caret = box->textCursor();
    caret.insertText(QStringLiteral("two\nlines"));
    box->setTextCursor(caret);
    ASSERT_EQ(box->toPlainText(), QStringLiteral("two\nlines"));
    ASSERT_EQ(compositionIn(*box), m_half);

    leave();

    QString text = box->toPlainText();
    EXPECT_EQ(text.remove(m_half), QStringLiteral("two\nlines"));
    EXPECT_EQ(box->toPlainText().size(), 13);
    EXPECT_EQ(compositionIn(*box), QString());
}

TEST_F(TextCompositionTest, inALineThatTheCaretHasLeftStandsWhereItWasComposed)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("one\ntwo"));
    moveTo(*box, 2);
    composeUnderlined(*box, m_half);
    moveTo(*box, 5);
    ASSERT_EQ(compositionIn(*box), m_half);

    leave();

    EXPECT_EQ(box->toPlainText(), QStringLiteral("onkanje\ntwo"));
    EXPECT_EQ(compositionIn(*box), QString());
    const QTextLayout &line = *box->document()->firstBlock().layout();
    EXPECT_EQ(line.preeditAreaPosition(), -1);
    EXPECT_TRUE(line.formats().isEmpty()) << "text is not underlined";
}

TEST_F(TextCompositionTest, inALineThatBecameShorterStandsAtItsEnd)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("one\ntwo"));
    moveTo(*box, 3);
    compose(*box, m_half);
    moveTo(*box, 5);
    QTextCursor end(box->document());
    end.setPosition(1);
    end.setPosition(3, QTextCursor::KeepAnchor);
    end.removeSelectedText();
    ASSERT_EQ(box->toPlainText(), QStringLiteral("o\ntwo"));

    leave();

    EXPECT_EQ(box->toPlainText(), QStringLiteral("okanj\ntwo"));
}

TEST_F(TextCompositionTest, replacesNothingThatIsSelected)
{
    for (const QString &text : { QStringLiteral("one\ntwo"), QStringLiteral("one two") }) {
        const auto box = newBox();
        paste(*box, text);
        compose(*box, m_half);
        QTextCursor word = box->textCursor();
        word.setPosition(0);
        word.setPosition(3, QTextCursor::KeepAnchor);
        box->setTextCursor(word);

        leave();

        QString left = box->toPlainText();
        EXPECT_TRUE(left.contains(m_half));
        EXPECT_EQ(left.remove(m_half), text);
    }
}

TEST_F(TextCompositionTest, droppedInALineThatTheCaretHasLeftLeavesNoLookThere)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("one\ntwo"));
    moveTo(*box, 2);
    composeUnderlined(*box, QString(16, QLatin1Char('m')));
    ASSERT_GT(box->frame().width, 200.0);
    moveTo(*box, 5);

    compose(*box, QStringLiteral("ka"));

    EXPECT_EQ(compositionIn(*box), QStringLiteral("ka"));
    const QTextLayout &line = *box->document()->firstBlock().layout();
    EXPECT_EQ(line.preeditAreaPosition(), -1);
    EXPECT_TRUE(line.formats().isEmpty());
    EXPECT_EQ(box->frame().width, 200.0);
}

TEST_F(TextCompositionTest, droppedInALineThatItHadWrappedLetsTheBoxShrink)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("one\ntwo"));
    moveTo(*box, 2);
    compose(*box, QString(30, QLatin1Char('m')));
    ASSERT_EQ(box->frame().width, 300.0);
    moveTo(*box, 5);

    compose(*box, QStringLiteral("ka"));

    EXPECT_EQ(box->frame().width, 200.0);
}

TEST_F(TextCompositionTest, whoseOwnCaretMovesLeavesWhatIsSelected)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("one two"));
    compose(*box, m_half);
    QTextCursor word = box->textCursor();
    word.setPosition(0);
    word.setPosition(3, QTextCursor::KeepAnchor);
    box->setTextCursor(word);

    QInputMethodEvent moved(m_half, { { QInputMethodEvent::Cursor, 1, 1, {} } });
    QCoreApplication::sendEvent(box.get(), &moved);

    EXPECT_EQ(box->toPlainText(), QStringLiteral("one two"));
}

TEST_F(TextCompositionTest, thatBecameTextIsFollowedByWhatIsTypedNext)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("one"));
    moveTo(*box, 1);
    composeUnderlined(*box, m_half);

    QTest::keyClick(box.get(), Qt::Key_Escape);
    QTest::keyClicks(box.get(), QStringLiteral("!"));

    EXPECT_EQ(box->toPlainText(), QStringLiteral("okanj!ne"));
    QTextCursor cursor(box->document());
    while (!cursor.atEnd()) {
        cursor.movePosition(QTextCursor::NextCharacter);
        EXPECT_EQ(cursor.charFormat().foreground().color(), box->textFontColor());
        EXPECT_FALSE(cursor.charFormat().fontUnderline());
    }
}

TEST_F(TextCompositionTest, isTakenOnlyWhileTheBoxIsEdited)
{
    const auto box = newBox();
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    const auto isTaken = [&box](const QString &half, const QString &commit = {}) {
        QInputMethodEvent event(half, {});
        event.setCommitString(commit);
        QCoreApplication::sendEvent(box.get(), &event);
        return event.isAccepted();
    };
    EXPECT_TRUE(isTaken(m_half));

    leave();
    ASSERT_EQ(box->toPlainText(), QStringLiteral("akanj"));

    EXPECT_FALSE(isTaken(m_half));
    EXPECT_FALSE(isTaken({}, QStringLiteral("漢字")));
    EXPECT_EQ(box->toPlainText(), QStringLiteral("akanj"));
    EXPECT_EQ(compositionIn(*box), QString());
}

TEST_F(TextCompositionTest, goesOnInTheLineToWhichTheCaretHasGone)
{
    const auto box = newBox();
    compose(*box, m_half);
    box->insertPlainText(QStringLiteral("on\ntwo")); // as when it is dropped

    compose(*box, QStringLiteral("ka"));
    EXPECT_EQ(compositionIn(*box), QStringLiteral("ka"));

    commit(*box, QString());
    EXPECT_EQ(compositionIn(*box), QString());
    EXPECT_EQ(box->toPlainText(), QStringLiteral("on\ntwo"));
}

TEST_F(TextCompositionTest, givenUpAfterTheCaretWentToAnotherLineIsGone)
{
    const auto box = newBox();
    compose(*box, m_half);
    box->insertPlainText(QStringLiteral("on\ntwo"));

    commit(*box, QString());

    EXPECT_EQ(compositionIn(*box), QString());
    EXPECT_EQ(box->toPlainText(), QStringLiteral("on\ntwo"));
}

TEST_F(TextCompositionTest, makesTheBoxGrow)
{
    const auto box = newBox();

    compose(*box, QString(16, QLatin1Char('m')));

    EXPECT_GT(box->frame().width, 200.0);
    compose(*box, QString());
    EXPECT_EQ(box->frame().width, 200.0);
}

TEST_F(TextCompositionTest, takesThePlaceholdersPlace)
{
    const auto box = newBox();
    const QImage hinted = pictureOf(*box);

    compose(*box, QStringLiteral("."));
    settle();

    const QRect farRight(120, 4, 70, 20); // of the placeholder's end, where the dot is not
    EXPECT_LT(darkest(hinted.copy(farRight)), paper);
    EXPECT_EQ(darkest(pictureOf(*box).copy(farRight)), paper);
}

TEST_F(TextCompositionTest, ofNothingLeavesAnEmptyBoxEmpty)
{
    const auto box = newBox();
    compose(*box, m_half);
    compose(*box, QString());

    leave();

    EXPECT_EQ(box->superview(), nullptr);
}

} // namespace
} // namespace penwick::test
