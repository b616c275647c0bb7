// SPDX-License-Identifier: MIT
// The insertion point of a text box, in the text's own colour.
// The editor's own caret inverts what is below it, whatever colour it is told.
#pragma once

#include <QBasicTimer>
#include <QColor>
#include <QObject>

class QPainter;
class QTextEdit;

namespace penwick {

constexpr double caretWidth = 2.0; // points

/// Blinks at the desktop's pace while it is shown; nothing runs while it is not.
class TextCaret final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `editor`, whose member this is.
    explicit TextCaret(QTextEdit &editor);

    void setColor(const QColor &color) { m_color = color; }
    /// Shows the caret, solid at first.
    void show();
    void hide();
    /// Shows the caret solid again, as after a key; nothing while it is hidden.
    void restart();

    /// Paints the caret in the coordinates of the editor's viewport, if it is to be seen now.
    void paint(QPainter &painter) const;

protected:
    void timerEvent(QTimerEvent *event) override;

private:
    void update();

    QTextEdit &m_editor;
    QColor m_color;
    QBasicTimer m_blink;
    bool m_isShown = false;
    bool m_isSolid = false; // the half of the blink in which it is seen
};

} // namespace penwick
