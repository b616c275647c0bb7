// SPDX-License-Identifier: MIT
#include "platform/scene/SvgIconEngine.h"

#include <QPainter>
#include <QPixmap>
#include <QSvgRenderer>

namespace penwick::platform {

namespace {

constexpr double disabledOpacity = 0.35;

} // namespace

SvgIconEngine::SvgIconEngine(const QString &file)
    : m_renderer(std::make_shared<QSvgRenderer>(file))
{ }

SvgIconEngine::~SvgIconEngine() = default;

void SvgIconEngine::paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State)
{
    painter->save();
    if (mode == QIcon::Disabled)
        painter->setOpacity(painter->opacity() * disabledOpacity);
    m_renderer->render(painter, QRectF(rect));
    painter->restore();
}

QPixmap SvgIconEngine::pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state)
{
    QPixmap pixmap(size);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    paint(&painter, QRect(QPoint(), size), mode, state);
    return pixmap;
}

QSize SvgIconEngine::actualSize(const QSize &size, QIcon::Mode, QIcon::State)
{
    const QSize own = m_renderer->defaultSize();
    return own.width() <= size.width() && own.height() <= size.height()
        ? own
        : own.scaled(size, Qt::KeepAspectRatio);
}

QIconEngine *SvgIconEngine::clone() const
{
    return new SvgIconEngine(*this);
}

} // namespace penwick::platform
