// SPDX-License-Identifier: MIT
#include "appearance/ToolCursors.h"

#include "appearance/PenwickBundle.h"
#include "appearance/Theme.h"
#include "platform/foundation/FatalError.h"

namespace penwick {

namespace {

platform::Point hotSpotOf(const QString &image)
{
    if (image == QStringLiteral("Text_Cursor"))
        return CursorHotspot::textCursorHotspot;
    if (image == QStringLiteral("Brush_Cursor"))
        return CursorHotspot::brushCursorHotspot;
    if (image == QStringLiteral("Eraser_Cursor"))
        return CursorHotspot::eraserCursorHotspot;
    if (image == QStringLiteral("Move_Cursor"))
        return CursorHotspot::moveCursorHotspot;
    return {};
}

} // namespace

platform::Cursor getCursorOfType(const QString &cursor_type)
{
    const auto &bundle = platform::require(penwickBundle(), "the resource bundle is not set");
    const QIcon image = bundle->imageForResource(cursor_type);
    if (image.isNull())
        platform::fatalError("a cursor image is missing");
    return platform::Cursor(image, hotSpotOf(cursor_type));
}

} // namespace penwick
