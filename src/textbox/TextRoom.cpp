// SPDX-License-Identifier: MIT
#include "textbox/TextRoom.h"

#include <QTextCursor>
#include <QTextDocument>

#include <algorithm>

namespace penwick {

namespace {

bool isLineEnd(QChar letter)
{
    return letter == u'\n' || letter == u'\r' || letter == QChar::LineSeparator
        || letter == QChar::ParagraphSeparator;
}

int lineEndsIn(QStringView text)
{
    return static_cast<int>(std::count_if(text.begin(), text.end(), isLineEnd));
}

int marksAround(QStringView before, QStringView after)
{
    const auto isLetter = [](QChar letter) { return !letter.isMark(); };
    const auto ahead = std::find_if(before.rbegin(), before.rend(), isLetter);
    const auto behind = std::find_if(after.begin(), after.end(), isLetter);
    return static_cast<int>((ahead - before.rbegin()) + (behind - after.begin()));
}

} // namespace

TextRoom roomAt(const QTextCursor &place)
{
    const QString text = place.document()->toRawText();
    const QStringView all(text);
    const QStringView before = all.first(place.selectionStart());
    const QStringView after = all.sliced(place.selectionEnd());
    const auto stays = static_cast<int>(before.size() + after.size());
    return { std::max(0, mostCharacters - stays),
        std::max(0, mostLines - 1 - lineEndsIn(before) - lineEndsIn(after)),
        std::max(0, mostMarks - marksAround(before, after)) };
}

QString fittingPart(const QString &text, const TextRoom &room)
{
    QString taken;
    int lineEnds = 0;
    int marks = mostMarks - room.marks;
    for (qsizetype place = 0; place < text.size() && taken.size() < room.characters; ++place) {
        const QChar letter = text.at(place);
        const bool isSecondHalf = letter == u'\n' && place > 0 && text.at(place - 1) == u'\r';
        if (isLineEnd(letter) && !isSecondHalf && ++lineEnds > room.lineEnds)
            break;
        marks = letter.isMark() ? marks + 1 : 0;
        if (marks <= mostMarks)
            taken += letter;
        else if (place - taken.size() > mostCharacters)
            break; // so many marks in a row that the rest is not worth reading
    }
    const bool isCut = taken.size() < text.size();
    if (isCut && !taken.isEmpty() && taken.back().isHighSurrogate())
        taken.chop(1); // the first half of a character whose second half was cut off
    return taken;
}

} // namespace penwick
