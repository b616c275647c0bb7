// SPDX-License-Identifier: MIT
// The end of a session: told once by closing, not at all by letting go.
#include "session/SessionFixture.h"

#include "canvas/DrawViewController.h"
#include "platform/window/WindowContent.h"

#include <QPointer>

#include <memory>
#include <optional>

namespace penwick::test {

namespace {

class SessionEnd : public SessionFixture
{
protected:
    /// Opens a window of `type` and puts it on the screen.
    std::shared_ptr<DrawingWindowController> opened(WindowType type = WindowType::whiteboard)
    {
        auto controller = m_penwick->createDrawingWindowController(type, primary());
        controller->showWindow(nullptr);
        EXPECT_TRUE(controller->window()->isVisible());
        return controller;
    }

    std::optional<Penwick> m_penwick { std::in_place };
};

const QVariant no(false);
const QVariant yes(true);

} // namespace

TEST_F(SessionEnd, closingIsToldOnceAndIsNoForAWhiteboard)
{
    const auto controller = opened();

    controller->window()->close();
    controller->window()->close();

    EXPECT_EQ(ends(), std::vector<QVariant> { no });
    EXPECT_EQ(ends().front().typeId(), QMetaType::Bool);
    EXPECT_FALSE(controller->window()->isVisible());
}

TEST_F(SessionEnd, closingIsNoForAnAnnotation)
{
    opened(WindowType::annotation)->window()->close();

    EXPECT_EQ(ends(), std::vector<QVariant> { no });
}

TEST_F(SessionEnd, closingIsYesForAnImageAnnotation)
{
    opened(WindowType::imageAnnotation)->window()->close();

    EXPECT_EQ(ends(), std::vector<QVariant> { yes });
}

TEST_F(SessionEnd, endButtonCloses)
{
    const auto controller = opened();
    auto *const content = dynamic_cast<DrawViewController *>(
        contentOf(*controller->window()).contentViewController());
    ASSERT_NE(content, nullptr);

    content->handleToolSelection(QStringLiteral("state"));

    EXPECT_EQ(ends(), std::vector<QVariant> { no });
    EXPECT_FALSE(controller->window()->isVisible());
}

TEST_F(SessionEnd, hidingIsNoEnd)
{
    const auto controller = opened();

    controller->window()->orderOut();

    EXPECT_TRUE(ends().empty());
}

TEST_F(SessionEnd, entryObjectThatIsLetGoTakesTheWindowWithoutAnEnd)
{
    const QPointer<platform::Window> window = opened()->window();

    m_penwick.reset();

    EXPECT_FALSE(window && window->isVisible());
    deleteWhatIsLeft();
    EXPECT_FALSE(window);
    EXPECT_TRUE(ends().empty());
}

TEST_F(SessionEnd, controllerThatTheHostHoldsKeepsItsWindow)
{
    auto controller = opened();
    m_penwick.reset();
    deleteWhatIsLeft();
    ASSERT_TRUE(controller->window()->isVisible());
    const QPointer<platform::Window> window = controller->window();

    controller.reset();
    deleteWhatIsLeft();

    EXPECT_FALSE(window);
    EXPECT_TRUE(ends().empty());
}

TEST_F(SessionEnd, hostMayDropEverythingInsideTheNews)
{
    auto controller = opened();
    const QPointer<platform::Window> window = controller->window();
    setReaction([&] {
        controller.reset();
        m_penwick.reset();
    });

    window->close();

    EXPECT_EQ(ends(), std::vector<QVariant> { no });
    EXPECT_FALSE(window && window->isVisible());
    deleteWhatIsLeft();
    EXPECT_FALSE(window);
}

TEST_F(SessionEnd, hostMayDropEverythingInsideTheNewsOfTheEndButton)
{
    const QPointer<platform::Window> window = opened()->window();
    auto *const content
        = dynamic_cast<DrawViewController *>(contentOf(*window).contentViewController());
    ASSERT_NE(content, nullptr);
    setReaction([&] { m_penwick.reset(); });

    content->handleToolSelection(QStringLiteral("state"));

    EXPECT_EQ(ends(), std::vector<QVariant> { no });
    deleteWhatIsLeft();
    EXPECT_FALSE(window);
}

TEST_F(SessionEnd, hostMayOpenTheNextWindowInsideTheNews)
{
    const QPointer<platform::Window> window = opened()->window();
    setReaction([&] { opened(); });

    window->close();

    EXPECT_EQ(ends(), std::vector<QVariant> { no });
    deleteWhatIsLeft();
    EXPECT_FALSE(window);
    EXPECT_TRUE(m_penwick->penwickWindowController()->window()->isVisible());
}

} // namespace penwick::test
