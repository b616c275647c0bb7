// SPDX-License-Identifier: MIT
// What of the pointer and the keys no view of a window has taken.
#pragma once

#include <penwick/Export.h>

class QKeyEvent;

namespace penwick::platform {

/// Is told of the presses and keys that no view of a window has taken. A window's controller is its
/// responder.
class PENWICK_EXPORT WindowResponder
{
public:
    virtual ~WindowResponder();
    /// The left button went down where no view of the window took it.
    virtual void mouseDown() = 0;
    /// The left button that mouseDown() was called for was let go again.
    virtual void mouseUp() = 0;
    /// A key went down that no view of the window took. Returns whether the responder acted on it.
    virtual bool keyDown(const QKeyEvent &event) = 0;
};

} // namespace penwick::platform
