// SPDX-License-Identifier: MIT
// How a canvas chooses a tool itself.
#pragma once

class QString;

namespace penwick {

/// The tool bar, as the canvas sees it: whoever shows which tool is chosen. Implemented by a
/// QObject.
class ToolChooser
{
public:
    virtual ~ToolChooser() = default;

    /// Does at once what a press on the button of `tool` does.
    virtual void chooseTool(const QString &tool) = 0;
};

} // namespace penwick
