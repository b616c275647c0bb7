// SPDX-License-Identifier: MIT
// A hand that scribbles, the same way in every run.
#pragma once

#include <penwick/platform/Geometry.h>

#include <random>
#include <vector>

namespace penwick {

class DrawingCanvasModel;

namespace bench {

constexpr int segmentsOfAStroke = 40;

// The canvas on which everything is measured, in points.
constexpr int canvasWidth = 1280;
constexpr int canvasHeight = 720;

/// Wanders over the canvas at random. With steps as long as those of writing it keeps out of a
/// number of small places, so that even the fullest canvas has some where nothing lies.
class Pen
{
public:
    /// The longest step, in points along each axis, of a pointer that writes.
    static constexpr double writing = 4.0;

    explicit Pen(unsigned seed, double longestStep = writing);

    /// Puts the pen down somewhere.
    platform::Point putDown();
    /// Leads it on by a step.
    platform::Point next();

private:
    double anyUpTo(double most);

    std::mt19937 m_random;
    double m_longestStep;
    platform::Point m_point;
};

/// Places on which a pen that writes with strokes of ordinary thickness leaves nothing.
[[nodiscard]] std::vector<platform::Point> freePlaces();

/// Where a pointer goes with its event `number` that moves around `freePlace`, seven points from
/// one event to the next, and comes upon nothing.
[[nodiscard]] platform::Point around(platform::Point freePlace, int number);

/// Draws strokes of so many segments into `model`.
void scribble(DrawingCanvasModel &model, Pen &pen, int strokes, int segments = segmentsOfAStroke);

} // namespace bench
} // namespace penwick
