// SPDX-License-Identifier: MIT
// The private desktop itself: it comes up, it obeys, and nothing of it stays behind.
#include "desktop/support/Desktop.h"
#include "desktop/support/Printing.h"
#include "desktop/support/WaitUntil.h"
#include "desktop/support/XConnection.h"

#include <gtest/gtest.h>

#include <array>
#include <csignal>
#include <cstdlib>
#include <stdexcept>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

namespace penwick::desktop {

TEST(PrivateDesktop, isAsLargeAsAsked)
{
    Desktop desktop(chosenManager(), { 640, 480 });

    EXPECT_EQ(desktop.screen().size(), QSize(640, 480));
    EXPECT_EQ(desktop.screen().picture().size(), QSize(640, 480));
    EXPECT_FALSE(desktop.pointer().look().image.isNull());
}

TEST(PrivateDesktop, pointerGoesWhereItIsSent)
{
    Desktop desktop(WindowManager::None);

    desktop.pointer().moveTo({ 10, 20 });
    EXPECT_EQ(desktop.pointer().place(), QPoint(10, 20));
    desktop.pointer().glideTo({ 300, 220 });
    EXPECT_EQ(desktop.pointer().place(), QPoint(300, 220));
}

TEST(PrivateDesktop, unknownKeyIsRefusedByName)
{
    Desktop desktop(WindowManager::None);

    EXPECT_NO_THROW(desktop.keyboard().type("Ab 1"));
    EXPECT_THROW(desktop.keyboard().press("NoSuchKey"), std::runtime_error);
}

TEST(PrivateDesktop, runsBesideAnother)
{
    Desktop first(eachManager().front());
    Desktop second(eachManager().back());

    EXPECT_NE(first.displayName(), second.displayName());
}

TEST(PrivateDesktop, isGoneAfterItsEnd)
{
    std::string displayName;
    {
        Desktop desktop;
        displayName = desktop.displayName();
    }

    EXPECT_THROW(XConnection { displayName }, std::runtime_error);
}

TEST(PrivateDesktop, isGoneAfterItsTestWasKilled)
{
    prctl(PR_SET_CHILD_SUBREAPER, 1); // what the killed process leaves behind becomes ours
    std::array<int, 2> ends {};
    ASSERT_EQ(pipe(ends.data()), 0);
    const pid_t test = fork();
    if (test == 0) {
        const Desktop desktop;
        [[maybe_unused]] const auto written = write(ends[1], "!", 1);
        pause();
        _exit(0);
    }
    char mark = 0;
    ASSERT_EQ(read(ends[0], &mark, 1), 1);

    kill(test, SIGKILL);

    // No child is left, neither the killed one nor the two that it had started.
    EXPECT_TRUE(waitUntil([] {
        while (waitpid(-1, nullptr, WNOHANG) > 0) { }
        return waitpid(-1, nullptr, WNOHANG) == -1;
    }));
}

TEST(WindowManager, thatTheEnvironmentNamesStandsForAll)
{
    const char *const variable = "PENWICK_WINDOW_MANAGER";

    setenv(variable, "kwin", 1);
    EXPECT_EQ(chosenManager(), WindowManager::Kwin);
    EXPECT_EQ(eachManager(), std::vector { WindowManager::Kwin });

    unsetenv(variable);
    EXPECT_EQ(chosenManager(), WindowManager::Openbox);
    EXPECT_EQ(eachManager(), (std::vector { WindowManager::Openbox, WindowManager::Xfwm4 }));

    setenv(variable, "nobody's", 1);
    EXPECT_THROW(static_cast<void>(chosenManager()), std::runtime_error);
}

TEST(ChildProcess, absentProgramIsNamedWithTheReason)
{
    try {
        const ChildProcess process({ { "no-such-program" }, { "PATH=/usr/bin" }, "/dev/null" });
        FAIL() << "it was started";
    } catch (const std::runtime_error &error) {
        EXPECT_STREQ(error.what(), "cannot start no-such-program: No such file or directory");
    }
}

TEST(ChildProcess, outputComesLineByLineAndTheStatusAfterIt)
{
    ChildProcess process({ { "sh", "-c", "read a; echo \"<$a>\"; echo second; exit 3" },
        { "PATH=/usr/bin:/bin" }, "/dev/null" });

    process.writeLine("first");
    require([&] { return process.exitStatus().has_value(); }, "the shell to end");

    EXPECT_EQ(process.takeLine(), "<first>");
    EXPECT_EQ(process.takeLine(), "second");
    EXPECT_EQ(process.takeLine(), std::nullopt);
    EXPECT_EQ(process.exitStatus(), 3);
}

TEST(ChildProcess, stubbornProgramIsEndedByForce)
{
    ChildProcess process({ { "sh", "-c", "trap '' TERM; echo ready; while :; do sleep 1; done" },
        { "PATH=/usr/bin:/bin" }, "/dev/null" });
    require([&] { return process.takeLine().has_value(); }, "the shell to be ready");

    process.end();

    EXPECT_EQ(process.exitStatus(), 128 + SIGKILL);
}

} // namespace penwick::desktop
