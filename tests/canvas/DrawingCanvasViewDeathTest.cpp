// SPDX-License-Identifier: MIT
// What stops the process when a canvas is used.
#include "canvas/CanvasFixture.h"
#include "platform/window/WindowContent.h"

namespace penwick::test {
namespace {

const QString eraser = QStringLiteral("eraser");
const QString text = QStringLiteral("text");

class DrawingCanvasViewDeathTest : public CanvasFixture
{
protected:
    /// A delegate that hands no text box to the canvas and is not the owner of text boxes.
    class Idle : public QObject, public DrawingCanvasDelegate
    {
    public:
        void didBeginDrawing(Point /*currentPoint*/) override { }
        void drawPathOnCanvas(Point /*pointToDraw*/, Point /*lastPoint*/) override { }
        void createTextBoxOnCanvas(Point /*textBoxLocation*/) override { }
        void didClearCanvas() override { }
        void updateDrawingCanvasElements() override { }
        void updateDrawingCanvasViewForDisplay() override { }
        [[nodiscard]] const std::shared_ptr<DrawingCanvasModel> &drawingCanvasModel() const override
        {
            return m_model;
        }
        [[nodiscard]] DrawingCanvasView *drawingView() const override { return nullptr; }

        void setModel(std::shared_ptr<DrawingCanvasModel> model) { m_model = std::move(model); }

    private:
        std::shared_ptr<DrawingCanvasModel> m_model;
    };

    class IdleOwner final : public Idle, public TextBoxDelegate
    {
    public:
        void shouldDeleteTheTextBox(std::int64_t /*withHash*/) override { }
    };
};

TEST_F(DrawingCanvasViewDeathTest, pressOutsideAWindowIsFatal)
{
    DrawingCanvasView alone(Rect { 0, 0, 100, 100 });

    EXPECT_DEATH(alone.mouseDown({ { 5, 5 }, 1 }),
        "penwick: fatal error: a canvas was pressed outside a window\n");
}

TEST_F(DrawingCanvasViewDeathTest, brushPressWithoutADelegateIsFatal)
{
    canvas->setDrawingCanvasDelegate(nullptr);

    EXPECT_DEATH(press({ 50, 60 }), "penwick: fatal error: the canvas has no delegate\n");
}

TEST_F(DrawingCanvasViewDeathTest, delegateThatIsGoneIsNone)
{
    {
        const Idle shortLived;
        canvas->setDrawingCanvasDelegate(const_cast<Idle *>(&shortLived));
    }

    EXPECT_EQ(canvas->drawingCanvasDelegate(), nullptr);
    EXPECT_DEATH(press({ 50, 60 }), "penwick: fatal error: the canvas has no delegate\n");
}

TEST_F(DrawingCanvasViewDeathTest, brushPressWithoutAModelIsFatal)
{
    controller->setDrawingCanvasModel(nullptr);

    EXPECT_DEATH(press({ 50, 60 }), "penwick: fatal error: the canvas's controller has no model\n");
}

TEST_F(DrawingCanvasViewDeathTest, eraserDragOrReleaseWithoutADelegateIsFatal)
{
    canvas->setCurrentSelectedTool(eraser);
    press({ 50, 60 });
    canvas->setDrawingCanvasDelegate(nullptr);

    EXPECT_DEATH(drag({ 51, 60 }), "penwick: fatal error: the canvas has no delegate\n");
    EXPECT_DEATH(release({ 50, 60 }), "penwick: fatal error: the canvas has no delegate\n");
}

TEST_F(DrawingCanvasViewDeathTest, eraserDragOrReleaseWithoutAModelIsFatal)
{
    canvas->setCurrentSelectedTool(eraser);
    press({ 50, 60 });
    controller->setDrawingCanvasModel(nullptr);

    EXPECT_DEATH(drag({ 51, 60 }), "penwick: fatal error: the canvas's controller has no model\n");
    EXPECT_DEATH(
        release({ 50, 60 }), "penwick: fatal error: the canvas's controller has no model\n");
}

TEST_F(DrawingCanvasViewDeathTest, eraserThatHitsForAControllerWithoutACanvasIsFatal)
{
    stroke({ { 20, 50 }, { 200, 50 } });
    Idle idle;
    idle.setModel(controller->drawingCanvasModel());
    canvas->setDrawingCanvasDelegate(&idle);
    canvas->setCurrentSelectedTool(eraser);
    press({ 100, 50 });

    EXPECT_DEATH(
        release({ 100, 50 }), "penwick: fatal error: the canvas's controller has no canvas\n");
}

TEST_F(DrawingCanvasViewDeathTest, textReleaseWithoutADelegateOrModelIsFatal)
{
    canvas->setCurrentSelectedTool(text);
    contentOf(window).makeFirstResponder(canvas);
    press({ 50, 60 });

    controller->setDrawingCanvasModel(nullptr);
    EXPECT_DEATH(
        release({ 50, 60 }), "penwick: fatal error: the canvas's controller has no model\n");
    canvas->setDrawingCanvasDelegate(nullptr);
    EXPECT_DEATH(release({ 50, 60 }), "penwick: fatal error: the canvas has no delegate\n");
}

TEST_F(DrawingCanvasViewDeathTest, textReleaseForADelegateThatOwnsNoTextBoxesIsFatal)
{
    Idle idle;
    idle.setModel(controller->drawingCanvasModel());
    canvas->setDrawingCanvasDelegate(&idle);
    canvas->setCurrentSelectedTool(text);
    contentOf(window).makeFirstResponder(canvas);
    press({ 50, 60 });

    EXPECT_DEATH(release({ 50, 60 }),
        "penwick: fatal error: a text box's delegate is no owner of text boxes\n");
}

TEST_F(DrawingCanvasViewDeathTest, newTextBoxThatDoesNotReachTheCanvasIsFatal)
{
    IdleOwner idle;
    idle.setModel(controller->drawingCanvasModel());
    canvas->setDrawingCanvasDelegate(&idle);
    canvas->setCurrentSelectedTool(text);
    contentOf(window).makeFirstResponder(canvas);
    press({ 50, 60 });

    EXPECT_DEATH(
        release({ 50, 60 }), "penwick: fatal error: a new text box has not reached the canvas\n");
}

} // namespace
} // namespace penwick::test
