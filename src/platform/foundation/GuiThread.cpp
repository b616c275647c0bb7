// SPDX-License-Identifier: MIT
#include "platform/foundation/GuiThread.h"

#include "platform/foundation/FatalError.h"

#include <QCoreApplication>
#include <QThread>

namespace penwick::platform {

namespace {

constexpr auto noApplication = "there is no QApplication";
constexpr auto applicationWithoutWidgets
    = "there is no QApplication: another kind of application object has no widgets";
constexpr auto anotherThread = "called from another thread than the application's";

bool isThreadOf(const QCoreApplication &application)
{
    return application.thread() == QThread::currentThread();
}

} // namespace

void requireGuiThread()
{
    const QCoreApplication *const application = QCoreApplication::instance();
    if (!application && QCoreApplication::closingDown())
        return; // a host may still hold objects of ours, and lets go of them now
    if (!application)
        fatalError(noApplication);
    if (!isThreadOf(*application))
        fatalError(anotherThread);
}

void requireApplication()
{
    requireGuiThread();
    // The class is asked for by its name, because this folder does not link Widgets.
    if (!QCoreApplication::instance()->inherits("QApplication"))
        fatalError(applicationWithoutWidgets);
}

void requireGuiThreadAtEnd()
{
    const QCoreApplication *const application = QCoreApplication::instance();
    if (application && !isThreadOf(*application))
        fatalError(anotherThread);
}

} // namespace penwick::platform
