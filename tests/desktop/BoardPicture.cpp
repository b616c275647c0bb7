// SPDX-License-Identifier: MIT
// Draws a small picture on a white board, on a virtual display, with a real pointer.
//   penwick-board-picture FILE               leaves a picture of the whole display in FILE
//   penwick-board-picture --display-answers  says by its status whether $DISPLAY can be used
#include "desktop/support/Desktop.h"
#include "desktop/support/HostProcess.h"
#include "desktop/support/WaitUntil.h"
#include "desktop/support/XConnection.h"

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <numbers>
#include <string_view>

using namespace penwick::desktop;

namespace {

using Stroke = std::vector<QPoint>;

Stroke arc(QPointF centre, double radius, double fromTurn, double toTurn)
{
    constexpr int steps = 48;
    Stroke stroke;
    for (int step = 0; step <= steps; ++step) {
        const double angle = 2 * std::numbers::pi * (fromTurn + (toTurn - fromTurn) * step / steps);
        stroke.push_back((centre + radius * QPointF(std::cos(angle), std::sin(angle))).toPoint());
    }
    return stroke;
}

Stroke wave(QPointF start, double length, double height, int waves)
{
    const int steps = waves * 24;
    Stroke stroke;
    for (int step = 0; step <= steps; ++step) {
        const double part = double(step) / steps;
        stroke.push_back((
            start + QPointF(length * part, -height * std::sin(2 * std::numbers::pi * waves * part)))
                             .toPoint());
    }
    return stroke;
}

// Places are pixels from the top left corner of the board, which is about 850 by 460.
std::vector<Stroke> drawing()
{
    std::vector<Stroke> strokes {
        { { 180, 340 }, { 180, 200 }, { 280, 110 }, { 380, 200 }, { 380, 340 }, { 180, 340 } },
        { { 160, 218 }, { 280, 110 }, { 400, 218 } },
        { { 250, 340 }, { 250, 260 }, { 310, 260 }, { 310, 340 } },
        { { 600, 340 }, { 600, 230 } },
        arc({ 600, 185 }, 48, 0.25, 1.27),
        arc({ 740, 90 }, 34, 0, 1),
    };
    for (int ray = 0; ray < 8; ++ray) {
        const double angle = std::numbers::pi * ray / 4;
        const QPointF direction(std::cos(angle), std::sin(angle));
        strokes.push_back({ (QPointF(740, 90) + 46 * direction).toPoint(),
            (QPointF(740, 90) + 66 * direction).toPoint() });
    }
    strokes.push_back(wave({ 80, 400 }, 700, 14, 7));
    return strokes;
}

void draw(Desktop &desktop, QPoint corner)
{
    for (Stroke stroke : drawing()) {
        for (QPoint &place : stroke)
            place += corner;
        desktop.pointer().drag(stroke);
        const QPoint end = stroke.back();
        require([&] { return desktop.screen().pixel(end).green() < 200; }, "a stroke to appear");
    }
}

int makePicture(const QString &fileName)
{
    Desktop desktop(WindowManager::Openbox, { 1280, 800 });
    HostProcess host(desktop);
    host.waitForWindow(QStringLiteral("drawing"));
    const std::vector<WindowId> windows = desktop.windows().ofProcess(host.processId());
    if (windows.empty())
        throw std::runtime_error("the window manager knows no board");

    draw(desktop, desktop.windows().clientArea(windows.front()).topLeft());

    if (!desktop.screen().picture().save(fileName))
        throw std::runtime_error("cannot write " + fileName.toStdString());
    desktop.windows().close(windows.front());
    return host.waitForExit();
}

bool displayAnswers()
{
    const char *const name = std::getenv("DISPLAY");
    if (!name || !*name)
        return false;
    const XConnection connection(name);
    return true;
}

} // namespace

int main(int argumentCount, char **arguments)
{
    if (argumentCount != 2) {
        std::fputs("Usage: penwick-board-picture FILE | --display-answers\n", stderr);
        return 2;
    }
    const bool onlyAsks = std::string_view(arguments[1]) == "--display-answers";
    try {
        if (onlyAsks)
            return displayAnswers() ? EXIT_SUCCESS : EXIT_FAILURE;
        return makePicture(QString::fromLocal8Bit(arguments[1]));
    } catch (const std::exception &error) {
        if (!onlyAsks)
            std::fprintf(stderr, "penwick-board-picture: %s\n", error.what());
        return EXIT_FAILURE;
    }
}
