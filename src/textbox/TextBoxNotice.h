// SPDX-License-Identifier: MIT
// A message at a text box for the person who writes in it.
#pragma once

class QString;
class QWidget;

namespace penwick {

/// Shows `text` below `box` for some seconds, and has assistive programs speak it.
void sayAt(QWidget &box, const QString &text);

} // namespace penwick
