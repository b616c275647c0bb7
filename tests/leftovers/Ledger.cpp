// SPDX-License-Identifier: MIT
#include "leftovers/Ledger.h"

#include <QAbstractEventDispatcher>
#include <QApplication>

#include <cstdlib>
#include <cstring>
#include <malloc.h>
#include <unistd.h>

#include <X11/Xlib.h>

namespace penwick::test {

namespace {

// No block is smaller than 32 bytes, its own bookkeeping included.
constexpr double bytesOfNoBlock = 24.0;

// The toolkit sets the title of a window through Xlib, which remembers each such request until Xlib
// is asked for an answer. The toolkit never asks, so the memory would grow; it is asked here.
void settleDisplay()
{
    if (QGuiApplication::platformName() != QStringLiteral("xcb"))
        return;
    if (auto *const x11 = qGuiApp->nativeInterface<QNativeInterface::QX11Application>())
        XSync(x11->display(), False);
}

/// Whether `widget` is the toolkit's stand-in for the whole screen, which the toolkit makes when a
/// pointer first enters a window.
bool isToolkitsOwn(const QWidget *widget)
{
    // The flag is deprecated, but the toolkit itself still sets it.
    QT_WARNING_PUSH
    QT_WARNING_DISABLE_DEPRECATED
    return widget->windowType() == Qt::Desktop;
    QT_WARNING_POP
}

} // namespace

QWidgetList Ledger::widgetsThatAre()
{
    QWidgetList widgets = QApplication::allWidgets();
    widgets.removeIf(isToolkitsOwn);
    return widgets;
}

Ledger Ledger::taken()
{
    settleDisplay();
    Ledger ledger;
    ledger.windows = QGuiApplication::allWindows().size();
    ledger.widgets = widgetsThatAre().size();
    // The toolkit's one-shots belong to the dispatcher until they have fired.
    ledger.timers = QAbstractEventDispatcher::instance()
                        ->findChildren<QObject *>(QString(), Qt::FindDirectChildrenOnly)
                        .size();
    ledger.memory = mallinfo2().uordblks;
    return ledger;
}

QString leftBehind(const Ledger &before, const Ledger &after, int sessions)
{
    QString text;
    const auto compare = [&text](const char *what, qsizetype was, qsizetype is) {
        if (is > was)
            text += QStringLiteral("%1 %2 left behind\n").arg(is - was).arg(QLatin1String(what));
    };
    compare("windows", before.windows, after.windows);
    compare("widgets", before.widgets, after.widgets);
    compare("timers", before.timers, after.timers);
    const double growth = double(after.memory) - double(before.memory);
    if (growth > bytesOfNoBlock * sessions) {
        text
            += QStringLiteral("%1 bytes a session left behind\n").arg(growth / sessions, 0, 'f', 1);
    }
    return text;
}

void countMemoryExactly(char **arguments)
{
    // Blocks that a thread keeps for itself count as used, and those of other threads not at all.
    const char *const name = "GLIBC_TUNABLES";
    const char *const exact = "glibc.malloc.tcache_count=0:glibc.malloc.arena_max=1";
    const char *const present = std::getenv(name);
    if (present && std::strcmp(present, exact) == 0)
        return;
    setenv(name, exact, 1);
    execv("/proc/self/exe", arguments); // goes on as it is where there is no such file
}

} // namespace penwick::test
