// SPDX-License-Identifier: MIT
// How long a picture is fitted to its window, on desktops that frame a window late or never.
#include "session/PictureFit.h"

#include "platform/view/ImageView.h"

#include <penwick/platform/Window.h>

#include <QCoreApplication>
#include <QResizeEvent>

#include <gtest/gtest.h>

namespace penwick::test {

namespace {

using platform::Rect;

/// A window that has no frame around it yet. The test tells what the desktop does.
class PictureFitTest : public testing::Test
{
protected:
    PictureFitTest()
    {
        QImage image(800, 600, QImage::Format_RGB32);
        image.fill(Qt::yellow);
        m_view.setImage(image);
        new PictureFit(m_window, m_view); // the view's
    }

    void resizeTo(QSize size)
    {
        const QSize former = m_window.size();
        m_window.resize(size);
        QResizeEvent event(size, former); // a window that was never shown hears of none
        QCoreApplication::sendEvent(&m_window, &event);
    }

    void settle()
    {
        Q_EMIT m_window.frameSettled();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }

    [[nodiscard]] Rect picture() const { return m_view.frame(); }
    [[nodiscard]] bool isFitting() const { return m_view.findChild<PictureFit *>(); }

    platform::Window m_window;
    platform::ImageView &m_view = *new platform::ImageView(&m_window);
};

} // namespace

TEST_F(PictureFitTest, followsTheContentBeforeTheDesktopHasAnswered)
{
    resizeTo({ 400, 300 });
    EXPECT_EQ(picture(), (Rect { 0, 0, 400, 300 }));

    resizeTo({ 200, 300 });
    EXPECT_EQ(picture(), (Rect { 0, 0, 200, 150 }));
}

TEST_F(PictureFitTest, contentThatALateFrameMakesSmallerIsFittedOnceMore)
{
    resizeTo({ 400, 300 });
    settle();

    m_window.show(); // this screen's windows have frames
    resizeTo({ 400, 270 });
    ASSERT_NE(m_window.frameGeometry(), m_window.geometry());
    settle();

    EXPECT_EQ(picture(), (Rect { 0, 0, 360, 270 }));
    EXPECT_FALSE(isFitting());
}

TEST_F(PictureFitTest, firstPullOfAWindowThatNoDesktopFramesEndsTheFitting)
{
    resizeTo({ 400, 300 });
    settle();
    settle(); // of the same size
    ASSERT_TRUE(isFitting()) << "a frame may still come";

    resizeTo({ 240, 180 });
    EXPECT_EQ(picture(), (Rect { 0, 0, 400, 300 })) << "in the user's hand";
    settle();

    EXPECT_EQ(picture(), (Rect { 0, 0, 400, 300 }));
    EXPECT_FALSE(isFitting());
    resizeTo({ 100, 100 });
    EXPECT_EQ(picture(), (Rect { 0, 0, 400, 300 }));
}

} // namespace penwick::test
