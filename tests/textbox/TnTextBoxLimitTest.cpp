// SPDX-License-Identifier: MIT
// More text than a box takes: what goes in, and what is said of the rest.
#include "textbox/TextBoxFixture.h"

#include "textbox/TextComposition.h"
#include "textbox/TextRoom.h"

#include <QInputMethodEvent>
#include <QToolTip>

namespace penwick::test {
namespace {

class TnTextBoxLimitTest : public TextBoxFixture
{
protected:
    ~TnTextBoxLimitTest() override { QToolTip::hideText(); }

    /// A box that takes `left` characters more.
    std::shared_ptr<TnTextBox> almostFull(int left)
    {
        auto box = newBox();
        paste(*box, QString(mostCharacters - left, QLatin1Char('m')));
        EXPECT_EQ(said(), QString());
        return box;
    }

    static qsizetype lengthOf(const TnTextBox &box) { return box.toPlainText().size(); }
    static QString said() { return QToolTip::isVisible() ? QToolTip::text() : QString(); }

    static void expectSaid(const TnTextBox &box, const QString &text)
    {
        EXPECT_EQ(said(), text);
        EXPECT_EQ(box.accessibleDescription(), text);
    }

    static void compose(TnTextBox &box, const QString &half, const QString &commit = {})
    {
        QInputMethodEvent event(half, {});
        event.setCommitString(commit);
        QCoreApplication::sendEvent(&box, &event);
    }

    /// As an input method does with the `length` characters before the caret.
    static void correct(TnTextBox &box, int length, const QString &text)
    {
        QInputMethodEvent event;
        event.setCommitString(text, -length, length);
        QCoreApplication::sendEvent(&box, &event);
    }

    const QString m_one = QStringLiteral("One character did not fit into this text box.");
};

TEST_F(TnTextBoxLimitTest, pasteOfAWholeDocumentPutsItsBeginningInAndSaysWhatDidNotGoIn)
{
    const auto box = newBox();
    const QString words = QStringLiteral("The quick brown fox. ").repeated(250'000);

    paste(*box, words);

    EXPECT_EQ(box->toPlainText(), words.left(mostCharacters));
    expectSaid(*box,
        QStringLiteral("%L1 characters did not fit into this text box.")
            .arg(words.size() - mostCharacters));
}

TEST_F(TnTextBoxLimitTest, pasteOfManyLinesPutsTheFirstOnesIn)
{
    const auto box = newBox();

    paste(*box, QStringLiteral("a\n").repeated(600));

    EXPECT_EQ(box->document()->blockCount(), mostLines);
    expectSaid(*box, QStringLiteral("701 characters did not fit into this text box."));
}

TEST_F(TnTextBoxLimitTest, pasteThatFitsSaysNothing)
{
    const auto box = newBox();

    paste(*box, QString(mostCharacters, QLatin1Char('m')));

    EXPECT_EQ(lengthOf(*box), mostCharacters);
    EXPECT_EQ(said(), QString());
    EXPECT_EQ(box->accessibleDescription(), QString());
}

TEST_F(TnTextBoxLimitTest, pasteIntoAFullBoxKeepsWhatIsThere)
{
    const auto box = almostFull(0);

    paste(*box, QStringLiteral("more"));

    EXPECT_EQ(box->toPlainText(), QString(mostCharacters, QLatin1Char('m')));
    expectSaid(*box, QStringLiteral("4 characters did not fit into this text box."));
}

TEST_F(TnTextBoxLimitTest, pasteTakesThePlaceOfWhatIsSelected)
{
    const auto box = almostFull(0);
    box->selectAll();

    paste(*box, QString(mostCharacters + 1, QLatin1Char('n')));

    EXPECT_EQ(box->toPlainText(), QString(mostCharacters, QLatin1Char('n')));
    expectSaid(*box, m_one);
}

TEST_F(TnTextBoxLimitTest, keysFillTheBoxAndThenSayThatTheyDoNotFit)
{
    const auto box = almostFull(1);

    QTest::keyClicks(box.get(), QStringLiteral("a"));
    EXPECT_EQ(lengthOf(*box), mostCharacters);
    EXPECT_EQ(said(), QString());
    QTest::keyClicks(box.get(), QStringLiteral("b"));
    EXPECT_EQ(lengthOf(*box), mostCharacters);
    expectSaid(*box, m_one);
}

TEST_F(TnTextBoxLimitTest, otherKeysWorkInAFullBox)
{
    const auto box = almostFull(0);

    QTest::keyClick(box.get(), Qt::Key_Return, Qt::ShiftModifier);
    EXPECT_EQ(lengthOf(*box), mostCharacters);
    expectSaid(*box, m_one);
    QTest::keyClick(box.get(), Qt::Key_Backspace);
    EXPECT_EQ(lengthOf(*box), mostCharacters - 1);
    QTest::keyClick(box.get(), Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(lengthOf(*box), mostCharacters);
    QTest::keyClick(box.get(), Qt::Key_A, Qt::ControlModifier);
    QTest::keyClicks(box.get(), QStringLiteral("a"));
    EXPECT_EQ(box->toPlainText(), QStringLiteral("a"));
}

TEST_F(TnTextBoxLimitTest, lineThatIsTooManyIsNotBegun)
{
    const auto box = newBox();
    paste(*box, QString(mostLines - 2, QLatin1Char('\n')));

    QTest::keyClick(box.get(), Qt::Key_Return, Qt::ShiftModifier);
    EXPECT_EQ(lengthOf(*box), mostLines - 1);
    EXPECT_EQ(said(), QString());
    QTest::keyClick(box.get(), Qt::Key_Enter, Qt::ShiftModifier);
    EXPECT_EQ(lengthOf(*box), mostLines - 1);
    expectSaid(*box, m_one);
}

TEST_F(TnTextBoxLimitTest, compositionIsShownAsFarAsItFits)
{
    const auto box = almostFull(3);

    compose(*box, QStringLiteral("kanji"));

    EXPECT_EQ(compositionIn(*box), QStringLiteral("kan"));
    expectSaid(*box, QStringLiteral("2 characters did not fit into this text box."));
}

TEST_F(TnTextBoxLimitTest, commitGoesInAsFarAsItFits)
{
    const auto box = almostFull(3);

    compose(*box, QStringLiteral("mo"), QStringLiteral("kan"));
    EXPECT_EQ(lengthOf(*box), mostCharacters);
    EXPECT_EQ(compositionIn(*box), QString());
    expectSaid(*box, QStringLiteral("2 characters did not fit into this text box."));
}

TEST_F(TnTextBoxLimitTest, correctionInAFullBoxTakesThePlaceOfTheWord)
{
    const auto box = almostFull(5);
    compose(*box, {}, QStringLiteral("their"));

    correct(*box, 5, QStringLiteral("there"));

    EXPECT_EQ(box->toPlainText().right(6), QStringLiteral("mthere"));
    EXPECT_EQ(lengthOf(*box), mostCharacters);
    EXPECT_EQ(said(), QString());
}

TEST_F(TnTextBoxLimitTest, correctionInAFullBoxMayBeOfOneLetterOrOfAllOfThem)
{
    const auto box = almostFull(0);

    correct(*box, 1, QStringLiteral("n"));
    EXPECT_EQ(box->toPlainText(), QString(mostCharacters - 1, QLatin1Char('m')) + QLatin1Char('n'));

    const QString all(mostCharacters, QLatin1Char('o'));
    correct(*box, mostCharacters, all);
    EXPECT_EQ(box->toPlainText(), all);
    EXPECT_EQ(said(), QString());
}

TEST_F(TnTextBoxLimitTest, commitInAFullBoxTakesThePlaceOfWhatIsSelected)
{
    const auto box = almostFull(0);
    box->selectAll();

    compose(*box, {}, QStringLiteral("new"));

    EXPECT_EQ(box->toPlainText(), QStringLiteral("new"));
    EXPECT_EQ(said(), QString());
}

TEST_F(TnTextBoxLimitTest, correctionThatDoesNotFitLeavesTheWord)
{
    const auto box = almostFull(5);
    compose(*box, {}, QStringLiteral("their"));

    correct(*box, 5, QStringLiteral("theirs"));

    EXPECT_EQ(box->toPlainText().right(6), QStringLiteral("mtheir"));
    EXPECT_EQ(lengthOf(*box), mostCharacters);
    expectSaid(*box, QStringLiteral("6 characters did not fit into this text box."));
}

TEST_F(TnTextBoxLimitTest, correctionOfOneLetterThatDoesNotFitLeavesIt)
{
    const auto box = almostFull(0);

    correct(*box, 1, QStringLiteral("no"));

    EXPECT_EQ(box->toPlainText(), QString(mostCharacters, QLatin1Char('m')));
    expectSaid(*box, QStringLiteral("2 characters did not fit into this text box."));
}

TEST_F(TnTextBoxLimitTest, correctionThatDoesNotFitMakesNoRoomForAComposition)
{
    const auto box = almostFull(5);
    compose(*box, {}, QStringLiteral("their"));

    QInputMethodEvent event(QStringLiteral("x"), {});
    event.setCommitString(QStringLiteral("theirs"), -5, 5);
    QCoreApplication::sendEvent(box.get(), &event);

    EXPECT_EQ(box->toPlainText().right(6), QStringLiteral("mtheir"));
    EXPECT_EQ(compositionIn(*box), QString());
    expectSaid(*box, QStringLiteral("7 characters did not fit into this text box."));
}

TEST_F(TnTextBoxLimitTest, correctionOfMoreThanThereIsTakesThePlaceOfWhatIsThere)
{
    const auto box = almostFull(0);
    const auto correctFrom = [&box](int start, int length, const QString &text) {
        QInputMethodEvent event;
        event.setCommitString(text, start, length);
        QCoreApplication::sendEvent(box.get(), &event);
    };

    correctFrom(-1, 5, QStringLiteral("n"));
    EXPECT_EQ(box->toPlainText(), QString(mostCharacters - 1, QLatin1Char('m')) + QLatin1Char('n'));
    correctFrom(-1, 5, QStringLiteral("no"));
    EXPECT_EQ(lengthOf(*box), mostCharacters);
    expectSaid(*box, QStringLiteral("2 characters did not fit into this text box."));

    box->selectAll();
    paste(*box, QStringLiteral("mend"));
    correctFrom(-9, 2, QStringLiteral("s"));
    EXPECT_EQ(box->toPlainText(), QStringLiteral("snd"));
}

TEST_F(TnTextBoxLimitTest, commitThatFitsInPartGoesInInPart)
{
    const auto box = almostFull(2);

    compose(*box, {}, QStringLiteral("kan"));

    EXPECT_EQ(box->toPlainText().right(3), QStringLiteral("mka"));
    expectSaid(*box, m_one);
}

TEST_F(TnTextBoxLimitTest, compositionTakesItsRoomBeforeItIsText)
{
    const auto box = almostFull(3);
    compose(*box, QStringLiteral("kanj"));
    expectSaid(*box, m_one);
    QToolTip::hideText();
    compose(*box, QStringLiteral("kan"));

    QTest::keyClicks(box.get(), QStringLiteral("b"));

    EXPECT_EQ(lengthOf(*box), mostCharacters - 3);
    expectSaid(*box, m_one);
}

TEST_F(TnTextBoxLimitTest, compositionKeepsItsPlace)
{
    const auto box = almostFull(4);
    compose(*box, QStringLiteral("kanj"));

    QMimeData more;
    more.setText(QStringLiteral("more"));
    QTextCursor start(box->document());
    box->setTextCursor(start);
    QDropEvent drop({ 2, 2 }, Qt::CopyAction, &more, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(box->viewport(), &drop);
    leave();

    EXPECT_EQ(lengthOf(*box), mostCharacters);
    EXPECT_TRUE(box->toPlainText().contains(QStringLiteral("kanj")));
}

TEST_F(TnTextBoxLimitTest, noticeIsGoneFromTheDescriptionOnceTheBoxIsLeft)
{
    const auto box = almostFull(0);
    QTest::keyClicks(box.get(), QStringLiteral("b"));

    leave();

    EXPECT_EQ(box->accessibleDescription(), QString());
}

TEST_F(TnTextBoxLimitTest, placedBoxRefusesInSilence)
{
    const auto box = almostFull(0);
    leave();
    clickOn(*box, { 50, 15 });

    QTest::keyClicks(box.get(), QStringLiteral("b"));
    compose(*box, QStringLiteral("b"));

    EXPECT_EQ(said(), QString());
    EXPECT_EQ(lengthOf(*box), mostCharacters);
}

} // namespace
} // namespace penwick::test
