// SPDX-License-Identifier: MIT
// How much a text box takes.
#pragma once

#include <QString>

class QTextCursor;

namespace penwick {

// Nobody who writes on a board comes near these limits. They are for a clipboard that holds a whole
// document: each key lays the whole text out anew, and that must not delay the host's next frame.
constexpr int mostCharacters = 2500; ///< of a box
constexpr int mostLines = 250; ///< of a box, wrapped ones not counted
constexpr int mostMarks = 64; ///< accents and the like on one letter

/// What may still go in at some place.
struct TextRoom
{
    int characters = mostCharacters;
    int lineEnds = mostLines - 1;
    int marks = mostMarks; ///< how many more the letter there can take

    friend bool operator==(const TextRoom &, const TextRoom &) = default;
};

/// What may go in at `place`, instead of what is selected there.
[[nodiscard]] TextRoom roomAt(const QTextCursor &place);

/// As much of the beginning of `text` as goes into `room`; marks that are too many are left out.
/// The cost is bounded by the room, however long `text` is.
[[nodiscard]] QString fittingPart(const QString &text, const TextRoom &room);

} // namespace penwick
