// SPDX-License-Identifier: MIT
// A white board on which text is written, with eyes for text boxes.
#pragma once

#include "desktop/support/BoardFixture.h"

#include <QColor>

namespace penwick::desktop {

/// Base of the tests that write on the board. A box is named by its top left corner there.
class TextBoxTest : public BoardTest
{
protected:
    static constexpr QSize newBoxSize { 200, 30 };
    static constexpr QColor editBorder { 51, 51, 255 }; // blue at alpha 0.8 on white
    static constexpr QColor placedBorder { 153, 153, 255 }; // at alpha 0.4
    static constexpr QColor deleteMark { 41, 41, 41 };
    static constexpr QColor hoveredDeleteMark { 190, 41, 76 };

    /// Opens a board, chooses the text tool and takes the pointer off the tool bar.
    void openForText();

    /// The corner of the box that a click at `place` makes.
    [[nodiscard]] static QPoint boxOf(QPoint place) { return place - QPoint(0, 6); }
    /// Clicks, and waits for the box; returns its corner.
    QPoint makeBox(QPoint place);
    /// The same with `text` in it, and left by a click far away.
    QPoint placeBox(QPoint place, std::string_view text);

    /// Types into the box at `corner` and waits until its text is wider than it was.
    void type(QPoint corner, std::string_view text);
    void doubleClick(QPoint place);

    [[nodiscard]] bool comesToBeEdited(QPoint corner);
    [[nodiscard]] bool comesToBePlaced(QPoint corner);
    [[nodiscard]] bool vanishes(QPoint corner);
    [[nodiscard]] bool isEdited(QPoint corner);

    /// The middle of the delete button of a box of `width`.
    [[nodiscard]] static QPoint deleteButtonOf(QPoint corner, int width = newBoxSize.width());
    /// Whether the delete button of a new box comes to look so.
    [[nodiscard]] bool deleteButtonComesToBe(QPoint corner, const QColor &color);

    /// The columns that the text of the box covers, from its corner; null without any text.
    [[nodiscard]] QRect inked(QPoint corner);
    [[nodiscard]] QColor at(QPoint place) { return desktop().screen().pixel(onScreen(place)); }
    /// `area` of the board as it is on the screen.
    [[nodiscard]] QImage pictureOf(const QRect &area);
    /// What is nearly `color` within `area`, in the board's places.
    [[nodiscard]] QRect extentOf(const QColor &color, const QRect &area);

    static constexpr QPoint farAway { 830, 60 };
};

} // namespace penwick::desktop
