// SPDX-License-Identifier: MIT
#include "Accuracy.h"

#include "SampledShape.h"
#include "Stopwatch.h"

#include "strokes/CoverageMask.h"
#include "strokes/PixelLayer.h"
#include "strokes/StrokePainter.h"

#include <QColor>
#include <QImage>
#include <QPainter>

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <random>

namespace penwick::bench {

namespace {

using platform::Point;
using Chain = std::vector<Point>;

constexpr QSize canvas(500, 400); // points
constexpr double margin = 60.0; // nothing begins or ends nearer to the border
constexpr int segmentsOfAScribble = 400;
constexpr double step = 6.0; // points
constexpr int singleSegments = 12;

double anyFrom(std::mt19937 &random, double least, double most)
{
    return std::uniform_real_distribution<double>(least, most)(random);
}

Chain scribbleChain()
{
    std::mt19937 random(5);
    Chain chain { { canvas.width() / 2.0, canvas.height() / 2.0 } };
    double heading = 0.0;
    while (chain.size() <= segmentsOfAScribble) {
        heading += anyFrom(random, -0.6, 0.6);
        const double x = chain.back().x + step * std::cos(heading);
        const double y = chain.back().y + step * std::sin(heading);
        const Point inside { std::clamp(x, margin, canvas.width() - margin),
            std::clamp(y, margin, canvas.height() - margin) };
        if (!(inside == Point { x, y }))
            heading += 3.0; // about turn
        chain.push_back(inside);
    }
    return chain;
}

std::vector<Chain> singleChains()
{
    std::mt19937 random(6);
    const auto anywhere = [&random] {
        const double x = anyFrom(random, margin, canvas.width() - margin);
        return Point { x, anyFrom(random, margin, canvas.height() - margin) };
    };
    std::vector<Chain> chains;
    for (int segment = 0; segment < singleSegments; ++segment) {
        const Point from = anywhere();
        chains.push_back({ from, anywhere() });
    }
    return chains;
}

StrokeEntry strokeOf(const Chain &chain, double width)
{
    auto path = std::make_shared<platform::BezierPath>();
    path->setLineWidth(width);
    for (std::size_t index = 1; index < chain.size(); ++index) {
        path->moveToPoint(chain[index - 1]);
        path->lineToPoint(chain[index]);
    }
    return { path, {}, path->hash() };
}

/// A picture with rows counted downwards, and what one segment of it took.
struct Painted
{
    QImage image;
    Samples times;
};

void paintOurs(Painted &painted, const StrokeEntry &stroke, double scale, int segments)
{
    PixelLayer layer(painted.image.size());
    CoverageMask scratch;
    const Stopwatch watch;
    paintStroke(layer, stroke, Qt::black, scale, layer.area(), scratch);
    painted.times.add(watch.elapsed(), segments);
    painted.image = layer.image();
}

void paintToolkits(Painted &painted, const StrokeEntry &stroke, double scale, int segments)
{
    painted.image.fill(Qt::transparent);
    const QPainterPath path = stroke.bPath->CGPath();
    const Stopwatch watch;
    QPainter painter(&painted.image);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(0.0, painted.image.height());
    painter.scale(scale, -scale);
    painter.setPen(QPen(
        QBrush(Qt::black), stroke.bPath->lineWidth(), Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPath(path);
    painter.end();
    painted.times.add(watch.elapsed(), segments);
}

/// Errors over the pixels that an edge crosses, in the shape or in the picture.
class Errors
{
public:
    void add(const QImage &image, const SampledShape &shape)
    {
        for (int y = 0; y < image.height(); ++y) {
            const auto *const line
                = reinterpret_cast<const QRgb *>(image.constScanLine(image.height() - 1 - y));
            for (int x = 0; x < image.width(); ++x)
                add(qAlpha(line[x]) / 255.0, shape.coverage(x, y));
        }
    }

    [[nodiscard]] double largest() const { return m_largest; }
    [[nodiscard]] double mean() const { return m_sum / std::max(m_count, 1.0); }

private:
    void add(double painted, double wanted)
    {
        const auto isEdge = [](double coverage) { return coverage > 0.0 && coverage < 1.0; };
        if (!isEdge(painted) && !isEdge(wanted))
            return;
        const double error = std::abs(painted - wanted);
        m_largest = std::max(m_largest, error);
        m_sum += error;
        m_count += 1.0;
    }

    double m_largest = 0.0;
    double m_sum = 0.0;
    double m_count = 0.0;
};

void printRow(const char *kind, const std::vector<Chain> &chains, double width, double scale)
{
    constexpr int repetitions = 7;
    const QSize size = (QSizeF(canvas) * scale).toSize();
    const QImage blank(size, QImage::Format_ARGB32_Premultiplied);
    Painted ours { blank, {} };
    Painted toolkits { blank, {} };
    Errors oursErrors;
    Errors toolkitsErrors;
    for (const Chain &chain : chains) {
        const StrokeEntry stroke = strokeOf(chain, width);
        const int segments = static_cast<int>(chain.size()) - 1;
        for (int repetition = 0; repetition < repetitions; ++repetition) {
            paintOurs(ours, stroke, scale, segments);
            paintToolkits(toolkits, stroke, scale, segments);
        }
        Chain pixels = chain;
        for (Point &point : pixels)
            point = { point.x * scale, point.y * scale };
        const SampledShape shape(size, pixels, width / 2 * scale);
        oursErrors.add(ours.image, shape);
        toolkitsErrors.add(toolkits.image, shape);
    }
    std::printf("| %s | %g | %g | %.2f | %.4f | %.1f us | %.2f | %.4f | %.1f us |\n", kind, width,
        scale, oursErrors.largest(), oursErrors.mean(), ours.times.cpu(), toolkitsErrors.largest(),
        toolkitsErrors.mean(), toolkits.times.cpu());
    std::fflush(stdout);
}

} // namespace

void printAccuracy()
{
    const std::vector<Chain> scribbles { scribbleChain() };
    const std::vector<Chain> singles = singleChains();
    std::printf("| drawn | width | scale | largest error | mean error | a segment "
                "| toolkit: largest error | mean error | a segment |\n"
                "|---|--:|--:|--:|--:|--:|--:|--:|--:|\n");
    for (const auto &[kind, chains] :
        { std::pair("scribble", &scribbles), std::pair("single lines", &singles) }) {
        for (const double width : { 1.0, 2.0, 5.0, 12.0, 20.0, 40.0 }) {
            for (const double scale : { 1.0, 1.5, 2.0 })
                printRow(kind, *chains, width, scale);
        }
    }
}

} // namespace penwick::bench
