// SPDX-License-Identifier: MIT
// One drawing session, the way a host has one.
#pragma once

#include "CommandLine.h"

#include <penwick/Penwick.h>

#include <QImage>
#include <QObject>

#include <cstdlib>
#include <memory>
#include <optional>

class QScreen;

namespace penwick::host {

/// Holds the component from the opening of its window to the end that it announces, then drops it
/// and ends the application's event loop with status 0, or with 1 where the picture that was asked
/// for could not be written. GUI thread only.
class Session final : public QObject
{
public:
    Session();
    ~Session() override;

    /// Opens the window as `options` say, on `screen`, in place of one that is open. Returns
    /// whether it is there; if it is not, the component has printed why.
    [[nodiscard]] bool open(
        const Options &options, QScreen &screen, const std::optional<QImage> &image);

    /// Calls the draw view controller's operation. Without an open window
    /// it only says so on standard error.
    void call(const StartCall &call);

    /// Shows now that the window is being shared.
    void announce();
    /// Closes the window, which ends the session.
    void close();
    /// Lets go of the component. A session that has not ended will not end.
    void letGo();
    /// The drawing window; null without one.
    [[nodiscard]] platform::Window *window() const;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void choose(const StartCall &startCall);
    void announceOnceSeen();
    void writePicture();
    void end();

    std::unique_ptr<Penwick> m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
    bool m_announcesSharing = false;
    std::optional<QString> m_pictureFile;
    int m_status = EXIT_SUCCESS; // of the program
};

} // namespace penwick::host
