// SPDX-License-Identifier: MIT
// Keeps the host's style, style sheet, palette and fonts out of the component's own widgets.
#pragma once

#include <QFont>
#include <QObject>

class QTextEdit;
class QWidget;

namespace penwick::platform {

/// Whether `event` is one after which a style may have changed a widget's look.
[[nodiscard]] bool isAboutLook(const QEvent &event);

/// Takes back what the application's style has done to `widget`. Returns whether there were limits
/// on the size of `widget`, which may have resized it.
///
/// An application's style sheet cannot be kept from a widget: the toolkit wraps whatever style the
/// widget is given in one that applies the sheet, and a sheet of the widget's own overrides only
/// the properties that it names. So views do not ask their style for anything, and what a style
/// does to a widget by itself, when it polishes it, is undone: limits on its size, and backgrounds
/// painted behind it.
bool keepOwnLook(QWidget &widget);

/// The desktop's own font, whatever the application's is, `size` points high, which are logical
/// pixels of the screen. All its properties are set, so that no widget or painter that it is used
/// with fills in others.
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
