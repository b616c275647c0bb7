// SPDX-License-Identifier: MIT
// What a window is made of; for the files of Window alone.
#pragma once

#include "platform/window/BackgroundDrag.h"
#include "platform/window/CaptureExclusion.h"
#include "platform/window/FrameTracker.h"
#include "platform/window/Glide.h"
#include "platform/window/LayerCall.h"
#include "platform/window/WindowBackdrop.h"
#include "platform/window/WindowContent.h"
#include "platform/window/WindowFamily.h"
#include "platform/window/WindowShape.h"

namespace penwick::platform {

/// Each part knows the widget at most. None calls anything of the window, whose address
/// WindowFamily keeps for others.
class WindowParts
{
public:
    /// `widget` is `window`, of which only the address is taken.
    WindowParts(QWidget &widget, Window &window)
        : tracker(new FrameTracker(widget))
        , glide(new Glide(*tracker))
        , shape(new WindowShape(widget, *tracker))
        , captures(widget)
        , family(window)
        , content(widget, *tracker)
    { }

    FrameTracker *const tracker; // a child of the window
    Glide *const glide; // a child of the tracker
    WindowShape *const shape; // a child of the tracker
    CaptureExclusion captures;
    WindowFamily family;
    WindowBackdrop backdrop;
    BackgroundDrag drag;
    LayerCall layerCall;
    bool isClosed = false;
    bool isMain = false;
    bool isMinimised = false;
    WindowContent content; // the first to go
};

} // namespace penwick::platform
