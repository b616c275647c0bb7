// SPDX-License-Identifier: MIT
#include "desktop/support/FaultFixture.h"

#include <algorithm>
#include <cstdlib>

namespace penwick::desktop {

void FaultTest::startKind(const std::string &kind, const std::vector<std::string> &arguments,
    const std::vector<std::string> &variables)
{
    std::vector<std::string> all { "--window", kind };
    if (kind == "imageAnnotation") {
        QImage image(600, 400, QImage::Format_RGB32);
        image.fill(Qt::white);
        const std::string file = desktop().file("picture.png");
        ASSERT_TRUE(image.save(QString::fromStdString(file)));
        all.insert(all.end(), { "--image", file });
    }
    all.insert(all.end(), arguments.begin(), arguments.end());
    start(all, HostProgram::Steered, variables);
    m_window = window();
    static_cast<void>(toolBar());
}

void FaultTest::expectInk()
{
    constexpr int distance = 24; // from one stroke to the next
    constexpr int visible = 15; // of 255 levels
    const QPoint corner = desktop().windows().clientArea(m_window).topLeft();
    const QPoint from = corner + QPoint(200, 60 + distance * m_strokes++);
    const QPoint middle = from + QPoint(50, 0);
    const QColor before = desktop().screen().pixel(middle);
    QColor now;
    const auto isInked = [&] { // the ground may be dark, but then it has a colour
        now = desktop().screen().pixel(middle);
        return std::max({ std::abs(now.red() - before.red()),
                   std::abs(now.green() - before.green()), std::abs(now.blue() - before.blue()) })
            > visible;
    };

    desktop().pointer().drag({ from, from + QPoint(100, 0) });

    EXPECT_TRUE(waitUntil(isInked))
        << before.name().toStdString() << " stays at " << middle.x() << ", " << middle.y();
}

std::vector<QRect> FaultTest::places()
{
    std::vector<QRect> places;
    for (const WindowId window : desktop().windows().ofProcess(host().processId()))
        places.push_back(desktop().windows().outerFrame(window));
    for (const char *const name : { "drawing", "toolPanel" })
        places.push_back(host().window(QString::fromLatin1(name)).frame);
    return places;
}

void FaultTest::expectPlacesKnown()
{
    std::vector<QRect> seen;
    EXPECT_TRUE(waitUntil([&] {
        seen = places();
        return seen.size() == 4 && seen[0] == seen[2] && seen[1] == seen[3];
    })) << testing::PrintToString(seen);
}

void FaultTest::expectEndByTool()
{
    desktop().pointer().click(toolBar().buttons.value(QStringLiteral("state")));
    EXPECT_EQ(host().waitForExit(), 0);
    EXPECT_EQ(host().printedLines(), QStringList());
}

void FaultTest::expectNothingSaid()
{
    EXPECT_EQ(host().errorOutput(), QString());
    EXPECT_EQ(host().printedLines(), QStringList());
}

std::vector<const char *> allKinds()
{
    return { "whiteboard", "annotation", "imageAnnotation" };
}

std::string kindName(const testing::TestParamInfo<const char *> &kind)
{
    return kind.param;
}

std::string managerAndKindName(const testing::TestParamInfo<ManagerAndKind> &info)
{
    const auto [manager, kind] = info.param;
    return managerName({ manager, 0 }) + '_' + kind;
}

} // namespace penwick::desktop
