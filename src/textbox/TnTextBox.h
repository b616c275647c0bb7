// SPDX-License-Identifier: MIT
// Text on a canvas.
#pragma once

#include "platform/ViewOf.h"
#include "platform/WeakReference.h"
#include "textbox/TextBoxDelegate.h"

#include <QColor>
#include <QTextEdit>

#include <memory>

namespace penwick {

/// An editable box of text. Held by reference: history keeps a box that has left its canvas.
class TnTextBox final : public platform::ViewOf<QTextEdit>
{
    Q_OBJECT

public:
    /// A ready-to-edit box; `fontSize` in points of the screen's logical pixels.
    static std::shared_ptr<TnTextBox> create(
        const platform::Rect &frame, double fontSize, const QColor &fontColor);

    TnTextBox(const platform::Rect &frame, double fontSize, const QColor &fontColor);
    ~TnTextBox() override;

    /// The owner to tell when the box deletes itself; weak.
    [[nodiscard]] TextBoxDelegate *textBoxDelegate() const { return m_textBoxDelegate.get(); }
    void setTextBoxDelegate(TextBoxDelegate *delegate) { m_textBoxDelegate = delegate; }

    /// Takes the box out of its superview and tells the owner, without whom the process stops.
    void deleteTextBox();

private:
    platform::WeakReference<TextBoxDelegate> m_textBoxDelegate;
};

} // namespace penwick
