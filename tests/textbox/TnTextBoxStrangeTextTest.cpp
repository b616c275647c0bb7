// SPDX-License-Identifier: MIT
// Text that no hand would write: very long, broken, or not meant to be seen.
#include "textbox/TextBoxFixture.h"

#include "textbox/TextRoom.h"

#include <QTextBlock>
#include <QTextLayout>

#include <ostream>

namespace penwick::test {
namespace {

struct StrangeText
{
    const char *name;
    QString text;

    friend std::ostream &operator<<(std::ostream &stream, const StrangeText &strange)
    {
        return stream << strange.name;
    }
};

QString controlCharacters()
{
    QString text;
    for (char16_t code = 1; code < 0x20; ++code) {
        if (code != u'\n' && code != u'\r')
            text += QChar(code);
    }
    return text + QChar(0x7f) + QChar(0x85) + QChar(0x200e) + QChar(0x202e) + QChar(0xfeff);
}

/// As many as a box takes, but one.
QString manyCharacters()
{
    QString text;
    while (text.size() < mostCharacters)
        text += QStringLiteral("The quick brown fox jumps over the lazy dog. ");
    return text.left(mostCharacters - 1);
}

class TnTextBoxStrangeTextTest : public TextBoxFixture,
                                 public ::testing::WithParamInterface<StrangeText>
{ };

TEST_P(TnTextBoxStrangeTextTest, isKeptAndShownAndTheBoardStaysUsable)
{
    const auto box = newBox();

    paste(*box, GetParam().text);
    EXPECT_EQ(box->toPlainText(), GetParam().text);
    EXPECT_GE(box->frame().x, 0.0);
    EXPECT_GE(box->frame().y, 0.0);
    EXPECT_LE(box->frame().maxX(), 300.0);
    EXPECT_LE(box->frame().maxY(), 200.0);
    leave();
    EXPECT_EQ(box->toPlainText(), GetParam().text);
    EXPECT_EQ(box->superview(), canvas);

    doubleClickOn(*box, { 20, 15 });
    QTest::keyClick(box.get(), Qt::Key_End, Qt::ControlModifier);
    QTest::keyClicks(box.get(), QStringLiteral("z"));
    EXPECT_EQ(box->toPlainText(), GetParam().text + QStringLiteral("z"));
    box->deleteTextBox();
    controller->handleToolSelection(QStringLiteral("undo"));
    settle();
    EXPECT_EQ(box->superview(), canvas);
    box->deleteTextBox(); // it may cover all of the canvas
    controller->handleToolSelection(QStringLiteral("brush"));
    stroke({ { 250, 150 }, { 280, 150 } });
    EXPECT_EQ(greyAt(onScreen(), { 265, 150 }), ink);
}

INSTANTIATE_TEST_SUITE_P(Texts, TnTextBoxStrangeTextTest,
    ::testing::Values(StrangeText { "manyCharacters", manyCharacters() },
        StrangeText { "longWord", QString(mostCharacters - 1, QLatin1Char('m')) },
        StrangeText { "nul", QStringLiteral("a") + QChar(0) + QStringLiteral("b") },
        StrangeText { "nulAlone", QString(QChar(0)) },
        StrangeText { "loneHighSurrogate", QStringLiteral("a") + QChar(0xd83d) },
        StrangeText { "loneLowSurrogate", QChar(0xde00) + QStringLiteral("b") },
        StrangeText { "surrogatesInTheWrongOrder", QString(QChar(0xde00)) + QChar(0xd83d) },
        StrangeText { "controlCharacters", controlCharacters() },
        StrangeText { "fortyCombiningMarks", QLatin1Char('e') + QString(40, QChar(0x0301)) },
        StrangeText { "combiningMarkAlone", QString(QChar(0x0301)) },
        StrangeText { "emoji", QStringLiteral("\U0001F468‍\U0001F469‍\U0001F467") },
        StrangeText { "bothDirections", QStringLiteral("abc שלום 123") }),
    [](const auto &strange) { return std::string(strange.param.name); });

using TnTextBoxLongTextTest = TextBoxFixture;

TEST_F(TnTextBoxLongTextTest, manyCharactersFillTheCanvas)
{
    const auto box = newBox();

    paste(*box, manyCharacters());

    EXPECT_EQ(box->frame(), (Rect { 0, 0, 300, 200 }));
    EXPECT_TRUE(box->viewport()->rect().contains(box->cursorRect()));
}

} // namespace
} // namespace penwick::test
