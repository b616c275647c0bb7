// SPDX-License-Identifier: MIT
// A piece of text with its look.
#pragma once

#include <QColor>
#include <QFont>
#include <QMetaType>
#include <QString>

namespace penwick::platform {

/// Text in one colour, font and alignment.
struct AttributedString
{
    QString string;
    QColor foregroundColor;
    QFont font;
    Qt::Alignment alignment = Qt::AlignLeft;

    friend bool operator==(const AttributedString &, const AttributedString &) = default;
};

} // namespace penwick::platform

Q_DECLARE_METATYPE(penwick::platform::AttributedString)
