// SPDX-License-Identifier: MIT
#include "desktop/support/BoardFixture.h"

#include <QPainter>

#include <algorithm>
#include <cstdlib>
#include <stdexcept>

namespace penwick::desktop {

namespace {

constexpr int borderWidth = 3;

// The log goes by whole points, which are two pixels on a fine screen.
bool areNear(const QRect &one, const QRect &other)
{
    const QMargins point(2, 2, 2, 2);
    return one.marginsAdded(point).contains(other) && other.marginsAdded(point).contains(one);
}

} // namespace

void BoardTest::start(const std::vector<std::string> &arguments, HostProgram program,
    const std::vector<std::string> &variables)
{
    m_host = std::make_unique<HostProcess>(m_desktop, arguments, program, variables);
    m_host->waitForWindow(QStringLiteral("drawing"));
    if (m_desktop.manager().composes)
        awaitPainted();
}

void BoardTest::awaitPainted()
{
    constexpr std::chrono::milliseconds longEnough { 2000 };
    constexpr int strength = 30; // of the border's green, per cent
    constexpr int near = 10; // of 255 levels
    constexpr int visible = 20; // likewise
    constexpr int inside = 8; // pixels, beyond the border also of a fine screen
    const QRect content = canvas();
    if (content == m_desktop.windows().outerFrame(window()))
        return; // a layer, which has no border
    const QRect corner(content.left(), content.bottom() - inside, inside, inside);
    if (!QRect(QPoint(), m_desktop.screen().size()).contains(corner))
        return;
    // A picture that is not of one colour there does not tell; then the bound is time enough.
    static_cast<void>(waitUntil(
        [&] {
            const QImage seen = m_desktop.screen().picture(corner);
            const QColor border = seen.pixelColor(1, 0);
            const QColor within = seen.pixelColor(inside - 1, 0);
            const int red = within.red() * (100 - strength) / 100;
            const int green = (within.green() * (100 - strength) + 255 * strength) / 100;
            return std::abs(border.red() - red) < near && std::abs(border.green() - green) < near
                && (within.red() - red > visible || green - within.green() > visible);
        },
        longEnough));
}

void BoardTest::open(HostProgram program, const std::vector<std::string> &arguments,
    const std::vector<std::string> &variables)
{
    start(arguments, program, variables);
    waitForLevel(canvas().center() - canvas().topLeft(), 255);
    static_cast<void>(toolBar());
}

WindowId BoardTest::window()
{
    const Windows &windows = m_desktop.windows();
    WindowId found = 0;
    require(
        [&] {
            const QRect frame = m_host->waitForWindow(QStringLiteral("drawing")).frame;
            for (const WindowId window : windows.ofProcess(m_host->processId())) {
                if (areNear(windows.outerFrame(window), frame))
                    found = window;
            }
            return found != 0;
        },
        "a window to stand where the log says the board is");
    return found;
}

QRect BoardTest::canvas()
{
    return m_desktop.windows().clientArea(window());
}

WindowState BoardTest::toolBar()
{
    WindowState bar = m_host->waitForWindow(QStringLiteral("toolPanel"));
    const QRect frame = m_desktop.windows().outerFrame(toolBarWindow());
    for (QPoint &button : bar.buttons)
        button += frame.topLeft() - bar.frame.topLeft();
    bar.frame = frame;
    return bar;
}

WindowId BoardTest::toolBarWindow()
{
    const Windows &windows = m_desktop.windows();
    const QSize size = m_host->waitForWindow(QStringLiteral("toolPanel")).frame.size();
    WindowId found = 0;
    require(
        [&] {
            for (const WindowId window : windows.ofProcess(m_host->processId())) {
                if (windows.outerFrame(window).size() == size && windows.isShown(window))
                    found = window;
            }
            return found != 0;
        },
        "a window of the tool bar's size");
    return found;
}

QPoint BoardTest::gripOf(const QRect &frame, QPoint side) const
{
    const QRect grips = frame.marginsAdded(m_desktop.manager().grips);
    QPoint place = frame.center() + QPoint(60, 0); // clear of what stands in the middle
    if (side.x())
        place.setX(side.x() < 0 ? grips.left() : grips.right() - (side.y() ? 1 : 0));
    if (side.y())
        place.setY(side.y() < 0 ? grips.top() : grips.bottom() - 1);
    return place;
}

void BoardTest::pull(QPoint grip, QPoint way)
{
    m_desktop.pointer().takeHold(grip);
    m_desktop.pointer().glideTo(grip + way);
    m_desktop.pointer().letGo();
}

void BoardTest::drag(const std::vector<QPoint> &places, MouseButton button)
{
    std::vector<QPoint> screenPlaces;
    const QPoint corner = canvas().topLeft();
    for (const QPoint place : places)
        screenPlaces.push_back(corner + place);
    m_desktop.pointer().drag(screenPlaces, button);
}

void BoardTest::click(QPoint place, MouseButton button)
{
    m_desktop.pointer().click(onScreen(place), button);
}

QImage BoardTest::picture()
{
    const QRect area = canvas().adjusted(borderWidth, borderWidth, -borderWidth, -borderWidth);
    QImage picture = m_desktop.screen().picture(area);
    QPainter(&picture).fillRect(toolBar().frame.translated(-area.topLeft()), Qt::white);
    return picture;
}

int BoardTest::level(QPoint place)
{
    return m_desktop.screen().pixel(onScreen(place)).green();
}

void BoardTest::waitForLevel(QPoint place, int wanted)
{
    const QPoint screenPlace = onScreen(place);
    int seen = -1;
    const bool came = waitUntil([&] {
        const QColor colour = m_desktop.screen().pixel(screenPlace);
        seen = colour.green();
        return colour.red() == seen && colour.blue() == seen && std::abs(seen - wanted) <= 1;
    });
    if (!came) {
        throw std::runtime_error("the board shows level " + std::to_string(seen) + " instead of "
            + std::to_string(wanted) + " at " + std::to_string(place.x()) + ", "
            + std::to_string(place.y()) + "; errors: " + m_host->errorOutput().toStdString());
    }
}

void BoardTest::settle()
{
    constexpr int distance = 12;
    const QPoint start = settlingArea.topLeft() + QPoint(10, 10 + distance * m_settlingStrokes++);
    const QPoint end = start + QPoint(40, 0);
    drag({ start, end });
    waitForLevel(end, inkOnWhite);
}

QRect BoardTest::difference(const QImage &one, const QImage &other)
{
    QRect area;
    for (int y = 0; y < one.height(); ++y) {
        for (int x = 0; x < one.width(); ++x) {
            if (one.pixel(x, y) != other.pixel(x, y))
                area |= QRect(x, y, 1, 1);
        }
    }
    return area;
}

int BoardTest::darkest(const QImage &image)
{
    int level = 255;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            level = std::min(level, qGray(image.pixel(x, y)));
    }
    return level;
}

std::string managerName(const testing::TestParamInfo<WindowManager> &manager)
{
    return traitsOf(manager.param).name;
}

} // namespace penwick::desktop
