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

// The first character, which is two units long beyond the basic plane.
QStringView firstOf(QStringView text)
{
    const bool isPair
        = text.size() > 1 && text.front().isHighSurrogate() && text.at(1).isLowSurrogate();
    return text.first(isPair ? 2 : 1);
}

QStringView lastOf(QStringView text)
{
    const bool isPair = text.size() > 1 && text.back().isLowSurrogate()
        && text.at(text.size() - 2).isHighSurrogate();
    return text.last(isPair ? 2 : 1);
}

bool isMark(QStringView character)
{
    return character.size() > 1
        ? QChar::isMark(QChar::surrogateToUcs4(character.front(), character.back()))
        : character.front().isMark();
}

int marksAround(QStringView before, QStringView after)
{
    int marks = 0;
    for (; !before.isEmpty() && isMark(lastOf(before)); ++marks)
        before.chop(lastOf(before).size());
    for (; !after.isEmpty() && isMark(firstOf(after)); ++marks)
        after = after.sliced(firstOf(after).size());
    return marks;
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
    for (qsizetype place = 0; place < text.size();) {
        const QStringView character = firstOf(QStringView(text).sliced(place));
        if (taken.size() + character.size() > room.characters)
            break;
        const QChar letter = character.front();
        const bool isSecondHalf = letter == u'\n' && place > 0 && text.at(place - 1) == u'\r';
        if (isLineEnd(letter) && !isSecondHalf && ++lineEnds > room.lineEnds)
            break;
        marks = isMark(character) ? marks + 1 : 0;
        if (marks <= mostMarks)
            taken += character;
        else if (place - taken.size() > mostCharacters)
            break; // so many marks in a row that the rest is not worth reading
        place += character.size();
    }
    return taken;
}

} // namespace penwick
