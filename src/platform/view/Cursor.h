// SPDX-License-Identifier: MIT
// A pointer shape that stays sharp on every screen.
// QCursor is a bitmap with a hot spot in that bitmap's own pixels; this is artwork with a hot spot
// in points, turned into a QCursor for the scale of the window it is shown in.
#pragma once

#include <penwick/platform/Geometry.h>

#include <QCursor>
#include <QIcon>

#include <memory>

class QWidget;

namespace penwick::platform {

/// Copies are the same cursor; two cursors made from the same artwork are not. GUI thread only.
class Cursor
{
public:
    /// The desktop's ordinary arrow.
    static Cursor arrow();

    /// `hotSpot` is in points from the image's TOP left corner, as the artwork is drawn.
    Cursor(const QIcon &image, Point hotSpot);

    [[nodiscard]] Point hotSpot() const;
    [[nodiscard]] QIcon image() const; ///< null for arrow()

    /// The cursor for a window with `devicePixelRatio`. The image is rendered once for each ratio.
    [[nodiscard]] QCursor forScale(double devicePixelRatio) const;

    /// Shows this cursor now over a view's `surface`, until the pointer next enters a view with a
    /// cursor of its own.
    void set(QWidget &surface) const;

    /// The cursor that was set last, by set() or by the pointer entering a view; arrow() where
    /// somebody else has given the view's widget another one since.
    static Cursor currentCursor();

    friend bool operator==(const Cursor &a, const Cursor &b) { return a.m_data == b.m_data; }

private:
    struct Data;
    explicit Cursor(std::shared_ptr<const Data> data);

    static Cursor &current();

    std::shared_ptr<const Data> m_data;
};

} // namespace penwick::platform
