// SPDX-License-Identifier: MIT
// Takes the pictures of the tool bar for docs/pictures, with a real pointer on a virtual display.
//   penwick-toolbar-pictures FOLDER PORTAL   PORTAL is the settings portal of the tests
#include "desktop/support/Desktop.h"
#include "desktop/support/HostProcess.h"

#include <QImage>

#include <chrono>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <thread>

using namespace penwick::desktop;

namespace {

/// One board at one scale with one contrast.
class Photographer
{
public:
    Photographer(QString folder, std::string portal, int scale)
        : m_folder(std::move(folder))
        , m_portalProgram(std::move(portal))
        , m_scale(scale)
        , m_desktop(WindowManager::Openbox, QSize(1280, 800) * scale)
    { }

    void open(const std::string &contrast)
    {
        m_portal = std::make_unique<ChildProcess>(
            ChildProcess::Command { { m_portalProgram, m_desktop.sessionBus(),
                                        "org.freedesktop.portal.Desktop", "uint:" + contrast },
                m_desktop.environment(), m_desktop.file("portal.log") });
        require([this] { return m_portal->takeLine() == "ready"; }, "the settings portal");
        m_host = std::make_unique<HostProcess>(m_desktop, std::vector<std::string> {},
            HostProgram::AsShipped,
            std::vector<std::string> { "DBUS_SESSION_BUS_ADDRESS=" + m_desktop.sessionBus(),
                "QT_SCALE_FACTOR=" + std::to_string(m_scale) });
        m_bar = m_host->waitForWindow(QStringLiteral("toolPanel"));
        // The server is asked where the window is; the log may be late.
        const Windows &windows = m_desktop.windows();
        for (const WindowId window : windows.ofProcess(m_host->processId())) {
            const QRect frame = windows.outerFrame(window);
            if (frame.size() != m_bar.frame.size())
                continue;
            for (QPoint &button : m_bar.buttons)
                button += frame.topLeft() - m_bar.frame.topLeft();
            m_bar.frame = frame;
        }
    }

    void moveTo(const char *tool)
    {
        m_desktop.pointer().moveTo(m_bar.buttons.value(QLatin1String(tool)));
    }
    void leave() { m_desktop.pointer().moveTo(m_bar.frame.topRight() + QPoint(400, 20) * m_scale); }
    void press(const char *tool)
    {
        moveTo(tool);
        m_desktop.pointer().press();
        m_desktop.pointer().release();
        leave();
    }
    void awaitPopover() { m_popover = m_host->waitForWindow(QStringLiteral("popover")).frame; }

    /// Writes the bar, and the popover that was awaited, with a little of the board around them.
    void take(const char *name)
    {
        const int edge = 8 * m_scale;
        const QRect area = (m_bar.frame | m_popover).adjusted(-edge, -edge, edge, edge);
        QImage last;
        // Until two pictures in a row are the same.
        require(
            [&] {
                std::this_thread::sleep_for(std::chrono::milliseconds(150));
                const QImage picture = m_desktop.screen().picture(area);
                return picture == std::exchange(last, picture);
            },
            "the picture to come to rest");
        const QString file
            = QStringLiteral("%1/toolbar-%2%3.png")
                  .arg(m_folder, QLatin1String(name),
                      m_scale == 1 ? QString() : QStringLiteral("@%1x").arg(m_scale));
        if (!last.save(file))
            throw std::runtime_error("cannot write " + file.toStdString());
    }

private:
    const QString m_folder;
    const std::string m_portalProgram;
    const int m_scale;
    Desktop m_desktop;
    std::unique_ptr<ChildProcess> m_portal;
    std::unique_ptr<HostProcess> m_host;
    WindowState m_bar;
    QRect m_popover;
};

void takePictures(const QString &folder, const std::string &portal, int scale)
{
    {
        Photographer normal(folder, portal, scale);
        normal.open("0");
        normal.leave();
        normal.take("normal");
        normal.moveTo("eraser");
        normal.take("hovered");
    }
    {
        Photographer increased(folder, portal, scale);
        increased.open("1");
        increased.moveTo("eraser");
        increased.take("contrast");
    }
    struct Popover
    {
        const char *name;
        std::vector<const char *> presses;
    };
    const std::vector<Popover> popovers { { "colours", { "color" } },
        { "thicknesses", { "brush" } }, { "sizes", { "text", "text" } } };
    for (const Popover &popover : popovers) {
        Photographer photographer(folder, portal, scale);
        photographer.open("0");
        for (const char *const tool : popover.presses)
            photographer.press(tool);
        photographer.awaitPopover();
        photographer.take(popover.name);
    }
}

} // namespace

int main(int argumentCount, char **arguments)
{
    if (argumentCount != 3) {
        std::fputs("Usage: penwick-toolbar-pictures FOLDER PORTAL\n", stderr);
        return 2;
    }
    try {
        for (const int scale : { 1, 2 })
            takePictures(QString::fromLocal8Bit(arguments[1]), arguments[2], scale);
    } catch (const std::exception &error) {
        std::fprintf(stderr, "penwick-toolbar-pictures: %s\n", error.what());
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
