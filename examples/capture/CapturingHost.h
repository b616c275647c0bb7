// SPDX-License-Identifier: MIT
// A host that shows others what is on its screen, and the tool bar only to whoever draws.
#pragma once

#include "ScreenCapture.h"

#include <penwick/Penwick.h>

#include <QObject>
#include <QString>

#include <memory>
#include <vector>

/// Opens a white board and takes pictures of the screen without the windows that Penwick says are
/// not to be seen. What is left out is told on standard output, each time it changes. Ends the
/// event loop when the session ends. Needs a QApplication on X11.
class CapturingHost final : public QObject
{
public:
    /// Pictures are written to `fileName`.
    explicit CapturingHost(const QString &fileName);
    ~CapturingHost() override;

    /// Whether the board is there.
    [[nodiscard]] bool open();
    /// Takes a picture and tells on standard output whether it was written.
    void capture() const;
    /// Shows that the board is being shared.
    void announce();

private:
    void takeListAnew();

    const QString m_fileName;
    const ScreenCapture m_screen;
    penwick::Penwick m_penwick;
    std::shared_ptr<penwick::DrawingWindowController> m_controller;
    std::vector<WId> m_leftOut;
};
