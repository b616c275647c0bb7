// SPDX-License-Identifier: MIT
// The entry object: its bundle, the windows it opens, and what it does without them.
#include "session/SessionFixture.h"

#include "appearance/PenwickBundle.h"
#include "history/NotificationNames.h"

#include <QPointer>
#include <QTimer>

#include <memory>
#include <set>
#include <thread>

namespace penwick::test {

namespace {

constexpr auto whiteboard = WindowType::whiteboard;

/// Gives the component a bundle of the test's making.
class DamagedResources : public SessionFixture
{
protected:
    /// What createDrawingWindowController() prints and returns with `bundle`.
    std::string printedWith(std::shared_ptr<platform::Bundle> bundle)
    {
        setPenwickBundle(std::move(bundle));
        testing::internal::CaptureStdout();
        const auto controller = m_penwick.createDrawingWindowController(whiteboard, primary());
        std::string printed = testing::internal::GetCapturedStdout();
        EXPECT_EQ(controller, nullptr);
        EXPECT_EQ(m_penwick.penwickWindowController(), nullptr);
        return printed;
    }

    Penwick m_penwick;
};

class PenwickTest : public SessionFixture
{ };

using PenwickDeathTest = PenwickTest;

const std::string notAble = "Not able to create Penwick WindowController!\n";

} // namespace

TEST_F(PenwickTest, newOneHasNoWindow)
{
    const Penwick penwick;

    EXPECT_EQ(penwick.penwickWindowController(), nullptr);
}

TEST_F(PenwickTest, constructionSetsTheBundle)
{
    setPenwickBundle(nullptr);

    const Penwick penwick;

    ASSERT_NE(penwickBundle(), nullptr);
    EXPECT_FALSE(penwickBundle()->imageForResource(QStringLiteral("Brush_Cursor")).isNull());
}

TEST_F(PenwickTest, everyConstructionSetsTheBundleAnew)
{
    const Penwick first;
    const std::weak_ptr<platform::Bundle> former = penwickBundle();

    const Penwick second;

    EXPECT_NE(penwickBundle(), nullptr);
    EXPECT_TRUE(former.expired());
}

TEST_F(PenwickTest, bundleOutlivesTheEntryObject)
{
    {
        const Penwick penwick;
    }

    EXPECT_NE(penwickBundle(), nullptr);
}

TEST_F(PenwickTest, createdControllerIsTheOneItHolds)
{
    Penwick penwick;

    const auto controller = penwick.createDrawingWindowController(whiteboard, primary());

    ASSERT_NE(controller, nullptr);
    EXPECT_EQ(penwick.penwickWindowController(), controller);
    EXPECT_EQ(controller->mWindowType(), whiteboard);
    EXPECT_FALSE(controller->window()->isVisible()) << "the host shows it";
}

TEST_F(PenwickTest, secondWindowReplacesTheFirst)
{
    Penwick penwick;
    QPointer<QObject> first = penwick.createDrawingWindowController(whiteboard, primary()).get();
    penwick.penwickWindowController()->showWindow(nullptr);
    const QPointer<platform::Window> firstWindow = penwick.penwickWindowController()->window();

    const auto second = penwick.createDrawingWindowController(whiteboard, primary());

    EXPECT_EQ(penwick.penwickWindowController(), second);
    EXPECT_FALSE(firstWindow && firstWindow->isVisible());
    deleteWhatIsLeft();
    EXPECT_FALSE(first);
    EXPECT_FALSE(firstWindow);
    EXPECT_TRUE(ends().empty());
}

TEST_F(PenwickTest, replacedWindowThatTheHostHoldsStays)
{
    Penwick penwick;
    const auto first = penwick.createDrawingWindowController(whiteboard, primary());
    first->showWindow(nullptr);

    const auto second = penwick.createDrawingWindowController(whiteboard, primary());
    deleteWhatIsLeft();

    EXPECT_NE(first, second);
    EXPECT_TRUE(first->window()->isVisible());
}

TEST_F(PenwickTest, sharingNotificationWithoutAWindowDoesNothing)
{
    Penwick penwick;

    penwick.showWindowSharingNotification();

    EXPECT_EQ(penwick.penwickWindowController(), nullptr);
}

TEST_F(DamagedResources, missingSceneIsReportedAndGivesNoWindow)
{
    EXPECT_EQ(printedWith(std::make_shared<platform::Bundle>(QString())), notAble);
}

TEST_F(DamagedResources, sceneOfTheWrongClassIsReportedAndGivesNoWindow)
{
    auto bundle = std::make_shared<platform::Bundle>(QString());
    bundle->addScene(QStringLiteral("Main"), QStringLiteral("DrawingWindowController"),
        [] { return std::make_unique<QTimer>(); });

    EXPECT_EQ(printedWith(std::move(bundle)), notAble);
}

TEST_F(DamagedResources, windowThatWasOpenIsLetGo)
{
    QPointer<QObject> former = m_penwick.createDrawingWindowController(whiteboard, primary()).get();

    EXPECT_EQ(printedWith(std::make_shared<platform::Bundle>(QString())), notAble);

    deleteWhatIsLeft();
    EXPECT_FALSE(former);
}

TEST_F(DamagedResources, missingScreenDoesNotMatterWithoutAController)
{
    setPenwickBundle(std::make_shared<platform::Bundle>(QString()));
    testing::internal::CaptureStdout();

    const auto controller = m_penwick.createDrawingWindowController(whiteboard, nullptr);

    EXPECT_EQ(testing::internal::GetCapturedStdout(), notAble);
    EXPECT_EQ(controller, nullptr);
}

TEST_F(PenwickDeathTest, missingScreenStopsTheProcess)
{
    Penwick penwick;

    EXPECT_DEATH(penwick.createDrawingWindowController(whiteboard, nullptr),
        "penwick: fatal error: a drawing window needs a screen");
}

TEST(NotificationName, sharesItsPrefixWithTheOthersAndEndsAsFixed)
{
    EXPECT_EQ(penwickSessionEndNotificationKey(),
        notificationPrefix() + QStringLiteral(".penwick.session.end"));
}

TEST(NotificationName, isMadeOnceForAllThreads)
{
    constexpr std::size_t count = 8;
    std::vector<const QString *> found(count);
    std::vector<std::thread> threads;
    for (std::size_t index = 0; index < count; ++index) {
        threads.emplace_back(
            [&found, index] { found[index] = &penwickSessionEndNotificationKey(); });
    }
    for (std::thread &thread : threads)
        thread.join();

    const std::set<const QString *> different(found.begin(), found.end());
    EXPECT_EQ(different.size(), 1U);
    EXPECT_EQ(*different.begin(), &penwickSessionEndNotificationKey());
}

} // namespace penwick::test
