// SPDX-License-Identifier: MIT
// One drawing session, the way a host has one.
#pragma once

#include "CommandLine.h"

#include <penwick/Penwick.h>

#include <QImage>
#include <QObject>

#include <memory>
#include <optional>

class QScreen;

namespace penwick::host {

/// Holds the component from the opening of its window to the end that it announces, then drops it
/// and ends the application's event loop with status 0. GUI thread only.
class Session final : public QObject
{
public:
    Session();
    ~Session() override;

    /// Opens the window as `options` say, on `screen`. Returns whether it is there; if it is not,
    /// the component has printed why.
    [[nodiscard]] bool open(
        const Options &options, QScreen &screen, const std::optional<QImage> &image);

    /// Calls the draw view controller's operation. Without an open window
    /// it only says so on standard error.
    void call(const StartCall &call);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void announceSharing();
    void end();

    std::unique_ptr<Penwick> m_penwick;
    std::shared_ptr<DrawingWindowController> m_controller;
    bool m_announcesSharing = false;
};

} // namespace penwick::host
