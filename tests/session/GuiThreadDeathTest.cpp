// SPDX-License-Identifier: MIT
// Every public operation of the entry object, the controllers and the windows, called from another
// thread than the application's: the process ends with a line that says so.
#include "platform/view/ViewController.h"
#include "session/SessionFixture.h"

#include <penwick/platform/WindowController.h>

#include <QFile>
#include <QKeyEvent>
#include <QRegularExpression>

#include <memory>
#include <ostream>
#include <set>
#include <thread>

namespace penwick::test {

namespace {

using platform::Window;
using platform::WindowController;

/// What the operations are called on; made on the application's thread.
struct Subject
{
    Subject()
        : controller(penwick->createDrawingWindowController(
            WindowType::whiteboard, QGuiApplication::primaryScreen()))
        , window(*controller->drawingWindow())
        , banner(*controller->sharingNotificationWindow())
    { }

    std::unique_ptr<Penwick> penwick = std::make_unique<Penwick>();
    std::shared_ptr<DrawingWindowController> controller;
    Window &window;
    Window &banner;
    std::unique_ptr<DrawingWindowController> bareDrawing
        = std::make_unique<DrawingWindowController>();
    std::unique_ptr<WindowController> bare = std::make_unique<WindowController>();
    std::unique_ptr<Window> bareWindow = std::make_unique<Window>();
    QKeyEvent key { QEvent::KeyPress, Qt::Key_B, Qt::NoModifier };
};

struct Operation
{
    const char *owner;
    const char *name;
    void (*call)(Subject &subject);
};

void PrintTo(const Operation &operation, std::ostream *stream)
{
    *stream << operation.owner << "::" << operation.name;
}

// An operation without arguments of the subject's member.
#define OF_WINDOW(name)                                                                            \
    {                                                                                              \
        "Window", #name, [](Subject &s) { static_cast<void>(s.window.name()); }                    \
    }
#define OF_BARE(name)                                                                              \
    {                                                                                              \
        "WindowController", #name, [](Subject &s) { static_cast<void>(s.bare->name()); }           \
    }
#define OF_DRAWING(name)                                                                           \
    {                                                                                              \
        "DrawingWindowController", #name,                                                          \
            [](Subject &s) { static_cast<void>(s.controller->name()); }                            \
    }

const Operation operations[] {
    { "Penwick", "Penwick", [](Subject &) { const Penwick another; } },
    { "Penwick", "~Penwick", [](Subject &s) { s.penwick.reset(); } },
    { "Penwick", "penwickWindowController",
        [](Subject &s) { static_cast<void>(s.penwick->penwickWindowController()); } },
    { "Penwick", "setPenwickWindowController",
        [](Subject &s) { s.penwick->setPenwickWindowController(s.controller); } },
    { "Penwick", "createDrawingWindowController",
        [](Subject &s) {
            static_cast<void>(s.penwick->createDrawingWindowController(
                WindowType::annotation, QGuiApplication::primaryScreen()));
        } },
    { "Penwick", "showWindowSharingNotification",
        [](Subject &s) { s.penwick->showWindowSharingNotification(); } },

    { "WindowController", "WindowController", [](Subject &) { const WindowController another; } },
    { "WindowController", "~WindowController", [](Subject &s) { s.bare.reset(); } },
    OF_BARE(window),
    { "WindowController", "setWindow",
        [](Subject &s) { s.bare->setWindow(std::move(s.bareWindow)); } },
    { "WindowController", "showWindow", [](Subject &s) { s.bare->showWindow(nullptr); } },
    OF_BARE(retire),
    OF_BARE(windowDidLoad),
    OF_BARE(mouseDown),
    OF_BARE(mouseUp),
    { "WindowController", "keyDown", [](Subject &s) { s.bare->keyDown(s.key); } },

    { "DrawingWindowController", "DrawingWindowController",
        [](Subject &) { const DrawingWindowController another; } },
    { "DrawingWindowController", "~DrawingWindowController",
        [](Subject &s) { s.bareDrawing.reset(); } },
    OF_DRAWING(drawingWindowOrigin),
    { "DrawingWindowController", "setDrawingWindowOrigin",
        [](Subject &s) { s.controller->setDrawingWindowOrigin(std::nullopt); } },
    OF_DRAWING(sharingNotificationWindow),
    { "DrawingWindowController", "setSharingNotificationWindow",
        [](Subject &s) { s.controller->setSharingNotificationWindow(nullptr); } },
    { "DrawingWindowController", "setMWindowType",
        [](Subject &s) { s.controller->setMWindowType(WindowType::annotation); } },
    { "DrawingWindowController", "setTPanelWindowController",
        [](Subject &s) { s.controller->setTPanelWindowController(nullptr); } },
    OF_DRAWING(mWindowType),
    OF_DRAWING(drawingWindow),
    { "DrawingWindowController", "setDrawingWindow",
        [](Subject &s) { s.controller->setDrawingWindow(nullptr); } },
    OF_DRAWING(tPanelWindowController),
    OF_DRAWING(minWindowWidth),
    OF_DRAWING(minWindowHeight),
    { "DrawingWindowController", "createWindowForApplication",
        [](Subject &s) {
            s.controller->createWindowForApplication(WindowType::annotation,
                *QGuiApplication::primaryScreen(), std::nullopt, std::nullopt);
        } },
    { "DrawingWindowController", "setWindowPositionRelativeToMainWindow",
        [](Subject &s) {
            s.controller->setWindowPositionRelativeToMainWindow(s.banner, 1.0, 2.0);
        } },
    { "DrawingWindowController", "setNotificationWindowProperties",
        [](Subject &s) { s.controller->setNotificationWindowProperties(s.banner); } },
    OF_DRAWING(showSharingNotificationWindow),
    OF_DRAWING(closeSharingNotificationWindow),
    OF_DRAWING(hideThePopover),
    OF_DRAWING(windowDidLoad),
    OF_DRAWING(windowWillAppear),
    OF_DRAWING(windowWillMove),
    OF_DRAWING(windowDidResignMain),
    OF_DRAWING(windowDidMove),
    OF_DRAWING(windowDidResize),
    OF_DRAWING(windowWillClose),
    { "DrawingWindowController", "keyDown", [](Subject &s) { s.controller->keyDown(s.key); } },

    { "Window", "Window", [](Subject &) { const Window another; } },
    { "Window", "~Window", [](Subject &s) { s.bareWindow.reset(); } },
    OF_WINDOW(frame),
    { "Window", "setFrame",
        [](Subject &s) {
            s.window.setFrame({ 0.0, 0.0, 9.0, 9.0 });
        } },
    { "Window", "setFrameOrigin",
        [](Subject &s) {
            s.window.setFrameOrigin({ 1.0, 2.0 });
        } },
    OF_WINDOW(attributes),
    { "Window", "setAttributes", [](Subject &s) { s.window.setAttributes({}); } },
    OF_WINDOW(showsWhatIsBelow),
    OF_WINDOW(isKeptOutOfCaptures),
    OF_WINDOW(windowsToLeaveOutOfCaptures),
    { "Window", "removeChildWindow", [](Subject &s) { s.window.removeChildWindow(s.banner); } },
    { "Window", "expectChildWindow", [](Subject &s) { s.window.expectChildWindow(s.banner); } },
    { "Window", "addChildWindow", [](Subject &s) { s.window.addChildWindow(s.banner); } },
    OF_WINDOW(parentWindow),
    OF_WINDOW(childWindows),
    OF_WINDOW(contentImage),
    OF_WINDOW(delegate),
    { "Window", "setDelegate", [](Subject &s) { s.window.setDelegate(nullptr); } },
    OF_WINDOW(orderFront),
    OF_WINDOW(orderOut),
    { "Window", "setVisible", [](Subject &s) { s.window.setVisible(true); } },
    // QWidget has this one too; a host ends a session by it.
    OF_WINDOW(close),
    // QWidget's close() reaches the window by its close event.
    { "Window", "closeEvent", [](Subject &s) { s.window.QWidget::close(); } },
};

#undef OF_WINDOW
#undef OF_BARE
#undef OF_DRAWING

/// The names declared between `class NAME` and its first section that is not public.
std::set<std::string> publicNames(const QString &header, const QString &owner)
{
    QFile file(QStringLiteral(PENWICK_SOURCE_TREE "/include/penwick/") + header);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << header.toStdString();
    QString text = QString::fromUtf8(file.readAll());
    const QRegularExpression begin(QStringLiteral("class PENWICK_EXPORT %1\\b").arg(owner));
    text = text.mid(text.indexOf(begin));
    text = text.mid(text.indexOf(QStringLiteral("public:")));
    static const QRegularExpression otherSection(
        QStringLiteral("\n(private|protected|Q_SIGNALS):"));
    text = text.left(text.indexOf(otherSection));
    static const QRegularExpression remark(QStringLiteral("//[^\n]*"));
    static const QRegularExpression removed(QStringLiteral("[^;]*= delete;"));
    text.remove(remark).remove(removed);
    static const QRegularExpression declared(QStringLiteral("(~?\\w+)\\("));
    std::set<std::string> names;
    auto matches = declared.globalMatch(text);
    while (matches.hasNext())
        names.insert(matches.next().captured(1).toStdString());
    return names;
}

class OnAnotherThreadDeathTest : public testing::TestWithParam<Operation>
{ };

} // namespace

TEST_P(OnAnotherThreadDeathTest, stopsTheProcess)
{
    Subject subject;

    EXPECT_DEATH(std::thread([&] { GetParam().call(subject); }).join(),
        "penwick: fatal error: called from another thread than the application's\n");
}

INSTANTIATE_TEST_SUITE_P(Operations, OnAnotherThreadDeathTest, testing::ValuesIn(operations),
    [](const testing::TestParamInfo<Operation> &operation) {
        std::string name = operation.param.name;
        if (name.front() == '~')
            name = "destructor";
        return std::string(operation.param.owner) + '_' + name;
    });

TEST(OnAnotherThread, everyPublicOperationIsTried)
{
    const char *const owners[] { "Penwick", "DrawingWindowController", "Window",
        "WindowController" };
    const char *const headers[] { "Penwick.h", "DrawingWindowController.h", "platform/Window.h",
        "platform/WindowController.h" };

    for (std::size_t index = 0; index < std::size(owners); ++index) {
        const std::string owner = owners[index];
        std::set<std::string> untried
            = publicNames(QString::fromLatin1(headers[index]), QString::fromLatin1(owners[index]));
        EXPECT_GE(untried.size(), 4U) << owner;
        for (const Operation &operation : operations) {
            if (owner == operation.owner)
                untried.erase(operation.name);
        }
        EXPECT_EQ(untried, std::set<std::string> {}) << owner;
    }
}

TEST(OnAnotherThread, namesAndPlainValuesAreForAnyThread)
{
    std::thread([] {
        EXPECT_FALSE(penwickSessionEndNotificationKey().isEmpty());
        EXPECT_EQ(windowTypeFromRawValue(1), WindowType::annotation);
        EXPECT_EQ(platform::WindowAttributes().sharingType, platform::SharingType::readOnly);
    }).join();
}

} // namespace penwick::test
