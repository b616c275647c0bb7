// SPDX-License-Identifier: MIT
// A window on the screen with a content view of 200 x 100 points.
#pragma once

#include "platform/RecordingView.h"
#include "platform/window/WindowContent.h"

#include <penwick/platform/Window.h>

#include <QCoreApplication>
#include <QEvent>
#include <QTest>

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <vector>

namespace penwick::platform {

/// A borderless window whose content is a recording view.
class ViewFixture : public testing::Test
{
protected:
    using Log = std::vector<std::string>;

    ViewFixture()
        : m_content(*new RecordingView(&m_window))
    {
        WindowAttributes borderless;
        borderless.styleMask = {};
        m_window.setAttributes(borderless);
        m_window.setFrame({ 300.0, 300.0, 200.0, 100.0 });
        contentOf(m_window).setContentView(&m_content);
        contentOf(m_window).adoptScene();
        m_window.show();
        EXPECT_TRUE(QTest::qWaitForWindowExposed(&m_window));
        EXPECT_EQ(m_content.frame(), (Rect { 0.0, 0.0, 200.0, 100.0 }));
        static_cast<void>(m_content.take());
    }

    /// A new view in the content.
    std::shared_ptr<RecordingView> added(const Rect &frame)
    {
        auto view = makeView<RecordingView>();
        view->setFrame(frame);
        m_content.addSubview(view);
        static_cast<void>(view->take());
        return view;
    }

    /// Lets go what was left to the event loop to delete.
    static void deleteWhatIsLeft()
    {
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }

    Window m_window;
    RecordingView &m_content; // the window's
};

} // namespace penwick::platform
