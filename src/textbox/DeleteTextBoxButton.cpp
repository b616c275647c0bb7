// SPDX-License-Identifier: MIT
#include "textbox/DeleteTextBoxButton.h"

#include "appearance/PenwickBundle.h"
#include "platform/foundation/FatalError.h"

namespace penwick {

namespace {

constexpr double distance = 1.0; // points, from the box's corner
constexpr double side = 20.0; // points

} // namespace

DeleteTextBoxButton::DeleteTextBoxButton(const platform::Rect &frame)
{
    const platform::Point origin = originFor(frame);
    setFrame({ origin.x, origin.y, side, side });
    const auto &bundle = platform::require(penwickBundle(), "the resource bundle is not set");
    setImage(bundle->imageForResource(QStringLiteral("Delete_Text_Icon")));
    setAlternateImage(bundle->imageForResource(QStringLiteral("Delete_Text_Icon_Hover")));
    setHidden(true);
    setAccessibleName(tr("Delete text"));
    setToolTip(accessibleName());
}

platform::Point DeleteTextBoxButton::originFor(const platform::Rect &frame)
{
    return { frame.maxX() + distance, frame.maxY() + distance };
}

void DeleteTextBoxButton::restoreImage()
{
    if (!m_tempImage.isNull())
        setImage(m_tempImage);
}

void DeleteTextBoxButton::mouseEntered()
{
    m_tempImage = image();
    setImage(alternateImage());
    platform::Cursor::arrow().set(*this);
}

void DeleteTextBoxButton::mouseExited()
{
    restoreImage();
}

void DeleteTextBoxButton::mouseMoved(const platform::MouseEvent &)
{
    platform::Cursor::arrow().set(*this);
}

} // namespace penwick
