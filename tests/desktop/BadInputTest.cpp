// SPDX-License-Identifier: MIT
// What a careless host may do, on a real desktop.
#include "desktop/support/BoardFixture.h"

#include <csignal>
#include <stdexcept>

namespace penwick::desktop {

namespace {

class BadInput : public BoardUnderEachManager
{
protected:
    [[nodiscard]] std::string imageFile(QSize size)
    {
        QImage image(size, QImage::Format_RGB32);
        image.fill(Qt::white);
        std::string file = desktop().file("picture.png");
        if (!image.save(QString::fromStdString(file)))
            throw std::runtime_error("cannot write " + file);
        return file;
    }

    /// Draws where nothing has been drawn yet, and waits for the stroke.
    void expectStrokeAppears(QPoint from)
    {
        const QPoint to = from + QPoint(100, 0);
        drag({ from, to });
        waitForLevel(to, inkOnWhite);
    }

    void pressTool(const char *name)
    {
        desktop().pointer().click(toolBar().buttons.value(QLatin1String(name)));
    }

    void closeAndExpectGoodEnd(bool isOverImage)
    {
        desktop().windows().close(window());
        EXPECT_EQ(host().waitForExit(), 0);
        EXPECT_EQ(host().waitForNotification(QStringLiteral(".penwick.session.end")),
            QJsonValue(isOverImage));
        EXPECT_EQ(host().errorOutput(), QString());
        EXPECT_EQ(host().printedLines(), QStringList());
    }
};

} // namespace

TEST_P(BadInput, noScreenStopsTheProcessAndIsSaid)
{
    open(HostProgram::Steered);

    EXPECT_THROW(host().steer(QStringLiteral("open-nowhere")), std::runtime_error);

    EXPECT_EQ(host().waitForExit(), 128 + SIGABRT);
    EXPECT_EQ(host().errorOutput(),
        QStringLiteral("penwick: fatal error: a drawing window needs a screen\n"));
}

TEST_P(BadInput, emptyImageLeavesAWindowWithoutAToolBar)
{
    open(HostProgram::Steered);

    host().steer(QStringLiteral("open imageAnnotation"));

    // As it is loaded: two thirds of the screen's width, 16 to 9.
    ASSERT_TRUE(waitUntil([this] { return host().window(QStringLiteral("drawing")).isVisible; }));
    EXPECT_EQ(desktop().windows().outerFrame(window()), QRect(213, 187, 853, 480));
    EXPECT_EQ(desktop().windows().title(window()), QStringLiteral("Tarnhill Whiteboard"));
    EXPECT_FALSE(host().window(QStringLiteral("toolPanel")).isVisible);
    EXPECT_TRUE(waitUntil(
        [this] { return desktop().windows().ofProcess(host().processId()).size() == 1; }));
    expectStrokeAppears({ 300, 300 });
    closeAndExpectGoodEnd(true);
}

TEST_P(BadInput, imageLargerThanTheScreenHasAWindowOfItsShapeThatFits)
{
    start({ "--window", "imageAnnotation", "--image", imageFile({ 2000, 1500 }) });

    const QRect granted(213, 0, 1067, 800);
    EXPECT_TRUE(
        waitUntil([&] { return host().window(QStringLiteral("drawing")).frame == granted; }));
    EXPECT_EQ(desktop().windows().outerFrame(window()), granted);
    EXPECT_TRUE(
        waitUntil([&] { return granted.adjusted(20, 25, 0, 0).contains(toolBar().frame); }));
    const QPoint from = QPoint(500, 300) - canvas().topLeft();
    expectStrokeAppears(from);
    closeAndExpectGoodEnd(true);
}

TEST_P(BadInput, titleOfTenThousandCharactersIsTheWindows)
{
    const std::string title(10'000, 'x');

    start({ "--window", "imageAnnotation", "--image", imageFile({ 600, 400 }), "--title", title });

    EXPECT_EQ(desktop().windows().title(window()), QString::fromStdString(title));
    EXPECT_EQ(desktop().windows().outerFrame(window()), QRect(213, 267, 600, 400));
    expectStrokeAppears({ 200, 100 });
    closeAndExpectGoodEnd(true);
}

TEST_P(BadInput, secondWindowReplacesTheFirstAndItsToolsWork)
{
    open(HostProgram::Steered);
    settle();
    const WindowId first = window();
    const WindowId firstBar = toolBarWindow();

    host().steer(QStringLiteral("open imageAnnotation 800x450"));

    const Windows &windows = desktop().windows();
    ASSERT_TRUE(waitUntil([&] { return !windows.isShown(first) && !windows.isShown(firstBar); }));
    ASSERT_TRUE(waitUntil([this] {
        return host().window(QStringLiteral("drawing")).frame.size() == QSize(800, 450)
            && host().window(QStringLiteral("toolPanel")).isVisible;
    }));
    EXPECT_EQ(windows.ofProcess(host().processId()).size(), 2U);
    expectStrokeAppears({ 200, 100 });
    pressTool("undo");
    waitForLevel({ 300, 100 }, 255);
    pressTool("redo");
    waitForLevel({ 300, 100 }, inkOnWhite);
    pressTool("eraser");
    drag({ { 250, 60 }, { 250, 140 } });
    waitForLevel({ 300, 100 }, 255);
    closeAndExpectGoodEnd(true);
}

TEST_P(BadInput, secondWindowIsMinimisedAndComesBackWithItsToolBar)
{
    open(HostProgram::Steered);
    host().steer(QStringLiteral("open whiteboard"));
    Windows &windows = desktop().windows();
    ASSERT_TRUE(waitUntil([&] { return windows.ofProcess(host().processId()).size() == 2; }));
    expectStrokeAppears({ 200, 100 });
    const WindowId board = window();
    const WindowId bar = toolBarWindow();
    const QRect boardFrame = windows.outerFrame(board);
    const QRect barFrame = windows.outerFrame(bar);

    windows.minimise(board);
    EXPECT_TRUE(waitUntil([&] { return !windows.isShown(board) && !windows.isShown(bar); }));
    windows.activate(board);
    EXPECT_TRUE(waitUntil([&] { return windows.isShown(board) && windows.isShown(bar); }));

    EXPECT_TRUE(waitUntil([&] {
        return windows.outerFrame(board) == boardFrame && windows.outerFrame(bar) == barFrame;
    }));
    waitForLevel({ 300, 100 }, inkOnWhite);
    expectStrokeAppears({ 200, 200 });
    closeAndExpectGoodEnd(false);
}

INSTANTIATE_TEST_SUITE_P(WindowManagers, BadInput, testing::ValuesIn(eachManager()), managerName);

} // namespace penwick::desktop
