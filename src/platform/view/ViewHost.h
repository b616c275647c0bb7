// SPDX-License-Identifier: MIT
// What a view may know of the window that it is in.
#pragma once

#include <QColor>
#include <QObject>

class QWidget;

namespace penwick::platform {

class View;

/// A window as its views see it: which view gets the keys, and the background below the views. Each
/// window that holds views has a ViewHost among its children. GUI thread only.
class ViewHost : public QObject
{
    Q_OBJECT

public:
    /// The host of the window that `widget` is in; null if that window holds no views.
    [[nodiscard]] static ViewHost *of(const QWidget &widget);

    ~ViewHost() override;

    /// The view that fills the window; null without one.
    [[nodiscard]] virtual View *contentView() const = 0;
    /// The view that gets the keys; null: the window itself does. Kept while the window is not
    /// active.
    [[nodiscard]] virtual View *firstResponder() const = 0;
    /// Makes `view` (null: the window itself) the first responder, after the present one has
    /// resigned. Returns whether it is the first responder now.
    virtual bool makeFirstResponder(View *view) = 0;
    /// Whether this is the window that gets the keys.
    [[nodiscard]] virtual bool isKeyWindow() const = 0;
    /// What the window shows where no view paints.
    [[nodiscard]] virtual QColor backgroundColor() const = 0;
    /// `view` leaves the window, or is being destroyed.
    virtual void forgetView(const View &view) = 0;

protected:
    /// `window` is the top-level widget; it has the new object among its children.
    explicit ViewHost(QWidget &window);
};

} // namespace penwick::platform
