// SPDX-License-Identifier: MIT
// Who is told, in which order, and what may be done meanwhile.
#include <penwick/platform/NotificationCenter.h>

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using penwick::platform::Notification;
using penwick::platform::NotificationCenter;

class NotificationCenterTest : public ::testing::Test
{
protected:
    /// A handler that writes `who` down.
    NotificationCenter::Handler writing(const char *who)
    {
        return [this, who](const Notification &) { calls.emplace_back(who); };
    }

    NotificationCenter center;
    std::vector<std::string> calls;
    const QString name = QStringLiteral("name");
    const int first = 0; // keys; only their addresses matter
    const int second = 0;
};

using Calls = std::vector<std::string>;

TEST_F(NotificationCenterTest, observersOfTheNameAreCalledInTheOrderOfAddingBeforePostReturns)
{
    center.addObserver(&second, name, writing("a"));
    center.addObserver(&first, QStringLiteral("other"), writing("b"));
    center.addObserver(&first, name, writing("c"));

    center.postNotification(name);

    EXPECT_EQ(calls, (Calls { "a", "c" }));
}

TEST_F(NotificationCenterTest, handlerIsHandedNameAndObject)
{
    Notification received;
    center.addObserver(
        &first, name, [&](const Notification &notification) { received = notification; });

    center.postNotification(name, 42);

    EXPECT_EQ(received.name, name);
    EXPECT_EQ(received.object, QVariant(42));
}

TEST_F(NotificationCenterTest, notificationWithoutObjectHasAnInvalidOne)
{
    QVariant object = 1;
    center.addObserver(
        &first, name, [&](const Notification &notification) { object = notification.object; });

    center.postNotification(name);

    EXPECT_FALSE(object.isValid());
}

TEST_F(NotificationCenterTest, observerWithoutNameHearsEverything)
{
    center.addObserver(&first, QString(), writing("all"));

    center.postNotification(name);
    center.postNotification(QStringLiteral("other"));

    EXPECT_EQ(calls, (Calls { "all", "all" }));
}

TEST_F(NotificationCenterTest, namesAreComparedExactly)
{
    center.addObserver(&first, name, writing("a"));

    center.postNotification(QStringLiteral("Name"));
    center.postNotification(QStringLiteral("name.more"));

    EXPECT_TRUE(calls.empty());
}

TEST_F(NotificationCenterTest, observerAddedTwiceIsCalledTwice)
{
    center.addObserver(&first, name, writing("a"));
    center.addObserver(&first, name, writing("b"));

    center.postNotification(name);

    EXPECT_EQ(calls, (Calls { "a", "b" }));
}

TEST_F(NotificationCenterTest, removingAnObserverDropsAllThatItAddedAndNothingElse)
{
    center.addObserver(&first, name, writing("a"));
    center.addObserver(&second, name, writing("b"));
    center.addObserver(&first, QString(), writing("c"));

    center.removeObserver(&first);
    center.removeObserver(&first);
    center.postNotification(name);

    EXPECT_EQ(calls, (Calls { "b" }));
}

TEST_F(NotificationCenterTest, observerRemovedDuringDeliveryIsNotCalledAnyMore)
{
    center.addObserver(&first, name, [this](const Notification &) {
        calls.emplace_back("a");
        center.removeObserver(&second);
    });
    center.addObserver(&second, name, writing("b"));

    center.postNotification(name);

    EXPECT_EQ(calls, (Calls { "a" }));
}

TEST_F(NotificationCenterTest, observerMayRemoveItselfWhileItIsCalled)
{
    center.addObserver(&first, name, [this](const Notification &) {
        center.removeObserver(&first);
        calls.emplace_back("a");
    });
    center.addObserver(&second, name, writing("b"));

    center.postNotification(name);
    center.postNotification(name);

    EXPECT_EQ(calls, (Calls { "a", "b", "b" }));
}

TEST_F(NotificationCenterTest, observerAddedDuringDeliveryHearsOnlyLaterOnes)
{
    center.addObserver(&first, name, [this](const Notification &) {
        if (calls.empty())
            center.addObserver(&second, name, writing("late"));
        calls.emplace_back("a");
    });

    center.postNotification(name);
    EXPECT_EQ(calls, (Calls { "a" }));

    center.postNotification(name);
    EXPECT_EQ(calls, (Calls { "a", "a", "late" }));
}

TEST_F(NotificationCenterTest, postFromAHandlerIsDeliveredAtOnce)
{
    const QString inner = QStringLiteral("inner");
    center.addObserver(&first, name, [this, inner](const Notification &) {
        calls.emplace_back("before");
        center.postNotification(inner);
        calls.emplace_back("after");
    });
    center.addObserver(&first, inner, writing("inner"));
    center.addObserver(&second, name, writing("second"));

    center.postNotification(name);

    EXPECT_EQ(calls, (Calls { "before", "inner", "after", "second" }));
}

TEST(NotificationCenter, defaultCenterIsAlwaysTheSame)
{
    EXPECT_EQ(&NotificationCenter::defaultCenter(), &NotificationCenter::defaultCenter());
}

} // namespace
