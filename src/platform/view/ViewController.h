// SPDX-License-Identifier: MIT
// The controller of a view.
#pragma once

#include "platform/view/NextResponder.h"

#include <QObject>

namespace penwick::platform {

class View;

/// Joins a view that a scene built to the rest of the component. Owned by the window whose content
/// the view is, or by another controller. GUI thread only.
class ViewController : public QObject, public NextResponder
{
    Q_OBJECT

public:
    ViewController();
    ~ViewController() override;

    /// The view; null before it was loaded.
    [[nodiscard]] View *view() const { return m_view; }
    /// Borrows `view`, which is complete with everything in it, and runs viewDidLoad().
    void setView(View &view);

    /// The view has been loaded.
    virtual void viewDidLoad() { }
    /// The window whose content the view is was asked to come to the screen. Not called when the
    /// window only comes back together with its parent window.
    virtual void viewWillAppear() { }
    /// Asks, for a view whose class does not decide this itself, whether it stops being the first
    /// responder.
    bool resignFirstResponder() override { return true; }

private:
    View *m_view = nullptr;
};

} // namespace penwick::platform
