// SPDX-License-Identifier: MIT
#include "platform/view/PointerPress.h"

#include <QPointer>

#include <utility>
#include <vector>

namespace penwick::platform {

namespace {

struct Waiting
{
    QPointer<QObject> context;
    std::function<void()> action;
};

struct PointerState
{
    bool isPressed = false;
    std::vector<Waiting> waiting;
};

PointerState &pointer()
{
    static auto *const state = new PointerState; // may be asked while the process ends
    return *state;
}

} // namespace

void pointerWasPressed()
{
    pointer().isPressed = true;
}

void pointerWasReleased()
{
    pointer().isPressed = false;
    for (const Waiting &next : std::exchange(pointer().waiting, {})) {
        if (next.context)
            next.action();
    }
}

void afterPointerIsReleased(QObject &context, std::function<void()> action)
{
    if (pointer().isPressed)
        pointer().waiting.push_back({ &context, std::move(action) });
    else
        action();
}

} // namespace penwick::platform
