// SPDX-License-Identifier: MIT
// The end of a session, as the host and the desktop see it.
#include "desktop/support/BoardFixture.h"

#include <algorithm>

namespace penwick::desktop {

namespace {

enum class Way
{
    EndTool, ///< the tool bar's button, pressed
    TitleBar, ///< the window's close button, pressed
    Desktop, ///< asked for at the window manager, as a task bar does
    Host ///< closed by the program itself
};

struct Ending
{
    const char *name;
    const char *kind;
    Way way;
    bool isOverImage;
};

class SessionEnd : public BoardUnderEachManager
{
protected:
    static bool isEnd(const PostedNotification &notification)
    {
        return notification.name.endsWith(QLatin1String(".penwick.session.end"));
    }

    void expectGoodEnd(bool isOverImage = false)
    {
        EXPECT_EQ(host().waitForExit(), 0);
        const auto &posted = host().notifications();
        EXPECT_EQ(std::count_if(posted.begin(), posted.end(), isEnd), 1);
        ASSERT_FALSE(posted.empty());
        EXPECT_TRUE(isEnd(posted.back()));
        EXPECT_EQ(posted.back().object, QJsonValue(isOverImage));
        for (const char *const name : { "drawing", "toolPanel" })
            EXPECT_FALSE(host().window(QLatin1String(name)).isVisible) << name;
        EXPECT_EQ(host().errorOutput(), QString());
        EXPECT_EQ(host().printedLines(), QStringList());
    }
};

class EveryEnd : public BoardTest,
                 public testing::WithParamInterface<std::tuple<WindowManager, Ending>>
{
protected:
    EveryEnd()
        : BoardTest(std::get<WindowManager>(GetParam()))
    { }

    [[nodiscard]] static const Ending &ending() { return std::get<Ending>(GetParam()); }

    void startKind()
    {
        desktop().startCompositor(); // or the overlay would say that there is none
        QImage image(600, 400, QImage::Format_RGB32);
        image.fill(Qt::white);
        const std::string file = desktop().file("picture.png");
        ASSERT_TRUE(image.save(QString::fromStdString(file)));
        start({ "--window", ending().kind, "--image", file }, HostProgram::Steered);
        static_cast<void>(toolBar());
    }

    void end()
    {
        // The last button of the title bar, in its middle.
        const QRect frame = desktop().windows().outerFrame(window());
        const int half = (canvas().top() - frame.top()) / 2;
        switch (ending().way) {
        case Way::EndTool:
            desktop().pointer().click(toolBar().buttons.value(QStringLiteral("state")));
            break;
        case Way::TitleBar:
            desktop().pointer().click(frame.topRight() + QPoint(-half - 3, half));
            break;
        case Way::Desktop:
            desktop().windows().close(window());
            break;
        case Way::Host:
            host().steer(QStringLiteral("close"));
            break;
        }
    }
};

std::string endName(const testing::TestParamInfo<EveryEnd::ParamType> &parameters)
{
    const auto &[manager, ending] = parameters.param;
    return managerName({ manager, 0 }) + '_' + ending.name;
}

} // namespace

TEST_P(EveryEnd, isToldOnceWithWhetherItWasOverAnImage)
{
    startKind();

    end();

    EXPECT_EQ(host().waitForExit(), 0);
    std::vector<QJsonValue> ends;
    for (const PostedNotification &posted : host().notifications()) {
        if (posted.name.endsWith(QLatin1String(".penwick.session.end")))
            ends.push_back(posted.object);
    }
    EXPECT_EQ(ends, std::vector<QJsonValue> { QJsonValue(ending().isOverImage) });
    for (const char *const name : { "drawing", "toolPanel" })
        EXPECT_FALSE(host().window(QLatin1String(name)).isVisible) << name;
    EXPECT_EQ(host().errorOutput(), QString());
    EXPECT_EQ(host().printedLines(), QStringList());
}

INSTANTIATE_TEST_SUITE_P(Endings, EveryEnd,
    testing::Combine(testing::ValuesIn(eachManager()),
        testing::Values( //
            Ending { "boardByTheEndTool", "whiteboard", Way::EndTool, false },
            Ending { "boardByItsTitleBar", "whiteboard", Way::TitleBar, false },
            Ending { "boardByTheDesktop", "whiteboard", Way::Desktop, false },
            Ending { "boardByTheHost", "whiteboard", Way::Host, false },
            Ending { "overlayByTheEndTool", "annotation", Way::EndTool, false },
            Ending { "overlayByTheDesktop", "annotation", Way::Desktop, false },
            Ending { "overlayByTheHost", "annotation", Way::Host, false },
            Ending { "imageByTheEndTool", "imageAnnotation", Way::EndTool, true },
            Ending { "imageByItsTitleBar", "imageAnnotation", Way::TitleBar, true },
            Ending { "imageByTheDesktop", "imageAnnotation", Way::Desktop, true },
            Ending { "imageByTheHost", "imageAnnotation", Way::Host, true })),
    endName);

TEST_P(SessionEnd, comesWithTheCloseOfABoardThatWasDrawnOn)
{
    open();
    settle();

    desktop().windows().close(window());

    expectGoodEnd();
}

TEST_P(SessionEnd, comesWithTheWindowManagersKey)
{
    open();
    require([this] { return desktop().windows().active() == window(); }, "the board to be active");

    desktop().keyboard().pressWith("Alt_L", "F4");

    expectGoodEnd();
}

TEST_P(SessionEnd, comesWhileTheBannerIsUp)
{
    open(HostProgram::Steered);
    host().steer(QStringLiteral("announce"));
    host().waitForWindow(QStringLiteral("banner"));

    desktop().windows().close(window());

    expectGoodEnd();
}

TEST_P(SessionEnd, mayBeHeardByAHostThatLetsGoAtOnce)
{
    open(HostProgram::Steered);
    settle();
    host().steer(QStringLiteral("let-go-at-end"));

    desktop().pointer().click(toolBar().buttons.value(QStringLiteral("state")));

    expectGoodEnd();
}

INSTANTIATE_TEST_SUITE_P(WindowManagers, SessionEnd, testing::ValuesIn(eachManager()), managerName);

} // namespace penwick::desktop
