// SPDX-License-Identifier: MIT
// The workspace and where it hears of the desktop's setting, on whatever desktop that is.
#include "platform/native/ContrastSource.h"

#include "platform/view/Workspace.h"

#include <gtest/gtest.h>

#include <vector>

namespace penwick::platform {

namespace {

class ToldByHand final : public ContrastSource
{ };

} // namespace

TEST(ContrastSource, noneIsNormalContrast)
{
    const Workspace workspace(nullptr);

    EXPECT_FALSE(workspace.accessibilityDisplayShouldIncreaseContrast());
}

TEST(ContrastSource, workspacePostsWhatIsAnotherValue)
{
    auto source = std::make_unique<ToldByHand>();
    ContrastSource &told = *source;
    Workspace workspace(std::move(source));
    std::vector<bool> values; // as each notification found it
    workspace.notificationCenter().addObserver(&values, QString(), [&](const Notification &) {
        values.push_back(workspace.accessibilityDisplayShouldIncreaseContrast());
    });

    Q_EMIT told.told(false); // as it is
    Q_EMIT told.told(true);
    Q_EMIT told.told(true);
    Q_EMIT told.told(false);

    EXPECT_EQ(values, (std::vector<bool> { true, false }));
    EXPECT_EQ(told.parent(), &workspace);
}

} // namespace penwick::platform
