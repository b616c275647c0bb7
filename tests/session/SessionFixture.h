// SPDX-License-Identifier: MIT
// A host's side of a session: its entry object, its screens and what it was told.
#pragma once

#include <penwick/Penwick.h>
#include <penwick/platform/NotificationCenter.h>

#include <QCoreApplication>
#include <QEvent>
#include <QGuiApplication>
#include <QScreen>
#include <QVariant>

#include <gtest/gtest.h>

#include <functional>
#include <utility>
#include <vector>

namespace penwick::test {

/// Opens drawing windows, and writes down the ends of sessions by their objects.
class SessionFixture : public testing::Test
{
protected:
    SessionFixture()
    {
        platform::NotificationCenter::defaultCenter().addObserver(
            this, penwickSessionEndNotificationKey(), [this](const platform::Notification &end) {
                m_ends.push_back(end.object);
                if (m_reaction)
                    m_reaction();
            });
    }

    ~SessionFixture() override
    {
        platform::NotificationCenter::defaultCenter().removeObserver(this);
    }

    /// 1920 x 1080, at the origin.
    static QScreen *primary() { return QGuiApplication::screens().at(0); }
    /// 1280 x 720, its bottom left corner at (1920, 160).
    static QScreen *secondary() { return QGuiApplication::screens().at(1); }

    /// Lets go what was left to the event loop to delete.
    static void deleteWhatIsLeft()
    {
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }

    /// To be done when the end of a session is told.
    void setReaction(std::function<void()> reaction) { m_reaction = std::move(reaction); }
    [[nodiscard]] const std::vector<QVariant> &ends() const { return m_ends; }

private:
    std::vector<QVariant> m_ends;
    std::function<void()> m_reaction;
};

} // namespace penwick::test
