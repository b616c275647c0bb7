// SPDX-License-Identifier: MIT
// What comes out of the scenes of drawing window and tool bar, as a session has it.
#include "session/SessionFixture.h"

#include "appearance/Theme.h"
#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasView.h"
#include "platform/view/Layer.h"
#include "platform/view/PlainView.h"
#include "platform/window/WindowContent.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QKeyEvent>

#include <memory>

namespace penwick::test {

namespace {

class Scenes : public SessionFixture
{
protected:
    void open(WindowType type)
    {
        m_board = m_penwick.createDrawingWindowController(type, primary());
        m_board->showWindow(nullptr);
    }

    [[nodiscard]] DrawingCanvasView &canvas() const
    {
        return dynamic_cast<DrawingCanvasView &>(
            *contentOf(*m_board->drawingWindow()).contentView());
    }
    [[nodiscard]] const platform::Window &panel() const
    {
        return *m_board->tPanelWindowController()->window();
    }
    [[nodiscard]] ToolPanelViewController &bar() const
    {
        return m_board->tPanelWindowController()->content();
    }

    bool press(Qt::Key key)
    {
        return m_board->keyDown(QKeyEvent(QEvent::KeyPress, key, Qt::NoModifier));
    }

    Penwick m_penwick;
    std::shared_ptr<DrawingWindowController> m_board;
};

} // namespace

TEST_F(Scenes, keysThatWorkTheToolBarAreTakenAndOthersAreNot)
{
    open(WindowType::whiteboard);

    EXPECT_TRUE(press(Qt::Key_E));
    EXPECT_EQ(canvas().currentSelectedTool(), Tools::eraser);
    EXPECT_FALSE(press(Qt::Key_Q));
}

TEST_F(Scenes, canvasCoversTheWindowOfAWhiteBoardAlone)
{
    open(WindowType::whiteboard);
    EXPECT_TRUE(canvas().surface().testAttribute(Qt::WA_OpaquePaintEvent));

    open(WindowType::annotation);
    EXPECT_FALSE(canvas().surface().testAttribute(Qt::WA_OpaquePaintEvent));
}

TEST_F(Scenes, imageLiesInTheWindowOfItsSceneFromTheCornerThatStays)
{
    open(WindowType::imageAnnotation); // without an image it stays as it was loaded
    const auto &content = dynamic_cast<DrawViewController &>(
        *contentOf(*m_board->drawingWindow()).contentViewController());
    const platform::ImageView &image = *content.annotatedImageView();

    EXPECT_EQ(image.frame().origin(), (platform::Point { 0, 0 }));
    EXPECT_EQ(image.frame().width, image.width());
    EXPECT_EQ(image.frame().height, image.height());
    EXPECT_GT(image.frame().width, 0);
}

TEST_F(Scenes, gripLetsThePointerThroughToTheHandleThatIsDragged)
{
    open(WindowType::whiteboard);
    const auto *const grip = panel().findChild<QWidget *>(QStringLiteral("grip"));

    ASSERT_NE(grip, nullptr);
    EXPECT_TRUE(grip->testAttribute(Qt::WA_TransparentForMouseEvents));
    EXPECT_EQ(panel().childAt(26, 8), &bar().outlets().toolBarHandle->widget());
}

TEST_F(Scenes, toolBarHasRoundCorners)
{
    open(WindowType::whiteboard);

    platform::View &handle = *bar().outlets().toolBarHandle;
    ASSERT_NE(bar().view()->layer(), nullptr);
    EXPECT_EQ(bar().view()->layer()->cornerRadius, ToolPanelUI::toolPanelBorderRadius);
    EXPECT_EQ(handle.layer()->cornerRadius, ToolPanelUI::toolPanelBorderRadius);
}

TEST_F(Scenes, buttonsOfTheToolBarHaveTheImagesThatTheSceneNames)
{
    open(WindowType::whiteboard);
    int named = 0;
    for (const auto *const button : panel().findChildren<ToolPanelButton *>()) {
        named += button->imageName().isEmpty() ? 0 : 1;
        EXPECT_EQ(button->image().isNull(), button->imageName().isEmpty());
        EXPECT_EQ(button->alternateImage().isNull(), button->alternateImageName().isEmpty());
    }
    EXPECT_EQ(named, 7) << "all but the one that ends";
}

} // namespace penwick::test
