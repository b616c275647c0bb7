// SPDX-License-Identifier: MIT
// A host that has made no QApplication: the process ends with a line of ours, not of the toolkit's.
// This program has none of any kind; what dies makes the others.
#include <penwick/Penwick.h>
#include <penwick/platform/Window.h>
#include <penwick/platform/WindowController.h>

#include <QApplication>

#include <gtest/gtest.h>

#include <cstdlib>
#include <memory>
#include <optional>

namespace penwick::test {

namespace {

struct Construction
{
    const char *name;
    void (*make)();
};

const Construction constructions[] {
    { "Penwick", [] { const Penwick made; } },
    { "DrawingWindowController", [] { const DrawingWindowController made; } },
    { "Window", [] { const platform::Window made; } },
    { "WindowController", [] { const platform::WindowController made; } },
};

template <class Application>
void makeUnder(const Construction &construction)
{
    int count = 1;
    char name[] = "host";
    char *arguments[] = { name, nullptr };
    const Application application(count, arguments);
    construction.make();
}

/// As a host does that keeps the entry object in static storage.
void outliveApplication()
{
    const auto penwick = std::make_unique<std::optional<Penwick>>();
    {
        int count = 1;
        char name[] = "host";
        char *arguments[] = { name, nullptr };
        const QApplication application(count, arguments);
        penwick->emplace();
        const auto controller = (*penwick)->createDrawingWindowController(
            WindowType::whiteboard, QGuiApplication::primaryScreen());
        controller->showWindow(nullptr);
    }
    penwick->reset();
    std::exit(0);
}

class WithoutApplicationDeathTest : public testing::TestWithParam<Construction>
{ };

} // namespace

TEST_P(WithoutApplicationDeathTest, noneAtAllStopsTheProcess)
{
    EXPECT_DEATH(GetParam().make(), "^penwick: fatal error: there is no QApplication\n$");
}

TEST_P(WithoutApplicationDeathTest, oneWithoutWidgetsStopsTheProcess)
{
    constexpr auto line = "penwick: fatal error: there is no QApplication: another kind of "
                          "application object has no widgets\n$";

    EXPECT_DEATH(makeUnder<QGuiApplication>(GetParam()), line);
    EXPECT_DEATH(makeUnder<QCoreApplication>(GetParam()), line);
}

TEST(OutlivedApplicationDeathTest, sessionThatIsLeftEndsInPeace)
{
    EXPECT_EXIT(outliveApplication(), testing::ExitedWithCode(0), "");
}

INSTANTIATE_TEST_SUITE_P(Constructions, WithoutApplicationDeathTest,
    testing::ValuesIn(constructions),
    [](const testing::TestParamInfo<Construction> &made) { return std::string(made.param.name); });

TEST(WithoutApplication, namesAndPlainValuesNeedNone)
{
    EXPECT_FALSE(penwickSessionEndNotificationKey().isEmpty());
    EXPECT_EQ(windowTypeFromRawValue(2), WindowType::imageAnnotation);
}

} // namespace penwick::test
