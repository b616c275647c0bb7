// SPDX-License-Identifier: MIT
#include "Tour.h"

#include <penwick/platform/NotificationCenter.h>

#include <QCoreApplication>
#include <QGuiApplication>
#include <QImage>

#include <chrono>
#include <cstdio>
#include <cstdlib>

using namespace std::chrono_literals;
using penwick::WindowType;
using penwick::platform::Notification;
using penwick::platform::NotificationCenter;

namespace {

const char *nameOf(WindowType kind)
{
    switch (kind) {
    case WindowType::whiteboard:
        return "whiteboard";
    case WindowType::annotation:
        return "annotation";
    case WindowType::imageAnnotation:
        return "imageAnnotation";
    }
    return "unknown";
}

void say(WindowType kind, const char *what)
{
    std::printf("%s: %s\n", nameOf(kind), what);
    std::fflush(stdout);
}

// Stands for a captured frame.
QImage somePicture()
{
    QImage picture(640, 360, QImage::Format_RGB32);
    picture.fill(Qt::darkCyan);
    return picture;
}

} // namespace

Tour::Tour()
{
    m_closing.setSingleShot(true);
    m_closing.setInterval(500ms);
    QObject::connect(&m_closing, &QTimer::timeout, &m_closing, [this] { close(); });
    m_bound.setSingleShot(true);
    m_bound.setInterval(10s);
    QObject::connect(
        &m_bound, &QTimer::timeout, &m_bound, [this] { fail("the session did not end"); });
    NotificationCenter::defaultCenter().addObserver(this,
        penwick::penwickSessionEndNotificationKey(),
        [this](const Notification &notification) { onSessionEnded(notification.object.toBool()); });
}

Tour::~Tour()
{
    NotificationCenter::defaultCenter().removeObserver(this);
}

void Tour::openNext()
{
    const std::optional<WindowType> kind = penwick::windowTypeFromRawValue(m_rawKind);
    if (!kind) {
        QCoreApplication::exit(EXIT_SUCCESS);
        return;
    }
    std::optional<QImage> image;
    std::optional<QString> title;
    if (*kind == WindowType::imageAnnotation) {
        image = somePicture();
        title = QStringLiteral("A captured frame");
    }

    m_penwick.emplace();
    const auto controller = m_penwick->createDrawingWindowController(
        *kind, QGuiApplication::primaryScreen(), image, title);
    if (!controller) {
        fail("no window could be made");
        return;
    }
    controller->showWindow(nullptr);
    m_penwick->showWindowSharingNotification();
    say(*kind, "opened");
    m_closing.start();
    m_bound.start();
}

void Tour::close()
{
    // Nothing but m_penwick holds the window while it closes: it goes in onSessionEnded().
    penwick::platform::Window *const window = m_penwick->penwickWindowController()->drawingWindow();
    window->close();
}

void Tour::onSessionEnded(bool wasOverImage)
{
    m_closing.stop(); // the user may have been faster
    m_bound.stop();
    const std::optional<WindowType> kind = penwick::windowTypeFromRawValue(m_rawKind);
    if (!m_penwick || !kind) {
        fail("a session ended that was not open");
        return;
    }
    m_penwick.reset();
    if (wasOverImage != (kind == WindowType::imageAnnotation)) {
        fail("the end was of another kind of window");
        return;
    }
    say(*kind, "ended");
    ++m_rawKind;
    QTimer::singleShot(0, &m_closing, [this] { openNext(); }); // the window is still closing
}

void Tour::fail(const char *what)
{
    std::fprintf(stderr, "penwick-embed: %s\n", what);
    QCoreApplication::exit(EXIT_FAILURE);
}
