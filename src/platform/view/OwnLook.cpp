// SPDX-License-Identifier: MIT
#include "platform/view/OwnLook.h"

#include <QEvent>
#include <QFontDatabase>
#include <QPalette>
#include <QTextEdit>

#include <algorithm>
#include <cmath>

namespace penwick::platform {

namespace {

constexpr double smallestFont = 1.0; // points
constexpr double largestFont = 1000.0; // points; beyond it no line would fit a screen
constexpr QColor ground { 239, 239, 239 };
constexpr QColor selection { 48, 140, 198 };

} // namespace

// A widget that a style polishes on its way to the screen hears of it by no event but Show.
bool isAboutLook(const QEvent &event)
{
    return event.type() == QEvent::Polish || event.type() == QEvent::StyleChange
        || event.type() == QEvent::Show || event.type() == QEvent::ContentsRectChange;
}

bool keepOwnLook(QWidget &widget)
{
    constexpr QSize largest(QWIDGETSIZE_MAX, QWIDGETSIZE_MAX);
    const bool isConfined = widget.minimumSize() != QSize(0, 0) || widget.maximumSize() != largest;
    if (isConfined) {
        widget.setMinimumSize(0, 0);
        widget.setMaximumSize(largest);
    }
    widget.setAttribute(Qt::WA_StyledBackground, false);
    widget.setAutoFillBackground(false);
    return isConfined;
}

QFont ownFont(double size)
{
    return ownFont(size, QFontDatabase::systemFont(QFontDatabase::GeneralFont));
}

QFont ownFont(double size, QFont font)
{
    font.setPixelSize(static_cast<int>(std::lround(std::clamp(size, smallestFont, largestFont))));
    font.setResolveMask(QFont::AllPropertiesResolved);
    return font;
}

OwnEditorLook::OwnEditorLook(QTextEdit &editor)
{
    QPalette colors(ground); // sets all colours, so that none is the application's
    colors.setColor(QPalette::Text, editor.palette().color(QPalette::Text));
    colors.setColor(QPalette::Highlight, selection);
    colors.setColor(QPalette::HighlightedText, Qt::white);
    editor.setPalette(colors);
    // An application's style sheet still colours the selection, unless the editor's own sheet does.
    editor.setStyleSheet(
        QStringLiteral("QTextEdit { selection-background-color: %1; selection-color: white; }")
            .arg(selection.name()));
    editor.installEventFilter(this);
}

// At these events a QTextEdit takes the widget's font and colours for its text. With a style sheet
// they are the sheet's, whatever the widget was given. So the editor does not hear of them.
bool OwnEditorLook::eventFilter(QObject *watched, QEvent *event)
{
    static_cast<void>(watched);
    return event->type() == QEvent::FontChange || event->type() == QEvent::ApplicationFontChange
        || event->type() == QEvent::PaletteChange;
}

} // namespace penwick::platform
