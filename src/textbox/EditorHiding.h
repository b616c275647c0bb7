// SPDX-License-Identifier: MIT
// What of an editor must not outlive its place on the screen.
#pragma once

#include <QObject>

class QTextEdit;

namespace penwick {

/// Closes an editor's menu and ends the drag over it when the editor is hidden.
///
/// A menu is a window of its own and would stay. And the desktop says nothing more about a drag to
/// a window that is gone: the toolkit would keep the editor as the drag's target, dead or not, and
/// tell it of the next drag that anything in the process refuses.
class EditorHiding final : public QObject
{
    Q_OBJECT

public:
    /// Borrows `editor`, whose member this is.
    explicit EditorHiding(QTextEdit &editor);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QTextEdit &m_editor;
    bool m_isDraggedOver = false;
};

} // namespace penwick
