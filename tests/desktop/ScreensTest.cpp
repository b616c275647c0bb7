// SPDX-License-Identifier: MIT
// Windows on the second of two screens with different origins.
#include "desktop/support/BoardFixture.h"

namespace penwick::desktop {

namespace {

/// Two monitors on one display and where the windows stand on the second one.
struct Layout
{
    const char *name;
    std::vector<QRect> monitors; ///< the first is the primary one
    QRect board; ///< two thirds of the width, a sixth from the left and bottom edges
    QRect image; ///< 600 x 400, its bottom left corner the board's
};

const Layout rightAndHigher { "rightAndHigher", { { 0, 200, 1280, 800 }, { 1280, 0, 1024, 768 } },
    { 1451, 256, 683, 384 }, { 1451, 240, 600, 400 } };
const Layout leftAndLower { "leftAndLower", { { 1024, 0, 1280, 800 }, { 0, 232, 1024, 768 } },
    { 171, 488, 683, 384 }, { 171, 472, 600, 400 } };

class Screens : public BoardTest,
                public testing::WithParamInterface<std::tuple<WindowManager, Layout>>
{
protected:
    static constexpr QSize wholeDisplay { 2304, 1000 };
    static constexpr int barInset = 20;

    Screens()
        : BoardTest(std::get<WindowManager>(GetParam()), wholeDisplay)
    {
        desktop().splitInto(layout().monitors);
    }

    [[nodiscard]] static const Layout &layout() { return std::get<Layout>(GetParam()); }

    void startOnSecond(
        std::vector<std::string> arguments = {}, HostProgram program = HostProgram::AsShipped)
    {
        arguments.insert(arguments.end(), { "--screen", "1" });
        start(arguments, program);
    }

    // Soon, not at once: a desktop may put its borders on late.
    void expectFrame(const QRect &frame)
    {
        const WindowId shown = window();
        QRect seen;
        EXPECT_TRUE(waitUntil([&] {
            return (seen = desktop().windows().outerFrame(shown)) == frame;
        })) << testing::PrintToString(seen)
            << " instead of " << testing::PrintToString(frame);
    }

    /// In the middle of the left edge, twenty points in; half a pixel goes either way.
    void expectToolBarIn(const QRect &frame)
    {
        const QRect bar = toolBar().frame;
        EXPECT_EQ(bar.left(), frame.left() + barInset);
        EXPECT_NEAR(bar.center().y(), frame.center().y(), 1);
    }

    void expectStrokeAppears()
    {
        drag({ { 200, 100 }, { 300, 200 } });
        EXPECT_TRUE(waitUntil([this] {
            return qGray(desktop().screen().pixel(onScreen({ 250, 150 })).rgb()) < 150;
        }));
    }
};

std::string screensName(const testing::TestParamInfo<Screens::ParamType> &parameters)
{
    const auto &[manager, layout] = parameters.param;
    return managerName({ manager, 0 }) + '_' + layout.name;
}

} // namespace

TEST_P(Screens, boardStandsOnTheScreenThatItWasGiven)
{
    startOnSecond();

    expectFrame(layout().board);
    expectToolBarIn(layout().board);
    expectStrokeAppears();
}

TEST_P(Screens, boardWithoutAGivenScreenStandsOnThePrimaryOne)
{
    start();

    const QRect primary = layout().monitors.front();
    expectFrame(QRect(213, 187, 853, 480).translated(primary.topLeft()));
}

TEST_P(Screens, overlayCoversExactlyTheScreenThatItWasGiven)
{
    startOnSecond({ "--window", "annotation" });

    expectFrame(layout().monitors.at(1));
    expectToolBarIn(layout().monitors.at(1));
    expectStrokeAppears();
}

TEST_P(Screens, imageWindowStandsOnTheScreenThatItWasGiven)
{
    const std::string file = desktop().file("picture.png");
    QImage image(600, 400, QImage::Format_RGB32);
    image.fill(Qt::white);
    ASSERT_TRUE(image.save(QString::fromStdString(file)));

    startOnSecond({ "--window", "imageAnnotation", "--image", file });

    expectFrame(layout().image);
    expectToolBarIn(layout().image);
    expectStrokeAppears();
}

TEST_P(Screens, bannerComesInTheMiddleOfTheBoard)
{
    startOnSecond({}, HostProgram::Steered);

    host().steer(QStringLiteral("announce"));

    const QPoint off
        = host().waitForWindow(QStringLiteral("banner")).frame.center() - layout().board.center();
    EXPECT_LE(std::abs(off.x()), 1);
    EXPECT_LE(std::abs(off.y()), 1);
}

TEST_P(Screens, toolBarFollowsTheBoardToTheOtherScreen)
{
    startOnSecond();
    const QPoint title(layout().board.center().x(), layout().board.top() + 10);
    const QPoint way = layout().monitors.front().center() - layout().board.center();

    pull(title, way);

    expectFrame(layout().board.translated(way));
    EXPECT_TRUE(waitUntil([&] {
        return toolBar().frame.left() == layout().board.translated(way).left() + barInset;
    }));
    expectToolBarIn(layout().board.translated(way));
    expectStrokeAppears();
}

INSTANTIATE_TEST_SUITE_P(Layouts, Screens,
    testing::Combine(
        testing::ValuesIn(eachManager()), testing::Values(rightAndHigher, leftAndLower)),
    screensName);

} // namespace penwick::desktop
