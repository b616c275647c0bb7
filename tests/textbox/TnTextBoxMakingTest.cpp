// SPDX-License-Identifier: MIT
// What a text box is like as it is made.
#include "platform/window/WindowContent.h"
#include "textbox/TextBoxFixture.h"

#include <QTextDocument>

#include <optional>

namespace penwick::test {
namespace {

using TnTextBoxMakingTest = TextBoxFixture;

TEST_F(TnTextBoxMakingTest, newBoxHasItsInitialValues)
{
    const auto box = TnTextBox::create({ 10, 20, 200, 30 }, 36.0, TnhColors::redColor);

    EXPECT_EQ(box->frame(), (Rect { 10, 20, 200, 30 }));
    EXPECT_EQ(box->mouseDownPoint(), (Point { 0, 0 }));
    EXPECT_TRUE(box->hasDashedBorder());
    EXPECT_EQ(box->textFontSize(), 36.0);
    EXPECT_EQ(box->textFontColor(), TnhColors::redColor);
    EXPECT_EQ(box->textBoxDelegate(), nullptr);
    EXPECT_FALSE(box->isTextBoxDeleted());
    EXPECT_TRUE(box->isEditable());
    EXPECT_EQ(box->textInteractionFlags(), Qt::TextEditorInteraction);
    EXPECT_TRUE(box->isUndoRedoEnabled());
    EXPECT_FALSE(box->document()->isUndoAvailable());
    EXPECT_EQ(box->textColor(), TnhColors::redColor);
    EXPECT_FALSE(box->viewport()->autoFillBackground());
    EXPECT_EQ(box->panGesture().state(), platform::PanGestureRecognizer::State::Possible);
}

TEST_F(TnTextBoxMakingTest, otherConstructorsLeaveTheSettingUpToCustomize)
{
    QTextDocument text(QStringLiteral("shared"));
    TnTextBox ofAScene;
    TnTextBox ofAFrame(Rect { 10, 20, 200, 30 });
    TnTextBox ofAText(Rect { 10, 20, 200, 30 }, text);

    for (const TnTextBox *const box : { &ofAScene, &ofAFrame, &ofAText }) {
        EXPECT_EQ(box->textFontSize(), 14.0);
        EXPECT_EQ(box->textFontColor(), TextBoxParams::defaultTextFontColor);
        EXPECT_TRUE(box->hasDashedBorder());
        EXPECT_EQ(box->mouseDownPoint(), (Point { 0, 0 }));
        EXPECT_EQ(box->deleteTextButton(), nullptr);
        EXPECT_EQ(box->textBoxDelegate(), nullptr);
        EXPECT_EQ(box->placeholderAttributedString(), platform::AttributedString());
        EXPECT_FALSE(box->isTextBoxDeleted());
        EXPECT_EQ(box->trackingArea(), std::nullopt);
        EXPECT_EQ(box->textParentView(), nullptr);
    }
    EXPECT_EQ(ofAFrame.frame(), (Rect { 10, 20, 200, 30 }));
    EXPECT_EQ(ofAText.frame(), (Rect { 10, 20, 200, 30 }));
    EXPECT_EQ(ofAText.document(), &text);
}

TEST_F(TnTextBoxMakingTest, customizeMakesABoxOfAnotherConstructorReady)
{
    const auto box = platform::makeView<TnTextBox>(Rect { 20, 100, 200, 30 });
    box->setTextFontSize(36.0);
    box->setTextFontColor(TnhColors::redColor);

    box->customizeTextBox();

    EXPECT_EQ(box->font().pixelSize(), 36);
    EXPECT_EQ(box->textColor(), TnhColors::redColor);
    EXPECT_EQ(box->placeholderAttributedString().foregroundColor.rgb(), TnhColors::redColor.rgb());
    ASSERT_NE(box->deleteTextButton(), nullptr);
    EXPECT_EQ(box->deleteTextButton()->frame(), (Rect { 221, 131, 20, 20 }));
    EXPECT_TRUE(box->isEditable());
    EXPECT_TRUE(box->hasDashedBorder());
}

TEST_F(TnTextBoxMakingTest, customizeMakesAPlacedBoxReadyToo)
{
    const auto box = placedBox();
    box->setTextFontColor(TnhColors::redColor);
    ASSERT_EQ(borderWidth(*box), 3.0);

    box->customizeTextBox();

    EXPECT_TRUE(box->isEditable());
    EXPECT_TRUE(box->hasDashedBorder());
    EXPECT_EQ(borderWidth(*box), 0.0);
    EXPECT_FALSE(box->deleteTextButton()->isHidden());
    EXPECT_EQ(box->textColor(), TnhColors::redColor);
}

TEST_F(TnTextBoxMakingTest, boxInNoWindowIsNotDragged)
{
    const auto box = TnTextBox::create({ 10, 20, 200, 30 }, 36.0, TnhColors::redColor);

    box->handleGesture(box->panGesture());

    EXPECT_EQ(box->frame(), (Rect { 10, 20, 200, 30 }));
    EXPECT_EQ(box->mouseDownPoint(), (Point { 0, 0 }));
}

TEST_F(TnTextBoxMakingTest, boxThatWasNotCustomizedIsEditedAndLeft)
{
    RecordingOwner owner;
    const auto box = platform::makeView<TnTextBox>(Rect { 20, 100, 200, 30 });
    box->setTextBoxDelegate(&owner);
    canvas->addSubview(box);
    contentOf(window).makeFirstResponder(box.get());
    QTest::keyClicks(box.get(), QStringLiteral("Hello"));
    leave();

    EXPECT_EQ(box->toPlainText(), QStringLiteral("Hello"));
    EXPECT_FALSE(box->isEditable());
    box->deleteTextBox();
    EXPECT_EQ(owner.reports, Ids { box->hash() });
}

TEST_F(TnTextBoxMakingTest, reservedPropertiesKeepWhatTheyAreGiven)
{
    const auto box = TnTextBox::create({ 10, 20, 200, 30 }, 36.0, TnhColors::redColor);

    box->setTrackingArea(Rect { 1, 2, 3, 4 });
    box->setTextParentView(canvas);

    EXPECT_EQ(box->trackingArea(), (Rect { 1, 2, 3, 4 }));
    EXPECT_EQ(box->textParentView(), canvas);
}

TEST_F(TnTextBoxMakingTest, parentViewIsHeldWeakly)
{
    const auto box = TnTextBox::create({ 10, 20, 200, 30 }, 36.0, TnhColors::redColor);
    {
        PlainView parent;
        box->setTextParentView(&parent);
        EXPECT_EQ(box->textParentView(), &parent);
    }

    EXPECT_EQ(box->textParentView(), nullptr);
}

TEST_F(TnTextBoxMakingTest, placeholderIsTheHintInHalfTheColourInALabelFontJustified)
{
    const auto box = TnTextBox::create({ 10, 20, 200, 30 }, 36.0, TnhColors::redColor);

    const auto found
        = box->property("placeholderAttributedString").value<platform::AttributedString>();

    EXPECT_EQ(found, box->placeholderAttributedString());
    EXPECT_EQ(found.string, QStringLiteral("Type your text here.."));
    EXPECT_EQ(found.foregroundColor.rgb(), TnhColors::redColor.rgb());
    EXPECT_EQ(found.foregroundColor.alpha(), 128);
    EXPECT_EQ(found.font.pixelSize(), 14);
    EXPECT_EQ(found.alignment, Qt::AlignJustify);
}

TEST_F(TnTextBoxMakingTest, newBoxHasAHiddenDeleteButtonOutsideItsTopRightCorner)
{
    const auto box = TnTextBox::create({ 100, 100, 200, 40 }, 24.0, TnhColors::redColor);

    ASSERT_NE(box->deleteTextButton(), nullptr);
    EXPECT_TRUE(box->deleteTextButton()->isHidden());
    EXPECT_EQ(box->deleteTextButton()->superview(), nullptr);
    EXPECT_EQ(box->deleteTextButton()->frame(), (Rect { 301, 141, 20, 20 }));
}

TEST_F(TnTextBoxMakingTest, textOfFontsUpTo24StandsSixPointsDownAndOfLargerOnesThree)
{
    const auto topAt = [](double size) {
        return TnTextBox::create({ 0, 0, 200, 30 }, size, Qt::black)->textContainerOrigin().y;
    };

    EXPECT_EQ(topAt(18.0), 6.0);
    EXPECT_EQ(topAt(24.0), 6.0);
    EXPECT_EQ(topAt(24.1), 3.0);
    EXPECT_EQ(topAt(30.0), 3.0);
    EXPECT_EQ(topAt(48.0), 3.0);
}

TEST_F(TnTextBoxMakingTest, firstLineBeginsAtTheContainersOrigin)
{
    const auto small = newBox();
    canvas->setTextFontSize(30.0);
    const auto large = newBox({ 20, 60 });

    EXPECT_EQ(small->cursorRect().topLeft(), QPoint(5, 6));
    EXPECT_EQ(large->cursorRect().topLeft(), QPoint(5, 3));
}

TEST_F(TnTextBoxMakingTest, fontIsTheSystemsWhereThePreferredOneIsNotInstalled)
{
    const auto box = TnTextBox::create({ 0, 0, 200, 30 }, 36.0, Qt::black);

    EXPECT_EQ(box->font().family(), QApplication::font().family());
    EXPECT_EQ(box->font().pixelSize(), 36);
}

TEST_F(TnTextBoxMakingTest, newBoxOnACanvasIsEditedWithItsDeleteButtonBesideIt)
{
    const auto box = newBox();

    EXPECT_EQ(box->frame(), (Rect { 20, 100, 200, 30 }));
    EXPECT_EQ(contentOf(window).firstResponder(), box.get());
    EXPECT_TRUE(box->hasFocus());
    EXPECT_TRUE(box->isEditable());
    EXPECT_EQ(borderWidth(*box), 0.0);
    EXPECT_EQ(
        canvas->subviews(), (std::vector<platform::View *> { box.get(), box->deleteTextButton() }));
    EXPECT_FALSE(box->deleteTextButton()->isHidden());
    EXPECT_EQ(box->deleteTextButton()->frame(), (Rect { 221, 131, 20, 20 }));
}

} // namespace
} // namespace penwick::test
