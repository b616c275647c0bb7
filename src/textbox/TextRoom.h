// SPDX-License-Identifier: MIT
// How much a text box takes.
#pragma once

#include <QString>

class QTextCursor;

namespace penwick {

// Nobody who writes on a board comes near these. They are there for a clipboard that holds a whole
// document: every key lays the text out anew, and must be done within a frame of the host's.
constexpr int mostCharacters = 2500; ///< of a box
constexpr int mostLines = 250; ///< of a box, wrapped ones not counted
constexpr int mostMarks = 64; ///< accents and the like on one letter

/// What may still go in at some place.
struct TextRoom
{
    int characters = mostCharacters;
    int lineEnds = mostLines - 1;
    int marks = mostMarks; ///< more on the letter that stands there

    friend bool operator==(const TextRoom &, const TextRoom &) = default;
};

/// What may go in at `place`, instead of what is selected there.
[[nodiscard]] TextRoom roomAt(const QTextCursor &place);

/// The beginning of `text` that goes into `room`, without marks that are too many. Costs no more
/// than what is taken, however long `text` is.
[[nodiscard]] QString fittingPart(const QString &text, const TextRoom &room);

} // namespace penwick
