// SPDX-License-Identifier: MIT
// The hand on the mouse.
#pragma once

#include <QImage>
#include <QPoint>

#include <vector>

namespace penwick::desktop {

class XConnection;

enum class MouseButton
{
    Left = 1,
    Middle = 2,
    Right = 3
};

/// What the pointer looks like at the moment.
struct CursorLook
{
    QImage image; ///< device pixels, premultiplied
    QPoint hotSpot; ///< device pixels from the image's top left

    friend bool operator==(const CursorLook &, const CursorLook &) = default;
};

/// Moves the real pointer and presses its buttons. Places are screen pixels from the top left.
/// Every operation returns once the server, and for buttons the window manager, has dealt with it;
/// the program under test may be later.
class Pointer final
{
public:
    /// Borrows `connection`, which must live longer.
    explicit Pointer(const XConnection &connection);

    void moveTo(QPoint place);
    void press(MouseButton button = MouseButton::Left);
    void release(MouseButton button = MouseButton::Left);
    void click(QPoint place, MouseButton button = MouseButton::Left);

    /// Moves from where the pointer is straight to `place`, in the small steps of a hand.
    void glideTo(QPoint place);

    /// Takes hold of a window's frame at `place`: presses there, and rests as a hand does before it
    /// pulls. A window manager may begin only then, and counts from where the pointer is by then.
    void takeHold(QPoint place);
    /// Lets go of it after a rest, so that the window manager is where the hand is.
    void letGo();

    /// Presses at the first of `places`, glides through the others and releases at the last.
    void drag(const std::vector<QPoint> &places, MouseButton button = MouseButton::Left);

    [[nodiscard]] QPoint place() const;
    [[nodiscard]] CursorLook look() const;

private:
    struct State
    {
        QPoint place;
        unsigned int buttons; ///< as the server has them
    };

    [[nodiscard]] State state() const;
    [[nodiscard]] bool isPressed(MouseButton button) const;
    void rest();
    void setButton(MouseButton button, bool isDown);

    const XConnection &m_connection;
};

} // namespace penwick::desktop
