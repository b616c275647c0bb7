// SPDX-License-Identifier: MIT
// Ends what an editor must not leave behind when it goes off the screen.
#pragma once

#include <QObject>

class QTextEdit;

namespace penwick {

/// Closes an editor's menu and ends the drag over it when the editor is hidden.
///
/// A menu is a window of its own and would stay open. And a window that is gone hears no more about
/// a drag from the desktop: the toolkit would keep the editor as the drag's target, even after its
/// destruction, and tell it of the next drag that another widget of the process refuses.
class EditorHiding final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `editor`, whose member this is.
    explicit EditorHiding(QTextEdit &editor);

    /// Closes the editor's menu, if it is open.
    void closeMenu();

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QTextEdit &m_editor;
    bool m_isDraggedOver = false;
};

} // namespace penwick
