// SPDX-License-Identifier: MIT
// Takes the pictures of the kinds of drawing windows for docs/pictures, with a real pointer on a
// virtual display with a compositing manager.
//   penwick-window-pictures FOLDER
#include "desktop/support/Desktop.h"
#include "desktop/support/HostProcess.h"
#include "desktop/support/OtherProgram.h"

#include <QImage>
#include <QPainter>
#include <QPainterPath>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <exception>
#include <numbers>
#include <thread>

using namespace penwick::desktop;

namespace {

using Stroke = std::vector<QPoint>;

constexpr QSize displaySize { 1280, 800 };

Stroke ellipse(QPointF centre, double width, double height)
{
    constexpr int steps = 60;
    constexpr double start = 0.6; // of a turn: where a hand begins
    Stroke stroke;
    for (int step = 0; step <= steps; ++step) {
        const double angle = 2 * std::numbers::pi * (start + double(step) / steps);
        stroke.push_back(
            (centre + QPointF(width / 2 * std::cos(angle), height / 2 * std::sin(angle)))
                .toPoint());
    }
    return stroke;
}

std::vector<Stroke> arrow(QPoint tail, QPoint tip)
{
    constexpr double headLength = 30;
    constexpr double headAngle = 0.5; // radians to either side
    const QPointF back = tail - tip;
    const double angle = std::atan2(back.y(), back.x());
    const auto barb = [&](double side) {
        const QPointF way(std::cos(angle + side), std::sin(angle + side));
        return tip + (headLength * way).toPoint();
    };
    return { { tail, tip }, { barb(-headAngle), tip, barb(headAngle) } };
}

// Stands for a captured frame.
QImage landscape(QSize size)
{
    QImage image(size, QImage::Format_RGB32);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    QLinearGradient sky(0, 0, 0, size.height() * 0.7);
    sky.setColorAt(0, QColor(110, 165, 215));
    sky.setColorAt(1, QColor(235, 238, 225));
    painter.fillRect(image.rect(), sky);
    painter.setPen(Qt::NoPen);
    const auto hill = [&](double base, double height, double waves, const QColor &color) {
        QPainterPath path(QPointF(0, size.height()));
        for (int x = 0; x <= size.width(); x += 4) {
            const double turn = waves * 2 * std::numbers::pi * x / size.width();
            path.lineTo(
                x, size.height() * base - height * (std::sin(turn) + 0.4 * std::sin(2.3 * turn)));
        }
        path.lineTo(size.width(), size.height());
        painter.fillPath(path, color);
    };
    hill(0.60, 38, 1.4, QColor(125, 155, 150));
    hill(0.74, 30, 1.9, QColor(95, 140, 105));
    hill(0.90, 20, 1.2, QColor(70, 115, 75));
    painter.setBrush(QColor(250, 235, 190));
    painter.drawEllipse(QPointF(size.width() * 0.72, size.height() * 0.24), 34, 34);
    return image;
}

/// One window of one kind on a display of its own.
class Photographer
{
public:
    explicit Photographer(QString folder)
        : m_folder(std::move(folder))
    {
        m_desktop.startCompositor();
    }

    Desktop &desktop() { return m_desktop; }

    void open(const std::vector<std::string> &arguments)
    {
        m_host = std::make_unique<HostProcess>(m_desktop, arguments, HostProgram::Steered);
        m_frame = m_host->waitForWindow(QStringLiteral("drawing")).frame;
        m_host->waitForWindow(QStringLiteral("toolPanel"));
    }

    void steer(const char *order) { m_host->steer(QLatin1String(order)); }
    [[nodiscard]] HostProcess &host() { return *m_host; }
    [[nodiscard]] QRect frame() const { return m_frame; }

    void draw(const std::vector<Stroke> &strokes)
    {
        for (const Stroke &stroke : strokes)
            m_desktop.pointer().drag(stroke);
        m_desktop.pointer().moveTo({ displaySize.width() - 2, displaySize.height() - 2 });
    }

    void take(const char *name, const QRect &area)
    {
        QImage last;
        // Until two pictures in a row are the same.
        require(
            [&] {
                std::this_thread::sleep_for(std::chrono::milliseconds(150));
                const QImage picture = m_desktop.screen().picture(area);
                return picture == std::exchange(last, picture);
            },
            "the picture to come to rest");
        const QString file = QStringLiteral("%1/window-%2.png").arg(m_folder, QLatin1String(name));
        if (!last.save(file))
            throw std::runtime_error("cannot write " + file.toStdString());
    }

private:
    const QString m_folder;
    Desktop m_desktop;
    std::unique_ptr<HostProcess> m_host;
    QRect m_frame;
};

void takeOverlay(const QString &folder)
{
    Photographer photographer(folder);
    OtherProgram desk(photographer.desktop(), QRect(QPoint(), displaySize), { 58, 84, 110 });
    OtherProgram slide(photographer.desktop(), { 160, 120, 640, 420 }, { 250, 246, 236 });
    OtherProgram chart(photographer.desktop(), { 720, 330, 400, 300 }, { 196, 222, 205 });
    photographer.open({ "--window", "annotation", "--option", "color#red", "--option", "brush#8" });
    std::vector<Stroke> strokes { ellipse({ 920, 480 }, 300, 190) };
    for (const Stroke &stroke : arrow({ 420, 300 }, { 745, 420 }))
        strokes.push_back(stroke);
    strokes.push_back({ { 250, 240 }, { 520, 236 } });
    photographer.draw(strokes);
    photographer.take("annotation", QRect(QPoint(), displaySize));
}

void takeImage(const QString &folder)
{
    Photographer photographer(folder);
    const std::string file = photographer.desktop().file("picture.png");
    if (!landscape({ 760, 480 }).save(QString::fromStdString(file)))
        throw std::runtime_error("cannot write " + file);
    photographer.open({ "--window", "imageAnnotation", "--image", file, "--title",
        "The view from the tower", "--option", "color#dark_blue" });
    const QPoint corner = photographer.frame().topLeft();
    std::vector<Stroke> strokes { ellipse(corner + QPoint(548, 130), 130, 120) };
    for (const Stroke &stroke : arrow(corner + QPoint(300, 90), corner + QPoint(470, 128)))
        strokes.push_back(stroke);
    photographer.draw(strokes);
    photographer.take("imageAnnotation", photographer.frame().adjusted(-16, -16, 16, 16));
}

void takeBoardWithBanner(const QString &folder)
{
    Photographer photographer(folder);
    photographer.open({});
    const QPoint corner = photographer.frame().topLeft();
    photographer.draw({ ellipse(corner + QPoint(240, 160), 160, 110),
        { corner + QPoint(330, 165), corner + QPoint(560, 165) },
        ellipse(corner + QPoint(650, 170), 170, 110) });
    photographer.steer("announce");
    photographer.host().waitForWindow(QStringLiteral("banner"));
    photographer.take("whiteboard", photographer.frame().adjusted(-16, -16, 16, 16));
}

} // namespace

int main(int argumentCount, char **arguments)
{
    if (argumentCount != 2) {
        std::fputs("Usage: penwick-window-pictures FOLDER\n", stderr);
        return 2;
    }
    const QString folder = QString::fromLocal8Bit(arguments[1]);
    try {
        takeOverlay(folder);
        takeImage(folder);
        takeBoardWithBanner(folder);
    } catch (const std::exception &error) {
        std::fprintf(stderr, "penwick-window-pictures: %s\n", error.what());
        return EXIT_FAILURE;
    }
    return EXIT_SUCCESS;
}
