// SPDX-License-Identifier: MIT
// The one place that hears of every press and key that views get.
#pragma once

#include <QObject>

namespace penwick::platform {

class View;

/// Tells of what the user does to views of any window, right before the view itself hears of it.
/// GUI thread only.
class ViewInput final : public QObject
{
    Q_OBJECT

public:
    /// The process's only one; never destroyed.
    static ViewInput &shared();

Q_SIGNALS:
    /// The left button goes down on `view`, or on one in it that leaves the press to it.
    void pressed(penwick::platform::View &view);
    /// A key goes down while `view`, or one in it that leaves the key to it, has the keys.
    void keyPressed(penwick::platform::View &view);

private:
    ViewInput() = default;
};

} // namespace penwick::platform
