// SPDX-License-Identifier: MIT
#include "platform/window/FrameNegotiation.h"

#include "platform/window/ScreenCoordinates.h"

#include <algorithm>
#include <utility>

namespace penwick::platform {

namespace {

using Kind = FrameNews::Kind;
using Time = FrameNegotiation::Time;

// How often, and after what time each, a request that was not granted is looked at again before
// what stands there is taken for the answer. The desktop does not announce every step of its own.
constexpr int looks = 6;
constexpr Time lookInterval { 50 };
constexpr int looksBeforeAskingAgain = 3; // of those that are left

// Steps of one move by the user follow each other faster than this.
constexpr Time longestRest { 500 };

// How long after it was shown, or framed anew, a window is still being put in its place.
constexpr Time newness { 2000 };

} // namespace

FrameNegotiation::FrameNegotiation(const QRect &frame, QPoint origin)
    : m_frame(frame)
    , m_told { QRect(), origin }
{ }

std::optional<Time> FrameNegotiation::nextLook() const
{
    std::optional<Time> next = m_userRestsAt;
    if (m_phase == Phase::Asked || m_phase == Phase::Granted)
        next = next ? std::min(*next, m_lookAt) : m_lookAt;
    return next;
}

void FrameNegotiation::askUnseen(const QRectF &frame)
{
    m_frame = frame;
    m_askedBeforeFrame.reset();
}

FrameEffects FrameNegotiation::ask(const QRectF &frame, Time now)
{
    askUnseen(frame);
    await(now);
    return { placing() };
}

// Told before anybody asks where the window is: who stands beside it and follows it would otherwise
// be put where it will be, and then be taken along the way as well.
FrameEffects FrameNegotiation::setOff(const QRectF &target, Time now)
{
    askUnseen(target);
    m_phase = Phase::Gliding;
    FrameEffects effects;
    tell(m_told.origin, Cause::Program, target, now, effects);
    return effects;
}

FramePlacing FrameNegotiation::step(const QRectF &frame) const
{
    return { rounded(frame).marginsRemoved(m_margins) };
}

FrameEffects FrameNegotiation::appear(const QMargins &margins, double scale, Time now)
{
    m_margins = margins;
    m_scale = scale;
    m_framing = Framing::Unknown;
    m_corner.reset();
    m_askedBeforeFrame.reset();
    m_framedAt = now;
    m_told.frame = rounded(m_frame);
    await(now);
    return { placing() };
}

// The window manager that ends takes its frames along, and the one that comes back builds them
// elsewhere before it puts them in their place. Neither is a move by the user, unless the window
// comes to rest elsewhere.
void FrameNegotiation::hearCorner(std::optional<QPoint> corner, Time now)
{
    const bool hadFrame = std::exchange(m_corner, corner).has_value();
    if (hadFrame == corner.has_value())
        return;
    m_framing = corner ? Framing::There : Framing::Lost;
    // The window manager was slow, and the toolkit believes in a place inside a frame in the
    // making.
    if (corner && m_askedBeforeFrame)
        m_frame = *m_askedBeforeFrame;
    m_askedBeforeFrame.reset();
    m_framedAt = now;
    await(now);
}

FrameEffects FrameNegotiation::look(const FrameObservation &seen, Time now)
{
    if (!isUserMoving(now))
        m_userRestsAt.reset();
    if (m_phase == Phase::Gliding)
        return lookOnTheWay(seen);
    if (seen.isMinimised) { // nobody answers meanwhile
        if (m_phase != Phase::Settled)
            m_phase = m_phase == Phase::Granted ? Phase::Settled : Phase::Suspended;
        return {};
    }
    if (m_phase == Phase::Suspended)
        await(now);
    const bool wasAsked = m_phase == Phase::Asked;
    const bool isTimeToAskAgain = countLook(now);
    FrameEffects effects;
    adoptScale(seen, effects);
    if (isDecoratedAnew(seen)) {
        m_margins = seen.margins;
        effects.emplace_back(placing());
        await(now);
        return effects;
    }
    const QRect outer = outerFrame(seen);
    if (isWhereItBelongs(outer))
        grant(seen, wasAsked, now, effects);
    else if (m_phase == Phase::Settled)
        believe(outer, seen, wasAsked ? Cause::Desktop : Cause::User, now, effects);
    else if (isTimeToAskAgain && m_framing != Framing::Lost && !seen.isArranged)
        effects.emplace_back(placing());
    // Elsewhere it is not believed until the looks are over; after an answer either, because where
    // requests go back and forth it may be the answer to an older one, and those in between come
    // later.
    return effects;
}

void FrameNegotiation::grant(
    const FrameObservation &seen, bool wasAsked, Time now, FrameEffects &effects)
{
    const bool isGranted = wasAsked || m_phase == Phase::Asked; // by another scale meanwhile
    if (m_phase == Phase::Asked)
        m_phase = Phase::Granted;
    remindToolkit(seen, now, effects);
    if (isGranted)
        effects.emplace_back(FrameNews { Kind::Confirmed });
    tell(seen.origin, Cause::Program, m_frame, now, effects);
    if (isAtRest())
        effects.emplace_back(FrameNews { Kind::Settled });
}

void FrameNegotiation::believe(
    const QRect &outer, const FrameObservation &seen, Cause cause, Time now, FrameEffects &effects)
{
    if (!m_corner && !m_askedBeforeFrame && isNew(now))
        m_askedBeforeFrame = m_frame;
    m_reminder = Reminder::NotNeeded;
    const QRectF asked = std::exchange(m_frame, QRectF(outer));
    tell(seen.origin, cause, asked, now, effects);
    effects.emplace_back(FrameNews { Kind::Settled });
}

// What it is to be on another screen, or inside other borders, is for the next step to mind.
FrameEffects FrameNegotiation::lookOnTheWay(const FrameObservation &seen)
{
    FrameEffects effects;
    if (seen.isMinimised)
        return effects;
    adoptScale(seen, effects);
    if (isDecoratedAnew(seen))
        m_margins = seen.margins;
    return effects;
}

void FrameNegotiation::await(Time now)
{
    m_phase = Phase::Asked;
    m_looksLeft = looks;
    m_lookAt = now + lookInterval;
}

// Only looks that were due count: many may be taken at once because something happened. Says
// whether this is the one at which to ask again. A window manager that is busy with a new window
// may answer an older request, or hold this one against the limits of an older one; one that
// refuses does so twice.
bool FrameNegotiation::countLook(Time now)
{
    if ((m_phase != Phase::Asked && m_phase != Phase::Granted) || now < m_lookAt)
        return false;
    m_lookAt = now + lookInterval;
    if (--m_looksLeft <= 0)
        m_phase = Phase::Settled;
    return m_phase == Phase::Asked && m_looksLeft == looksBeforeAskingAgain;
}

// On a screen of another scale the same window and the same title bar measure other points. What
// the program has asked for in points still holds.
void FrameNegotiation::adoptScale(const FrameObservation &seen, FrameEffects &effects)
{
    const double before = std::exchange(m_scale, seen.scale);
    if (before == seen.scale)
        return;
    if (m_framing == Framing::Lost || seen.isArranged)
        m_margins = m_margins * (before / seen.scale);
    else if (!seen.isBorderless)
        m_margins = seen.margins;
    // A toolkit that answers before the desktop has done so may grant what is not there yet.
    // Without more looks: what is asked for may itself bring the window to the screen and back.
    if (m_phase == Phase::Granted)
        m_phase = Phase::Asked;
    if (m_phase == Phase::Asked)
        effects.emplace_back(placing());
    else
        m_isScaleUntold = m_phase == Phase::Settled;
    effects.emplace_back(FrameNews { Kind::Rescaled });
}

// Another title bar is the desktop's doing and not the user's, so the frame that was asked for
// still holds. A window that was just shown has no margins at all until it is decorated.
bool FrameNegotiation::isDecoratedAnew(const FrameObservation &seen) const
{
    if (seen.isBorderless || m_framing == Framing::Lost || seen.isArranged)
        return false; // whatever the toolkit makes of a frame that is still being built
    return seen.margins != m_margins && !(m_phase == Phase::Asked && seen.margins.isNull());
}

QRect FrameNegotiation::outerFrame(const FrameObservation &seen) const
{
    QRect outer = seen.frame;
    if (seen.isBorderless)
        outer = seen.content;
    else if (m_framing == Framing::Lost) // the next window manager puts it around what is there
        outer = seen.content.marginsAdded(m_margins);
    if (m_corner) {
        // The toolkit keeps a screen's corner in device pixels and scales what lies inside it.
        outer.moveTopLeft(seen.screen + (QPointF(*m_corner - seen.screen) / seen.scale).toPoint());
    }
    return outer;
}

// Borders of a pixel cannot be told in points where a point is more than that.
bool FrameNegotiation::isWhereItBelongs(const QRect &outer) const
{
    const QRect frame = rounded(m_frame);
    if (m_scale == 1.0)
        return outer == frame;
    const QMargins point(1, 1, 1, 1);
    return frame.marginsAdded(point).contains(outer) && outer.marginsAdded(point).contains(frame);
}

bool FrameNegotiation::isNew(Time now) const
{
    return m_framedAt && now - *m_framedAt < newness;
}

bool FrameNegotiation::isUserMoving(Time now) const
{
    return m_userRestsAt && now < *m_userRestsAt;
}

// A window manager may move a frame without a word to its window right after it has decorated it;
// the toolkit then holds a place that was true for a moment. It is told the true one as soon as the
// window moves again; asking for where it stands anyway would move nothing. Later on, and while the
// user drags the window, the toolkit may well lag behind.
void FrameNegotiation::remindToolkit(const FrameObservation &seen, Time now, FrameEffects &effects)
{
    QRect believed = rounded(m_frame);
    believed.moveTopLeft(seen.frame.topLeft());
    const bool isStale = m_corner && isNew(now) && !isUserMoving(now) && !seen.isArranged
        && !isWhereItBelongs(believed);
    if (!isStale) {
        m_reminder = Reminder::NotNeeded;
        return;
    }
    if (std::exchange(m_reminder, Reminder::Given) == Reminder::Given)
        return;
    effects.emplace_back(FramePlacing { placing().content.translated(1, 0) });
    effects.emplace_back(placing());
    await(now);
}

void FrameNegotiation::tellUserMove(Time now, FrameEffects &effects)
{
    const bool goesOn = isUserMoving(now);
    m_userRestsAt = now + longestRest;
    if (!goesOn)
        effects.emplace_back(FrameNews { Kind::MoveBegan });
}

// The window keeps its pixels, so its size in points is another one. The move comes before the
// size here, so that whatever keeps its distance from the window's corner does so in points.
void FrameNegotiation::tellRescaled(QPoint delta, bool hasResized, Time now, FrameEffects &effects)
{
    if (!delta.isNull()) {
        tellUserMove(now, effects);
        effects.emplace_back(FrameNews { Kind::Shifted, delta });
        effects.emplace_back(FrameNews { Kind::Moved });
    }
    if (hasResized)
        effects.emplace_back(FrameNews { Kind::Resized });
}

void FrameNegotiation::tell(
    QPoint origin, Cause cause, const QRectF &asked, Time now, FrameEffects &effects)
{
    const Told before = std::exchange(m_told, { rounded(m_frame), origin });
    const bool hasResized = m_told.frame.size() != before.frame.size();
    const QPoint delta = m_told.frame.topLeft() - before.frame.topLeft();
    if (std::exchange(m_isScaleUntold, false))
        return tellRescaled(delta, hasResized, now, effects);
    if (hasResized)
        effects.emplace_back(FrameNews { Kind::Resized });
    if (hasResized && cause == Cause::User)
        effects.emplace_back(FrameNews { Kind::ResizedByUser });
    else if (hasResized && cause == Cause::Desktop)
        effects.emplace_back(FrameNews { Kind::ResizedByDesktop, {}, asked });
    else if (!delta.isNull() && cause != Cause::Program)
        tellUserMove(now, effects);
    if (!hasResized && !delta.isNull())
        effects.emplace_back(FrameNews { Kind::Shifted, delta });
    if (!delta.isNull() || m_told.origin != before.origin)
        effects.emplace_back(FrameNews { Kind::Moved });
}

} // namespace penwick::platform
