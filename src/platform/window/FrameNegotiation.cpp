// SPDX-License-Identifier: MIT
#include "platform/window/FrameNegotiation.h"

#include "platform/window/ScreenCoordinates.h"

#include <algorithm>
#include <utility>

namespace penwick::platform {

namespace {

using Kind = FrameNews::Kind;
using Time = FrameNegotiation::Time;

// How many looks there are, and how far apart, before what is seen counts as the desktop's answer
// to a request that it did not grant. They are needed because a desktop does not announce each
// step.
constexpr int looks = 6;
constexpr Time lookInterval { 50 };
constexpr int looksBeforeAskingAgain = 3; // how many are left when the desktop is asked again

// Steps of one move by the user follow each other faster than this.
constexpr Time longestRest { 500 };

// For how long after a window was shown or framed anew a window manager may still be placing it.
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

// The whole move is told at once, and its steps are not. Meanwhile other windows are placed beside
// the target; if they followed the steps as well, they would be moved twice.
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

// When a window manager ends, its frames go; the next one makes new frames elsewhere before it puts
// them in their places. Neither is a move by the user, unless the window comes to rest elsewhere.
void FrameNegotiation::hearCorner(std::optional<QPoint> corner, Time now)
{
    const bool hadFrame = std::exchange(m_corner, corner).has_value();
    if (hadFrame == corner.has_value())
        return;
    m_framing = corner ? Framing::There : Framing::Lost;
    // The window manager was slow: the looks were over before it had framed the window, and the
    // place that was then seen was inside an unfinished frame. So the request holds again.
    if (corner && m_askedBeforeFrame)
        m_frame = *m_askedBeforeFrame;
    m_askedBeforeFrame.reset();
    m_framedAt = now;
    if (m_phase != Phase::Gliding) // which asks at its end
        await(now);
}

FrameEffects FrameNegotiation::look(const FrameObservation &seen, Time now)
{
    if (!isUserMoving(now))
        m_userRestsAt.reset();
    if (m_phase == Phase::Gliding)
        return lookOnTheWay(seen);
    if (seen.isMinimised) { // no desktop answers for a minimised window
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
    // A window seen elsewhere is not believed until the looks are over, not even after it was seen
    // as asked: when several requests were made in a row, that may have been the answer to an older
    // one, and other answers are still to come.
    return effects;
}

// It is not told as what the desktop has chosen, which would be answered by another request: this
// is the answer to one.
FrameEffects FrameNegotiation::learn(const FrameObservation &seen, Time now)
{
    FrameEffects effects;
    const QRect outer = outerFrame(seen);
    if (isAtRest() && !isWhereItBelongs(outer))
        believe(outer, seen, Cause::Program, now, effects);
    return effects;
}

void FrameNegotiation::grant(
    const FrameObservation &seen, bool wasAsked, Time now, FrameEffects &effects)
{
    const bool isGranted = wasAsked || m_phase == Phase::Asked; // adoptScale() may ask anew
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

// While the window glides, another scale and other borders are only taken over; the next step
// places the window by them.
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

// Counts a look that was due; early looks, which are taken because something happened, do not
// count. Returns whether the desktop is to be asked again at this look. A window manager that is
// busy with a new window may still answer an older request, or measure this one by older size
// limits; one that refuses will refuse again.
bool FrameNegotiation::countLook(Time now)
{
    if ((m_phase != Phase::Asked && m_phase != Phase::Granted) || now < m_lookAt)
        return false;
    m_lookAt = now + lookInterval;
    if (--m_looksLeft <= 0)
        m_phase = Phase::Settled;
    return m_phase == Phase::Asked && m_looksLeft == looksBeforeAskingAgain;
}

// On a screen of another scale the same window and the same title bar have other sizes in points.
// What the program has asked for in points still holds.
void FrameNegotiation::adoptScale(const FrameObservation &seen, FrameEffects &effects)
{
    const double before = std::exchange(m_scale, seen.scale);
    if (before == seen.scale)
        return;
    if (m_framing == Framing::Lost || seen.isArranged)
        m_margins = m_margins * (before / seen.scale);
    else if (!seen.isBorderless)
        m_margins = seen.margins;
    // The toolkit may have reported as granted what the desktop had not done yet, so a granted
    // request is open again. It gets no new looks, because the request itself may be what moves the
    // window to and fro between two screens.
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
        return false; // the toolkit's margins mean nothing then
    return seen.margins != m_margins && (isAtRest() || !seen.margins.isNull());
}

QRect FrameNegotiation::outerFrame(const FrameObservation &seen) const
{
    QRect outer = seen.frame;
    if (seen.isBorderless)
        outer = seen.content;
    else if (m_framing == Framing::Lost) // the next window manager frames the content where it is
        outer = seen.content.marginsAdded(m_margins);
    if (m_corner)
        outer.moveTopLeft(fromPixels(*m_corner, seen.screen, seen.scale));
    return outer;
}

// Where a point has more than one pixel, a border of a single pixel is no whole number of points,
// so a difference of one point is allowed.
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

// Right after a window manager has framed a window, it may move the frame without telling the
// window. The toolkit then keeps a place that was true only for a moment. It learns the true place
// when the window moves, so the window is moved by a point and back; a request for the place where
// it is would move nothing. At other times, and while the user drags the window, the toolkit is
// only a little late.
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

// On a screen of another scale the window keeps its size in pixels, so its size in points changes.
// Here the move is told before the size, so that whoever keeps a distance from the window's corner
// keeps it in points.
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
