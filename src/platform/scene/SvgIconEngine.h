// SPDX-License-Identifier: MIT
// Artwork as an icon, without the icon plug-in that a host may not have shipped.
#pragma once

#include <QIconEngine>

#include <memory>

class QSvgRenderer;

namespace penwick::platform {

/// Renders one SVG resource at whatever size and scale it is asked for.
class SvgIconEngine final : public QIconEngine
{
public:
    explicit SvgIconEngine(const QString &file);
    ~SvgIconEngine() override;

    void paint(QPainter *painter, const QRect &rect, QIcon::Mode mode, QIcon::State state) override;
    QPixmap pixmap(const QSize &size, QIcon::Mode mode, QIcon::State state) override;
    /// The artwork's own size, or the largest of its shape that fits into `size`.
    QSize actualSize(const QSize &size, QIcon::Mode mode, QIcon::State state) override;
    [[nodiscard]] QIconEngine *clone() const override;

private:
    std::shared_ptr<QSvgRenderer> m_renderer; // shared by the copies of an icon
};

} // namespace penwick::platform
