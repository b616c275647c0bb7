// SPDX-License-Identifier: MIT
// Keys on a board and its tool bar, as they come from the desktop: which of them work the bar when.
#include "toolpanel/ToolPanelFixture.h"

#include "platform/window/WindowContent.h"
#include "textbox/TnTextBox.h"

#include <QKeyEvent>

namespace penwick::test {

namespace {

class ToolPanelKeys : public ToolPanelFixture
{
protected:
    [[nodiscard]] QString tool() const { return canvas().currentSelectedTool(); }

    /// `place` from the top left corner of `window`'s content, on whatever is there.
    static void click(const QWidget &window, QPoint place)
    {
        QWidget *const target = window.childAt(place);
        QTest::mouseClick(target, Qt::LeftButton, {}, target->mapFrom(&window, place));
    }
    /// Right of the tool bar.
    void click(QPoint place) { click(drawing, place); }
    void type(Qt::Key key, Qt::KeyboardModifiers modifiers = {})
    {
        platform::View *const responder = contentOf(drawing).firstResponder();
        QTest::keyClick(responder ? &responder->widget() : &drawing, key, modifiers);
    }
    void repeat(Qt::Key key, Qt::KeyboardModifiers modifiers = {})
    {
        QKeyEvent event(QEvent::KeyPress, key, modifiers, QString(), true);
        QCoreApplication::sendEvent(&drawing, &event);
    }

    /// A new text box at `place`, which is then being edited and has "one" in it.
    TnTextBox &writeAt(QPoint place)
    {
        press("text");
        click(place);
        for (const Qt::Key letter : { Qt::Key_O, Qt::Key_N, Qt::Key_E })
            type(letter);
        return box();
    }
    [[nodiscard]] TnTextBox &box() const { return *canvas().textBoxArray().last().textBox; }
    void clickBox()
    {
        QWidget &widget = box();
        click(widget.mapTo(&drawing, widget.rect().center()));
    }
};

class DesktopKey : public ToolPanelKeys,
                   public testing::WithParamInterface<std::pair<const char *, QKeyCombination>>
{ };

std::string keyName(
    const testing::TestParamInfo<std::pair<const char *, QKeyCombination>> &combination)
{
    return combination.param.first;
}

} // namespace

TEST_F(ToolPanelKeys, lettersChooseToolsOnAFreshBoard)
{
    type(Qt::Key_E);
    EXPECT_EQ(tool(), QStringLiteral("eraser"));
    type(Qt::Key_B);
    EXPECT_EQ(tool(), QStringLiteral("brush"));
    type(Qt::Key_T, Qt::ShiftModifier);
    EXPECT_EQ(tool(), QStringLiteral("text"));
    type(Qt::Key_C);
    EXPECT_TRUE(isPopoverShown());
    type(Qt::Key_4);
    EXPECT_EQ(selectedOptions("color"), only("color#red"));
}

TEST_F(ToolPanelKeys, typingOnAfterReturnChoosesNothing)
{
    writeAt({ 250, 100 });
    type(Qt::Key_Return);

    type(Qt::Key_B);
    type(Qt::Key_E);
    type(Qt::Key_C);
    type(Qt::Key_1);

    EXPECT_EQ(tool(), QStringLiteral("text"));
    EXPECT_FALSE(isPopoverShown());
    EXPECT_EQ(box().toPlainText(), QStringLiteral("one"));
}

TEST_F(ToolPanelKeys, digitsRestInAnOpenPopoverTooAndEscapeClosesIt)
{
    writeAt({ 250, 100 });
    type(Qt::Key_Escape);
    press("color"); // by no pointer

    type(Qt::Key_4);
    EXPECT_TRUE(isPopoverShown());
    EXPECT_EQ(selectedOptions("color"), only("color#black"));

    type(Qt::Key_Escape);
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(ToolPanelKeys, answerWhetherTheyWereTaken)
{
    const auto isTaken = [this](Qt::Key key, bool isRepeated = false) {
        return bar.performKey(
            QKeyEvent(QEvent::KeyPress, key, Qt::NoModifier, QString(), isRepeated));
    };
    EXPECT_TRUE(isTaken(Qt::Key_E));
    EXPECT_FALSE(isTaken(Qt::Key_E, true));
    EXPECT_FALSE(isTaken(Qt::Key_Escape)) << "nothing is open";
    EXPECT_FALSE(isTaken(Qt::Key_4));

    press("brush");
    press("brush");
    ASSERT_TRUE(isPopoverShown());
    const auto count = static_cast<int>(
        bar.popoverVc()->brushPopoverView()->subviews().at(0)->subviews().size());
    ASSERT_LT(count, 9);
    EXPECT_FALSE(isTaken(static_cast<Qt::Key>(Qt::Key_1 + count))) << "there is none";
    ASSERT_TRUE(isPopoverShown());
    EXPECT_TRUE(isTaken(static_cast<Qt::Key>(Qt::Key_1 + count - 1)));
    press("color");
    ASSERT_TRUE(isPopoverShown());
    EXPECT_TRUE(isTaken(Qt::Key_Escape));
    EXPECT_FALSE(isPopoverShown());
}

TEST_F(ToolPanelKeys, pressOnTheBoardWakesThem)
{
    writeAt({ 250, 100 });
    type(Qt::Key_Tab);
    press("brush"); // by no pointer
    type(Qt::Key_E);
    EXPECT_EQ(tool(), QStringLiteral("brush"));

    click({ 400, 250 });
    type(Qt::Key_E);

    EXPECT_EQ(tool(), QStringLiteral("eraser"));
}

TEST_F(ToolPanelKeys, pressAnywhereOnTheBarWakesThem)
{
    writeAt({ 250, 100 });
    for (const QPoint place : { QPoint(26, 8), button("undo").mapTo(&panel, QPoint(5, 5)) }) {
        type(Qt::Key_Return);
        type(Qt::Key_E);
        EXPECT_EQ(tool(), QStringLiteral("text"));

        click(panel, place);
        type(Qt::Key_E);
        EXPECT_EQ(tool(), QStringLiteral("eraser"));

        writeAt({ 300, 60 + place.y() / 8 });
    }
}

TEST_F(ToolPanelKeys, pressOnAPopoverWakesThem)
{
    writeAt({ 250, 100 });
    type(Qt::Key_Return);
    press("color");

    const ToolOptionsButton &red = option(QStringLiteral("color#red"));
    click(popover(), red.mapTo(&popover(), QPoint(5, 5)));
    type(Qt::Key_E);

    EXPECT_EQ(tool(), QStringLiteral("eraser"));
}

TEST_F(ToolPanelKeys, keyboardThatEntersTheBarWakesThem)
{
    writeAt({ 250, 100 });
    type(Qt::Key_Return);

    bar.keyboardEntered();
    type(Qt::Key_E);

    EXPECT_EQ(tool(), QStringLiteral("eraser"));
}

TEST_F(ToolPanelKeys, clickThatEndsAnEditWakesThem)
{
    writeAt({ 250, 100 });

    click({ 400, 250 });
    ASSERT_FALSE(box().isEditable());
    type(Qt::Key_E);

    EXPECT_EQ(tool(), QStringLiteral("eraser"));
}

TEST_F(ToolPanelKeys, clickOnAPlacedBoxPutsThemToRest)
{
    writeAt({ 250, 100 });
    click({ 400, 250 });

    clickBox();
    type(Qt::Key_E);
    EXPECT_EQ(tool(), QStringLiteral("text"));

    click({ 400, 250 });
    type(Qt::Key_E);
    EXPECT_EQ(tool(), QStringLiteral("eraser"));
}

TEST_F(ToolPanelKeys, pressOnAnotherBoardWakesNothingHere)
{
    writeAt({ 250, 100 });
    type(Qt::Key_Return);
    Penwick elsewhere;
    const auto other = elsewhere.createDrawingWindowController(
        WindowType::whiteboard, QGuiApplication::primaryScreen());
    other->showWindow(nullptr);
    QCoreApplication::processEvents();

    click(*other->drawingWindow(), { 400, 250 });
    type(Qt::Key_E);

    EXPECT_EQ(tool(), QStringLiteral("text"));
}

TEST_F(ToolPanelKeys, keyThatRepeatsItselfDoesNothing)
{
    auto &model = *drawViewController().drawingCanvasModel();
    model.createPathWithParam(Qt::black, 5.0, { 300, 300 });
    drawViewController().updateDrawingCanvasElements();

    for (const Qt::Key key : { Qt::Key_E, Qt::Key_C })
        repeat(key);
    for (const Qt::Key key : { Qt::Key_Z, Qt::Key_Delete, Qt::Key_W })
        repeat(key, Qt::ControlModifier);

    EXPECT_EQ(tool(), QStringLiteral("brush"));
    EXPECT_FALSE(isPopoverShown());
    EXPECT_EQ(model.pathArray().size(), 1);
    EXPECT_TRUE(drawing.isVisible());
}

TEST_P(DesktopKey, worksOnTheBoardAlsoWhileLettersRest)
{
    auto &model = *drawViewController().drawingCanvasModel();
    writeAt({ 250, 100 });
    type(Qt::Key_Return);
    const auto inked = [&] { return model.textBoxArray().size() + model.pathArray().size(); };
    ASSERT_EQ(inked(), 1);

    type(GetParam().second.key(), GetParam().second.keyboardModifiers());

    EXPECT_TRUE(inked() == 0 || !drawing.isVisible());
}

TEST_P(DesktopKey, isTheEditorsWhileABoxIsEdited)
{
    writeAt({ 250, 100 });
    auto &model = *drawViewController().drawingCanvasModel();
    model.createPathWithParam(Qt::black, 5.0, { 300, 300 });

    type(GetParam().second.key(), GetParam().second.keyboardModifiers());

    EXPECT_TRUE(drawing.isVisible());
    EXPECT_EQ(model.pathArray().size(), 1);
    EXPECT_EQ(model.textBoxArray().size(), 1);
    EXPECT_TRUE(box().isEditable());
    EXPECT_EQ(tool(), QStringLiteral("text"));
}

INSTANTIATE_TEST_SUITE_P(Keys, DesktopKey,
    testing::Values(std::pair("undo", Qt::ControlModifier | Qt::Key_Z),
        std::pair("clear", Qt::ControlModifier | Qt::Key_Delete),
        std::pair("close", Qt::ControlModifier | Qt::Key_W)),
    keyName);

} // namespace penwick::test
