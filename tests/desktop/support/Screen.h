// SPDX-License-Identifier: MIT
// The eye on the screen.
#pragma once

#include <QColor>
#include <QImage>
#include <QPoint>
#include <QRect>

namespace penwick::desktop {

class XConnection;

/// Reads what is really shown. Device pixels from the top left; the pointer is not in the picture.
class Screen final
{
public:
    /// Borrows `connection`, which must live longer.
    explicit Screen(const XConnection &connection);

    [[nodiscard]] QSize size() const;
    [[nodiscard]] QImage picture() const;
    /// `area` must lie within the screen.
    [[nodiscard]] QImage picture(const QRect &area) const;
    [[nodiscard]] QColor pixel(QPoint place) const;

private:
    const XConnection &m_connection;
};

} // namespace penwick::desktop
