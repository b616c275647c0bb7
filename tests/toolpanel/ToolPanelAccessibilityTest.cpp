// SPDX-License-Identifier: MIT
// The tool bar for people who do not use a pointer: names, descriptions, and the press action.
#include "toolpanel/ToolPanelFixture.h"

#include <QAccessible>
#include <QMouseEvent>
#include <QSet>

namespace penwick::test {

namespace {

class ToolPanelAccessibility : public ToolPanelFixture
{
protected:
    [[nodiscard]] std::vector<ToolPanelButton *> allButtons() const
    {
        std::vector<ToolPanelButton *> all;
        for (const QString &name : toolNames())
            all.push_back(bar.button(name));
        for (ToolOptionsButton *const each : options())
            all.push_back(each);
        return all;
    }

    static QAccessibleInterface &accessible(QObject &object)
    {
        return *QAccessible::queryAccessibleInterface(&object);
    }

    static void pressThroughAccessibility(QObject &button)
    {
        accessible(button).actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    }

    void sendToCanvas(QEvent::Type type, QPointF place, Qt::MouseButtons buttons)
    {
        const auto changed = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
        QMouseEvent event(
            type, place, canvas().mapToGlobal(place), changed, buttons, Qt::NoModifier);
        QCoreApplication::sendEvent(&canvas(), &event);
    }
};

} // namespace

TEST_F(ToolPanelAccessibility, everyButtonHasAToolTipANameAndADescription)
{
    for (ToolPanelButton *const each : allButtons()) {
        const std::string name = each->identifier().toStdString();
        const QString spoken = accessible(*each).text(QAccessible::Name);
        EXPECT_FALSE(spoken.isEmpty()) << name;
        EXPECT_TRUE(each->toolTip().startsWith(spoken)) << name;
        EXPECT_FALSE(accessible(*each).text(QAccessible::Description).isEmpty()) << name;
        EXPECT_EQ(accessible(*each).role(), QAccessible::Button) << name;
        EXPECT_FALSE(accessible(*each).state().focusable) << name;
    }
}

TEST_F(ToolPanelAccessibility, noTwoButtonsHaveTheSameName)
{
    QSet<QString> names;
    for (const ToolPanelButton *const each : allButtons())
        names.insert(each->accessibleName());

    EXPECT_EQ(names.size(), 8 + 17);
}

TEST_F(ToolPanelAccessibility, buttonsAreReachedFromTheWindow)
{
    for (const QString &name : toolNames()) {
        QAccessibleInterface *around = &accessible(*bar.button(name));
        while (around && around->object() != &panel)
            around = around->parent();
        EXPECT_NE(around, nullptr) << name.toStdString();
    }
}

TEST_F(ToolPanelAccessibility, disabledButtonSaysSo)
{
    EXPECT_TRUE(accessible(button("undo")).state().disabled);
    EXPECT_FALSE(accessible(button("brush")).state().disabled);
}

TEST_F(ToolPanelAccessibility, pressActionChoosesATool)
{
    pressThroughAccessibility(button("eraser"));

    EXPECT_TRUE(QTest::qWaitFor(
        [this] { return canvas().currentSelectedTool() == QStringLiteral("eraser"); }));
    EXPECT_EQ(selected(), only("eraser"));
}

TEST_F(ToolPanelAccessibility, pressActionChoosesAnOption)
{
    press("color");

    pressThroughAccessibility(option(QStringLiteral("color#red")));

    EXPECT_TRUE(QTest::qWaitFor([this] { return canvas().brushColor() == QColor(255, 58, 104); }));
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(ToolPanelAccessibility, pressActionOfADisabledButtonDoesNothing)
{
    pressThroughAccessibility(button("undo"));
    pressThroughAccessibility(button("eraser"));

    EXPECT_TRUE(QTest::qWaitFor([this] { return selected() == only("eraser"); }));
    EXPECT_EQ(bar.selectedButtonId(), QStringLiteral("eraser"));
}

TEST_F(ToolPanelAccessibility, toolChosenDuringAStrokeWaitsUntilTheButtonIsUp)
{
    sendToCanvas(QEvent::MouseButtonPress, { 300, 300 }, Qt::LeftButton);
    sendToCanvas(QEvent::MouseMove, { 350, 300 }, Qt::LeftButton);

    button("eraser").click();
    button("clear").click();
    sendToCanvas(QEvent::MouseMove, { 400, 300 }, Qt::LeftButton);

    auto &model = *drawViewController().drawingCanvasModel();
    EXPECT_EQ(canvas().currentSelectedTool(), QStringLiteral("brush"));
    EXPECT_EQ(selected(), only("brush"));
    EXPECT_EQ(model.pathArray().size(), 1);

    sendToCanvas(QEvent::MouseButtonRelease, { 400, 300 }, Qt::NoButton);

    // Both, in their order.
    EXPECT_EQ(canvas().currentSelectedTool(), QStringLiteral("eraser"));
    EXPECT_EQ(selected(), only("eraser"));
    EXPECT_TRUE(model.pathArray().isEmpty());
}

TEST_F(ToolPanelAccessibility, toolChosenDuringAStrokeIsForgottenWithItsBar)
{
    sendToCanvas(QEvent::MouseButtonPress, { 300, 300 }, Qt::LeftButton);
    button("eraser").click();

    m_board.reset();
    m_penwick.reset();
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
}

} // namespace penwick::test
