// SPDX-License-Identifier: MIT
// Many sessions in one process on a real desktop: nothing of them stays behind.
#include "desktop/support/BoardFixture.h"
#include "desktop/support/ChildProcess.h"
#include "desktop/support/Desktop.h"
#include "desktop/support/WaitUntil.h"

#include <gtest/gtest.h>

#include <QFile>

namespace penwick::desktop {

namespace {

class ManySessions : public testing::TestWithParam<WindowManager>
{ };

QString contents(const std::string &name)
{
    QFile file(QString::fromStdString(name));
    return file.open(QIODevice::ReadOnly) ? QString::fromLocal8Bit(file.readAll()) : QString();
}

} // namespace

TEST_P(ManySessions, leaveNothingBehind)
{
    constexpr std::chrono::seconds bound { 50 };
    Desktop desktop(GetParam());
    desktop.startCompositor(); // or each overlay would say that there is none
    const std::string errors = desktop.file("sessions.log");
    std::vector<std::string> environment = desktop.environment();
    environment.emplace_back("QT_QPA_PLATFORM=xcb");

    ChildProcess sessions({ { PENWICK_LEFTOVERS_PROGRAM, "81" }, environment, errors });
    require([&] { return sessions.exitStatus().has_value(); }, "the sessions to end", bound);

    EXPECT_EQ(sessions.exitStatus(), 0);
    EXPECT_EQ(contents(errors), QString());
}

INSTANTIATE_TEST_SUITE_P(
    WindowManagers, ManySessions, testing::ValuesIn(eachManager()), managerName);

} // namespace penwick::desktop
