// SPDX-License-Identifier: MIT
// The desktop's increase-contrast setting, switched while the tool bar is open.
#include "desktop/support/ToolBarFixture.h"

namespace penwick::desktop {

namespace {

class Contrast : public ToolBarTest
{
protected:
    /// Starts a settings portal with that contrast, then a board on its bus.
    void openWithContrast(const std::string &contrast)
    {
        const std::string &bus = desktop().sessionBus();
        m_portal = std::make_unique<ChildProcess>(
            ChildProcess::Command { { PENWICK_FAKE_SETTINGS_PORTAL, bus,
                                        "org.freedesktop.portal.Desktop", "uint:" + contrast },
                desktop().environment(), desktop().file("portal.log") });
        await("ready");
        open(HostProgram::AsShipped, {}, { "DBUS_SESSION_BUS_ADDRESS=" + bus });
    }

    void change(const std::string &contrast)
    {
        m_portal->writeLine("change uint:" + contrast);
        await("done");
    }

private:
    void await(const std::string &answer)
    {
        require([&] { return m_portal->takeLine() == answer; }, "the settings portal");
    }

    std::unique_ptr<ChildProcess> m_portal;
};

} // namespace

TEST_F(Contrast, thatIsSwitchedRepaintsTheOpenBar)
{
    openWithContrast("0");
    ASSERT_TRUE(turns("state", end));
    ASSERT_TRUE(turns("brush", selected));

    change("1");
    EXPECT_TRUE(turns("state", endInContrast));
    EXPECT_TRUE(turns("brush", selectedInContrast));
    EXPECT_EQ(background("text"), normal);
    desktop().pointer().moveTo(centre("text"));
    EXPECT_TRUE(turns("text", selectedInContrast));
    leave();

    change("0");
    EXPECT_TRUE(turns("state", end));
    EXPECT_TRUE(turns("brush", selected));
    EXPECT_EQ(host().errorOutput(), QString());
}

TEST_F(Contrast, thatIsIncreasedAlreadyIsThereFromTheStart)
{
    openWithContrast("1");

    EXPECT_TRUE(turns("state", endInContrast));
    EXPECT_TRUE(turns("brush", selectedInContrast));
}

} // namespace penwick::desktop
