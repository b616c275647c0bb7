// SPDX-License-Identifier: MIT
// What becomes of the selection in a text that nobody edits.
#pragma once

#include <QObject>

class QTextEdit;

namespace penwick {

/// Clears the selection of a read-only editor as soon as anything else is pressed, so that no text
/// stays highlighted on the canvas. Listens to the process's presses only while there is such a
/// selection.
class PlacedSelection final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `editor`, whose member this is.
    explicit PlacedSelection(QTextEdit &editor);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void listenIfNeeded();

    QTextEdit &m_editor;
};

} // namespace penwick
