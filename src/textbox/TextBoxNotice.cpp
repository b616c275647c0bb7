// SPDX-License-Identifier: MIT
#include "textbox/TextBoxNotice.h"

#include <QAccessible>
#include <QToolTip>
#include <QWidget>

namespace penwick {

void sayAt(QWidget &box, const QString &text)
{
    QToolTip::showText(box.mapToGlobal(QPoint(0, box.height())), text, &box);
    box.setAccessibleDescription(text);
#if QT_VERSION >= QT_VERSION_CHECK(6, 8, 0)
    QAccessibleAnnouncementEvent heard(&box, text);
#else
    QAccessibleEvent heard(&box, QAccessible::Alert);
#endif
    QAccessible::updateAccessibility(&heard);
}

} // namespace penwick
