// SPDX-License-Identifier: MIT
#include "toolpanel/ToolKeys.h"

#include "appearance/Theme.h"

#include <QKeyEvent>
#include <QKeySequence>

namespace penwick {

namespace {

constexpr Qt::KeyboardModifiers noLetter = Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier;

QString drawingToolForKey(int key)
{
    switch (key) {
    case Qt::Key_B:
        return Tools::brush;
    case Qt::Key_T:
        return Tools::text;
    case Qt::Key_E:
        return Tools::eraser;
    case Qt::Key_C:
        return Tools::color;
    default:
        return {};
    }
}

} // namespace

QString toolForKey(const QKeyEvent &event)
{
    if (event.matches(QKeySequence::Undo))
        return Tools::undo;
    if (event.matches(QKeySequence::Redo)
        || event.keyCombination() == (Qt::ControlModifier | Qt::Key_Y))
        return Tools::redo;
    if (event.matches(QKeySequence::Close))
        return Tools::state;
    if (event.keyCombination() == (Qt::ControlModifier | Qt::Key_Delete))
        return Tools::clear;
    return event.modifiers() & noLetter ? QString() : drawingToolForKey(event.key());
}

bool isTyped(const QKeyEvent &event)
{
    const bool isLetter = event.key() >= Qt::Key_A && event.key() <= Qt::Key_Z;
    const bool isDigit = event.key() >= Qt::Key_0 && event.key() <= Qt::Key_9;
    return (isLetter || isDigit) && !(event.modifiers() & noLetter);
}

int optionForKey(const QKeyEvent &event)
{
    const bool isDigit = event.key() >= Qt::Key_1 && event.key() <= Qt::Key_9;
    return isDigit && !(event.modifiers() & noLetter) ? event.key() - Qt::Key_1 : -1;
}

} // namespace penwick
