// SPDX-License-Identifier: MIT
// The component's fixed look: its colours, sizes and default tool.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QColor>
#include <QHash>
#include <QLatin1String>
#include <QString>

namespace penwick {

// All of these are constants at compile time and inline: loading the library runs no code for them,
// and the library holds each only once.

namespace ColorParts {
inline constexpr ushort full = 0xFFFF;
/// 0.3, 0.4 and 0.8 of `full`, rounded as QColor::setAlphaF() rounds them.
inline constexpr ushort alpha030 = 19661;
inline constexpr ushort alpha040 = 26214;
inline constexpr ushort alpha080 = 52428;
} // namespace ColorParts

/// The theme's colours. Several are equal by design and stay separate: they mean different things.
namespace TnhColors {
inline constexpr QColor redColor { 255, 58, 104 };
inline constexpr QColor greenColor { 0, 203, 121 };
inline constexpr QColor blueColor { 20, 120, 199 };
inline constexpr QColor whiteColor { 255, 255, 255 };
inline constexpr QColor greyColor { 77, 103, 128 };
inline constexpr QColor blackColor { 41, 41, 41 };
inline constexpr QColor yellowColor { 255, 196, 61 };
inline constexpr QColor lightBlueColor { 0, 167, 244 };
inline constexpr QColor lightGreyColor { 203, 210, 218 };
inline constexpr QColor borderGreenColor { QColor::Rgb, ColorParts::alpha030, 0, ColorParts::full,
    0 };
inline constexpr QColor endButtonColor { 239, 71, 111 };
inline constexpr QColor endButtonColorHover { 255, 80, 134 };
inline constexpr QColor endButtonColorContrast { 190, 41, 76 };
inline constexpr QColor endButtonColorContrastHover { 219, 47, 87 };
inline constexpr QColor toolPanelHandleColor { 203, 210, 218 };
inline constexpr QColor toolPanelButtonColor { 246, 248, 250 };
inline constexpr QColor toolPanelButtonHoverColor { 18, 168, 241 };
inline constexpr QColor toolPanelButtonHoverColorContrast { 7, 69, 149 };
inline constexpr QColor textBoxEditBorderColor { QColor::Rgb, ColorParts::alpha080, 0, 0,
    ColorParts::full };
inline constexpr QColor textBoxNormalBorderColor { QColor::Rgb, ColorParts::alpha040, 0, 0,
    ColorParts::full };
inline constexpr QColor toolOptionButtonColor { 246, 248, 250 };
inline constexpr QColor toolOptionButtonHoverColor { 203, 210, 218 };
} // namespace TnhColors

namespace ToolPanelUI {
inline constexpr QColor toolPanelBorderColor { 128, 128, 128 };
inline constexpr double toolPanelBorderRadius = 4.0; ///< points
inline constexpr QColor toolPanelColor { 246, 248, 250 };
} // namespace ToolPanelUI

namespace PopoverUI {
/// The colour of a popover's border, in spite of the name, which is fixed.
inline constexpr QColor popoverBackgroundColor { 128, 128, 128 };
} // namespace PopoverUI

namespace TextBoxParams {
inline constexpr QColor defaultTextFontColor { 0, 0, 0 };
} // namespace TextBoxParams

/// The identifiers of the tools: what the tool bar's buttons are called and what is handed on when
/// one is chosen. Only the first three change what the pointer does.
namespace Tools {
inline constexpr QLatin1String text { "text" };
inline constexpr QLatin1String brush { "brush" };
inline constexpr QLatin1String eraser { "eraser" };
inline constexpr QLatin1String color { "color" };
inline constexpr QLatin1String clear { "clear" };
inline constexpr QLatin1String state { "state" }; ///< ends the session
inline constexpr QLatin1String undo { "undo" };
inline constexpr QLatin1String redo { "redo" };
inline constexpr QLatin1String defaultSelectedTool = text;
} // namespace Tools

/// Hot spots in points from the top left corner of the cursor's image.
namespace CursorHotspot {
inline constexpr platform::Point textCursorHotspot { 10.0, 10.0 };
inline constexpr platform::Point brushCursorHotspot { 0.0, 20.0 };
inline constexpr platform::Point eraserCursorHotspot { 0.0, 20.0 };
inline constexpr platform::Point moveCursorHotspot { 12.0, 12.0 };
} // namespace CursorHotspot

/// The colours that a drawing may use, by the names under which the colour popover offers them.
/// Made once; any thread.
[[nodiscard]] const QHash<QString, QColor> &colorMap();

} // namespace penwick
