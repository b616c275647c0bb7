// SPDX-License-Identifier: MIT
// A box looks the same whatever the host brings: its own text, its style sheet, its language.
#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"
#include "textbox/TextBoxLayout.h"

#include <QScrollBar>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>
#include <QTranslator>

namespace penwick::test {
namespace {

class TnTextBoxLooksTest : public TextBoxFixture
{
protected:
    ~TnTextBoxLooksTest() override
    {
        if (!qApp->styleSheet().isEmpty())
            qApp->setStyleSheet({});
    }

    /// How many pixels inside the border and right of the caret have exactly this colour.
    static int count(const QImage &picture, const QColor &color)
    {
        int found = 0;
        for (int y = 4; y < picture.height() - 4; ++y) {
            for (int x = 8; x < picture.width() - 4; ++x)
                found += picture.pixelColor(x, y) == color ? 1 : 0;
        }
        return found;
    }

    /// The last column with ink in it, without the border and what is beyond.
    static int lastInked(const QImage &picture)
    {
        for (int x = picture.width() - 4; x > 3; --x) {
            if (darkest(picture.copy(x, 4, 1, picture.height() - 8)) < paper)
                return x;
        }
        return 0;
    }
};

/// Says the hint of an empty box at greater length.
class Wordy final : public QTranslator
{
public:
    [[nodiscard]] bool isEmpty() const override { return false; }
    [[nodiscard]] QString translate(const char *context, const char *source,
        const char * /*disambiguation*/, int /*n*/) const override
    {
        const bool isHint = QLatin1String(context).endsWith(QLatin1String("TnTextBox"))
            && QLatin1String(source) == QLatin1String("Type your text here..");
        return isHint ? QString(40, QLatin1Char('M')) : QString();
    }
};

TEST_F(TnTextBoxLooksTest, textThatWasThereBeforeIsInTheBoxesFontAndColour)
{
    QTextDocument text(QStringLiteral("MMM"));
    const auto box = platform::makeView<TnTextBox>(Rect { 20, 100, 200, 40 }, text);
    box->setTextFontSize(30.0);
    box->setTextFontColor(TnhColors::redColor);
    box->customizeTextBox();
    canvas->addSubview(box);
    box->setHidden(false);
    contentOf(window).makeFirstResponder(box.get());
    settle();

    EXPECT_GT(count(pictureOf(*box), TnhColors::redColor), 100);
    QFont font = box->font();
    ASSERT_EQ(font.pixelSize(), 30);
    EXPECT_NEAR(text.firstBlock().layout()->lineAt(0).naturalTextWidth(),
        QFontMetricsF(font).horizontalAdvance(QStringLiteral("MMM")), 1.0);
    box->removeFromSuperview(); // before its text goes
}

TEST_F(TnTextBoxLooksTest, fontAndColourThatAreChangedLaterAreThoseOfTheTextThatIsThere)
{
    QTextDocument text(QStringLiteral("MMM"));
    const auto box = platform::makeView<TnTextBox>(Rect { 20, 100, 200, 40 }, text);
    box->customizeTextBox();
    canvas->addSubview(box);
    box->setHidden(false);
    contentOf(window).makeFirstResponder(box.get());
    box->setTextFontSize(30.0);
    box->setTextFontColor(TnhColors::redColor);

    box->customizeTextBox();
    settle();

    EXPECT_GT(count(pictureOf(*box), TnhColors::redColor), 100);
    EXPECT_NEAR(text.firstBlock().layout()->lineAt(0).naturalTextWidth(),
        QFontMetricsF(box->font()).horizontalAdvance(QStringLiteral("MMM")), 1.0);
    box->removeFromSuperview();
}

TEST_F(TnTextBoxLooksTest, hostsStyleSheetChangesNothing)
{
    const auto box = placedBox();
    box->selectAll();
    settle();
    const QImage before = pictureOf(*box);
    const Rect frame = box->frame();

    qApp->setStyleSheet(QStringLiteral("* { font: bold 40px; color: lime; background: black; "
                                       "selection-background-color: yellow; padding: 9px; }"));
    settle();

    EXPECT_EQ(pictureOf(*box), before);
    EXPECT_EQ(box->frame(), frame);
}

TEST_F(TnTextBoxLooksTest, boxThatIsMadeUnderAStyleSheetLooksAsOneWithout)
{
    const auto without = pictureOf(*placedBox({ 20, 60 }, QStringLiteral("Hello")));

    qApp->setStyleSheet(QStringLiteral("QTextEdit { font: bold 40px; color: lime; }"));
    const auto with = pictureOf(*placedBox({ 20, 150 }, QStringLiteral("Hello")));

    EXPECT_EQ(with, without);
}

TEST_F(TnTextBoxLooksTest, longHintIsCutWhereTheTextWouldEnd)
{
    Wordy wordy;
    QCoreApplication::installTranslator(&wordy);
    const auto box = newBox();
    QCoreApplication::removeTranslator(&wordy);
    settle();

    const int last = lastInked(pictureOf(*box));

    EXPECT_LE(last, 194);
    EXPECT_GT(last, 194 - 12) << "the hint fills the width";
}

// What a picture of the drawing is painted from.
TEST_F(TnTextBoxLooksTest, contentOfATextThatIsHigherThanItsBoxEndsWithTheBox)
{
    const auto box = newBox();
    paste(*box, QStringLiteral("MM\n").repeated(20));
    leave();
    ASSERT_GT(box->verticalScrollBar()->maximum(), 0);
    QImage picture(300, 400, QImage::Format_RGB32);
    picture.fill(Qt::white);

    QPainter painter(&picture);
    box->drawContent(painter);
    painter.end();

    EXPECT_LT(darkest(picture.copy(0, 0, 300, 200)), 128);
    EXPECT_EQ(darkest(picture.copy(0, 200, 300, 200)), paper);
}

TEST_F(TnTextBoxLooksTest, textOnACanvasWithoutASizeIsOnePointWide)
{
    QTextDocument text(QStringLiteral("M"));

    EXPECT_EQ(layOutText(text, 0.0).width, 1.0);
    EXPECT_EQ(layOutText(text, 0.9).width, 1.0);
}

} // namespace
} // namespace penwick::test
