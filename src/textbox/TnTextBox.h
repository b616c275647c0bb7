// SPDX-License-Identifier: MIT
// Text on a canvas: edited, placed, moved and deleted where it stands.
#pragma once

#include "platform/AttributedString.h"
#include "platform/PanGestureRecognizer.h"
#include "platform/WeakReference.h"
#include "textbox/DeleteTextBoxButton.h"
#include "textbox/TextBoxDelegate.h"
#include "textbox/TextEditor.h"

#include <QColor>

#include <memory>
#include <optional>

namespace penwick {

/// A box of text with two modes: being edited (dashed border, delete button beside it) and placed
/// (thin border, dragged by the pointer, deleted by Backspace).
///
/// Held by reference: history keeps a box that has left its canvas, and the same box comes back.
/// Its own coordinates run downwards, as text does. A box that reports its end without a delegate
/// stops the process.
class TnTextBox final : public TextEditor
{
    Q_OBJECT
    Q_PROPERTY(penwick::platform::AttributedString placeholderAttributedString READ
            placeholderAttributedString)

public:
    /// A ready-to-edit box; `fontSize` in points of the screen's logical pixels.
    static std::shared_ptr<TnTextBox> create(
        const platform::Rect &frame, double fontSize, const QColor &fontColor);

    TnTextBox(const platform::Rect &frame, double fontSize, const QColor &fontColor);
    ~TnTextBox() override;

    /// The owner to tell when the box deletes itself; weak.
    [[nodiscard]] TextBoxDelegate *textBoxDelegate() const { return m_textBoxDelegate.get(); }
    void setTextBoxDelegate(TextBoxDelegate *delegate) { m_textBoxDelegate = delegate; }

    [[nodiscard]] platform::Point mouseDownPoint() const { return m_mouseDownPoint; }
    /// Whether the box looks edited: dashed border and delete button.
    [[nodiscard]] bool hasDashedBorder() const { return m_hasDashedBorder; }
    [[nodiscard]] double textFontSize() const { return m_textFontSize; } ///< points
    [[nodiscard]] const QColor &textFontColor() const { return m_textFontColor; }
    [[nodiscard]] DeleteTextBoxButton *deleteTextButton() const { return m_deleteTextButton.get(); }
    /// The hint that an empty box shows.
    [[nodiscard]] const platform::AttributedString &placeholderAttributedString() const
    {
        return m_placeholderAttributedString;
    }
    /// Whether the box has deleted itself; not any more once it is back on a canvas.
    [[nodiscard]] bool isTextBoxDeleted() const { return m_isTextBoxDeleted; }
    [[nodiscard]] platform::PanGestureRecognizer &panGesture() { return m_panGesture; }

    /// Where the text begins, from the box's top left corner: smaller fonts stand lower.
    [[nodiscard]] platform::Point textContainerOrigin() const;

    void draw(const platform::Rect &dirtyRect) override;
    /// The text alone.
    void drawContent(QPainter &painter) override;
    /// Draws the dashed border into `rect`, unless that is less than the whole height.
    void drawBorder(const platform::Rect &rect);
    void mouseDown(const platform::MouseEvent &event) override;
    void mouseUp(const platform::MouseEvent &event) override;
    /// Nothing: a placed box is moved by its gesture, and selecting text is the editor's own.
    void mouseDragged(const platform::MouseEvent &event) override;
    void mouseMoved(const platform::MouseEvent &event) override;
    void keyUp(const platform::KeyEvent &event) override;
    void viewDidMoveToWindow() override;
    bool resignFirstResponder() override;

    /// The box follows the pointer.
    void handleGesture(const platform::PanGestureRecognizer &gesture);
    /// Takes the box off its canvas and tells the owner.
    void deleteTextBox();

private:
    void customizeTextBox();
    void showPlacedBorder();
    void showDeleteTextButton();
    void removeAndReport();
    void endEditing();
    void fitToText();
    void drawPlaceholder();

    platform::Point m_mouseDownPoint; // of the grab, from the box's origin
    bool m_hasDashedBorder = true;
    double m_textFontSize;
    QColor m_textFontColor;
    std::shared_ptr<DeleteTextBoxButton> m_deleteTextButton;
    platform::WeakReference<TextBoxDelegate> m_textBoxDelegate;
    platform::AttributedString m_placeholderAttributedString;
    bool m_isTextBoxDeleted = false;
    platform::PanGestureRecognizer m_panGesture;
    std::optional<platform::Cursor> m_pointer; // for the mode that m_pointerIsForText says
    bool m_pointerIsForText = false;
    bool m_isFitting = false;
};

} // namespace penwick
