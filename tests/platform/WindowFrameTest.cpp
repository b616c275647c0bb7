// SPDX-License-Identifier: MIT
// A window's one frame: asked, gliding, granted.
#include "platform/RecordingView.h"
#include "platform/WindowFixture.h"
#include "platform/window/WindowContent.h"

#include <QVariantAnimation>
#include <QWindow>

namespace penwick::platform {

namespace {

class WindowFrame : public WindowFixture
{
protected:
    [[nodiscard]] QVariantAnimation *glide() const
    {
        return m_window.findChild<QVariantAnimation *>();
    }
};

const Rect place { 320.0, 180.0, 640.0, 360.0 };
const Rect target { 400.0, 300.0, 800.0, 450.0 };

} // namespace

TEST_F(WindowFrame, frameSetBeforeShowingHoldsAfterIt)
{
    m_window.setFrame(place);
    EXPECT_EQ(m_window.frame(), place);

    show(m_window);

    EXPECT_EQ(m_window.frame(), place);
    EXPECT_EQ(reallyAt(m_window), place) << "the outer frame, title bar included";
    EXPECT_EQ(m_delegate.take(), Log {});
}

TEST_F(WindowFrame, frameSetAfterShowingIsTheOuterOneToo)
{
    m_window.setFrame(place);
    show(m_window);

    m_window.setFrame(target);
    EXPECT_EQ(m_window.frame(), target);
    settle(m_window);

    EXPECT_EQ(m_window.frame(), target);
    EXPECT_EQ(reallyAt(m_window), target);
}

TEST_F(WindowFrame, frameOutlastsHiding)
{
    m_window.setFrame(place);
    show(m_window);

    m_window.hide();
    EXPECT_EQ(m_window.frame(), place);
    show(m_window);

    EXPECT_EQ(reallyAt(m_window), place);
}

TEST_F(WindowFrame, frameSetWhileHiddenHoldsWhenShownAgain)
{
    m_window.setFrame(place);
    show(m_window);
    m_window.hide();

    m_window.setFrame(target);
    show(m_window);

    EXPECT_EQ(m_window.frame(), target);
    EXPECT_EQ(reallyAt(m_window), target);
}

TEST_F(WindowFrame, fractionsAreKept)
{
    const Rect uneven { 10.25, 20.5, 853.0 + 1.0 / 3, 480.0 };
    m_window.setFrame(uneven);

    m_window.show();

    ASSERT_TRUE(
        QTest::qWaitFor([this] { return m_window.frameGeometry() == QRect(10, 580, 853, 480); }));
    EXPECT_EQ(m_window.frame(), uneven);
}

TEST_F(WindowFrame, originIsSetWithoutTheSize)
{
    m_window.setFrame(place);

    m_window.setFrameOrigin({ 1.0, 2.0 });

    EXPECT_EQ(m_window.frame(), (Rect { 1.0, 2.0, 640.0, 360.0 }));
}

TEST_F(WindowFrame, borderlessWindowFillsItsFrame)
{
    WindowAttributes borderless;
    borderless.styleMask = {};
    m_window.setAttributes(borderless);
    m_window.setFrame(place);

    show(m_window);

    EXPECT_EQ(m_window.size(), QSize(640, 360));
    EXPECT_EQ(reallyAt(m_window), place);
}

TEST_F(WindowFrame, windowThatLosesItsTitleBarKeepsItsFrame)
{
    m_window.setFrame(place);
    show(m_window);
    WindowAttributes borderless;
    borderless.styleMask = {};

    m_window.setAttributes(borderless);
    settle(m_window);

    EXPECT_TRUE(m_window.isVisible());
    EXPECT_EQ(m_window.frame(), place);
    EXPECT_EQ(m_window.size(), QSize(640, 360));
}

TEST_F(WindowFrame, windowNotYetShownDoesNotGlide)
{
    m_window.setFrame(place, Animate::Yes);

    EXPECT_EQ(glide(), nullptr);
    EXPECT_EQ(m_window.frame(), place);
}

TEST_F(WindowFrame, glidingWindowAnswersItsTargetAndArrivesThere)
{
    m_window.setFrame(place);
    show(m_window);

    m_window.setFrame(target, Animate::Yes);

    ASSERT_NE(glide(), nullptr);
    EXPECT_EQ(m_window.frame(), target);
    EXPECT_NE(reallyAt(m_window), target);
    ASSERT_TRUE(QTest::qWaitFor([this] { return !glide(); }));
    settle(m_window);
    EXPECT_EQ(m_window.frame(), target);
    EXPECT_EQ(reallyAt(m_window), target);
}

TEST_F(WindowFrame, halfWayOfAGlideTheTargetIsStillTheAnswer)
{
    m_window.setFrame(place);
    show(m_window);
    m_window.setFrame(target, Animate::Yes);

    glide()->setCurrentTime(glide()->duration() / 2);

    EXPECT_EQ(m_window.frame(), target);
}

TEST_F(WindowFrame, frameSetDuringAGlideEndsIt)
{
    m_window.setFrame(place);
    show(m_window);
    m_window.setFrame(target, Animate::Yes);

    m_window.setFrame(place);
    settle(m_window);

    EXPECT_EQ(glide(), nullptr);
    EXPECT_EQ(reallyAt(m_window), place);
}

TEST_F(WindowFrame, moveIsToldOnce)
{
    m_window.setFrame(place);
    show(m_window);

    m_window.setFrameOrigin({ 500.0, 400.0 });
    settle(m_window);

    EXPECT_EQ(m_delegate.take(), Log { "move" });
}

TEST_F(WindowFrame, moveByTheUserIsToldAndIsTheFrame)
{
    m_window.setFrame(place);
    show(m_window);
    ASSERT_TRUE(QTest::qWaitFor([this] { return reallyAt(m_window) == place; }));

    m_window.windowHandle()->setPosition(m_window.windowHandle()->position() + QPoint(30, -40));

    EXPECT_TRUE(QTest::qWaitFor([this] { return m_window.frame().x == 350.0; }));
    EXPECT_EQ(m_window.frame(), (Rect { 350.0, 220.0, 640.0, 360.0 }));
    EXPECT_EQ(m_delegate.take(), Log { "move" });
}

TEST_F(WindowFrame, delegateThatIsGoneIsNotTold)
{
    auto delegate = std::make_unique<RecordingDelegate>();
    m_window.setDelegate(delegate.get());
    m_window.setFrame(place);
    show(m_window);

    delegate.reset();
    m_window.setFrameOrigin({ 500.0, 400.0 });
    settle(m_window);
    m_window.close();
}

TEST_F(WindowFrame, contentViewFillsTheWindow)
{
    auto *const content = new RecordingView(&m_window);
    contentOf(m_window).setContentView(content);
    m_window.setFrame(place);
    show(m_window);

    m_window.setFrame(target);
    settle(m_window);

    const QSize inside = m_window.size();
    EXPECT_EQ(content->frame(),
        (Rect {
            0.0, 0.0, static_cast<double>(inside.width()), static_cast<double>(inside.height()) }));
    EXPECT_EQ(content->geometry(), m_window.rect());
}

TEST_F(WindowFrame, contentViewThatDiesIsNotTheContentAnyMore)
{
    auto *const content = new RecordingView(&m_window);
    contentOf(m_window).setContentView(content);

    delete content;

    EXPECT_EQ(contentOf(m_window).contentView(), nullptr);
}

TEST_F(WindowFrame, windowsNeverEndTheHost)
{
    EXPECT_FALSE(m_window.testAttribute(Qt::WA_QuitOnClose));
}

} // namespace penwick::platform
