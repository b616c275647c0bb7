// SPDX-License-Identifier: MIT
// The eraser and the text tool under the pointer.
#include "canvas/CanvasFixture.h"
#include "platform/window/WindowContent.h"

#include <QApplication>

namespace penwick::test {
namespace {

const QString eraser = QStringLiteral("eraser");
const QString text = QStringLiteral("text");

using DrawingCanvasViewToolsTest = CanvasFixture;

// Eraser

TEST_F(DrawingCanvasViewToolsTest, eraserPressNeitherErasesNorTakesTheFirstResponder)
{
    stroke({ { 20, 50 }, { 200, 50 } });
    contentOf(window).makeFirstResponder(nullptr);
    canvas->setCurrentSelectedTool(eraser);

    press({ 100, 50 });

    EXPECT_EQ(contentOf(window).firstResponder(), nullptr);
    EXPECT_EQ(model().pathArray().size(), 1);
}

TEST_F(DrawingCanvasViewToolsTest, eraserDragAcrossThreeStrokesErasesEachAsItIsCrossed)
{
    const Ids strokes { stroke({ { 20, 50 }, { 200, 50 } }), stroke({ { 20, 100 }, { 200, 100 } }),
        stroke({ { 20, 150 }, { 200, 150 } }) };
    canvas->setCurrentSelectedTool(eraser);
    static_cast<void>(recorder.take());
    press({ 100, 30 });

    drag({ 100, 50 });
    EXPECT_EQ(idsOf(canvas->pathArray()), (Ids { strokes[1], strokes[2] }));
    drag({ 100, 75 });
    EXPECT_EQ(idsOf(canvas->pathArray()), (Ids { strokes[1], strokes[2] }));
    drag({ 100, 100 });
    EXPECT_EQ(idsOf(canvas->pathArray()), Ids { strokes[2] });
    drag({ 100, 150 });
    EXPECT_EQ(idsOf(canvas->pathArray()), Ids());
    release({ 100, 180 });
    settle();

    EXPECT_EQ(onScreen(), blank());
    EXPECT_EQ(recorder.take(),
        (Posts { "enableUndo true", "enableRedo false", "enableUndo true", "enableRedo false",
            "enableUndo true", "enableRedo false" }));
}

TEST_F(DrawingCanvasViewToolsTest, eraserDragThatHitsNothingMarksNothing)
{
    stroke({ { 20, 50 }, { 200, 50 } });
    canvas->setCurrentSelectedTool(eraser);
    press({ 100, 100 });
    static_cast<void>(recorder.take());
    PaintRecorder painted(*canvas);

    drag({ 100, 120 });
    settle();

    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
    EXPECT_EQ(painted.take(), std::vector<QRect>());
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawingCanvasViewToolsTest, eraserDragThatHitsRepaintsTheWholeCanvas)
{
    stroke({ { 20, 50 }, { 200, 50 } });
    canvas->setCurrentSelectedTool(eraser);
    press({ 100, 100 });
    PaintRecorder painted(*canvas);

    drag({ 100, 50 });
    settle();

    EXPECT_EQ(painted.take(), (std::vector<QRect> { { 0, 0, width, height } }));
    EXPECT_EQ(onScreen(), blank());
}

TEST_F(DrawingCanvasViewToolsTest, eraserReleaseOnEmptySpaceErasesNothingButStillRepaints)
{
    const std::int64_t kept = stroke({ { 20, 50 }, { 200, 50 } });
    canvas->setCurrentSelectedTool(eraser);
    static_cast<void>(recorder.take());
    PaintRecorder painted(*canvas);

    click({ 100, 100 });
    settle();

    EXPECT_EQ(idsOf(model().pathArray()), Ids { kept });
    EXPECT_EQ(painted.take(), (std::vector<QRect> { { 0, 0, width, height } }));
    EXPECT_EQ(recorder.take(), Posts());
}

TEST_F(DrawingCanvasViewToolsTest, eraserClickOnACrossingErasesTheOlderAndTheNextOneTheNewer)
{
    stroke({ { 20, 100 }, { 200, 100 } });
    const std::int64_t newer = stroke({ { 100, 20 }, { 100, 180 } });
    canvas->setCurrentSelectedTool(eraser);

    click({ 100, 100 });
    EXPECT_EQ(idsOf(canvas->pathArray()), Ids { newer });
    settle();
    EXPECT_EQ(greyAt(onScreen(), { 50, 100 }), paper);
    EXPECT_LT(greyAt(onScreen(), { 100, 50 }), paper);

    click({ 100, 100 });
    settle();
    EXPECT_EQ(idsOf(canvas->pathArray()), Ids());
    EXPECT_EQ(onScreen(), blank());
}

// Text

TEST_F(DrawingCanvasViewToolsTest, textClickPlacesABoxBelowAndRightOfItAndGivesItTheFirstResponder)
{
    canvas->setCurrentSelectedTool(text);
    canvas->setBrushColor(QColor(255, 58, 104));
    canvas->setTextFontSize(36.0);
    contentOf(window).makeFirstResponder(canvas);

    click({ 60, 100 });

    ASSERT_EQ(model().textBoxArray().size(), 1);
    const TextBoxEntry &entry = model().textBoxArray().last();
    EXPECT_EQ(entry.textBox->frame(), (Rect { 60, 76, 200, 30 }));
    EXPECT_EQ(entry.textId, entry.textBox->hash());
    EXPECT_EQ(entry.textBox->textBoxDelegate(), controller);
    EXPECT_EQ(entry.textBox->textColor(), QColor(255, 58, 104)); // at full alpha
    EXPECT_EQ(idsOf(canvas->textBoxArray()), Ids { entry.textId });
    EXPECT_EQ(canvas->subviews(), std::vector<platform::View *> { entry.textBox.get() });
    EXPECT_EQ(contentOf(window).firstResponder(), entry.textBox.get());
    EXPECT_TRUE(model().pathArray().isEmpty());
    EXPECT_EQ(recorder.take(), Posts { "enableUndo true" });
}

TEST_F(DrawingCanvasViewToolsTest, textClickWhileABoxIsEditedOnlyEndsTheEditing)
{
    canvas->setCurrentSelectedTool(text);
    contentOf(window).makeFirstResponder(canvas);
    click({ 20, 100 });
    QTest::keyClicks(model().textBoxArray().last().textBox.get(), QStringLiteral("Text"));
    static_cast<void>(recorder.take());

    click({ 20, 160 });
    EXPECT_EQ(model().textBoxArray().size(), 1);
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
    EXPECT_EQ(recorder.take(), Posts());

    click({ 20, 160 });
    EXPECT_EQ(model().textBoxArray().size(), 2);
    EXPECT_EQ(contentOf(window).firstResponder(), model().textBoxArray().last().textBox.get());
}

TEST_F(DrawingCanvasViewToolsTest, textClickThatTremblesWhileABoxIsEditedOnlyEndsTheEditing)
{
    canvas->setCurrentSelectedTool(text);
    writtenTextBox({ 20, 100 });
    ASSERT_NE(contentOf(window).firstResponder(), canvas);
    const double almost = QApplication::startDragDistance() - 1;

    press({ 20, 160 });
    drag({ 21, 160 });
    drag({ 20 + almost, 160 });
    EXPECT_NE(contentOf(window).firstResponder(), canvas); // it may still become a drag
    release({ 20 + almost, 160 });

    EXPECT_EQ(model().textBoxArray().size(), 1);
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
}

TEST_F(DrawingCanvasViewToolsTest, boxOfAReleaseBesideTheCanvasStandsWhereItIsSeen)
{
    canvas->setCurrentSelectedTool(QStringLiteral("text"));
    contentOf(window).makeFirstResponder(canvas);

    press({ 250, 20 });
    release({ 340, -60 });

    ASSERT_EQ(model().textBoxArray().size(), 1);
    EXPECT_EQ(model().textBoxArray().last().textBox->frame(), (Rect { 280, -10, 200, 30 }));
}

TEST_F(DrawingCanvasViewToolsTest, textDragEndsTheEditingAndItsReleasePlacesABox)
{
    canvas->setCurrentSelectedTool(text);
    writtenTextBox({ 20, 100 });
    const double enough = QApplication::startDragDistance();

    press({ 20, 160 });
    drag({ 20 + enough, 160 });
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
    release({ 20 + enough, 160 });

    ASSERT_EQ(model().textBoxArray().size(), 2);
    EXPECT_EQ(
        model().textBoxArray().last().textBox->frame().origin(), (Point { 20 + enough, 136 }));
}

TEST_F(DrawingCanvasViewToolsTest, eraserDragOfAPixelIsADrag)
{
    stroke({ { 20, 50 }, { 200, 50 } });
    canvas->setCurrentSelectedTool(eraser);

    press({ 100, 52 });
    drag({ 100, 51 });

    EXPECT_TRUE(model().pathArray().isEmpty());
}

TEST_F(DrawingCanvasViewToolsTest, textClickWhileNobodyIsFirstResponderOnlyMakesTheCanvasIt)
{
    canvas->setCurrentSelectedTool(text);
    contentOf(window).makeFirstResponder(nullptr);

    click({ 20, 100 });

    EXPECT_TRUE(model().textBoxArray().isEmpty());
    EXPECT_EQ(contentOf(window).firstResponder(), canvas);
}

TEST_F(DrawingCanvasViewToolsTest, textPressAloneDoesNothing)
{
    canvas->setCurrentSelectedTool(text);
    contentOf(window).makeFirstResponder(nullptr);

    press({ 20, 100 });

    EXPECT_EQ(contentOf(window).firstResponder(), nullptr);
    EXPECT_TRUE(model().textBoxArray().isEmpty());
    EXPECT_TRUE(model().pathArray().isEmpty());
}

TEST_F(DrawingCanvasViewToolsTest, boxThatIsInTheCopyAgainComesBackWithTheNextRepaint)
{
    const std::int64_t id = placedTextBox({ 20, 100 });
    const auto box = model().textBoxArray().last().textBox;
    platform::View *const button = box->deleteTextButton();
    box->removeFromSuperview();
    ASSERT_EQ(canvas->subviews(), std::vector<platform::View *> { button });

    canvas->setNeedsDisplay();
    settle();

    EXPECT_EQ(idsOf(canvas->textBoxArray()), Ids { id });
    EXPECT_EQ(canvas->subviews(), (std::vector<platform::View *> { button, box.get() }));
    EXPECT_TRUE(box->isVisible());
}

TEST_F(DrawingCanvasViewToolsTest, repaintLeavesTheOrderOfTheSubviewsAlone)
{
    placedTextBox({ 20, 100 });
    const auto placed = model().textBoxArray().last().textBox;
    const auto plain = addPlainView();
    textBox({ 20, 160 });
    const auto edited = model().textBoxArray().last().textBox;
    const std::vector<platform::View *> before = canvas->subviews();
    ASSERT_EQ(before,
        (std::vector<platform::View *> { placed.get(), placed->deleteTextButton(), plain.get(),
            edited.get(), edited->deleteTextButton() }));

    canvas->setNeedsDisplay();
    settle();

    EXPECT_EQ(canvas->subviews(), before);
}

} // namespace
} // namespace penwick::test
