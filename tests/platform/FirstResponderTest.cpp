// SPDX-License-Identifier: MIT
// Who gets the keys: one view of each window, which the window decides and not Qt's focus.
#include "platform/ViewFixture.h"
#include "platform/window/WindowContent.h"

namespace penwick::platform {

namespace {

class FirstResponder : public ViewFixture
{
protected:
    const std::shared_ptr<RecordingView> m_one = added({ 0.0, 0.0, 10.0, 10.0 });
    const std::shared_ptr<RecordingView> m_other = added({ 20.0, 0.0, 10.0, 10.0 });
};

} // namespace

TEST_F(FirstResponder, newWindowIsItsOwnFirstResponder)
{
    EXPECT_EQ(contentOf(m_window).firstResponder(), nullptr);
}

TEST_F(FirstResponder, chosenViewIsFirstResponderAndHasTheFocus)
{
    EXPECT_TRUE(contentOf(m_window).makeFirstResponder(m_one.get()));

    EXPECT_EQ(contentOf(m_window).firstResponder(), m_one.get());
    EXPECT_EQ(m_window.focusWidget(), m_one.get());
}

TEST_F(FirstResponder, previousOneResigns)
{
    contentOf(m_window).makeFirstResponder(m_one.get());

    EXPECT_TRUE(contentOf(m_window).makeFirstResponder(m_other.get()));

    EXPECT_EQ(m_one->take(), Log { "resign" });
    EXPECT_EQ(contentOf(m_window).firstResponder(), m_other.get());
}

TEST_F(FirstResponder, sameOneDoesNotResign)
{
    contentOf(m_window).makeFirstResponder(m_one.get());

    EXPECT_TRUE(contentOf(m_window).makeFirstResponder(m_one.get()));

    EXPECT_EQ(m_one->take(), Log {});
}

TEST_F(FirstResponder, oneThatWillNotGoStays)
{
    contentOf(m_window).makeFirstResponder(m_one.get());
    m_one->setKeepsFirstResponder(true);

    EXPECT_FALSE(contentOf(m_window).makeFirstResponder(m_other.get()));

    EXPECT_EQ(contentOf(m_window).firstResponder(), m_one.get());
}

TEST_F(FirstResponder, windowTakesOver)
{
    contentOf(m_window).makeFirstResponder(m_one.get());

    EXPECT_TRUE(contentOf(m_window).makeFirstResponder(nullptr));

    EXPECT_EQ(m_one->take(), Log { "resign" });
    EXPECT_EQ(contentOf(m_window).firstResponder(), nullptr);
}

TEST_F(FirstResponder, viewThatLeavesWhileThePreviousOneResignsIsNotFirstResponder)
{
    contentOf(m_window).makeFirstResponder(m_one.get());
    m_one->setReaction([other = m_other.get()](const std::string &what) {
        if (what == "resign")
            other->removeFromSuperview();
    });

    EXPECT_FALSE(contentOf(m_window).makeFirstResponder(m_other.get()));

    EXPECT_EQ(contentOf(m_window).firstResponder(), nullptr);
}

TEST_F(FirstResponder, viewOfAnotherWindowIsNotFirstResponder)
{
    Window other;

    EXPECT_FALSE(contentOf(other).makeFirstResponder(m_one.get()));

    EXPECT_EQ(contentOf(other).firstResponder(), nullptr);
}

TEST_F(FirstResponder, nobodyIsFirstResponderWhileOneResigns)
{
    contentOf(m_window).makeFirstResponder(m_one.get());
    const View *meanwhile = m_one.get();
    m_one->setReaction(
        [&](const std::string &) { meanwhile = contentOf(m_window).firstResponder(); });

    contentOf(m_window).makeFirstResponder(m_other.get());

    EXPECT_EQ(meanwhile, nullptr);
}

TEST_F(FirstResponder, firstResponderIsKeptThroughDeactivationAndHiding)
{
    contentOf(m_window).makeFirstResponder(m_one.get());
    Window other;
    other.show();
    other.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&other));
    m_window.orderOut();
    m_window.orderFront();

    EXPECT_EQ(contentOf(m_window).firstResponder(), m_one.get());
    EXPECT_EQ(m_one->take(), Log {});
}

TEST_F(FirstResponder, focusThatGoesElsewhereIsNoResignation)
{
    contentOf(m_window).makeFirstResponder(m_one.get());

    m_other->setFocus();
    m_one->clearFocus();

    EXPECT_EQ(contentOf(m_window).firstResponder(), m_one.get());
    EXPECT_EQ(m_one->take(), Log {});
}

TEST_F(FirstResponder, viewThatDiesIsNotFirstResponderAnyMore)
{
    auto *const view = new RecordingView(&m_content);
    m_content.adoptScene();
    contentOf(m_window).makeFirstResponder(view);

    delete view;

    EXPECT_EQ(contentOf(m_window).firstResponder(), nullptr);
}

TEST_F(FirstResponder, activeWindowIsTheKeyWindow)
{
    Window window;
    window.show();
    window.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&window));

    EXPECT_TRUE(contentOf(window).isKeyWindow());
    EXPECT_FALSE(contentOf(m_window).isKeyWindow());
}

} // namespace penwick::platform
