// SPDX-License-Identifier: MIT
// What a host's style does to a view or a window is taken back.
#include "platform/view/OwnLook.h"
#include "platform/view/PlainView.h"
#include "platform/window/WindowContent.h"

#include <penwick/platform/Window.h>

#include <QApplication>
#include <QTest>
#include <QTextDocument>
#include <QTextEdit>

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

/// An application style sheet for as long as it lives.
class Sheet
{
public:
    explicit Sheet(const char *sheet) { application().setStyleSheet(QLatin1String(sheet)); }
    ~Sheet() { application().setStyleSheet(QString()); }
    Sheet(const Sheet &) = delete;
    Sheet &operator=(const Sheet &) = delete;

private:
    static QApplication &application() { return *qobject_cast<QApplication *>(qApp); }
};

constexpr auto large = "* { min-width: 300px; min-height: 300px; max-width: 310px; }";

class Editor final : public ViewOf<QTextEdit>
{
public:
    using ViewOf::ViewOf;
};

} // namespace

TEST(OwnLook, windowOpenedUnderASheetHasItsOwnSize)
{
    const Sheet sheet(large);
    Window window;
    window.setFrame({ 100, 100, 52, 60 });

    window.show();
    QCoreApplication::processEvents();

    EXPECT_EQ(window.minimumSize(), QSize(0, 0));
    EXPECT_EQ(window.maximumSize(), QSize(QWIDGETSIZE_MAX, QWIDGETSIZE_MAX));
    EXPECT_EQ(window.frame().size(), (Size { 52, 60 }));
}

TEST(OwnLook, openWindowKeepsItsSizeWhenASheetComes)
{
    WindowAttributes attributes;
    attributes.styleMask = {};
    Window window;
    window.setAttributes(attributes);
    window.setFrame({ 100, 100, 52, 60 });
    window.show();
    QCoreApplication::processEvents();

    const Sheet sheet(large);
    QCoreApplication::processEvents();

    EXPECT_EQ(window.size(), QSize(52, 60));
    EXPECT_EQ(window.frame(), (Rect { 100, 100, 52, 60 }));
}

TEST(OwnLook, viewKeepsItsSizeAndPaintsNoForeignBackground)
{
    Window window;
    window.setFrame({ 100, 100, 400, 400 });
    const auto view = makeView<PlainView>();
    PlainView root;
    root.addSubview(view);
    contentOf(window).setContentView(&root);
    view->setFrame({ 10, 10, 30, 20 });
    window.show();
    QCoreApplication::processEvents();

    const Sheet sheet("* { min-width: 300px; min-height: 300px; background: red; }");
    QCoreApplication::processEvents();

    EXPECT_EQ(view->size(), QSize(30, 20));
    EXPECT_FALSE(view->testAttribute(Qt::WA_StyledBackground));
    EXPECT_EQ(view->geometry().left(), 10);
    contentOf(window).setContentView(nullptr);
}

TEST(OwnLook, editorIsFilledByItsText)
{
    const Sheet sheet("QTextEdit { border: 9px solid red; padding: 11px; }");
    Window window;
    window.setFrame({ 100, 100, 400, 400 });
    const auto editor = makeView<Editor>();
    PlainView root;
    root.addSubview(editor);
    contentOf(window).setContentView(&root);
    editor->setFrame({ 10, 10, 200, 100 });
    window.show();
    QCoreApplication::processEvents();

    EXPECT_EQ(editor->viewport()->geometry(), QRect(0, 0, 200, 100));
    editor->setFrame({ 10, 10, 240, 120 });
    EXPECT_EQ(editor->viewport()->geometry(), QRect(0, 0, 240, 120));
    contentOf(window).setContentView(nullptr);
}

TEST(OwnLook, editorKeepsItsFont)
{
    QTextEdit editor;
    editor.setFont(ownFont(24));
    const OwnEditorLook look(editor);
    const QFont font = editor.document()->defaultFont();

    const Sheet sheet("* { font: bold 40px; }");
    editor.ensurePolished();

    EXPECT_EQ(editor.document()->defaultFont(), font);
    EXPECT_EQ(font.pixelSize(), 24);
}

TEST(OwnLook, fontSetsAllItsProperties)
{
    QFont loud(QStringLiteral("Serif"), 40, QFont::Bold, true);
    loud.setUnderline(true);

    const QFont font = ownFont(12).resolve(loud);

    EXPECT_EQ(font, ownFont(12));
    EXPECT_EQ(font.pixelSize(), 12);
    EXPECT_FALSE(font.underline());
}

TEST(OwnLook, fontOfNoSizeThatALineCouldHaveIsTheNearest)
{
    EXPECT_EQ(ownFont(-5).pixelSize(), 1);
    EXPECT_EQ(ownFont(1e9).pixelSize(), 1000);
    EXPECT_EQ(ownFont(14.4).pixelSize(), 14);
}

} // namespace penwick::platform
