// SPDX-License-Identifier: MIT
// The editor under a text box: plain text in one font and colour, with a caret of its own.
#pragma once

#include "platform/view/OwnLook.h"
#include "platform/view/ViewOf.h"
#include "textbox/EditorHiding.h"
#include "textbox/PlacedSelection.h"
#include "textbox/TextCaret.h"
#include "textbox/TextRoom.h"

#include <QAbstractTextDocumentLayout>
#include <QTextEdit>

#include <optional>

namespace penwick {

/// Edits plain text, or only shows it while it is not editable. It has no background, no frame and
/// no scroll bars. Its owner sets its size; text that is longer is scrolled by the wheel. It takes
/// only as much text as TextRoom.h allows, whether typed, composed, pasted or dropped.
///
/// Its own y axis points downwards, as text runs.
class TextEditor : public platform::ViewOf<QTextEdit>
{
    Q_OBJECT

public:
    /// Shows `text`, which must outlive the editor; if `text` is null, a text of its own.
    explicit TextEditor(QTextDocument *text = nullptr, QWidget *parent = nullptr);
    ~TextEditor() override;

    [[nodiscard]] bool isFlipped() const override { return true; }

    [[nodiscard]] bool isEditable() const { return !isReadOnly(); }
    /// False ends an edit: a composition becomes text, nothing stays selected, the next edit cannot
    /// undo this one, and a text that is too long for the editor shows its beginning.
    void setEditable(bool editable);
    [[nodiscard]] bool isEmpty() const; ///< a composition is no text yet
    [[nodiscard]] bool isBlank() const; ///< empty, and without a composition

    /// Writes everything in `font` and `color`, beginning at `origin` from the top left corner.
    void setInk(const QFont &font, const QColor &color, platform::Point origin);

    void draw(const platform::Rect &dirtyRect) override;

    using QTextEdit::inputMethodQuery;
    /// What an input method is told; it puts its candidates beside the caret.
    [[nodiscard]] QVariant inputMethodQuery(Qt::InputMethodQuery query) const override;

Q_SIGNALS:
    /// The text, or the composition in it, has changed.
    void writingChanged();
    /// A key was pressed that ends editing.
    void endAsked();
    /// `count` characters were not taken: there is no room for them.
    void refused(int count);

protected:
    using Selection = QAbstractTextDocumentLayout::Selection;

    /// Paints the text that lies in `part`, with `selections` and without a caret. `part` and
    /// `painter` are in the viewport's coordinates, y down; `painter` is left translated.
    void paintText(QPainter &painter, const QRectF &part, const QList<Selection> &selections) const;

    void mousePressEvent(QMouseEvent *event) override;
    void mouseMoveEvent(QMouseEvent *event) override;
    void mouseReleaseEvent(QMouseEvent *event) override;
    void wheelEvent(QWheelEvent *event) override;
    void keyPressEvent(QKeyEvent *event) override;
    void focusInEvent(QFocusEvent *event) override;
    void focusOutEvent(QFocusEvent *event) override;
    void inputMethodEvent(QInputMethodEvent *event) override;
    void insertFromMimeData(const QMimeData *source) override;

private:
    void endEdit();
    void prepareForPress(const QMouseEvent &press);
    [[nodiscard]] QList<Selection> selections() const;
    [[nodiscard]] TextRoom room() const;
    [[nodiscard]] bool refuses(const QKeyEvent &press);

    TextCaret m_caret;
    EditorHiding m_hiding;
    PlacedSelection m_selection;
    std::optional<platform::OwnEditorLook> m_look;
};

} // namespace penwick
