// SPDX-License-Identifier: MIT
// The hands on the keyboard.
#pragma once

#include <string>
#include <string_view>

namespace penwick::desktop {

class XConnection;

/// Presses real keys; the window that has the keyboard gets them.
class Keyboard final
{
public:
    /// Borrows `connection`, which must live longer.
    explicit Keyboard(const XConnection &connection);

    /// Presses and releases the key with this X name ("Return", "BackSpace", "a").
    /// Throws a runtime_error when the keyboard has no such key.
    void press(const std::string &keyName);

    /// The same while the key `modifierName` ("Control_L", "Shift_L") is held.
    void pressWith(const std::string &modifierName, const std::string &keyName);

    /// Types ASCII letters of either case, digits and spaces.
    void type(std::string_view text);

private:
    void setKey(const std::string &keyName, bool isDown);

    const XConnection &m_connection;
};

} // namespace penwick::desktop
