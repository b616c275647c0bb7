// SPDX-License-Identifier: MIT
// What a window is made of; for the files of Window alone.
#pragma once

#include <penwick/platform/Window.h>
#include <penwick/platform/WindowController.h>

#include "platform/view/ViewController.h"
#include "platform/window/BackgroundDrag.h"
#include "platform/window/CaptureExclusion.h"
#include "platform/window/FrameTracker.h"
#include "platform/window/Glide.h"
#include "platform/window/WindowBackdrop.h"
#include "platform/window/WindowContent.h"
#include "platform/window/WindowFamily.h"
#include "platform/window/WindowShape.h"

namespace penwick::platform {

class Window::Private
{
public:
    explicit Private(Window &window)
        : tracker(new FrameTracker(window))
        , glide(new Glide(*tracker))
        , shape(new WindowShape(window, *tracker))
        , captures(window)
        , content(window)
    { }

    FrameTracker *const tracker; // a child of the window
    Glide *const glide; // a child of the tracker
    WindowShape *const shape; // a child of the tracker
    CaptureExclusion captures;
    WindowContent content;
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
