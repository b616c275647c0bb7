// SPDX-License-Identifier: MIT
// A real input method, which composes Japanese from Latin letters.
#pragma once

#include "desktop/support/ChildProcess.h"

#include <string>
#include <vector>

namespace penwick::desktop {

class Desktop;

enum class InputMethodKind
{
    Ibus,
    Fcitx
};

/// Its daemon on a private desktop and its session bus, with the engine "anthy" chosen: the next
/// letter that a text box gets is composed. Ended by the destructor, before the desktop.
class InputMethod final
{
public:
    /// Throws a runtime_error with the reason when it is absent or does not come up.
    InputMethod(Desktop &desktop, InputMethodKind kind);

    /// What a program needs that is to be written in with it, beside the desktop's environment.
    [[nodiscard]] std::vector<std::string> environment() const;

private:
    [[nodiscard]] ChildProcess::Command daemon(Desktop &desktop) const;
    /// What a program says on its first line of output; empty if it says nothing.
    [[nodiscard]] std::string askedOf(
        const Desktop &desktop, const std::vector<std::string> &command) const;
    void awaitIt(const Desktop &desktop) const;

    const InputMethodKind m_kind;
    const std::vector<std::string> m_variables;
    ChildProcess m_daemon;
};

} // namespace penwick::desktop
