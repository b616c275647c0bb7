// SPDX-License-Identifier: MIT
#include "desktop/support/ToolBarFixture.h"

#include <stdexcept>

namespace penwick::desktop {

namespace {

// From the middle of any button to a place beside its image, but still inside the button; the end
// button is the smallest.
const QPoint beside(-15, -11);

// The darkest level of a button's image is below this; that of a disabled button's is above.
constexpr int halfway = 100;

} // namespace

void ToolBarTest::press(const char *tool)
{
    desktop().pointer().click(centre(tool));
    leave();
}

void ToolBarTest::choose(const char *option)
{
    const WindowState shown = popover();
    const QString name = QLatin1String(option);
    if (!shown.buttons.contains(name))
        throw std::runtime_error(std::string("the popover does not offer ") + option);
    desktop().pointer().click(shown.buttons.value(name));
    leave();
}

bool ToolBarTest::isPopoverHidden()
{
    return waitUntil([this] { return !host().window(QStringLiteral("popover")).isVisible; });
}

QPoint ToolBarTest::centre(const char *tool)
{
    const WindowState bar = toolBar();
    const QString name = QLatin1String(tool);
    if (!bar.buttons.contains(name))
        throw std::runtime_error(std::string("the tool bar has no button ") + tool);
    return bar.buttons.value(name);
}

QColor ToolBarTest::background(const char *tool)
{
    return desktop().screen().pixel(centre(tool) + beside);
}

bool ToolBarTest::turns(const char *tool, const QColor &color)
{
    return waitUntil([&] { return background(tool) == color; });
}

bool ToolBarTest::turnsEnabled(const char *tool, bool isEnabled)
{
    return waitUntil([&] {
        const QRect image(centre(tool) - QPoint(12, 12), QSize(24, 24));
        return (darkest(desktop().screen().picture(image)) < halfway) == isEnabled;
    });
}

void ToolBarTest::dragBar(QPoint way)
{
    constexpr int handle = 8; // below the upper edge
    const QRect frame = toolBar().frame;
    const QPoint grip(frame.center().x(), frame.top() + handle);
    desktop().pointer().drag({ grip, grip + way });
}

bool ToolBarTest::comesToStandAt(QPoint place)
{
    return waitUntil([&] {
        const QPoint corner = desktop().windows().outerFrame(window()).topLeft();
        const QPoint off = toolBar().frame.topLeft() - corner - place;
        return std::abs(off.x()) <= 1 && std::abs(off.y()) <= 1;
    });
}

} // namespace penwick::desktop
