// SPDX-License-Identifier: MIT
// A button of the tool bar.
#pragma once

#include "platform/Button.h"

namespace penwick {

/// Paints its own background for three states: normal, under the pointer, selected; the last two
/// look the same. The buttons "text" and "brush" carry a small triangle that hints at their
/// options, "state" (the end button) has colours of its own, and "color" never changes its image
/// by itself.
///
/// The desktop's increase-contrast setting is read at every change of look.
class ToolPanelButton : public platform::Button
{
    Q_OBJECT
    /// Whether the button shows the selected state.
    Q_PROPERTY(bool isSelected READ isSelected WRITE setIsSelected)

public:
    explicit ToolPanelButton(QWidget *parent = nullptr);
    explicit ToolPanelButton(const platform::Rect &frame);
    ~ToolPanelButton() override;

    [[nodiscard]] bool isSelected() const { return m_isSelected; }
    /// Only remembers it; toggleToolState() shows it.
    void setIsSelected(bool isSelected) { m_isSelected = isSelected; }

    [[nodiscard]] const QColor &arrowNormalColor() const { return m_arrowNormalColor; }
    [[nodiscard]] const QColor &arrowHoverColor() const { return m_arrowHoverColor; }
    /// The triangle's colour. The property's own name is "setArrowColor", which leaves its setter
    /// without one of its kind.
    [[nodiscard]] const QColor &setArrowColor() const { return m_setArrowColor; }
    void assignArrowColor(const QColor &color);
    /// Image of the normal state.
    [[nodiscard]] const QIcon &buttonImage() const { return m_buttonImage; }
    void setButtonImage(const QIcon &image) { m_buttonImage = image; }
    /// Image of the other two states.
    [[nodiscard]] const QIcon &buttonAltImage() const { return m_buttonAltImage; }
    void setButtonAltImage(const QIcon &image) { m_buttonAltImage = image; }

    /// Background under the pointer and when selected.
    [[nodiscard]] virtual QColor hoverBackgroundColor() const;
    /// The same while the desktop asks for more contrast.
    [[nodiscard]] QColor hoverBackgroundColorContrast() const;
    /// Background of the normal state.
    [[nodiscard]] virtual QColor originalBackgroundColor() const;

    /// Shows isSelected().
    virtual void toggleToolState();

    void awakeFromScene() override;
    void draw(const platform::Rect &dirtyRect) override;
    void mouseEntered() override;
    void mouseExited() override;

protected:
    [[nodiscard]] bool hasFixedImage() const;

private:
    void showTriangle(const QColor &color);

    bool m_isSelected = false;
    const QColor m_arrowNormalColor { 86, 98, 113 };
    const QColor m_arrowHoverColor { 255, 255, 255 };
    QColor m_setArrowColor = m_arrowNormalColor;
    QIcon m_buttonImage;
    QIcon m_buttonAltImage;
};

} // namespace penwick
