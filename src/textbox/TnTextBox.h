// SPDX-License-Identifier: MIT
// Text on a canvas: edited, placed, moved and deleted where it stands.
#pragma once

#include "platform/foundation/WeakReference.h"
#include "platform/view/AttributedString.h"
#include "platform/view/PanGestureRecognizer.h"
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
/// Its own y axis points downwards, as text runs. A box that deletes itself and has no delegate to
/// tell stops the process.
class TnTextBox final : public TextEditor
{
    Q_OBJECT
    Q_PROPERTY(penwick::platform::AttributedString placeholderAttributedString READ
            placeholderAttributedString)

public:
    /// A ready-to-edit box; `fontSize` in points of the screen's logical pixels.
    static std::shared_ptr<TnTextBox> create(
        const platform::Rect &frame, double fontSize, const QColor &fontColor);

    // The first three constructors leave it to the caller to call customizeTextBox(): one for a
    // scene, one with a frame, and one that shows `textContainer`, which must outlive the box. The
    // fourth is the one that create() uses.
    explicit TnTextBox(QWidget *parent = nullptr);
    explicit TnTextBox(const platform::Rect &frame);
    TnTextBox(const platform::Rect &frame, QTextDocument &textContainer);
    TnTextBox(const platform::Rect &frame, double fontSize, const QColor &fontColor);
    ~TnTextBox() override;

    /// The owner to tell when the box deletes itself; weak.
    [[nodiscard]] TextBoxDelegate *textBoxDelegate() const { return m_textBoxDelegate.get(); }
    void setTextBoxDelegate(TextBoxDelegate *delegate) { m_textBoxDelegate = delegate; }

    [[nodiscard]] platform::Point mouseDownPoint() const { return m_mouseDownPoint; }
    /// Whether the box looks edited: dashed border and delete button.
    [[nodiscard]] bool hasDashedBorder() const { return m_hasDashedBorder; }
    /// The area in which pointer moves are followed. Kept, but not used: a widget hears of them
    /// all.
    [[nodiscard]] const std::optional<platform::Rect> &trackingArea() const
    {
        return m_trackingArea;
    }
    void setTrackingArea(const std::optional<platform::Rect> &area) { m_trackingArea = area; }
    /// The canvas that holds the box. Kept, but not used: superview() tells it. Weak.
    [[nodiscard]] platform::View *textParentView() const { return m_textParentView.get(); }
    void setTextParentView(platform::View *view) { m_textParentView = view; }
    // customizeTextBox() uses these; a later change has no effect before it is called again.
    [[nodiscard]] double textFontSize() const { return m_textFontSize; } ///< points
    void setTextFontSize(double size) { m_textFontSize = size; }
    [[nodiscard]] const QColor &textFontColor() const { return m_textFontColor; }
    void setTextFontColor(const QColor &color) { m_textFontColor = color; }
    /// Null before customizeTextBox().
    [[nodiscard]] DeleteTextBoxButton *deleteTextButton() const { return m_deleteTextButton.get(); }
    /// The hint that an empty box shows.
    [[nodiscard]] const platform::AttributedString &placeholderAttributedString() const
    {
        return m_placeholderAttributedString;
    }
    /// Whether the box has deleted itself because it was left empty; false again once it is back on
    /// a canvas.
    [[nodiscard]] bool isTextBoxDeleted() const { return m_isTextBoxDeleted; }
    /// What drags the placed box; made when it is first asked for.
    [[nodiscard]] platform::PanGestureRecognizer &panGesture();

    /// Makes the box ready to be edited, in its font size and colour. Without the component's
    /// bundle the process stops.
    void customizeTextBox();

    /// Where the text begins, from the box's top left corner, y down: small fonts begin lower.
    [[nodiscard]] platform::Point textContainerOrigin() const;

    void draw(const platform::Rect &dirtyRect) override;
    /// The text alone.
    void drawContent(QPainter &painter) override;
    /// Draws the dashed border into `rect`, unless `rect` is less high than the box.
    void drawBorder(const platform::Rect &rect);
    void mouseDown(const platform::MouseEvent &event) override;
    void mouseUp(const platform::MouseEvent &event) override;
    /// Does nothing: panGesture() moves a placed box, and the editor selects text by itself.
    void mouseDragged(const platform::MouseEvent &event) override;
    void mouseMoved(const platform::MouseEvent &event) override;
    void keyUp(const platform::KeyEvent &event) override;
    void viewDidMoveToWindow() override;
    void superviewDidResize(platform::Size former) override;
    bool resignFirstResponder() override;

    /// Moves the box with the pointer.
    void handleGesture(const platform::PanGestureRecognizer &gesture);
    /// Takes the box off its canvas and tells the owner.
    void deleteTextBox();

private:
    TnTextBox(QTextDocument *textContainer, QWidget *parent);
    void beginEditing();
    void becomePlaced();
    void endEditing();
    void showDeleteTextButton();
    void removeAndReport();
    void sayRefused(int count);
    void fitToText();
    void moveInto(const platform::Rect &frame);
    void drawPlaceholder();

    platform::Point m_mouseDownPoint; // where the pointer took hold, from the box's origin
    bool m_hasDashedBorder = true;
    std::optional<platform::Rect> m_trackingArea;
    platform::WeakReference<platform::View> m_textParentView;
    double m_textFontSize = 14.0;
    QColor m_textFontColor;
    std::shared_ptr<DeleteTextBoxButton> m_deleteTextButton;
    platform::WeakReference<TextBoxDelegate> m_textBoxDelegate;
    platform::AttributedString m_placeholderAttributedString;
    bool m_isTextBoxDeleted = false;
    std::unique_ptr<platform::PanGestureRecognizer> m_panGesture;
    std::optional<platform::Cursor> m_pointer; // the cursor that was made last
    bool m_pointerIsForText = false;
    bool m_isWritten = false; // whether there has ever been text in the box
};

} // namespace penwick
