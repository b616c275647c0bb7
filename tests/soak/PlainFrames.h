// SPDX-License-Identifier: MIT
// Where the second model's windows stand.
#pragma once

#include <optional>
#include <string>

namespace penwick::test {

/// The outer frame of a window, in points, y up.
struct PlainFrame
{
    double x = 0.0; ///< left edge
    double y = 0.0; ///< bottom edge
    double width = 0.0;
    double height = 0.0;

    [[nodiscard]] double top() const { return y + height; }
};

/// The drawing window and its tool bar's panel.
class PlainFrames
{
public:
    PlainFrame board;
    PlainFrame panel;

    /// Whether a board whose window is at `frame`, in whole pixels, is where it is known to be.
    [[nodiscard]] bool isAt(const PlainFrame &frame) const;
    void moveTo(const PlainFrame &frame); ///< of the same size; the panel goes along
    /// A board that is shown is brought inside the screen in its own shape, on parts of a pixel if
    /// need be; its window is at `frame` then.
    void comeUpAt(const PlainFrame &frame);
    void resizeTo(const PlainFrame &frame);
    /// The desktop has granted `frame` for what was asked: 16:9 after its edges were pulled, so
    /// that no pull outward makes it smaller.
    void restAt(const PlainFrame &frame);
    void letPanelGo(); ///< where the user has dragged it; it is pulled into the drawing window

    [[nodiscard]] std::string inWords() const;

private:
    void shiftPanel(double x, double y);
    void pullPanelIn();
    void showPanel(); ///< of a board that has no room for it, where all of it is seen
    [[nodiscard]] bool isPanelTall() const;
    [[nodiscard]] PlainFrame &ownPlace();
    [[nodiscard]] PlainFrame reshaped() const;

    std::optional<PlainFrame> m_ownPlace; // the panel's, to which it comes back with its board
    std::optional<PlainFrame> m_unpulled; // the drawing window before the user took hold of an edge
};

} // namespace penwick::test
