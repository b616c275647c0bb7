// SPDX-License-Identifier: MIT
// What waits until the pointer is let go.
#include "platform/view/PointerPress.h"

#include "platform/ViewFixture.h"

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

/// Writes down what ran, in order.
class PointerPress : public ViewFixture
{
protected:
    ~PointerPress() override { pointerWasReleased(); }

    void runLater(const std::string &name)
    {
        afterPointerIsReleased(m_context, [this, name] { m_ran.push_back(name); });
    }

    QObject m_context;
    Log m_ran;
};

} // namespace

TEST_F(PointerPress, actionRunsAtOnceWhileNothingIsPressed)
{
    runLater("one");

    EXPECT_EQ(m_ran, Log { "one" });
}

TEST_F(PointerPress, actionsWaitForTheReleaseAndRunInOrderOnce)
{
    pointerWasPressed();
    runLater("one");
    runLater("two");
    EXPECT_EQ(m_ran, Log {});

    pointerWasReleased();
    EXPECT_EQ(m_ran, (Log { "one", "two" }));

    pointerWasReleased();
    EXPECT_EQ(m_ran, (Log { "one", "two" }));
}

TEST_F(PointerPress, actionOfAContextThatIsGoneIsDropped)
{
    pointerWasPressed();
    {
        QObject gone;
        afterPointerIsReleased(gone, [this] { m_ran.push_back("gone"); });
    }
    runLater("kept");

    pointerWasReleased();

    EXPECT_EQ(m_ran, Log { "kept" });
}

TEST_F(PointerPress, actionThatAddsAnotherRunsItAtOnce)
{
    pointerWasPressed();
    afterPointerIsReleased(m_context, [this] {
        m_ran.push_back("outer");
        runLater("inner");
    });
    runLater("last");

    pointerWasReleased();

    EXPECT_EQ(m_ran, (Log { "outer", "inner", "last" }));
}

TEST_F(PointerPress, viewThatIsPressedMakesItWait)
{
    const auto view = added({ 0.0, 0.0, 20.0, 20.0 });

    QTest::mousePress(view.get(), Qt::LeftButton);
    runLater("one");
    EXPECT_EQ(m_ran, Log {});
    QTest::mouseRelease(view.get(), Qt::LeftButton);

    EXPECT_EQ(m_ran, Log { "one" });
}

TEST_F(PointerPress, viewThatLeavesTheScreenWhilePressedDoesNotMakeItWaitForEver)
{
    const auto view = added({ 0.0, 0.0, 20.0, 20.0 });
    QTest::mousePress(view.get(), Qt::LeftButton);
    runLater("one");

    view->removeFromSuperview();

    EXPECT_EQ(m_ran, Log { "one" });
}

TEST_F(PointerPress, viewThatDiesWhilePressedDoesNotMakeItWaitForEver)
{
    auto view = added({ 0.0, 0.0, 20.0, 20.0 });
    QTest::mousePress(view.get(), Qt::LeftButton);
    runLater("one");

    view->removeFromSuperview();
    view.reset();
    deleteWhatIsLeft();

    EXPECT_EQ(m_ran, Log { "one" });
}

TEST_F(PointerPress, otherButtonsMakeNothingWait)
{
    const auto view = added({ 0.0, 0.0, 20.0, 20.0 });

    QTest::mousePress(view.get(), Qt::RightButton);
    runLater("one");

    EXPECT_EQ(m_ran, Log { "one" });
    QTest::mouseRelease(view.get(), Qt::RightButton);
}

} // namespace penwick::platform
