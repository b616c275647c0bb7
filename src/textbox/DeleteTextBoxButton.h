// SPDX-License-Identifier: MIT
// The mark beside a text box that deletes it.
#pragma once

#include "platform/view/Button.h"

namespace penwick {

/// A small image just outside its box's top right corner; a second image takes its place while the
/// pointer is over it. Without the component's bundle the process stops.
class DeleteTextBoxButton final : public platform::Button
{
    Q_OBJECT

public:
    /// A button without images or a place; for a scene.
    explicit DeleteTextBoxButton(QWidget *parent = nullptr);
    /// `frame` is the text box's.
    explicit DeleteTextBoxButton(const platform::Rect &frame);

    /// The normal image while the hover image is shown in its place; null before the first hover.
    [[nodiscard]] const QIcon &tempImage() const { return m_tempImage; }
    /// Shows the normal image again.
    void restoreImage();
    /// The place of the button of a text box at `frame`.
    [[nodiscard]] static platform::Point originFor(const platform::Rect &frame);

    void mouseEntered() override;
    void mouseExited() override;
    void mouseMoved(const platform::MouseEvent &event) override;
    /// Sets the arrow as the cursor. Every move over the button calls it.
    void cursorUpdate(const platform::MouseEvent &event);

private:
    QIcon m_tempImage;
    bool m_isHovered = false;
};

} // namespace penwick
