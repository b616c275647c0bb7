// SPDX-License-Identifier: MIT
// What a text box has to say to whoever writes in it.
#pragma once

class QString;
class QWidget;

namespace penwick {

/// Shows `text` below `box` for some seconds, and has assistive programs say it.
void sayAt(QWidget &box, const QString &text);

} // namespace penwick
