// SPDX-License-Identifier: MIT
// Options: colours, thicknesses and font sizes by their identifiers.
#include "canvas/CanvasFixture.h"

#include "appearance/Theme.h"

#include <QLocale>

namespace penwick::test {
namespace {

const QString brush = QStringLiteral("brush");
const QString eraser = QStringLiteral("eraser");
const QString text = QStringLiteral("text");

using DrawViewControllerOptionTest = CanvasFixture;

TEST_F(DrawViewControllerOptionTest, everyColourOfTheMapCanBeChosen)
{
    ASSERT_EQ(colorMap().size(), 9);
    for (auto color = colorMap().constBegin(); color != colorMap().constEnd(); ++color) {
        EXPECT_EQ(printedByOption(QStringLiteral("color#") + color.key()), "");
        EXPECT_EQ(canvas->brushColor(), color.value()) << color.key().toStdString();
    }
}

TEST_F(DrawViewControllerOptionTest, colourOptionGoesBackToTheLastToolThoughItsNameIsUnknown)
{
    canvas->setBrushColor(Qt::red);
    canvas->setLastSelecedTool(eraser);
    for (const char *const name : { "gray", "Black", "darkgrey", "dark_gray", "" }) {
        canvas->setCurrentSelectedTool(QStringLiteral("laser"));

        EXPECT_EQ(printedByOption(QStringLiteral("color#") + QString::fromLatin1(name)), "");

        EXPECT_EQ(canvas->brushColor(), QColor(Qt::red)) << name;
        EXPECT_EQ(canvas->currentSelectedTool(), eraser) << name;
    }
}

TEST_F(DrawViewControllerOptionTest, brushOptionSetsTheThicknessOfNewStrokesAndLeavesTheTool)
{
    canvas->setCurrentSelectedTool(QStringLiteral("laser"));

    EXPECT_EQ(printedByOption(QStringLiteral("brush#7")), "");

    EXPECT_EQ(canvas->brushThickness(), 7.0);
    EXPECT_EQ(canvas->textFontSize(), 24.0);
    EXPECT_EQ(canvas->currentSelectedTool(), QStringLiteral("laser"));
    canvas->setCurrentSelectedTool(brush);
    press({ 50, 60 });
    EXPECT_EQ(model().pathArray().last().bPath->lineWidth(), 7.0);
}

TEST_F(DrawViewControllerOptionTest, textOptionSetsTheFontSizeAndLeavesTheTool)
{
    canvas->setCurrentSelectedTool(QStringLiteral("laser"));

    EXPECT_EQ(printedByOption(QStringLiteral("text#48")), "");

    EXPECT_EQ(canvas->textFontSize(), 48.0);
    EXPECT_EQ(canvas->brushThickness(), 5.0);
    EXPECT_EQ(canvas->currentSelectedTool(), QStringLiteral("laser"));
}

TEST_F(DrawViewControllerOptionTest, valueThatIsNoNumberChangesAndPrintsNothing)
{
    for (const char *const value : { "", "thick", "7px", "1.2.3", "nan", "inf", "0x7", "1,000" }) {
        const QString ending = QLatin1Char('#') + QString::fromLatin1(value);

        EXPECT_EQ(printedByOption(brush + ending), "");
        EXPECT_EQ(printedByOption(text + ending), "");

        EXPECT_EQ(canvas->brushThickness(), 5.0) << value;
        EXPECT_EQ(canvas->textFontSize(), 24.0) << value;
    }
}

TEST_F(DrawViewControllerOptionTest, optionOfAnyOtherToolDoesNothing)
{
    canvas->setCurrentSelectedTool(QStringLiteral("laser"));
    for (const char *const option : { "eraser#7", "laser#7", "Brush#7", "Color#red", "#7", "#" })
        EXPECT_EQ(printedByOption(QString::fromLatin1(option)), "") << option;

    EXPECT_EQ(canvas->brushThickness(), 5.0);
    EXPECT_EQ(canvas->textFontSize(), 24.0);
    EXPECT_EQ(canvas->brushColor(), QColor(41, 41, 41));
    EXPECT_EQ(canvas->currentSelectedTool(), QStringLiteral("laser"));
}

class MalformedOption : public DrawViewControllerOptionTest,
                        public ::testing::WithParamInterface<const char *>
{ };

TEST_P(MalformedOption, isPrintedAndChangesNothing)
{
    canvas->setCurrentSelectedTool(QStringLiteral("laser"));

    EXPECT_EQ(printedByOption(QString::fromUtf8(GetParam())),
        std::string("Selected tool Option: ") + GetParam() + " is not available!\n");

    EXPECT_EQ(canvas->brushThickness(), 5.0);
    EXPECT_EQ(canvas->brushColor(), QColor(41, 41, 41));
    EXPECT_EQ(canvas->currentSelectedTool(), QStringLiteral("laser"));
}

INSTANTIATE_TEST_SUITE_P(DrawViewController, MalformedOption,
    ::testing::Values("", "brush", "brush7", "brush#7#", "#brush#7", "##", "color#red#blue",
        "brush##7", "100 %s", "größe"));

class DecimalComma : public DrawViewControllerOptionTest
{
protected:
    DecimalComma() { QLocale::setDefault(QLocale(QLocale::German, QLocale::Germany)); }
    ~DecimalComma() override { QLocale::setDefault(m_before); }

private:
    const QLocale m_before;
};

TEST_F(DecimalComma, numberIsReadAsItsReaderWritesIt)
{
    EXPECT_EQ(printedByOption(QStringLiteral("brush#7,5")), "");
    EXPECT_EQ(canvas->brushThickness(), 7.5);

    EXPECT_EQ(printedByOption(QStringLiteral("text#18,25")), "");
    EXPECT_EQ(canvas->textFontSize(), 18.25);
}

TEST_F(DecimalComma, pointIsNoDecimalSign)
{
    EXPECT_EQ(printedByOption(QStringLiteral("brush#7.5")), "");
    EXPECT_EQ(canvas->brushThickness(), 5.0);
}

TEST_F(DrawViewControllerOptionTest, pointIsADecimalSignWhereItsReaderWritesIt)
{
    const QLocale before;
    QLocale::setDefault(QLocale::c());
    EXPECT_EQ(printedByOption(QStringLiteral("brush#7.5")), "");
    EXPECT_EQ(canvas->brushThickness(), 7.5);

    EXPECT_EQ(printedByOption(QStringLiteral("brush#8,5,1")), "");
    EXPECT_EQ(canvas->brushThickness(), 7.5);
    QLocale::setDefault(before);
}

} // namespace
} // namespace penwick::test
