// SPDX-License-Identifier: MIT
// What a window is made of; for the files of Window alone.
#pragma once

#include <penwick/platform/Window.h>
#include <penwick/platform/WindowController.h>

#include "platform/BackgroundDrag.h"
#include "platform/CaptureExclusion.h"
#include "platform/FrameTracker.h"
#include "platform/Glide.h"
#include "platform/ViewController.h"
#include "platform/WindowBackdrop.h"
#include "platform/WindowFamily.h"
#include "platform/WindowShape.h"

namespace penwick::platform {

class Window::Private
{
public:
    explicit Private(Window &window)
        : tracker(new FrameTracker(window))
        , glide(new Glide(*tracker))
        , shape(new WindowShape(window, *tracker))
        , captures(window)
    { }

    FrameTracker *const tracker; // a child of the window
    Glide *const glide; // a child of the tracker
    WindowShape *const shape; // a child of the tracker
    CaptureExclusion captures;
    WindowFamily family;
    std::unique_ptr<ViewController> contentViewController;
    QPointer<WindowController> windowController;
    WindowBackdrop backdrop;
    BackgroundDrag drag;
    bool isClosed = false;
    bool isMain = false;
    bool isMinimised = false;
    bool isContentBorrowed = false;
};

} // namespace penwick::platform
