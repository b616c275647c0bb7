// SPDX-License-Identifier: MIT
// What goes into a text, and what there is no room for.
#include "textbox/TextRoom.h"

#include <QTextCursor>
#include <QTextDocument>

#include <gtest/gtest.h>

namespace penwick::test {

namespace {

const QString accent(QChar(0x0301));

QString times(int count, const QString &text)
{
    return text.repeated(count);
}

/// At the end of `text`.
TextRoom roomBehind(const QString &text)
{
    QTextDocument document;
    document.setPlainText(text);
    QTextCursor cursor(&document);
    cursor.movePosition(QTextCursor::End);
    return roomAt(cursor);
}

} // namespace

TEST(TextRoom, emptyTextTakesTwoThousandFiveHundredCharactersAndTwoHundredFiftyLines)
{
    EXPECT_EQ(roomBehind(QString()), (TextRoom { 2500, 249, 64 }));
}

TEST(TextRoom, textThatIsThereTakesUpRoom)
{
    EXPECT_EQ(roomBehind(QStringLiteral("ab\ncd")), (TextRoom { 2495, 248, 64 }));
    EXPECT_EQ(roomBehind(times(2500, QStringLiteral("m"))), (TextRoom { 0, 249, 64 }));
    EXPECT_EQ(roomBehind(times(249, QStringLiteral("\n"))), (TextRoom { 2251, 0, 64 }));
}

TEST(TextRoom, lineThatIsNoParagraphCounts)
{
    EXPECT_EQ(roomBehind(QStringLiteral("a") + QChar(QChar::LineSeparator)),
        (TextRoom { 2498, 248, 64 }));
}

TEST(TextRoom, textThatIsTooLongAlreadyHasNoRoom)
{
    EXPECT_EQ(roomBehind(times(6000, QStringLiteral("\n"))), (TextRoom { 0, 0, 64 }));
    EXPECT_EQ(roomBehind(QStringLiteral("e") + times(70, accent)), (TextRoom { 2429, 249, 0 }));
}

TEST(TextRoom, whatIsSelectedMakesRoom)
{
    QTextDocument document;
    document.setPlainText(QStringLiteral("ab\ncd"));
    QTextCursor cursor(&document);
    cursor.setPosition(1);
    cursor.setPosition(4, QTextCursor::KeepAnchor);

    EXPECT_EQ(roomAt(cursor), (TextRoom { 2498, 249, 64 }));
}

TEST(TextRoom, marksOnBothSidesAreOnOneLetter)
{
    QTextDocument document;
    document.setPlainText(QStringLiteral("e") + times(5, accent));
    QTextCursor cursor(&document);
    cursor.setPosition(3);

    EXPECT_EQ(roomAt(cursor).marks, 59);
}

TEST(TextRoom, whatFitsGoesInWhole)
{
    const QString text = QStringLiteral("one\r\ntwo\nthree");

    EXPECT_EQ(fittingPart(text, { 15, 2, 64 }), text);
}

TEST(TextRoom, beginningGoesInWhereAllDoesNot)
{
    const QString text = QStringLiteral("one\r\ntwo\nthree");

    EXPECT_EQ(fittingPart(text, { 14, 2, 64 }), text.left(14));
    EXPECT_EQ(fittingPart(text, { 15, 1, 64 }), QStringLiteral("one\r\ntwo"));
    EXPECT_EQ(fittingPart(text, { 15, 0, 64 }), QStringLiteral("one"));
    EXPECT_EQ(fittingPart(text, { 0, 2, 64 }), QString());
}

TEST(TextRoom, everyEndOfALineCounts)
{
    for (const QChar end : { QChar(u'\n'), QChar(u'\r'), QChar(QChar::LineSeparator),
             QChar(QChar::ParagraphSeparator) })
        EXPECT_EQ(fittingPart(QStringLiteral("a") + end + QStringLiteral("b"), { 9, 0, 64 }),
            QStringLiteral("a"))
            << static_cast<int>(end.unicode());
}

TEST(TextRoom, noCharacterIsCutInTwo)
{
    const QString face = QStringLiteral("\U0001F600");

    EXPECT_EQ(fittingPart(QStringLiteral("a") + face, { 2, 0, 64 }), QStringLiteral("a"));
    EXPECT_EQ(fittingPart(QStringLiteral("a") + face, { 3, 0, 64 }), QStringLiteral("a") + face);
    const QString half(face.front()); // as it came
    EXPECT_EQ(fittingPart(half, { 2, 0, 64 }), half);
}

TEST(TextRoom, marksThatAreTooManyAreLeftOutAndTheRestGoesIn)
{
    const QString letter = QStringLiteral("e");

    EXPECT_EQ(fittingPart(letter + times(64, accent), {}), letter + times(64, accent));
    EXPECT_EQ(
        fittingPart(letter + times(65, accent) + letter, {}), letter + times(64, accent) + letter);
    EXPECT_EQ(fittingPart(times(3, accent) + letter + accent, { 100, 0, 2 }),
        times(2, accent) + letter + accent);
    EXPECT_EQ(fittingPart(accent, { 100, 0, 0 }), QString());
}

TEST(TextRoom, marksBeyondTheBasicPlaneCountAsOneEach)
{
    const QString stem = QStringLiteral("\U0001D165"); // of a note
    const QString letter = QStringLiteral("e");

    EXPECT_EQ(fittingPart(letter + times(64, stem), {}), letter + times(64, stem));
    EXPECT_EQ(
        fittingPart(letter + times(65, stem) + letter, {}), letter + times(64, stem) + letter);
    EXPECT_EQ(roomBehind(letter + times(3, stem) + times(2, accent)).marks, 59);
    QTextDocument document;
    document.setPlainText(letter + times(5, stem));
    QTextCursor cursor(&document);
    cursor.setPosition(1 + 4);
    EXPECT_EQ(roomAt(cursor).marks, 59) << "on both sides";
}

TEST(TextRoom, marksAtTheBeginningOfATextAreCounted)
{
    QTextDocument document;
    document.setPlainText(times(3, accent));

    EXPECT_EQ(roomAt(QTextCursor(&document)).marks, 61);
}

TEST(TextRoom, onlyTheSecondHalfOfAPairOfCharactersEndsNoLineOfItsOwn)
{
    EXPECT_EQ(fittingPart(QStringLiteral("\na"), { 9, 0, 64 }), QString());
    EXPECT_EQ(fittingPart(QStringLiteral("\r\na"), { 9, 1, 64 }), QStringLiteral("\r\na"));
    EXPECT_EQ(fittingPart(QStringLiteral("\n\na"), { 9, 1, 64 }), QStringLiteral("\n"));
    EXPECT_EQ(fittingPart(QStringLiteral("\ra\nb"), { 9, 1, 64 }), QStringLiteral("\ra"));
    EXPECT_EQ(fittingPart(QStringLiteral("\r\rb"), { 9, 1, 64 }), QStringLiteral("\r"));
}

TEST(TextRoom, halfAPairIsACharacterOfItsOwn)
{
    const QChar high(0xD83D);
    const QChar low(0xDE00);

    EXPECT_EQ(fittingPart(QString(u'a') + low, { 1, 0, 64 }), QString(u'a'));
    EXPECT_EQ(fittingPart(QString(high) + u'a', { 1, 0, 64 }), QString(high));
    EXPECT_EQ(fittingPart(QString(high) + low, { 1, 0, 64 }), QString());
    EXPECT_EQ(roomBehind(QString(high) + accent).marks, 63);
    EXPECT_EQ(roomBehind(QString(u'a') + accent).marks, 63);
}

TEST(TextRoom, linesOnBothSidesAreCounted)
{
    QTextDocument document;
    document.setPlainText(QStringLiteral("a\nb\nc\nd"));
    QTextCursor cursor(&document);
    cursor.setPosition(3);

    EXPECT_EQ(roomAt(cursor).lineEnds, 246);
}

TEST(TextRoom, newRoomIsThatOfAnEmptyText)
{
    EXPECT_EQ(TextRoom(), (TextRoom { 2500, 249, 64 }));
}

TEST(TextRoom, millionsOfMarksEndTheSearchForMore)
{
    const QString text = QStringLiteral("e") + times(1'000'000, accent) + QStringLiteral("e");

    EXPECT_EQ(fittingPart(text, {}), QStringLiteral("e") + times(64, accent));
}

} // namespace penwick::test
