// SPDX-License-Identifier: MIT
// The example that captures the screen, built against what was installed, on a real desktop: what
// is not to be seen is not in its pictures, and what was drawn below is.
#include "desktop/support/Desktop.h"
#include "desktop/support/WaitUntil.h"
#include "package/InstalledPackage.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QProcess>

#include <algorithm>
#include <sstream>

namespace penwick::test {

namespace {

using desktop::ChildProcess;
using desktop::Desktop;
using desktop::waitUntil;
using desktop::WindowId;
using desktop::WindowManager;

constexpr int inkOnWhite = 105;
constexpr QSize bannerSize { 300, 60 };

QString text(const char *start, const QString &end)
{
    return QString::fromLatin1(start) + end;
}

// The program, built once for all tests; empty where it could not be, with a failure.
const QString &program()
{
    static const QString path = [] {
        const InstalledPackage &package = InstalledPackage::shared();
        const QString sources = package.newFolder(QStringLiteral("capture"));
        const QDir from(QStringLiteral(PENWICK_SOURCE_TREE "/examples/capture"));
        for (const QString &name : from.entryList(QDir::Files))
            EXPECT_TRUE(QFile::copy(from.filePath(name), sources + QLatin1Char('/') + name));
        const QString build = sources + QStringLiteral("/build");
        const QString cmake = QStringLiteral(PENWICK_CMAKE);
        const Ending configured = run(cmake,
            { QStringLiteral("-S"), sources, QStringLiteral("-B"), build, QStringLiteral("-G"),
                QStringLiteral(PENWICK_GENERATOR), text("-DCMAKE_PREFIX_PATH=", package.prefix()),
                QStringLiteral("-DCMAKE_CXX_COMPILER=" PENWICK_COMPILER),
                QStringLiteral("-DCMAKE_CXX_FLAGS=" PENWICK_STRANGER_FLAGS) });
        EXPECT_EQ(configured.status, 0) << configured.errors.toStdString();
        const Ending built = run(cmake, { QStringLiteral("--build"), build });
        EXPECT_EQ(built.status, 0) << built.output.toStdString() << built.errors.toStdString();
        return build + QStringLiteral("/penwick-capture");
    }();
    return path;
}

class CaptureExample : public testing::TestWithParam<WindowManager>
{
protected:
    void SetUp() override { ASSERT_EQ(InstalledPackage::shared().complaint().toStdString(), ""); }

    CaptureExample()
        : m_desktop(GetParam())
    { }

    // Starts the example and returns once its tool bar stands where it belongs.
    void start()
    {
        ChildProcess::Command command { { program().toStdString(), pictureFile() },
            m_desktop.environment(), m_desktop.file("errors") };
        command.environment.emplace_back("QT_QPA_PLATFORM=xcb");
        m_host = std::make_unique<ChildProcess>(command);
        desktop::require(
            [this] { return !leftOut().empty() && board() != 0 && toolBar() != 0; }, "the board");
        constexpr int inset = 20;
        desktop::require(
            [this] { return frameOf(toolBar()).left() == frameOf(board()).left() + inset; },
            "the tool bar in its place");
        desktop::require([this] { return level(canvas().center()) == 255; }, "the paper");
    }

    [[nodiscard]] std::string pictureFile() const { return m_desktop.file("picture.png"); }
    Desktop &desktop() { return m_desktop; }
    [[nodiscard]] const std::vector<std::string> &lines()
    {
        while (const auto line = m_host->takeLine())
            m_lines.push_back(*line);
        return m_lines;
    }

    // What the program said last that it leaves out.
    [[nodiscard]] std::vector<WindowId> leftOut()
    {
        std::vector<WindowId> windows;
        for (const std::string &line : lines()) {
            if (!line.starts_with("left out:"))
                continue;
            std::istringstream stream(line.substr(line.find(':') + 1));
            windows.clear();
            for (WindowId window = 0; stream >> window;)
                windows.push_back(window);
        }
        return windows;
    }
    [[nodiscard]] bool isLeftOut(WindowId window)
    {
        const std::vector<WindowId> windows = leftOut();
        return std::find(windows.begin(), windows.end(), window) != windows.end();
    }
    [[nodiscard]] long timesTheListWasTold()
    {
        return std::count_if(lines().begin(), lines().end(),
            [](const std::string &line) { return line.starts_with("left out:"); });
    }

    // The first window of the program's that is on the screen and of which `is` holds; else 0.
    template <class Is>
    [[nodiscard]] WindowId find(Is &&is)
    {
        for (const WindowId window : m_desktop.windows().ofProcess(m_host->id())) {
            if (m_desktop.windows().isShown(window) && is(m_desktop.windows().clientArea(window)))
                return window;
        }
        return 0;
    }
    [[nodiscard]] WindowId board()
    {
        return find([](const QRect &area) { return area.width() > 600; });
    }
    [[nodiscard]] WindowId toolBar()
    {
        return find([](const QRect &area) { return area.width() < 120 && area.height() > 200; });
    }
    [[nodiscard]] WindowId banner()
    {
        return find([](const QRect &area) { return area.size() == bannerSize; });
    }
    // The shown window that is neither the board nor its tool bar nor the banner; 0 if there is
    // none.
    [[nodiscard]] WindowId popover()
    {
        const std::vector<WindowId> others { board(), toolBar(), banner() };
        for (const WindowId window : m_desktop.windows().ofProcess(m_host->id())) {
            if (m_desktop.windows().isShown(window)
                && std::find(others.begin(), others.end(), window) == others.end())
                return window;
        }
        return 0;
    }
    [[nodiscard]] QRect frameOf(WindowId window) { return m_desktop.windows().outerFrame(window); }
    [[nodiscard]] QRect canvas() { return m_desktop.windows().clientArea(board()); }
    [[nodiscard]] int level(QPoint place) { return m_desktop.screen().pixel(place).green(); }

    // Has a picture taken and reads it.
    [[nodiscard]] QImage capture()
    {
        const long before = count("captured");
        m_host->writeLine("");
        EXPECT_TRUE(waitUntil([&] { return count("captured") > before; }));
        return QImage(QString::fromStdString(pictureFile()));
    }
    void announce() { m_host->writeLine("announce"); }

private:
    [[nodiscard]] long count(const std::string &line)
    {
        return std::count(lines().begin(), lines().end(), line);
    }

    Desktop m_desktop;
    std::unique_ptr<ChildProcess> m_host;
    std::vector<std::string> m_lines;
};

// How many pixels of `area` are neither paper nor the brush's ink at any strength.
int strangePixels(const QImage &picture, const QRect &area)
{
    int strange = 0;
    for (int y = area.top(); y <= area.bottom(); ++y) {
        for (int x = area.left(); x <= area.right(); ++x) {
            const QColor color = picture.pixelColor(x, y);
            const bool isGrey = color.red() == color.green() && color.green() == color.blue();
            strange += !isGrey || color.red() < inkOnWhite - 1;
        }
    }
    return strange;
}

std::string managerName(const testing::TestParamInfo<WindowManager> &manager)
{
    return desktop::traitsOf(manager.param).name;
}

} // namespace

TEST_P(CaptureExample, leavesTheToolBarOutAndShowsTheStrokeThatRunsBelowIt)
{
    ASSERT_NO_FATAL_FAILURE(start());
    const QRect bar = frameOf(toolBar());
    const QPoint below(bar.center().x(), bar.center().y());
    const QPoint beside(bar.right() + 60, below.y());
    desktop().pointer().drag({ beside, QPoint(canvas().left() + 6, below.y()) });
    ASSERT_TRUE(waitUntil([&] { return std::abs(level(beside) - inkOnWhite) <= 1; }));
    ASSERT_GT(strangePixels(desktop().screen().picture(), bar), 1000) << "the bar is on the screen";

    const QImage picture = capture();

    EXPECT_EQ(picture.size(), desktop().screen().size());
    EXPECT_NEAR(picture.pixelColor(beside).green(), inkOnWhite, 1);
    EXPECT_NEAR(picture.pixelColor(below).green(), inkOnWhite, 1);
    EXPECT_EQ(strangePixels(picture, bar), 0);
    EXPECT_TRUE(isLeftOut(toolBar()));
    EXPECT_FALSE(isLeftOut(board()));
}

TEST_P(CaptureExample, leavesOutPopoverAndBannerByWhatItWasToldBeforeTheyWereShown)
{
    ASSERT_NO_FATAL_FAILURE(start());
    constexpr std::size_t all = 3; // tool bar, popover, banner
    ASSERT_EQ(leftOut().size(), all);
    const long told = timesTheListWasTold();

    for (int showing = 0; showing < 2; ++showing) {
        desktop().keyboard().press("c"); // the colours
        ASSERT_TRUE(waitUntil([this] { return popover() != 0; }));
        const WindowId colours = popover();
        EXPECT_TRUE(isLeftOut(colours));
        announce();
        ASSERT_TRUE(waitUntil([this] { return banner() != 0; }));
        EXPECT_TRUE(isLeftOut(banner()));
        const QRect areas[] = { frameOf(colours), frameOf(banner()) };
        constexpr QMargins border(3, 3, 3, 3);
        const QImage picture = capture();
        for (const QRect &area : areas)
            EXPECT_EQ(strangePixels(picture, area & canvas().marginsRemoved(border)), 0);
        ASSERT_TRUE(waitUntil([this] { return banner() == 0; }));
        desktop().keyboard().press("Escape");
        ASSERT_TRUE(waitUntil([this] { return popover() == 0; }));
    }

    EXPECT_EQ(timesTheListWasTold(), told) << "each has kept its identifier";
}

INSTANTIATE_TEST_SUITE_P(
    WindowManagers, CaptureExample, testing::ValuesIn(desktop::eachManager()), managerName);

} // namespace penwick::test
