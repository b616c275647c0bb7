// SPDX-License-Identifier: MIT
// A button of the tool bar.
#pragma once

#include "platform/view/Button.h"
#include "platform/view/TrackingArea.h"

#include <optional>

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
    /// The triangle's colour. The name of this getter is fixed; it reads like a setter's, so the
    /// setter has another name.
    [[nodiscard]] const QColor &setArrowColor() const { return m_setArrowColor; }
    void assignArrowColor(const QColor &color);
    /// Image of the normal state.
    [[nodiscard]] const QIcon &buttonImage() const { return m_buttonImage; }
    void setButtonImage(const QIcon &image) { m_buttonImage = image; }
    /// Image of the other two states.
    [[nodiscard]] const QIcon &buttonAltImage() const { return m_buttonAltImage; }
    void setButtonAltImage(const QIcon &image) { m_buttonAltImage = image; }

    /// The area of which the pointer's entering and leaving are told: the bounds as they were when
    /// the button was made or a scene was loaded.
    [[nodiscard]] const std::optional<platform::TrackingArea> &trackingArea() const
    {
        return m_trackingArea;
    }
    void setTrackingArea(const std::optional<platform::TrackingArea> &area)
    {
        m_trackingArea = area;
    }

    // The backgrounds. They are read by these functions alone: a derived class that overrides one
    // shows its own colour, and a colour assigned to it is kept but not shown.

    /// Under the pointer and when selected.
    [[nodiscard]] virtual QColor hoverBackgroundColor() const { return m_hoverBackgroundColor; }
    void setHoverBackgroundColor(const QColor &color) { m_hoverBackgroundColor = color; }
    /// The same while the desktop asks for more contrast.
    [[nodiscard]] QColor hoverBackgroundColorContrast() const
    {
        return m_hoverBackgroundColorContrast;
    }
    void setHoverBackgroundColorContrast(const QColor &color)
    {
        m_hoverBackgroundColorContrast = color;
    }
    /// In the normal state.
    [[nodiscard]] virtual QColor originalBackgroundColor() const
    {
        return m_originalBackgroundColor;
    }
    void setOriginalBackgroundColor(const QColor &color) { m_originalBackgroundColor = color; }

    /// Does nothing; a derived class may override it.
    virtual void setViewImages() { }
    /// Does nothing; a derived class may override it.
    virtual void defineTrackingAreaForTextBox() { }

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
    std::optional<platform::TrackingArea> m_trackingArea;
    QColor m_hoverBackgroundColor;
    QColor m_hoverBackgroundColorContrast;
    QColor m_originalBackgroundColor;
};

} // namespace penwick
