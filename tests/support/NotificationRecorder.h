// SPDX-License-Identifier: MIT
// What the default notification centre delivered, in words.
#pragma once

#include <string>
#include <vector>

namespace penwick::test {

/// Writes down every notification that is posted while it lives, in order.
///
/// "enableUndo true", "enableRedo false" for button states; "removeWithId 7" (or the case's name)
/// for subview operations; "redraw" for an updated drawing. Anything else, or one of these with an
/// object that it must not have, is written down as "?" and its name.
class NotificationRecorder
{
public:
    NotificationRecorder();
    ~NotificationRecorder();
    NotificationRecorder(const NotificationRecorder &) = delete;
    NotificationRecorder &operator=(const NotificationRecorder &) = delete;

    /// What was written down since the last call.
    [[nodiscard]] std::vector<std::string> take();

private:
    std::vector<std::string> m_posted;
};

} // namespace penwick::test
