// SPDX-License-Identifier: MIT
// The host that the monkey plays with: built with sanitizers, and ended by any warning of the
// toolkit.
#pragma once

#include "desktop/support/ChildProcess.h"
#include "desktop/support/Desktop.h"

#include <memory>
#include <string>

namespace penwick::desktop {

/// One host after the other: when a session has ended well, the next is opened.
class MonkeyHost final
{
public:
    /// Opens a window of `kind` with the host program `program`. Borrows `desktop`.
    MonkeyHost(Desktop &desktop, std::string program, std::string kind);

    /// Opens the next session if the present one has ended. Throws a runtime_error if it did not
    /// end well: a status other than 0, or a word of a sanitizer.
    void keepOpen();
    /// Returns once the host has answered; if its session has ended instead, like keepOpen().
    void awaitAnswer();
    /// Ends the session as its end button does, and waits for its good end.
    void end();

    [[nodiscard]] int processId() const { return static_cast<int>(m_process->id()); }
    [[nodiscard]] int sessions() const { return m_sessions; }
    [[nodiscard]] std::string errorOutput() const;

private:
    void open();
    void requireGoodEnd();

    Desktop &m_desktop;
    const std::string m_program;
    const std::string m_kind;
    const std::string m_errorFile;
    std::unique_ptr<ChildProcess> m_process;
    int m_sessions = 0;
};

} // namespace penwick::desktop
