// SPDX-License-Identifier: MIT
// Who answers for a view whose class does not decide itself.
#pragma once

namespace penwick::platform {

/// A view passes on to it what the view is asked. It is a QObject; the view holds it weakly.
class NextResponder
{
public:
    virtual ~NextResponder() = default;
    /// Asks whether the view stops being the first responder.
    virtual bool resignFirstResponder() = 0;
};

} // namespace penwick::platform
