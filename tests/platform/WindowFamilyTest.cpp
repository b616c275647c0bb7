// SPDX-License-Identifier: MIT
// Child windows: they follow a move, and are on the screen only while their parent is.
#include "platform/WindowFixture.h"

#include <QWindow>

#include <memory>

namespace penwick::platform {

namespace {

class WindowFamily : public WindowFixture
{
protected:
    WindowFamily()
    {
        WindowAttributes borderless;
        borderless.styleMask = {};
        m_child.setAttributes(borderless);
        m_grandchild.setAttributes(borderless);
        m_window.setFrame({ 320.0, 180.0, 640.0, 360.0 });
        m_child.setFrame({ 340.0, 300.0, 50.0, 100.0 });
        m_grandchild.setFrame({ 400.0, 300.0, 30.0, 40.0 });
    }

    /// Everything on the screen: the child above the window, the grandchild above the child.
    void showAll()
    {
        show(m_window);
        m_window.addChildWindow(m_child);
        m_child.addChildWindow(m_grandchild);
        settle(m_child);
        settle(m_grandchild);
    }

    [[nodiscard]] std::vector<bool> visible() const
    {
        return { m_window.isVisible(), m_child.isVisible(), m_grandchild.isVisible() };
    }

    Window m_child;
    Window m_grandchild;
};

const std::vector<bool> all { true, true, true };
const std::vector<bool> nothing { false, false, false };

} // namespace

TEST_F(WindowFamily, childOfAWindowOnTheScreenIsShownAtOnce)
{
    show(m_window);

    m_window.addChildWindow(m_child);

    EXPECT_TRUE(m_child.isVisible());
    EXPECT_EQ(m_child.parentWindow(), &m_window);
    EXPECT_EQ(m_window.childWindows(), std::vector<Window *> { &m_child });
    EXPECT_EQ(m_child.windowHandle()->transientParent(), m_window.windowHandle());
}

TEST_F(WindowFamily, childOfAHiddenWindowIsNotShownByBeingAdded)
{
    m_window.addChildWindow(m_child);

    show(m_window);

    EXPECT_FALSE(m_child.isVisible());
    EXPECT_EQ(m_child.parentWindow(), &m_window);
}

TEST_F(WindowFamily, childWaitsForItsParent)
{
    m_window.addChildWindow(m_child);
    m_child.orderFront();
    EXPECT_FALSE(m_child.isVisible());

    show(m_window);

    EXPECT_TRUE(m_child.isVisible());
    EXPECT_EQ(m_child.windowHandle()->transientParent(), m_window.windowHandle());
}

TEST_F(WindowFamily, childThatIsAddedAgainIsOneChild)
{
    showAll();

    m_window.addChildWindow(m_child);

    EXPECT_EQ(m_window.childWindows(), std::vector<Window *> { &m_child });
}

TEST_F(WindowFamily, childOfAnotherParentChangesOver)
{
    showAll();

    m_window.addChildWindow(m_grandchild);

    EXPECT_EQ(m_window.childWindows(), (std::vector<Window *> { &m_child, &m_grandchild }));
    EXPECT_EQ(m_child.childWindows(), std::vector<Window *> {});
    EXPECT_EQ(m_grandchild.parentWindow(), &m_window);
}

TEST_F(WindowFamily, childThatDiesIsNoChildAnyMore)
{
    show(m_window);
    {
        Window child;
        m_window.addChildWindow(child);
    }

    EXPECT_EQ(m_window.childWindows(), std::vector<Window *> {});
    m_window.hide();
    m_window.show();
}

TEST_F(WindowFamily, parentThatDiesTakesItsChildrenOffTheScreen)
{
    Window child;
    {
        Window parent;
        show(parent);
        parent.addChildWindow(child);
        ASSERT_TRUE(child.isVisible());
    }

    EXPECT_FALSE(child.isVisible());
    EXPECT_EQ(child.parentWindow(), nullptr);
}

TEST_F(WindowFamily, childrenFollowAMove)
{
    showAll();

    m_window.setFrameOrigin({ 420.0, 150.0 });
    settle(m_window);

    EXPECT_TRUE(QTest::qWaitFor([this] { return m_grandchild.frame().x == 500.0; }));
    EXPECT_EQ(m_child.frame(), (Rect { 440.0, 270.0, 50.0, 100.0 }));
    EXPECT_EQ(m_grandchild.frame(), (Rect { 500.0, 270.0, 30.0, 40.0 }));
}

TEST_F(WindowFamily, childrenStayWhenTheirParentIsResized)
{
    showAll();

    m_window.setFrame({ 300.0, 100.0, 800.0, 600.0 });
    settle(m_window);

    EXPECT_EQ(m_delegate.take(), Log { "move" });
    EXPECT_EQ(m_child.frame(), (Rect { 340.0, 300.0, 50.0, 100.0 }));
    EXPECT_EQ(m_grandchild.frame(), (Rect { 400.0, 300.0, 30.0, 40.0 }));
}

TEST_F(WindowFamily, childrenStayWhenTheBottomEdgeIsDragged)
{
    showAll();

    m_window.setFrame({ 320.0, 80.0, 640.0, 460.0 });
    settle(m_window);

    EXPECT_EQ(m_child.frame(), (Rect { 340.0, 300.0, 50.0, 100.0 }));
}

TEST_F(WindowFamily, childThatMovesLeavesItsParent)
{
    showAll();

    m_child.setFrameOrigin({ 10.0, 10.0 });
    settle(m_child);

    EXPECT_EQ(m_window.frame(), (Rect { 320.0, 180.0, 640.0, 360.0 }));
    EXPECT_TRUE(QTest::qWaitFor([this] { return m_grandchild.frame().x == 70.0; }));
}

TEST_F(WindowFamily, hiddenWindowTakesItsFamilyAndBringsItBack)
{
    showAll();

    m_window.orderOut();
    EXPECT_EQ(visible(), nothing);
    m_window.orderFront();

    EXPECT_EQ(visible(), all);
}

TEST_F(WindowFamily, minimisedWindowTakesItsFamilyAndBringsItBack)
{
    const std::vector<bool> onlyMinimised { true, false, false };
    showAll();

    m_window.showMinimized();
    EXPECT_EQ(visible(), onlyMinimised);

    m_window.showNormal();
    EXPECT_EQ(visible(), all);
}

TEST_F(WindowFamily, whatWasHiddenBeforeItWasMinimisedStaysHidden)
{
    showAll();
    m_grandchild.orderOut();

    m_window.showMinimized();
    m_window.showNormal();

    EXPECT_EQ(visible(), (std::vector<bool> { true, true, false }));
}

TEST_F(WindowFamily, closedWindowTakesItsFamily)
{
    showAll();

    m_window.close();

    EXPECT_EQ(visible(), nothing);
}

TEST_F(WindowFamily, whatWasHiddenBeforeStaysHidden)
{
    showAll();
    m_grandchild.orderOut();

    m_window.orderOut();
    m_window.orderFront();

    EXPECT_EQ(visible(), (std::vector<bool> { true, true, false }));
}

TEST_F(WindowFamily, whatIsHiddenMeanwhileStaysHidden)
{
    showAll();

    m_window.orderOut();
    m_child.orderOut();
    m_window.orderFront();

    EXPECT_EQ(visible(), (std::vector<bool> { true, false, false }));
    m_child.orderFront();
    EXPECT_EQ(visible(), all);
}

TEST_F(WindowFamily, whatIsShownMeanwhileComesUpWithItsParent)
{
    show(m_window);
    m_window.addChildWindow(m_child);
    m_child.orderOut();
    m_window.orderOut();

    m_child.orderFront();
    EXPECT_FALSE(m_child.isVisible());
    m_window.orderFront();

    EXPECT_TRUE(m_child.isVisible());
}

TEST_F(WindowFamily, familyIsStillThereAfterTheParentsFlagsChanged)
{
    showAll();
    WindowAttributes attributes = m_window.attributes();
    attributes.level = WindowLevel::mainMenu;

    m_window.setAttributes(attributes);

    EXPECT_EQ(visible(), all);
}

TEST_F(WindowFamily, closeIsToldOnceAndWithoutTheFamily)
{
    showAll();

    m_window.close();
    m_window.close();

    EXPECT_EQ(m_delegate.take(), Log { "close" });
}

TEST_F(WindowFamily, windowThatIsShownAgainCanBeClosedAgain)
{
    show(m_window);
    m_window.close();

    show(m_window);
    m_window.close();

    EXPECT_EQ(m_delegate.take(), (Log { "close", "close" }));
}

TEST_F(WindowFamily, closeFromInsideTheNewsOfClosingIsNotToldAgain)
{
    show(m_window);
    m_delegate.setReaction([this] { m_window.close(); });

    m_window.close();

    EXPECT_EQ(m_delegate.take(), Log { "close" });
    EXPECT_FALSE(m_window.isVisible());
}

TEST_F(WindowFamily, hidingIsNotClosing)
{
    show(m_window);

    m_window.orderOut();

    EXPECT_EQ(m_delegate.take(), Log {});
}

TEST_F(WindowFamily, windowThatDiesIsNotClosed)
{
    RecordingDelegate delegate;
    {
        Window window;
        window.setDelegate(&delegate);
        show(window);
    }

    EXPECT_EQ(delegate.take(), Log {});
}

} // namespace penwick::platform
