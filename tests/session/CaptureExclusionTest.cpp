// SPDX-License-Identifier: MIT
// What a drawing window says a capture is to leave out: its tool bar, popover and banner.
#include "session/SessionFixture.h"

#include "session/ToolPanelWindowController.h"
#include "toolpanel/ToolPanelButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <QSignalSpy>

#include <algorithm>
#include <optional>

namespace penwick::test {

namespace {

using platform::Window;
using Identifiers = std::vector<WId>;

class LeftOutOfCaptures : public SessionFixture, public testing::WithParamInterface<WindowType>
{
protected:
    LeftOutOfCaptures()
    {
        QImage image(400, 300, QImage::Format_RGB32);
        image.fill(Qt::white);
        m_controller = m_penwick->createDrawingWindowController(GetParam(), primary(), image);
    }

    [[nodiscard]] Window &window() const { return *m_controller->drawingWindow(); }
    [[nodiscard]] ToolPanelViewController &bar() const
    {
        return m_controller->tPanelWindowController()->content();
    }
    [[nodiscard]] Identifiers sorted() const
    {
        Identifiers list = window().windowsToLeaveOutOfCaptures();
        std::sort(list.begin(), list.end());
        return list;
    }
    [[nodiscard]] Identifiers barPopoverAndBanner() const
    {
        Identifiers list { m_controller->tPanelWindowController()->window()->winId(),
            bar().popoverW()->winId(), m_controller->sharingNotificationWindow()->winId() };
        std::sort(list.begin(), list.end());
        return list;
    }

    std::optional<Penwick> m_penwick { std::in_place };
    std::shared_ptr<DrawingWindowController> m_controller;
};

} // namespace

TEST_P(LeftOutOfCaptures, areToolBarPopoverAndBannerBeforeAnyOfThemWasShown)
{
    const Identifiers list = sorted();

    EXPECT_EQ(list.size(), 3U);
    EXPECT_EQ(list, barPopoverAndBanner());
    EXPECT_FALSE(bar().popoverW()->isVisible());
    EXPECT_FALSE(m_controller->sharingNotificationWindow()->isVisible());
}

TEST_P(LeftOutOfCaptures, areTheSameWhateverIsShownAndHidden)
{
    const Identifiers before = sorted();
    const QSignalSpy told(&window(), &Window::windowsToLeaveOutOfCapturesChanged);
    m_controller->showWindow(nullptr);

    for (int showing = 0; showing < 2; ++showing) {
        m_penwick->showWindowSharingNotification();
        bar().OnToolBarItemSelection(*bar().outlets().colorButton);
        EXPECT_TRUE(bar().popoverW()->isVisible());
        EXPECT_TRUE(m_controller->sharingNotificationWindow()->isVisible());
        m_controller->hideThePopover();
        m_controller->closeSharingNotificationWindow();
        window().orderOut();
        window().orderFront();
    }

    EXPECT_EQ(sorted(), before);
    EXPECT_EQ(told.count(), 0);
}

// A host that asked for the list in the slot would ask a window that it has let go.
TEST_P(LeftOutOfCaptures, endOfTheSessionIsNoNewsOfThem)
{
    static_cast<void>(sorted());
    m_controller->showWindow(nullptr);
    const QSignalSpy told(&window(), &Window::windowsToLeaveOutOfCapturesChanged);

    window().close();
    m_controller.reset();
    m_penwick.reset();
    deleteWhatIsLeft();

    EXPECT_EQ(told.count(), 0);
}

TEST_P(LeftOutOfCaptures, bannerAndToolBarThatAreReplacedAreNotAmongThem)
{
    const std::shared_ptr<Window> banner = m_controller->sharingNotificationWindow();
    const std::shared_ptr<ToolPanelWindowController> toolBar
        = m_controller->tPanelWindowController();
    const Window &panel = *toolBar->toolPanelWindow();
    m_controller->showWindow(nullptr);
    m_penwick->showWindowSharingNotification();

    m_controller->setSharingNotificationWindow(std::make_shared<Window>());
    m_controller->setTPanelWindowController(std::make_shared<ToolPanelWindowController>());

    EXPECT_EQ(sorted(), Identifiers {});
    EXPECT_EQ(window().childWindows(), std::vector<Window *> {});
    EXPECT_EQ(banner->parentWindow(), nullptr);
    EXPECT_EQ(panel.parentWindow(), nullptr);
}

TEST_P(LeftOutOfCaptures, bannerThatIsSetIsAmongThemBeforeItIsShown)
{
    const auto banner = std::make_shared<Window>();
    m_controller->setNotificationWindowProperties(*banner);

    m_controller->setSharingNotificationWindow(banner);

    EXPECT_EQ(sorted(), barPopoverAndBanner());
}

TEST_P(LeftOutOfCaptures, thoseThatAreSetAgainStayAmongThem)
{
    const Identifiers before = sorted();

    m_controller->setSharingNotificationWindow(m_controller->sharingNotificationWindow());
    m_controller->setTPanelWindowController(m_controller->tPanelWindowController());

    EXPECT_EQ(sorted(), before);
}

TEST_P(LeftOutOfCaptures, noneIsKeptOutByADesktopThatCannot)
{
    for (const Window *const child : window().childWindows())
        EXPECT_FALSE(child->isKeptOutOfCaptures());
}

INSTANTIATE_TEST_SUITE_P(Kinds, LeftOutOfCaptures,
    testing::Values(WindowType::whiteboard, WindowType::annotation, WindowType::imageAnnotation));

} // namespace penwick::test
