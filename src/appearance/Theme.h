// SPDX-License-Identifier: MIT
// The component's fixed look: its colours, sizes and default tool.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QColor>
#include <QHash>
#include <QString>

namespace penwick {

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
inline const QColor borderGreenColor = QColor::fromRgbF(0.0F, 1.0F, 0.0F, 0.3F);
inline constexpr QColor endButtonColor { 239, 71, 111 };
inline constexpr QColor endButtonColorHover { 255, 80, 134 };
inline constexpr QColor endButtonColorContrast { 190, 41, 76 };
inline constexpr QColor endButtonColorContrastHover { 219, 47, 87 };
inline constexpr QColor toolPanelHandleColor { 203, 210, 218 };
inline constexpr QColor toolPanelButtonColor { 246, 248, 250 };
inline constexpr QColor toolPanelButtonHoverColor { 18, 168, 241 };
inline constexpr QColor toolPanelButtonHoverColorContrast { 7, 69, 149 };
inline const QColor textBoxEditBorderColor = QColor::fromRgbF(0.0F, 0.0F, 1.0F, 0.8F);
inline const QColor textBoxNormalBorderColor = QColor::fromRgbF(0.0F, 0.0F, 1.0F, 0.4F);
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
inline const QString text = QStringLiteral("text");
inline const QString brush = QStringLiteral("brush");
inline const QString eraser = QStringLiteral("eraser");
inline const QString color = QStringLiteral("color");
inline const QString clear = QStringLiteral("clear");
inline const QString state = QStringLiteral("state"); ///< ends the session
inline const QString undo = QStringLiteral("undo");
inline const QString redo = QStringLiteral("redo");
inline const QString defaultSelectedTool = text;
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
