// SPDX-License-Identifier: MIT
// A white board with its tool bar, open without a screen.
#pragma once

#include "canvas/DrawViewController.h"
#include "canvas/DrawingCanvasModel.h"
#include "canvas/DrawingCanvasView.h"
#include "history/NotificationNames.h"
#include "platform/window/WindowContent.h"
#include "session/ToolPanelWindowController.h"
#include "toolpanel/ButtonLook.h"
#include "toolpanel/ContrastSetting.h"
#include "toolpanel/PopoverView.h"
#include "toolpanel/PopoverViewController.h"
#include "toolpanel/ToolOptionsButton.h"
#include "toolpanel/ToolPanelViewController.h"

#include <penwick/Penwick.h>
#include <penwick/platform/NotificationCenter.h>

#include <QCoreApplication>
#include <QGuiApplication>
#include <QScreen>
#include <QStringList>
#include <QTest>

#include <gtest/gtest.h>

#include <memory>

namespace penwick::test {

/// The identifiers of the eight buttons.
inline const QStringList &toolNames()
{
    static const QStringList names { QStringLiteral("text"), QStringLiteral("brush"),
        QStringLiteral("eraser"), QStringLiteral("color"), QStringLiteral("clear"),
        QStringLiteral("state"), QStringLiteral("redo"), QStringLiteral("undo") };
    return names;
}

class ToolPanelFixture : public testing::Test
{
protected:
    ToolPanelFixture()
        : m_board(m_penwick->createDrawingWindowController(
            WindowType::whiteboard, QGuiApplication::primaryScreen()))
        , drawing(*m_board->drawingWindow())
        , panel(*m_board->tPanelWindowController()->toolPanelWindow())
        , bar(m_board->tPanelWindowController()->content())
    {
        m_board->showWindow(nullptr);
        static_cast<void>(QTest::qWaitForWindowExposed(&panel));
        QCoreApplication::processEvents();
    }

    [[nodiscard]] DrawViewController &drawViewController() const
    {
        return *dynamic_cast<DrawViewController *>(contentOf(drawing).contentViewController());
    }
    [[nodiscard]] DrawingCanvasView &canvas() const { return *drawViewController().drawingView(); }
    [[nodiscard]] platform::Window &popover() const { return *bar.popoverW(); }

    [[nodiscard]] ToolPanelButton &button(const char *identifier) const
    {
        return *bar.button(QLatin1String(identifier));
    }

    /// The option button of any popover.
    [[nodiscard]] ToolOptionsButton &option(const QString &identifier) const
    {
        for (ToolOptionsButton *const each : options()) {
            if (each->identifier() == identifier)
                return *each;
        }
        throw std::runtime_error("no option " + identifier.toStdString());
    }

    /// All option buttons, popover by popover and in their order there.
    [[nodiscard]] std::vector<ToolOptionsButton *> options() const
    {
        std::vector<ToolOptionsButton *> found;
        for (PopoverView *const view : popoverViews()) {
            for (platform::View *const each : view->subviews().at(0)->subviews())
                found.push_back(dynamic_cast<ToolOptionsButton *>(each));
        }
        return found;
    }

    [[nodiscard]] std::vector<PopoverView *> popoverViews() const
    {
        PopoverViewController &popovers = *bar.popoverVc();
        return { popovers.textPopoverView(), popovers.colorPopoverView(),
            popovers.brushPopoverView() };
    }

    void press(const char *identifier) { button(identifier).click(); }
    void choose(const char *identifier) { option(QLatin1String(identifier)).click(); }

    /// The tool bar's selected buttons.
    [[nodiscard]] QStringList selected() const
    {
        QStringList names;
        for (const QString &name : toolNames()) {
            if (bar.button(name)->isSelected())
                names.append(name);
        }
        return names;
    }

    /// The selected options of one kind.
    [[nodiscard]] QStringList selectedOptions(const char *kind) const
    {
        QStringList names;
        for (const ToolOptionsButton *const each : options()) {
            if (each->isSelected() && each->identifier().startsWith(QLatin1String(kind)))
                names.append(each->identifier());
        }
        return names;
    }

    [[nodiscard]] bool isPopoverShown() const { return popover().isVisible(); }

    static void post(const QVariant &object)
    {
        platform::NotificationCenter::defaultCenter().postNotification(
            penwickNotificationKey(), object);
    }

    ContrastSetting m_contrast;
    std::unique_ptr<Penwick> m_penwick = std::make_unique<Penwick>();
    std::shared_ptr<DrawingWindowController> m_board;
    platform::Window &drawing;
    ToolBarPanelWindow &panel;
    ToolPanelViewController &bar;
};

inline QStringList only(const char *name)
{
    return { QLatin1String(name) };
}

} // namespace penwick::test
