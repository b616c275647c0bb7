// SPDX-License-Identifier: MIT
// One session of each kind of drawing window, one after the other.
#pragma once

#include <penwick/Penwick.h>

#include <QTimer>

#include <cstdint>
#include <optional>

/// Opens every kind of drawing window in the order of their raw values. Each is shown for a moment
/// and closed; its end is heard, the Penwick dropped, the next one opened. Then the application's
/// event loop is ended: with 0, or with 1 once something was not as promised. Needs a QApplication.
class Tour final
{
public:
    Tour();
    ~Tour();
    Tour(const Tour &) = delete;
    Tour &operator=(const Tour &) = delete;

    /// Opens the next window, or ends the event loop after the last one.
    void openNext();

private:
    void close();
    void onSessionEnded(bool wasOverImage);
    void fail(const char *what);

    std::optional<penwick::Penwick> m_penwick; // holds the controller, which holds the window
    std::uintptr_t m_rawKind = 0; // of the window that is open or comes next
    QTimer m_closing; // the moment for which a window is shown
    QTimer m_bound; // no session lasts longer
};
