// SPDX-License-Identifier: MIT
#include "textbox/DeleteTextBoxButton.h"

#include "appearance/PenwickBundle.h"
#include "platform/foundation/FatalError.h"

#include <utility>

namespace penwick {

namespace {

constexpr double distance = 1.0; // points, from the box's corner
constexpr double side = 20.0; // points

} // namespace

DeleteTextBoxButton::DeleteTextBoxButton(QWidget *parent)
    : Button(parent)
{ }

DeleteTextBoxButton::DeleteTextBoxButton(const platform::Rect &frame)
{
    const platform::Point origin = originFor(frame);
    setFrame({ origin.x, origin.y, side, side });
    const auto &bundle = platform::require(penwickBundle(), "the resource bundle is not set");
    setImage(bundle->imageForResource(QStringLiteral("Delete_Text_Icon")));
    setAlternateImage(bundle->imageForResource(QStringLiteral("Delete_Text_Icon_Hover")));
    setHidden(true);
    setAboveSiblings(true); // another box may lie there
    setAccessibleName(tr("Delete text"));
    setToolTip(accessibleName());
}

platform::Point DeleteTextBoxButton::originFor(const platform::Rect &frame)
{
    return { frame.maxX() + distance, frame.maxY() + distance };
}

void DeleteTextBoxButton::restoreImage()
{
    m_isHovered = false;
    if (!m_tempImage.isNull())
        setImage(m_tempImage);
}

void DeleteTextBoxButton::mouseEntered()
{
    // A desktop may tell of an entry twice without a leave between.
    if (!std::exchange(m_isHovered, true))
        m_tempImage = image();
    setImage(alternateImage());
    platform::Cursor::arrow().set(surface());
}

void DeleteTextBoxButton::mouseExited()
{
    restoreImage();
}

void DeleteTextBoxButton::mouseMoved(const platform::MouseEvent &event)
{
    cursorUpdate(event);
}

void DeleteTextBoxButton::cursorUpdate(const platform::MouseEvent &)
{
    platform::Cursor::arrow().set(surface());
}

} // namespace penwick
