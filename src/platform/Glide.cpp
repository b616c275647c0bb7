// SPDX-License-Identifier: MIT
#include "platform/Glide.h"

#include "platform/FrameTracker.h"

#include <QVariantAnimation>

namespace penwick::platform {

namespace {

constexpr int glideTime = 200; // ms

Rect between(const Rect &from, const Rect &to, double progress)
{
    const auto mix = [progress](double a, double b) { return a + (b - a) * progress; };
    return { mix(from.x, to.x), mix(from.y, to.y), mix(from.width, to.width),
        mix(from.height, to.height) };
}

} // namespace

Glide::Glide(FrameTracker &tracker)
    : QObject(&tracker)
    , m_tracker(tracker)
{ }

void Glide::start(const Rect &target)
{
    stop();
    const Rect from = m_tracker.frame();
    m_target = target;
    m_animation = new QVariantAnimation(this);
    m_animation->setDuration(glideTime);
    m_animation->setEasingCurve(QEasingCurve::OutCubic);
    m_animation->setStartValue(0.0);
    m_animation->setEndValue(1.0);
    connect(m_animation, &QVariantAnimation::valueChanged, this,
        [this, from, target](const QVariant &progress) {
            m_tracker.request(between(from, target, progress.toDouble()));
        });
    connect(m_animation, &QVariantAnimation::finished, this, [this] { m_target.reset(); });
    m_animation->start(QAbstractAnimation::DeleteWhenStopped);
}

void Glide::stop()
{
    delete m_animation;
    m_target.reset();
}

} // namespace penwick::platform
