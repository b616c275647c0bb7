// SPDX-License-Identifier: MIT
#include "toolpanel/ToolPanelButton.h"

#include "appearance/Theme.h"
#include "platform/view/Workspace.h"

#include <QPainterPath>

namespace penwick {

namespace {

constexpr double triangleInset = 2.0; // points, from the right and lower edges
constexpr double triangleLeg = 6.0; // points

bool isContrastIncreased()
{
    return platform::Workspace::shared().accessibilityDisplayShouldIncreaseContrast();
}

} // namespace

ToolPanelButton::ToolPanelButton(QWidget *parent)
    : Button(parent)
    , m_hoverBackgroundColor(TnhColors::toolPanelButtonHoverColor)
    , m_hoverBackgroundColorContrast(TnhColors::toolPanelButtonHoverColorContrast)
    , m_originalBackgroundColor(TnhColors::toolPanelButtonColor)
{
    ToolPanelButton::awakeFromScene(); // derived classes are not made yet
}

ToolPanelButton::ToolPanelButton(const platform::Rect &frame)
    : ToolPanelButton(nullptr)
{
    setFrame(frame);
    ToolPanelButton::awakeFromScene();
}

ToolPanelButton::~ToolPanelButton() = default;

// Called by the constructors, and again when a scene has given the button its place and images.
void ToolPanelButton::awakeFromScene()
{
    m_trackingArea = platform::TrackingArea { bounds() };
    m_buttonImage = image();
    m_buttonAltImage = alternateImage();
}

void ToolPanelButton::assignArrowColor(const QColor &color)
{
    m_setArrowColor = color;
}

bool ToolPanelButton::hasFixedImage() const
{
    return identifier() == Tools::color;
}

void ToolPanelButton::showTriangle(const QColor &color)
{
    m_setArrowColor = color;
    setNeedsDisplay();
}

void ToolPanelButton::draw(const platform::Rect &dirtyRect)
{
    Button::draw(dirtyRect);
    if (identifier() != Tools::text && identifier() != Tools::brush)
        return;
    const double right = bounds().width - triangleInset;
    const double bottom = bounds().height - triangleInset;
    QPainterPath triangle(QPointF(right, bottom));
    triangle.lineTo(right, bottom - triangleLeg);
    triangle.lineTo(right - triangleLeg, bottom);
    triangle.closeSubpath();
    Painter painter(*this);
    painter.fillPath(triangle, m_setArrowColor);
}

void ToolPanelButton::mouseEntered()
{
    if (!isEnabled())
        return;
    showTriangle(m_arrowHoverColor);
    if (identifier() == Tools::state) {
        setBackgroundColor(isContrastIncreased() ? TnhColors::endButtonColorContrastHover
                                                 : TnhColors::endButtonColorHover);
    } else {
        setBackgroundColor(
            isContrastIncreased() ? hoverBackgroundColorContrast() : hoverBackgroundColor());
    }
    if (!hasFixedImage())
        setImage(m_buttonAltImage);
}

// The enabled state does not matter here: a button that was disabled under the pointer must not
// keep its hover look.
void ToolPanelButton::mouseExited()
{
    if (m_isSelected)
        return;
    showTriangle(m_arrowNormalColor);
    if (identifier() == Tools::state) {
        setBackgroundColor(
            isContrastIncreased() ? TnhColors::endButtonColorContrast : TnhColors::endButtonColor);
    } else {
        setBackgroundColor(originalBackgroundColor());
    }
    if (!hasFixedImage())
        setImage(m_buttonImage);
}

// Here the end button gets the ordinary colours of the panel, like every other button.
void ToolPanelButton::toggleToolState()
{
    if (m_isSelected) {
        setBackgroundColor(
            isContrastIncreased() ? hoverBackgroundColorContrast() : hoverBackgroundColor());
        showTriangle(m_arrowHoverColor);
    } else {
        showTriangle(m_arrowNormalColor);
        setBackgroundColor(originalBackgroundColor());
    }
    if (!hasFixedImage())
        setImage(m_isSelected ? m_buttonAltImage : m_buttonImage);
}

} // namespace penwick
