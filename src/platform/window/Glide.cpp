// SPDX-License-Identifier: MIT
#include "platform/window/Glide.h"

#include "platform/window/FrameTracker.h"

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
    const Rect from = m_at.value_or(m_tracker.frame());
    stop();
    m_at = from;
    m_animation = new QVariantAnimation(this);
    m_animation->setDuration(glideTime);
    m_animation->setEasingCurve(QEasingCurve::OutCubic);
    m_animation->setStartValue(0.0);
    m_animation->setEndValue(1.0);
    connect(m_animation, &QVariantAnimation::valueChanged, this,
        [this, from, target](const QVariant &progress) {
            m_at = between(from, target, progress.toDouble());
            m_tracker.step(*m_at);
        });
    connect(m_animation, &QVariantAnimation::finished, this, [this, target] {
        m_at.reset();
        m_tracker.request(target);
    });
    m_animation->start(QAbstractAnimation::DeleteWhenStopped);
    m_tracker.setOff(target); // last: whoever is told may send the window elsewhere
}

void Glide::halt()
{
    if (const auto at = m_at) {
        stop();
        m_tracker.request(*at);
    }
}

void Glide::stop()
{
    delete m_animation;
    m_at.reset();
}

} // namespace penwick::platform
