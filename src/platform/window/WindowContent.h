// SPDX-License-Identifier: MIT
// A window as its views see it.
#pragma once

#include "platform/view/ViewHost.h"

namespace penwick::platform {

class Window;

/// Passes on to a window what its views ask of it. Held by the window.
class WindowContent final : public ViewHost
{
public:
    explicit WindowContent(Window &window);

    [[nodiscard]] View *contentView() const override;
    [[nodiscard]] View *firstResponder() const override;
    bool makeFirstResponder(View *view) override;
    [[nodiscard]] bool isKeyWindow() const override;
    [[nodiscard]] QColor backgroundColor() const override;
    void close() override;
    void forgetView(const View &view) override;

private:
    Window &m_window;
};

} // namespace penwick::platform
