// SPDX-License-Identifier: MIT
// What a popover tells the tool bar.
#pragma once

class QString;

namespace penwick {

/// The tool bar, as its popovers see it. Implemented by a QObject.
class ToolPanelOptionDelegate
{
public:
    virtual ~ToolPanelOptionDelegate() = default;

    /// Another colour was chosen; `newColorState` names its image.
    virtual void changeColorToolImage(const QString &newColorState) = 0;
};

} // namespace penwick
