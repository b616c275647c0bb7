// SPDX-License-Identifier: MIT
// Who gets the keys: one view of each window, which the window decides and not Qt's focus.
#include "platform/ViewFixture.h"

namespace penwick::platform {

namespace {

class WindowResponder : public ViewFixture
{
protected:
    const std::shared_ptr<RecordingView> m_one = added({ 0.0, 0.0, 10.0, 10.0 });
    const std::shared_ptr<RecordingView> m_other = added({ 20.0, 0.0, 10.0, 10.0 });
};

} // namespace

TEST_F(WindowResponder, newWindowIsItsOwnFirstResponder)
{
    EXPECT_EQ(m_window.firstResponder(), nullptr);
}

TEST_F(WindowResponder, chosenViewIsFirstResponderAndHasTheFocus)
{
    EXPECT_TRUE(m_window.makeFirstResponder(m_one.get()));

    EXPECT_EQ(m_window.firstResponder(), m_one.get());
    EXPECT_EQ(m_window.focusWidget(), m_one.get());
}

TEST_F(WindowResponder, previousOneResigns)
{
    m_window.makeFirstResponder(m_one.get());

    EXPECT_TRUE(m_window.makeFirstResponder(m_other.get()));

    EXPECT_EQ(m_one->take(), Log { "resign" });
    EXPECT_EQ(m_window.firstResponder(), m_other.get());
}

TEST_F(WindowResponder, sameOneDoesNotResign)
{
    m_window.makeFirstResponder(m_one.get());

    EXPECT_TRUE(m_window.makeFirstResponder(m_one.get()));

    EXPECT_EQ(m_one->take(), Log {});
}

TEST_F(WindowResponder, oneThatWillNotGoStays)
{
    m_window.makeFirstResponder(m_one.get());
    m_one->setKeepsFirstResponder(true);

    EXPECT_FALSE(m_window.makeFirstResponder(m_other.get()));

    EXPECT_EQ(m_window.firstResponder(), m_one.get());
}

TEST_F(WindowResponder, windowTakesOver)
{
    m_window.makeFirstResponder(m_one.get());

    EXPECT_TRUE(m_window.makeFirstResponder(nullptr));

    EXPECT_EQ(m_one->take(), Log { "resign" });
    EXPECT_EQ(m_window.firstResponder(), nullptr);
}

TEST_F(WindowResponder, viewThatLeavesWhileThePreviousOneResignsIsNotFirstResponder)
{
    m_window.makeFirstResponder(m_one.get());
    m_one->setReaction([other = m_other.get()](const std::string &what) {
        if (what == "resign")
            other->removeFromSuperview();
    });

    EXPECT_FALSE(m_window.makeFirstResponder(m_other.get()));

    EXPECT_EQ(m_window.firstResponder(), nullptr);
}

TEST_F(WindowResponder, viewOfAnotherWindowIsNotFirstResponder)
{
    Window other;

    EXPECT_FALSE(other.makeFirstResponder(m_one.get()));

    EXPECT_EQ(other.firstResponder(), nullptr);
}

TEST_F(WindowResponder, nobodyIsFirstResponderWhileOneResigns)
{
    m_window.makeFirstResponder(m_one.get());
    const View *meanwhile = m_one.get();
    m_one->setReaction([&](const std::string &) { meanwhile = m_window.firstResponder(); });

    m_window.makeFirstResponder(m_other.get());

    EXPECT_EQ(meanwhile, nullptr);
}

TEST_F(WindowResponder, firstResponderIsKeptThroughDeactivationAndHiding)
{
    m_window.makeFirstResponder(m_one.get());
    Window other;
    other.show();
    other.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&other));
    m_window.orderOut();
    m_window.orderFront();

    EXPECT_EQ(m_window.firstResponder(), m_one.get());
    EXPECT_EQ(m_one->take(), Log {});
}

TEST_F(WindowResponder, focusThatGoesElsewhereIsNoResignation)
{
    m_window.makeFirstResponder(m_one.get());

    m_other->setFocus();
    m_one->clearFocus();

    EXPECT_EQ(m_window.firstResponder(), m_one.get());
    EXPECT_EQ(m_one->take(), Log {});
}

TEST_F(WindowResponder, viewThatDiesIsNotFirstResponderAnyMore)
{
    auto *const view = new RecordingView(&m_content);
    m_content.adoptScene();
    m_window.makeFirstResponder(view);

    delete view;

    EXPECT_EQ(m_window.firstResponder(), nullptr);
}

TEST_F(WindowResponder, activeWindowIsTheKeyWindow)
{
    Window window;
    window.show();
    window.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&window));

    EXPECT_TRUE(window.isKeyWindow());
    EXPECT_FALSE(m_window.isKeyWindow());
}

} // namespace penwick::platform
