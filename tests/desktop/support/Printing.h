// SPDX-License-Identifier: MIT
// How a failed comparison shows Qt's values. Included wherever a test compares them.
#pragma once

#include <QPoint>
#include <QRect>
#include <QString>

#include <ostream>

// GoogleTest looks for these beside the types, which is outside of every namespace.
inline void PrintTo(const QString &text, std::ostream *stream)
{
    *stream << '"' << text.toStdString() << '"';
}

inline void PrintTo(const QPoint &point, std::ostream *stream)
{
    *stream << '(' << point.x() << ", " << point.y() << ')';
}

inline void PrintTo(const QSize &size, std::ostream *stream)
{
    *stream << size.width() << " x " << size.height();
}

inline void PrintTo(const QRect &rectangle, std::ostream *stream)
{
    PrintTo(rectangle.topLeft(), stream);
    *stream << ' ';
    PrintTo(rectangle.size(), stream);
}
