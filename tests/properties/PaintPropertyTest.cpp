// SPDX-License-Identifier: MIT
// Random drawings: after every step the window shows, pixel for pixel, what painting every stroke
// anew would.
//     penwick-test-properties-paint [--seed=S] [--steps=N]
// does N steps of the drawing of seed S; both are printed, and QT_SCALE_FACTOR is heeded.
#include "properties/PaintSession.h"

#include <gtest/gtest.h>

#include <QApplication>

#include <charconv>
#include <cstdio>
#include <random>
#include <string>
#include <string_view>

namespace penwick::test {
namespace {

std::uint32_t seed = std::random_device()();
int steps = 2'500; // at each of four scales

/// Nothing for pictures that are the same, else how many pixels differ, and between which.
std::string difference(const QImage &shown, const QImage &expected)
{
    if (shown == expected)
        return {};
    int differing = 0;
    QRect area;
    for (int y = 0; y < expected.height(); ++y) {
        for (int x = 0; x < expected.width(); ++x) {
            if (shown.pixel(x, y) == expected.pixel(x, y))
                continue;
            ++differing;
            area |= QRect(x, y, 1, 1);
        }
    }
    return std::to_string(differing) + " pixels, from " + std::to_string(area.left()) + ","
        + std::to_string(area.top()) + " to " + std::to_string(area.right()) + ","
        + std::to_string(area.bottom());
}

void expectFullRepaintAfterEveryStep(std::uint32_t ofSeed, int count)
{
    PaintSession session(ofSeed);
    for (int step = 1; step <= count; ++step) {
        const std::string done = session.doSomething();
        const QImage shown = session.onScreen();
        const auto place = [&] {
            return " differ after step " + std::to_string(step) + " of seed "
                + std::to_string(ofSeed) + ": " + done;
        };
        ASSERT_EQ(difference(session.withoutTextBoxes(shown), session.paintedAnew()), "")
            << "strokes" << place();
        ASSERT_EQ(difference(shown, session.paintedByWindow()), "") << "window" << place();
        if (step % 50 == 0) { // not always: it brings up to date what the next paint would have to
            ASSERT_EQ(difference(session.content(), session.paintedAnew()), "")
                << "content" << place();
        }
    }
}

TEST(PaintProperties, windowShowsTheFullRepaintAfterEveryStep)
{
    std::printf("%d steps of seed %u\n", steps, seed);
    expectFullRepaintAfterEveryStep(seed, steps);
}

/// The number behind `option` in `argument`, if that is what it is.
template <class Number>
bool take(std::string_view argument, std::string_view option, Number &number)
{
    if (!argument.starts_with(option))
        return false;
    argument.remove_prefix(option.size());
    const auto [end, error]
        = std::from_chars(argument.data(), argument.data() + argument.size(), number);
    return error == std::errc() && end == argument.data() + argument.size();
}

} // namespace
} // namespace penwick::test

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    const QApplication application(argc, argv);
    ::testing::InitGoogleTest(&argc, argv);
    for (int index = 1; index < argc; ++index) {
        if (!penwick::test::take(argv[index], "--seed=", penwick::test::seed)
            && !penwick::test::take(argv[index], "--steps=", penwick::test::steps)) {
            std::fprintf(stderr, "unknown: %s\n", argv[index]);
            return 2;
        }
    }
    return RUN_ALL_TESTS();
}
