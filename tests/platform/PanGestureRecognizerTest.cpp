// SPDX-License-Identifier: MIT
// A drag told from a click, by the steps that it runs.
#include "platform/view/PanGestureRecognizer.h"

#include "platform/ViewFixture.h"

namespace penwick::platform {

namespace {

using State = PanGestureRecognizer::State;

/// Writes down each step with its place in the window.
class PanGesture : public ViewFixture
{
protected:
    using Steps = std::vector<std::pair<State, Point>>;

    Steps take() { return std::exchange(m_steps, {}); }

    PanGestureRecognizer m_recognizer { [this](const PanGestureRecognizer &gesture) {
        m_steps.emplace_back(gesture.state(), gesture.locationIn(nullptr));
    } };
    Steps m_steps;
};

} // namespace

TEST_F(PanGesture, beginsAtThePressAndFollowsAndEnds)
{
    m_recognizer.pressed({ 10, 20 });
    m_recognizer.dragged({ 14, 20 });
    m_recognizer.dragged({ 15, 25 });
    m_recognizer.released({ 16, 26 });

    EXPECT_EQ(take(),
        (Steps { { State::Began, { 10, 20 } }, { State::Changed, { 14, 20 } },
            { State::Changed, { 15, 25 } }, { State::Ended, { 16, 26 } } }));
}

TEST_F(PanGesture, clickRunsNothing)
{
    m_recognizer.pressed({ 10, 20 });
    m_recognizer.released({ 10, 20 });

    EXPECT_EQ(take(), Steps {});
    EXPECT_EQ(m_recognizer.state(), State::Possible);
}

TEST_F(PanGesture, lessThanThreePointsIsAHandThatTrembles)
{
    m_recognizer.pressed({ 10, 20 });
    m_recognizer.dragged({ 12, 22 });
    EXPECT_EQ(take(), Steps {});

    m_recognizer.dragged({ 13, 20 });
    EXPECT_EQ(take(), (Steps { { State::Began, { 10, 20 } }, { State::Changed, { 13, 20 } } }));
    m_recognizer.dragged({ 10, 20 }); // once it has begun, every place counts
    EXPECT_EQ(take(), (Steps { { State::Changed, { 10, 20 } } }));
}

TEST_F(PanGesture, withoutAPressRunsNothing)
{
    m_recognizer.dragged({ 30, 30 });
    m_recognizer.released({ 30, 30 });

    EXPECT_EQ(take(), Steps {});
}

TEST_F(PanGesture, dragAfterTheReleaseRunsNothing)
{
    m_recognizer.pressed({ 10, 20 });
    m_recognizer.dragged({ 20, 20 });
    m_recognizer.released({ 20, 20 });
    static_cast<void>(take());

    m_recognizer.dragged({ 30, 20 });
    m_recognizer.released({ 30, 20 });

    EXPECT_EQ(take(), Steps {});
}

TEST_F(PanGesture, secondDragBeginsAnew)
{
    m_recognizer.pressed({ 10, 20 });
    m_recognizer.dragged({ 20, 20 });
    m_recognizer.released({ 20, 20 });
    static_cast<void>(take());

    m_recognizer.pressed({ 50, 50 });
    EXPECT_EQ(m_recognizer.state(), State::Possible);
    m_recognizer.dragged({ 50, 60 });

    EXPECT_EQ(take(), (Steps { { State::Began, { 50, 50 } }, { State::Changed, { 50, 60 } } }));
}

TEST_F(PanGesture, placeIsInTheCoordinatesOfTheViewThatIsAsked)
{
    const auto view = added({ 30.0, 10.0, 50.0, 50.0 });
    m_recognizer.pressed({ 40, 20 });
    m_recognizer.dragged({ 50, 20 });

    EXPECT_EQ(m_recognizer.locationIn(view.get()), (Point { 20, 10 }));
    EXPECT_EQ(m_recognizer.locationIn(nullptr), (Point { 50, 20 }));
}

TEST_F(PanGesture, followsThePointerOverItsView)
{
    const auto view = added({ 30.0, 10.0, 50.0, 50.0 });
    view->addGestureRecognizer(m_recognizer);

    QTest::mousePress(view.get(), Qt::LeftButton, Qt::NoModifier, QPoint(10, 10));
    QMouseEvent drag(QEvent::MouseMove, QPointF(20, 10), view->mapToGlobal(QPointF(20, 10)),
        Qt::NoButton, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(view.get(), &drag);
    QTest::mouseRelease(view.get(), Qt::LeftButton, Qt::NoModifier, QPoint(20, 10));

    EXPECT_EQ(take(),
        (Steps { { State::Began, { 40, 50 } }, { State::Changed, { 50, 50 } },
            { State::Ended, { 50, 50 } } }));
    view->removeGestureRecognizer(m_recognizer);
}

TEST_F(PanGesture, addedTwiceFollowsOnce)
{
    const auto view = added({ 30.0, 10.0, 50.0, 50.0 });
    view->addGestureRecognizer(m_recognizer);
    view->addGestureRecognizer(m_recognizer);

    QTest::mousePress(view.get(), Qt::LeftButton, Qt::NoModifier, QPoint(10, 10));
    QMouseEvent drag(QEvent::MouseMove, QPointF(20, 10), view->mapToGlobal(QPointF(20, 10)),
        Qt::NoButton, Qt::LeftButton, Qt::NoModifier);
    QCoreApplication::sendEvent(view.get(), &drag);

    EXPECT_EQ(take().size(), 2U);
    view->removeGestureRecognizer(m_recognizer);
}

TEST_F(PanGesture, takenOffItsViewFollowsNoMore)
{
    const auto view = added({ 30.0, 10.0, 50.0, 50.0 });
    view->addGestureRecognizer(m_recognizer);
    view->removeGestureRecognizer(m_recognizer);

    QTest::mousePress(view.get(), Qt::LeftButton, Qt::NoModifier, QPoint(10, 10));
    QTest::mouseRelease(view.get(), Qt::LeftButton, Qt::NoModifier, QPoint(30, 10));

    EXPECT_EQ(take(), Steps {});
}

} // namespace penwick::platform
