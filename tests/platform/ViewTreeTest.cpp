// SPDX-License-Identifier: MIT
// Subviews: their order, who keeps them, and what happens when they leave.
#include "platform/ViewFixture.h"
#include "platform/view/ViewHost.h"
#include "platform/window/WindowContent.h"

#include <QPointer>

namespace penwick::platform {

namespace {

using Views = std::vector<View *>;

class ViewTree : public ViewFixture
{
protected:
    /// The subviews' widgets as they lie above one another, the lowest first.
    [[nodiscard]] Views stacked() const
    {
        Views views;
        for (QObject *const child : m_content.children())
            views.push_back(dynamic_cast<View *>(child));
        return views;
    }
};

} // namespace

TEST_F(ViewTree, addedViewLiesOnTop)
{
    const auto first = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto second = added({ 0.0, 0.0, 10.0, 10.0 });

    EXPECT_EQ(m_content.subviews(), (Views { first.get(), second.get() }));
    EXPECT_EQ(stacked(), (Views { first.get(), second.get() }));
    EXPECT_EQ(second->superview(), &m_content);
    EXPECT_TRUE(second->isVisible());
}

TEST_F(ViewTree, viewThatIsASubviewAlreadyStaysWhereItIs)
{
    const auto first = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto second = added({ 0.0, 0.0, 10.0, 10.0 });

    m_content.addSubview(first);

    EXPECT_EQ(m_content.subviews(), (Views { first.get(), second.get() }));
    EXPECT_EQ(stacked(), (Views { first.get(), second.get() }));
    EXPECT_EQ(first->take(), Log {});
}

TEST_F(ViewTree, viewAboveItsSiblingsLiesOverWhatIsAddedLaterAndKeepsItsPlaceAmongTheSubviews)
{
    const auto above = added({ 0.0, 0.0, 10.0, 10.0 });
    above->setAboveSiblings(true);
    const auto later = added({ 0.0, 0.0, 10.0, 10.0 });

    EXPECT_EQ(m_content.subviews(), (Views { above.get(), later.get() }));
    EXPECT_EQ(stacked(), (Views { later.get(), above.get() }));

    m_content.setSubviews({ above.get(), later.get() });
    EXPECT_EQ(m_content.subviews(), (Views { above.get(), later.get() }));
    EXPECT_EQ(stacked(), (Views { later.get(), above.get() }));
}

TEST_F(ViewTree, viewComesAboveItsSiblingsAtOnce)
{
    const auto above = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto later = added({ 0.0, 0.0, 10.0, 10.0 });

    EXPECT_FALSE(above->isAboveSiblings());
    above->setAboveSiblings(true);

    EXPECT_TRUE(above->isAboveSiblings());
    EXPECT_EQ(stacked(), (Views { later.get(), above.get() }));
}

TEST_F(ViewTree, viewOfAnotherSuperviewChangesOver)
{
    const auto first = added({ 0.0, 0.0, 100.0, 100.0 });
    const auto second = added({ 0.0, 0.0, 10.0, 10.0 });

    first->addSubview(second);

    EXPECT_EQ(m_content.subviews(), Views { first.get() });
    EXPECT_EQ(first->subviews(), Views { second.get() });
    EXPECT_EQ(second->superview(), first.get());
    EXPECT_EQ(second->take(), (Log { "left", "came" }));
}

TEST_F(ViewTree, subviewsAreKeptInTheOrderGiven)
{
    const auto first = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto second = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto third = added({ 0.0, 0.0, 10.0, 10.0 });

    m_content.setSubviews({ third.get(), first.get() });

    EXPECT_EQ(m_content.subviews(), (Views { third.get(), first.get() }));
    EXPECT_EQ(stacked(), (Views { third.get(), first.get() }));
    EXPECT_EQ(second->superview(), nullptr);
    EXPECT_EQ(second->take(), Log { "left" });
    EXPECT_EQ(first->take(), Log {});
}

TEST_F(ViewTree, strangerDoesNotBecomeASubviewByBeingKept)
{
    const auto first = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto stranger = makeView<RecordingView>();

    m_content.setSubviews({ stranger.get(), first.get() });

    EXPECT_EQ(m_content.subviews(), Views { first.get() });
    EXPECT_EQ(stranger->superview(), nullptr);
}

TEST_F(ViewTree, removedViewIsOutOfTheWindow)
{
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });

    view->removeFromSuperview();

    EXPECT_EQ(m_content.subviews(), Views {});
    EXPECT_EQ(view->superview(), nullptr);
    EXPECT_EQ(view->window(), nullptr);
    EXPECT_EQ(view->parentWidget(), nullptr);
    EXPECT_FALSE(view->isVisible());
    EXPECT_EQ(view->take(), Log { "left" });
}

TEST_F(ViewTree, viewWithoutASuperviewIsNotRemoved)
{
    const auto view = makeView<RecordingView>();

    view->removeFromSuperview();

    EXPECT_EQ(view->take(), Log {});
}

TEST_F(ViewTree, viewThatComesBackIsSeenAgainWhereItWas)
{
    const auto view = added({ 10.0, 20.0, 30.0, 40.0 });
    view->removeFromSuperview();

    m_content.addSubview(view);

    EXPECT_TRUE(view->isVisible());
    EXPECT_EQ(view->geometry(), QRect(10, 40, 30, 40));
    EXPECT_EQ(view->window(), ViewHost::of(m_window));
    EXPECT_EQ(view->take(), (Log { "left", "came" }));
}

TEST_F(ViewTree, viewsInsideComeAndLeaveWithTheOneAroundThem)
{
    const auto outer = makeView<RecordingView>();
    const auto inner = makeView<RecordingView>();
    outer->addSubview(inner);
    static_cast<void>(inner->take());

    m_content.addSubview(outer);
    outer->removeFromSuperview();

    EXPECT_EQ(inner->take(), (Log { "came", "left" }));
}

TEST_F(ViewTree, superviewKeepsItsSubviewAlive)
{
    auto view = added({ 0.0, 0.0, 10.0, 10.0 });
    const QPointer<QWidget> widget(view.get());

    view.reset();
    deleteWhatIsLeft();

    ASSERT_EQ(m_content.subviews().size(), 1U);
    EXPECT_EQ(&m_content.subviews().front()->widget(), widget.data());
}

TEST_F(ViewTree, subviewThatNobodyHoldsDiesFromTheEventLoop)
{
    auto view = added({ 0.0, 0.0, 10.0, 10.0 });
    const QPointer<QWidget> widget(view.get());
    view.reset();

    m_content.setSubviews({});

    EXPECT_TRUE(widget);
    deleteWhatIsLeft();
    EXPECT_FALSE(widget);
}

TEST_F(ViewTree, heldSubviewOutlivesItsSuperview)
{
    auto outer = added({ 0.0, 0.0, 100.0, 100.0 });
    const auto inner = makeView<RecordingView>();
    outer->addSubview(inner);
    static_cast<void>(inner->take());

    outer->removeFromSuperview();
    outer.reset();
    deleteWhatIsLeft();

    EXPECT_EQ(inner->superview(), nullptr);
    EXPECT_EQ(inner->parentWidget(), nullptr);
    EXPECT_EQ(inner->window(), nullptr);
}

TEST_F(ViewTree, heldSubviewOutlivesItsWindow)
{
    const auto view = makeView<RecordingView>();
    {
        Window window;
        auto *const content = new RecordingView(&window);
        content->addSubview(view);
        contentOf(window).makeFirstResponder(view.get());
        window.show();
    }

    EXPECT_EQ(view->superview(), nullptr);
    EXPECT_EQ(view->parentWidget(), nullptr);
    EXPECT_EQ(view->window(), nullptr);
}

TEST_F(ViewTree, viewThatDiesIsNoSubviewAnyMore)
{
    auto *const scene = new RecordingView(&m_content);
    m_content.adoptScene();
    ASSERT_EQ(m_content.subviews(), Views { scene });

    delete scene;

    EXPECT_EQ(m_content.subviews(), Views {});
}

TEST_F(ViewTree, viewOfASceneBelongsToItsSuperview)
{
    QPointer<QWidget> inner;
    {
        RecordingView outer;
        inner = new RecordingView(&outer);
        outer.adoptScene();
        EXPECT_EQ(outer.subviews().size(), 1U);
    }

    EXPECT_FALSE(inner);
}

TEST_F(ViewTree, viewThatRemovesItselfInsideItsEventStaysValidUntilTheEventIsOver)
{
    auto view = added({ 0.0, 0.0, 10.0, 10.0 });
    QWidget *const widget = view.get();
    const QPointer<QWidget> watched(widget);
    const std::weak_ptr<RecordingView> weak = view;
    std::int64_t hashAfterwards = 0;
    view->setReaction([self = view.get(), &hashAfterwards](const std::string &what) {
        if (what.rfind("down", 0) != 0)
            return;
        self->removeFromSuperview();
        hashAfterwards = self->hash();
    });
    const std::int64_t hash = view->hash();
    view.reset();

    QTest::mousePress(widget, Qt::LeftButton, Qt::NoModifier, QPoint(1, 1));

    EXPECT_EQ(hashAfterwards, hash);
    EXPECT_TRUE(weak.expired());
    EXPECT_EQ(m_content.subviews(), Views {});
    deleteWhatIsLeft();
    EXPECT_FALSE(watched);
}

TEST_F(ViewTree, firstResponderThatIsRemovedResignsBeforeItLeaves)
{
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });
    contentOf(m_window).makeFirstResponder(view.get());

    view->removeFromSuperview();

    EXPECT_EQ(view->take(), (Log { "resign", "left" }));
    EXPECT_EQ(contentOf(m_window).firstResponder(), nullptr);
}

TEST_F(ViewTree, firstResponderInsideARemovedViewResigns)
{
    const auto outer = added({ 0.0, 0.0, 100.0, 100.0 });
    const auto inner = makeView<RecordingView>();
    outer->addSubview(inner);
    contentOf(m_window).makeFirstResponder(inner.get());
    static_cast<void>(inner->take());

    outer->removeFromSuperview();

    EXPECT_EQ(inner->take(), (Log { "resign", "left" }));
    EXPECT_EQ(contentOf(m_window).firstResponder(), nullptr);
}

TEST_F(ViewTree, firstResponderElsewhereStaysWhenAViewIsRemoved)
{
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto other = added({ 0.0, 0.0, 10.0, 10.0 });
    contentOf(m_window).makeFirstResponder(other.get());

    view->removeFromSuperview();

    EXPECT_EQ(contentOf(m_window).firstResponder(), other.get());
    EXPECT_EQ(other->take(), Log {});
}

TEST_F(ViewTree, viewThatRemovesItselfAsItResignsLeavesOnce)
{
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });
    contentOf(m_window).makeFirstResponder(view.get());
    view->setReaction([self = view.get()](const std::string &what) {
        if (what == "resign")
            self->removeFromSuperview();
    });

    view->removeFromSuperview();

    EXPECT_EQ(view->take(), (Log { "resign", "left" }));
    EXPECT_EQ(m_content.subviews(), Views {});
}

TEST_F(ViewTree, viewsThatGoWhileOthersAreRemovedAreNotRemovedTwice)
{
    const auto first = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto second = added({ 0.0, 0.0, 10.0, 10.0 });
    contentOf(m_window).makeFirstResponder(first.get());
    first->setReaction([other = second.get()](const std::string &what) {
        if (what == "resign")
            other->removeFromSuperview();
    });

    m_content.setSubviews({});

    EXPECT_EQ(m_content.subviews(), Views {});
    EXPECT_EQ(second->take(), Log { "left" });
}

TEST_F(ViewTree, hiddenViewStaysASubview)
{
    const auto view = added({ 0.0, 0.0, 10.0, 10.0 });

    view->setHidden(true);

    EXPECT_TRUE(view->isHidden());
    EXPECT_FALSE(view->isVisible());
    EXPECT_EQ(m_content.subviews(), Views { view.get() });
}

TEST_F(ViewTree, viewThatWasHiddenBeforeItWasAddedStaysHidden)
{
    const auto view = makeView<RecordingView>();
    view->setHidden(true);

    m_content.addSubview(view);

    EXPECT_FALSE(view->isVisible());
    view->setHidden(false);
    EXPECT_TRUE(view->isVisible());
}

TEST_F(ViewTree, viewOutsideOfASuperviewIsNeverAWindowOfItsOwn)
{
    const auto view = makeView<RecordingView>();

    view->setHidden(false);

    EXPECT_FALSE(view->isVisible());
}

TEST_F(ViewTree, identityIsUniqueAndLasts)
{
    const auto first = added({ 0.0, 0.0, 10.0, 10.0 });
    const auto second = added({ 0.0, 0.0, 10.0, 10.0 });
    const std::int64_t hash = first->hash();

    first->removeFromSuperview();
    m_content.addSubview(first);

    EXPECT_EQ(first->hash(), hash);
    EXPECT_NE(first->hash(), second->hash());
}

} // namespace penwick::platform
