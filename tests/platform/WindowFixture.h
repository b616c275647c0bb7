// SPDX-License-Identifier: MIT
// A window and a delegate that writes down what it is told.
#pragma once

#include <penwick/platform/Window.h>

#include <QCoreApplication>
#include <QObject>
#include <QTest>

#include <gtest/gtest.h>

#include <cmath>
#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace penwick::platform {

/// Writes down "move" and "close", in order.
class RecordingDelegate final : public QObject, public WindowDelegate
{
public:
    /// To be done when the window is about to close.
    void setReaction(std::function<void()> reaction) { m_reaction = std::move(reaction); }
    [[nodiscard]] std::vector<std::string> take() { return std::exchange(m_log, {}); }

    void windowDidMove() override { m_log.emplace_back("move"); }
    void windowWillClose() override
    {
        m_log.emplace_back("close");
        if (m_reaction)
            m_reaction();
    }

private:
    std::vector<std::string> m_log;
    std::function<void()> m_reaction;
};

/// A titled window that is not on the screen yet.
class WindowFixture : public testing::Test
{
protected:
    using Log = std::vector<std::string>;

    WindowFixture() { m_window.setDelegate(&m_delegate); }

    static void show(Window &window)
    {
        window.show();
        EXPECT_TRUE(QTest::qWaitForWindowExposed(&window));
        settle(window);
    }

    /// Waits until the desktop has said where the window is.
    static void settle(Window &window)
    {
        EXPECT_TRUE(QTest::qWaitFor([&] { return reallyAt(window) == rounded(window.frame()); }));
        QCoreApplication::processEvents();
    }

    /// The window's outer frame as Qt's window system has it.
    static Rect reallyAt(const Window &window)
    {
        const QRect outer = window.frameGeometry();
        constexpr double screenHeight = 1080.0;
        return { static_cast<double>(outer.x()), screenHeight - outer.y() - outer.height(),
            static_cast<double>(outer.width()), static_cast<double>(outer.height()) };
    }

    static Rect rounded(const Rect &rect)
    {
        return { std::round(rect.x), std::round(rect.y), std::round(rect.width),
            std::round(rect.height) };
    }

    RecordingDelegate m_delegate;
    Window m_window;
};

} // namespace penwick::platform
