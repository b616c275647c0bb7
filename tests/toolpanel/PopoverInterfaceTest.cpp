// SPDX-License-Identifier: MIT
// What the popovers offer: every option is one that the drawing takes, and today's is selected.
#include "toolpanel/ToolPanelFixture.h"

#include "appearance/PenwickBundle.h"
#include "appearance/Theme.h"
#include "platform/view/PlainView.h"

#include <QAccessible>

namespace penwick::test {

namespace {

class PopoverInterface : public ToolPanelFixture
{
protected:
    [[nodiscard]] QStringList offered(const char *kind) const
    {
        QStringList values;
        for (const ToolOptionsButton *const each : options()) {
            if (each->identifier().section(QLatin1Char('#'), 0, 0) == QLatin1String(kind))
                values.append(each->identifier().section(QLatin1Char('#'), 1));
        }
        return values;
    }

    static QStringList words(const char *text)
    {
        return QString::fromLatin1(text).split(QLatin1Char(' '));
    }
};

} // namespace

TEST_F(PopoverInterface, gridsHoldOptionButtonsAndNothingElse)
{
    for (PopoverView *const view : popoverViews()) {
        ASSERT_EQ(view->subviews().size(), 1U);
        platform::View &grid = *view->subviews().front();
        EXPECT_FALSE(grid.subviews().empty());
        EXPECT_EQ(static_cast<qsizetype>(grid.subviews().size()),
            grid.widget().findChildren<QWidget *>().size());
        for (platform::View *const each : grid.subviews())
            EXPECT_NE(dynamic_cast<ToolOptionsButton *>(each), nullptr);
    }
}

TEST_F(PopoverInterface, optionsAreInTheirOrder)
{
    EXPECT_EQ(offered("text"), words("18 24 36 48"));
    EXPECT_EQ(offered("brush"), words("3 5 8 12"));
    EXPECT_EQ(offered("color"),
        words("black dark_grey light_grey red yellow green dark_blue light_blue white"));
    EXPECT_EQ(options().size(), 4U + 4U + 9U);
}

TEST_F(PopoverInterface, coloursAreThoseOfTheColourMap)
{
    QStringList names = colorMap().keys();
    names.sort();
    QStringList values = offered("color");
    values.sort();

    EXPECT_EQ(values, names);
}

TEST_F(PopoverInterface, todaysValuesAreSelectedFromTheFirstOpening)
{
    EXPECT_EQ(selectedOptions("text"), only("text#24"));
    EXPECT_EQ(selectedOptions("color"), only("color#black"));
    EXPECT_EQ(selectedOptions("brush"), only("brush#5"));
    EXPECT_EQ(canvas().textFontSize(), 24.0);
    EXPECT_EQ(canvas().brushThickness(), 5.0);
    EXPECT_EQ(canvas().brushColor(), colorMap().value(QStringLiteral("black")));
    for (const ToolOptionsButton *const each : options()) {
        EXPECT_EQ(lookOf(*each).image, each->isSelected() ? Shown::AlternateImage : Shown::Image)
            << each->identifier().toStdString();
        EXPECT_EQ(each->backgroundColor(),
            each->isSelected() ? QColor(203, 210, 218) : QColor(246, 248, 250))
            << each->identifier().toStdString();
    }
}

TEST_F(PopoverInterface, drawingTakesEveryOption)
{
    for (ToolOptionsButton *const each : options()) {
        testing::internal::CaptureStdout();
        each->click();
        EXPECT_EQ(testing::internal::GetCapturedStdout(), "");

        const QString value = each->identifier().section(QLatin1Char('#'), 1);
        if (each->identifier().startsWith(QLatin1String("text#")))
            EXPECT_EQ(canvas().textFontSize(), value.toDouble());
        else if (each->identifier().startsWith(QLatin1String("brush#")))
            EXPECT_EQ(canvas().brushThickness(), value.toDouble());
        else
            EXPECT_EQ(canvas().brushColor(), colorMap().value(value));
    }
}

TEST_F(PopoverInterface, everyColourHasAnImageOfItsName)
{
    for (const QString &name : colorMap().keys()) {
        const QIcon image = penwickBundle()->imageForResource(QStringLiteral("color#") + name);

        EXPECT_EQ(image.pixmap(24, 24).toImage().pixelColor(12, 12), colorMap().value(name))
            << name.toStdString();
    }
}

TEST_F(PopoverInterface, imagesAreDifferentWhenSelected)
{
    for (const ToolOptionsButton *const each : options()) {
        EXPECT_FALSE(each->buttonImage().isNull()) << each->identifier().toStdString();
        EXPECT_NE(each->buttonImage().pixmap(60, 60).toImage(),
            each->buttonAltImage().pixmap(60, 60).toImage())
            << each->identifier().toStdString();
    }
}

TEST_F(PopoverInterface, popoversAreAsLargeAsTheirWindow)
{
    for (const PopoverView *const view : popoverViews())
        EXPECT_EQ(view->frame().size(), popover().frame().size());
}

TEST_F(PopoverInterface, optionsLieInsideTheirGridAndApart)
{
    for (const PopoverView *const view : popoverViews()) {
        const platform::View &grid = *view->subviews().front();
        const std::vector<platform::View *> all = grid.subviews();
        for (const platform::View *const one : all) {
            EXPECT_TRUE(grid.widget().rect().contains(one->widget().geometry()));
            for (const platform::View *const other : all) {
                EXPECT_TRUE(one == other
                    || !one->widget().geometry().intersects(other->widget().geometry()));
            }
        }
    }
}

} // namespace penwick::test
