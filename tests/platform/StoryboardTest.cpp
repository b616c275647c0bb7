// SPDX-License-Identifier: MIT
// Scenes by identifier: a missing one and one of another class.
#include "platform/scene/Storyboard.h"

#include "platform/scene/Bundle.h"

#include <QTimer>
#include <QWindow>

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

const auto name = QStringLiteral("Main");
const auto identifier = QStringLiteral("Scene");

/// A bundle with one scene, which holds a QTimer.
Bundle bundleWithATimer(int &made)
{
    Bundle bundle((QString()));
    bundle.addScene(name, identifier, [&made] {
        ++made;
        return std::make_unique<QTimer>();
    });
    return bundle;
}

} // namespace

TEST(Storyboard, everyInstanceIsANewOne)
{
    int made = 0;
    const Bundle bundle = bundleWithATimer(made);
    const Storyboard storyboard(name, bundle);

    const auto first = storyboard.instantiate<QTimer>(identifier);
    const auto second = storyboard.instantiate<QTimer>(identifier);

    EXPECT_TRUE(first);
    EXPECT_TRUE(second);
    EXPECT_NE(first, second);
    EXPECT_EQ(made, 2);
}

TEST(Storyboard, missingSceneGivesNothing)
{
    int made = 0;
    const Bundle bundle = bundleWithATimer(made);

    EXPECT_FALSE(Storyboard(name, bundle).instantiateController(QStringLiteral("Other")));
    EXPECT_FALSE(Storyboard(QStringLiteral("Other"), bundle).instantiateController(identifier));
    EXPECT_EQ(made, 0);
}

TEST(Storyboard, sceneOfAnotherClassIsThereAndIsNotGivenAsTheWrongOne)
{
    int made = 0;
    const Bundle bundle = bundleWithATimer(made);
    const Storyboard storyboard(name, bundle);

    const auto asWindow = storyboard.instantiate<QWindow>(identifier);
    const auto asItIs = storyboard.instantiateController(identifier);

    EXPECT_FALSE(asWindow);
    EXPECT_TRUE(asItIs);
    EXPECT_EQ(made, 2);
}

} // namespace penwick::platform
