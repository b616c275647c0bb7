// SPDX-License-Identifier: MIT
#include "platform/view/Cursor.h"

#include "platform/native/NativeDesktop.h"

#include <QPixmap>
#include <QPointer>
#include <QWidget>

#include <cmath>
#include <utility>
#include <vector>

namespace penwick::platform {

namespace {

constexpr int largestCursor = 128; // points; more than any cursor's own size

struct SetCursor
{
    QPointer<QWidget> widget;
    QCursor shown;
};

// What was set last, and on what. Never destroyed, like the cursor itself.
SetCursor &lastSet()
{
    static auto *const last = new SetCursor;
    return *last;
}

} // namespace

struct Cursor::Data
{
    QIcon image;
    Point hotSpot;
    mutable std::vector<std::pair<double, QCursor>> rendered {}; ///< by scale; a desktop has few
};

Cursor::Cursor(std::shared_ptr<const Data> data)
    : m_data(std::move(data))
{ }

Cursor::Cursor(const QIcon &image, Point hotSpot)
    : Cursor(std::make_shared<const Data>(Data { image, hotSpot }))
{ }

Cursor Cursor::arrow()
{
    // Never destroyed: images need an application, which may be gone by then.
    static const auto *const data = new std::shared_ptr<const Data>(std::make_shared<const Data>());
    return Cursor(*data);
}

Cursor &Cursor::current()
{
    static auto *const cursor = new Cursor(arrow());
    return *cursor;
}

Point Cursor::hotSpot() const
{
    return m_data->hotSpot;
}

QIcon Cursor::image() const
{
    return m_data->image;
}

QCursor Cursor::forScale(double devicePixelRatio) const
{
    if (m_data->image.isNull())
        return QCursor(Qt::ArrowCursor);
    for (const auto &[scale, cursor] : m_data->rendered) {
        if (scale == devicePixelRatio)
            return cursor;
    }
    const QSize size = m_data->image.actualSize(QSize(largestCursor, largestCursor));
    const QPixmap pixmap = m_data->image.pixmap(size, devicePixelRatio);
    const double scale = NativeDesktop::hotSpotScale(devicePixelRatio);
    const QCursor cursor(pixmap, static_cast<int>(std::lround(m_data->hotSpot.x * scale)),
        static_cast<int>(std::lround(m_data->hotSpot.y * scale)));
    m_data->rendered.emplace_back(devicePixelRatio, cursor);
    return cursor;
}

void Cursor::set(QWidget &surface) const
{
    current() = *this;
    const QCursor shown = forScale(surface.devicePixelRatioF());
    // Each setCursor() goes to the desktop, which is too much for every move of the pointer.
    if (!surface.testAttribute(Qt::WA_SetCursor) || surface.cursor() != shown)
        surface.setCursor(shown);
    lastSet() = { &surface, shown };
}

Cursor Cursor::currentCursor()
{
    // The host may have given the widget another cursor meanwhile.
    const SetCursor &last = lastSet();
    return last.widget && last.widget->cursor() != last.shown ? arrow() : current();
}

} // namespace penwick::platform
