// SPDX-License-Identifier: MIT
// Keeps the host's style, style sheet, palette and fonts out of the component's own widgets.
#pragma once

#include <QFont>
#include <QObject>

class QTextEdit;
class QWidget;

namespace penwick::platform {

/// Whether `event` follows upon what a style has done to a widget.
[[nodiscard]] bool isAboutLook(const QEvent &event);

/// Takes back what the application's style has done to `widget`. Answers whether it had made the
/// widget larger or smaller than it may be.
///
/// An application's style sheet cannot be kept from a widget: the toolkit wraps whatever style the
/// widget is given in one that applies the sheet, and a sheet of the widget's own overrides only
/// the properties that it thinks of. So views do not ask their style for anything, and what a style
/// does to a widget by itself, when it polishes it, is undone: sizes below or above which it may
/// not go, and backgrounds painted behind it.
bool keepOwnLook(QWidget &widget);

/// The desktop's own font, whatever the application's is, `size` points of the screen's logical
/// pixels high. Nothing of it is left to the widget or the painter that it is used with.
[[nodiscard]] QFont ownFont(double size);

/// The same with another font than the desktop's.
[[nodiscard]] QFont ownFont(double size, QFont font);

/// Lets a text editor keep the font and the colours that it has when this is made. Held by the
/// editor's class.
class OwnEditorLook final : public QObject
{
public:
    /// Borrows `editor`.
    explicit OwnEditorLook(QTextEdit &editor);

    bool eventFilter(QObject *watched, QEvent *event) override;
};

} // namespace penwick::platform
