// SPDX-License-Identifier: MIT
// Which windows a capture is to leave out, and when that is told anew.
#include "platform/WindowFixture.h"

#include <QSignalSpy>

#include <memory>

namespace penwick::platform {

namespace {

using Identifiers = std::vector<WId>;

WindowAttributes seen(bool isSeen)
{
    WindowAttributes attributes;
    attributes.styleMask = {};
    attributes.sharingType = isSeen ? SharingType::readOnly : SharingType::none;
    return attributes;
}

class CaptureExclusion : public WindowFixture
{
protected:
    CaptureExclusion()
    {
        for (Window *const window : { &m_bar, &m_popover, &m_banner })
            window->setAttributes(seen(false));
    }

    [[nodiscard]] Identifiers list() const { return m_window.windowsToLeaveOutOfCaptures(); }

    void expectAll()
    {
        m_window.expectChildWindow(m_banner);
        m_window.addChildWindow(m_bar);
        m_bar.expectChildWindow(m_popover);
    }

    Window m_bar;
    Window m_popover;
    Window m_banner;
    QSignalSpy m_told { &m_window, &Window::windowsToLeaveOutOfCapturesChanged };
};

} // namespace

TEST_F(CaptureExclusion, windowThatMayBeSeenIsNotInTheList)
{
    EXPECT_EQ(list(), Identifiers {});
    EXPECT_EQ(m_bar.windowsToLeaveOutOfCaptures(), Identifiers { m_bar.winId() });
}

TEST_F(CaptureExclusion, listsWindowsAboveAndExpectedAboveInTheOrderOfAdding)
{
    expectAll();

    EXPECT_EQ(list(), (Identifiers { m_banner.winId(), m_bar.winId(), m_popover.winId() }));
    EXPECT_EQ(
        m_bar.windowsToLeaveOutOfCaptures(), (Identifiers { m_bar.winId(), m_popover.winId() }));
    EXPECT_EQ(m_window.childWindows(), std::vector<Window *> { &m_bar });
    EXPECT_FALSE(m_banner.isVisible());
}

TEST_F(CaptureExclusion, expectedWindowIsNeitherShownNorMovedWithTheOther)
{
    expectAll();
    m_banner.setFrame({ 10.0, 20.0, 30.0, 40.0 });
    show(m_window);

    EXPECT_FALSE(m_banner.isVisible());
    EXPECT_EQ(m_banner.parentWindow(), nullptr);
    EXPECT_EQ(m_banner.frame(), (Rect { 10.0, 20.0, 30.0, 40.0 }));
}

TEST_F(CaptureExclusion, staysTheSameHoweverOftenWindowsComeAndGo)
{
    expectAll();
    const Identifiers before = list();
    show(m_window);
    m_bar.orderFront();
    m_told.clear();

    for (int showing = 0; showing < 3; ++showing) {
        m_window.addChildWindow(m_banner);
        m_bar.addChildWindow(m_popover);
        EXPECT_TRUE(m_banner.isVisible());
        EXPECT_TRUE(m_popover.isVisible());
        EXPECT_EQ(list(), before);
        m_popover.orderOut();
        m_banner.orderOut();
        m_banner.close();
        EXPECT_EQ(list(), before);
    }
    m_window.orderOut();

    EXPECT_EQ(list(), before);
    EXPECT_EQ(m_told.count(), 0);
}

TEST_F(CaptureExclusion, newWindowAndAnotherSharingTypeAreToldBelow)
{
    m_window.addChildWindow(m_bar);
    EXPECT_EQ(m_told.count(), 1);

    m_bar.expectChildWindow(m_popover);
    EXPECT_EQ(m_told.count(), 2);
    m_popover.setAttributes(seen(true));
    EXPECT_EQ(m_told.count(), 3);
    EXPECT_EQ(list(), Identifiers { m_bar.winId() });
    m_window.setAttributes(seen(false));
    EXPECT_EQ(m_told.count(), 4);
    EXPECT_EQ(list(), (Identifiers { m_window.winId(), m_bar.winId() }));
}

TEST_F(CaptureExclusion, whatLeavesTheListAsItIsIsNotTold)
{
    expectAll();
    m_told.clear();
    static_cast<void>(list());

    WindowAttributes other = seen(false);
    other.backgroundColor = Qt::red;
    m_bar.setAttributes(other);
    m_window.expectChildWindow(m_banner);
    m_window.addChildWindow(m_bar);
    m_window.setFrame({ 1.0, 2.0, 300.0, 200.0 });
    static_cast<void>(list());

    EXPECT_EQ(m_told.count(), 0);
}

TEST_F(CaptureExclusion, identifierThatTheDesktopGivesAnewIsTold)
{
    expectAll();
    show(m_window);
    m_window.addChildWindow(m_banner);
    const Identifiers before = list();
    m_told.clear();

    WindowAttributes above = m_banner.attributes();
    above.level = WindowLevel::mainMenu; // another kind of native window
    m_banner.setAttributes(above);
    QCoreApplication::processEvents();

    const Identifiers after = list();
    EXPECT_EQ(after.front(), m_banner.winId());
    EXPECT_EQ(m_told.count() > 0, after != before);
}

TEST_F(CaptureExclusion, windowThatGoesOrBelongsElsewhereIsToldWhereItWas)
{
    Window other;
    QSignalSpy toldThere(&other, &Window::windowsToLeaveOutOfCapturesChanged);
    m_window.expectChildWindow(m_banner);
    m_told.clear();

    other.addChildWindow(m_banner);

    EXPECT_EQ(m_told.count(), 1);
    EXPECT_EQ(toldThere.count(), 1);
    EXPECT_EQ(list(), Identifiers {});
    auto shortLived = std::make_unique<Window>();
    shortLived->setAttributes(seen(false));
    m_window.expectChildWindow(*shortLived);
    m_told.clear();
    shortLived.reset();
    EXPECT_EQ(m_told.count(), 1);
    EXPECT_EQ(list(), Identifiers {});
}

TEST_F(CaptureExclusion, windowThatIsRemovedIsToldAndStandsByItself)
{
    expectAll();
    show(m_window);
    m_bar.orderFront();
    m_told.clear();

    m_window.removeChildWindow(m_banner);
    EXPECT_EQ(list(), (Identifiers { m_bar.winId(), m_popover.winId() }));
    EXPECT_EQ(m_told.count(), 1);
    m_window.removeChildWindow(m_bar);
    m_window.removeChildWindow(m_popover); // it is the bar's

    EXPECT_EQ(list(), Identifiers {});
    EXPECT_EQ(m_told.count(), 2);
    EXPECT_EQ(m_window.childWindows(), std::vector<Window *> {});
    EXPECT_EQ(m_bar.parentWindow(), nullptr);
    EXPECT_EQ(m_bar.windowHandle()->transientParent(), nullptr);
    EXPECT_EQ(
        m_bar.windowsToLeaveOutOfCaptures(), (Identifiers { m_bar.winId(), m_popover.winId() }));
    m_window.hide();
    EXPECT_TRUE(m_bar.isVisible());
}

TEST_F(CaptureExclusion, listIsTheNewOneInsideTheSlot)
{
    Identifiers told;
    const QObject context;
    QObject::connect(
        &m_window, &Window::windowsToLeaveOutOfCapturesChanged, &context, [&] { told = list(); });

    m_window.expectChildWindow(m_banner);

    EXPECT_EQ(told, Identifiers { m_banner.winId() });
}

TEST_F(CaptureExclusion, desktopWithoutAProtocolKeepsNoWindowOut)
{
    EXPECT_FALSE(m_bar.isKeptOutOfCaptures());
    EXPECT_FALSE(m_window.isKeptOutOfCaptures());
}

} // namespace penwick::platform
