// SPDX-License-Identifier: MIT
#include "CapturingHost.h"

#include <penwick/platform/NotificationCenter.h>

#include <QCoreApplication>
#include <QGuiApplication>

#include <cstdio>

using penwick::platform::Notification;
using penwick::platform::NotificationCenter;
using penwick::platform::Window;

CapturingHost::CapturingHost(const QString &fileName)
    : m_fileName(fileName)
{
    NotificationCenter::defaultCenter().addObserver(this,
        penwick::penwickSessionEndNotificationKey(),
        [](const Notification &) { QCoreApplication::quit(); });
}

CapturingHost::~CapturingHost()
{
    NotificationCenter::defaultCenter().removeObserver(this);
}

bool CapturingHost::open()
{
    m_controller = m_penwick.createDrawingWindowController(
        penwick::WindowType::whiteboard, QGuiApplication::primaryScreen());
    if (!m_controller)
        return false;
    connect(m_controller->drawingWindow(), &Window::windowsToLeaveOutOfCapturesChanged, this,
        &CapturingHost::takeListAnew);
    takeListAnew();
    m_controller->showWindow(this);
    return true;
}

void CapturingHost::takeListAnew()
{
    m_leftOut = m_controller->drawingWindow()->windowsToLeaveOutOfCaptures();
    std::fputs("left out:", stdout);
    for (const WId window : m_leftOut)
        std::printf(" %llu", static_cast<unsigned long long>(window));
    std::putchar('\n');
    std::fflush(stdout);
}

void CapturingHost::capture() const
{
    const bool isWritten = m_screen.picture(m_leftOut).save(m_fileName);
    std::puts(isWritten ? "captured" : "the picture could not be written");
    std::fflush(stdout);
}

void CapturingHost::announce()
{
    m_penwick.showWindowSharingNotification();
}
