// SPDX-License-Identifier: MIT
#include "desktop/support/Keyboard.h"

#include "desktop/support/XConnection.h"

#include <X11/Xlib.h>

#include <X11/extensions/XTest.h>

#include <cctype>
#include <stdexcept>

namespace penwick::desktop {

Keyboard::Keyboard(const XConnection &connection)
    : m_connection(connection)
{ }

void Keyboard::press(const std::string &keyName)
{
    setKey(keyName, true);
    setKey(keyName, false);
}

void Keyboard::pressWith(const std::string &modifierName, const std::string &keyName)
{
    setKey(modifierName, true);
    press(keyName);
    setKey(modifierName, false);
}

void Keyboard::type(std::string_view text)
{
    for (const char character : text) {
        const auto code = static_cast<unsigned char>(character);
        if (character == ' ')
            press("space");
        else if (std::isupper(code))
            pressWith("Shift_L", std::string(1, static_cast<char>(std::tolower(code))));
        else
            press(std::string(1, character));
    }
}

void Keyboard::setKey(const std::string &keyName, bool isDown)
{
    const KeySym symbol = XStringToKeysym(keyName.c_str());
    const KeyCode code
        = symbol == NoSymbol ? KeyCode { 0 } : XKeysymToKeycode(m_connection.display(), symbol);
    if (code == 0)
        throw std::runtime_error("the keyboard has no key " + keyName);
    XTestFakeKeyEvent(m_connection.display(), code, isDown ? True : False, CurrentTime);
    m_connection.finishWithWindowManager();
}

} // namespace penwick::desktop
