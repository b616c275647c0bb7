// SPDX-License-Identifier: MIT
// The steps of the pointer on the drawing window.
#include "soak/Session.h"
#include "soak/Words.h"

#include <algorithm>

namespace penwick::test {

namespace {

constexpr int columns = 16; // places that the pointer goes to
constexpr int rows = 12;

} // namespace

Spot Session::spotFor(const Step &step, int margin) const
{
    const Spot size = m_real.size();
    const auto at = [margin](int part, int parts, double length) {
        const int free = static_cast<int>(length - 2 * margin);
        const int place = margin + (part % parts) * free / (parts - 1);
        return static_cast<double>(place);
    };
    return { at(step.a, columns, size.x), at(step.b, rows, size.y) };
}

bool Session::canPoint() const
{
    return m_plain->isVisible() && !m_plain->isMinimised() && !m_plain->isClosed();
}

bool Session::isGrabLost() const
{
    if (m_grab.empty() || m_grab == "canvas")
        return false;
    const auto &views = m_plain->canvas().views;
    const bool isThere = std::find(views.begin(), views.end(), m_grab) != views.end();
    const bool isShown = m_grab.front() == 'b'
        || m_plain->canvas().allBoxes.at("b" + m_grab.substr(1)).isButtonShown;
    return !isThere || !isShown;
}

void Session::press(Spot spot, int clicks)
{
    if (isGrabLost())
        releaseAll(spot);
    if (!canPoint() || m_real.held().testFlag(Qt::LeftButton))
        return;
    if (isMenuOpen() && !m_real.isBoardAt(spot))
        return;
    if (isMenuOpen())
        clicks = 1; // what closes a menu is not the first click of several
    m_plain->closeMenu();
    if (!m_real.held())
        m_grab = m_real.targetAt(spot);
    say("press " + m_grab + inWords(spot));
    m_real.press(spot);
    m_at = m_real.onDesktop(spot);
    m_spot = spot;
    m_plain->press(m_grab, spot, 1);
    for (int click = 2; click <= clicks; ++click) {
        if (m_real.held() != Qt::LeftButton || isGrabLost())
            return;
        release(spot);
        pressAgain(spot, click);
    }
}

void Session::pressAgain(Spot spot, int click)
{
    if (!canPoint() || m_real.held())
        return;
    m_grab = m_real.targetAt(spot);
    say((click == 2 ? "press again " : "press a third time ") + m_grab + inWords(spot));
    m_real.pressAgain(spot);
    m_plain->press(m_grab, spot, click == 2 ? 2 : 1); // a third is a first again
}

void Session::pressView(const Step &step)
{
    const auto &views = m_plain->canvas().views;
    if (!views.empty())
        press(m_real.middleOf(views[static_cast<std::size_t>(step.a) % views.size()]),
            step.b % 4 == 0 ? 2 : 1);
    if (step.b % 2 && m_real.held())
        release(m_real.middleOf(m_grab));
}

// Into what is being edited, so often that a word, or all of it, is selected; or twice into a box,
// so that it is.
void Session::pressText(const Step &step)
{
    std::string box = m_plain->canvas().editedBox();
    const bool isEdited = !box.empty();
    const auto &boxes = m_plain->canvas().boxes;
    if (!isEdited && !boxes.empty())
        box = boxes[static_cast<std::size_t>(step.a) % boxes.size()];
    if (box.empty())
        return;
    press(m_real.middleOf(box), isEdited ? 1 + step.a % 3 : 2);
    if (step.b % 2 && m_real.held())
        release(m_real.middleOf(box));
}

// The toolkit reports the way to a place before what happens there.
void Session::goTo(Spot spot)
{
    const QPointF place = m_real.onDesktop(spot);
    if (place != m_at && m_plain->isHeld())
        m_plain->drag(spot);
    m_at = place;
    m_spot = spot;
}

void Session::drag(Spot spot)
{
    if (isGrabLost())
        releaseAll(spot);
    if (!canPoint() || isMenuOpen())
        return;
    say("move" + inWords(spot));
    m_real.move(spot);
    goTo(spot);
}

// Less or more than makes a drag of a press.
void Session::tremble(const Step &step)
{
    drag({ m_spot.x + step.a % 15 - 7, m_spot.y + step.b % 11 - 5 });
}

void Session::release(Spot spot)
{
    if (isGrabLost())
        return releaseAll(spot);
    if (!canPoint() || !m_real.held().testFlag(Qt::LeftButton))
        return;
    // A delete button does what it does only where it is let go.
    if (m_grab.front() == 'x')
        spot = m_real.middleOf(m_grab);
    say("release" + inWords(spot));
    m_real.release(spot);
    goTo(spot);
    m_plain->release(spot);
    if (!m_real.held())
        m_grab.clear();
}

void Session::stroke(const Step &step)
{
    press(spotFor(step), 1);
    for (int part = 1; part <= 1 + step.b % 3; ++part)
        drag(spotFor({ step.kind, step.a + part * (step.b % 5), step.b + part }));
    release(spotFor({ step.kind, step.b, step.a }));
}

void Session::otherButton(const Step &step)
{
    otherButton(step.a % 3 ? Qt::RightButton : Qt::MiddleButton, spotFor(step));
}

void Session::otherButton(Qt::MouseButton button, Spot spot)
{
    const std::string name = button == Qt::RightButton ? "right" : "middle";
    if (isGrabLost())
        releaseAll(spot);
    if (!canPoint() || isMenuOpen())
        return;
    if (m_real.held().testFlag(button)) {
        say("release the " + name + " button" + inWords(spot));
        m_real.release(spot, button);
        goTo(spot);
        if (!m_real.held())
            m_grab.clear();
        return;
    }
    const std::string target = m_real.held() ? m_grab : m_real.targetAt(spot);
    if (target != "canvas" && m_real.held())
        return; // a menu in the middle of a drag would take the release
    say("press the " + name + " button on " + target + inWords(spot));
    m_real.press(spot, button);
    goTo(spot);
    if (target == "canvas") {
        m_grab = target;
        return;
    }
    if (target.front() == 'b' && button == Qt::RightButton)
        m_plain->openMenu(target);
    if (target.front() == 'b' && button == Qt::MiddleButton)
        m_plain->pressWheelOn(target);
    m_real.release(spot, button);
}

void Session::releaseAll(Spot spot)
{
    for (const Qt::MouseButton button : { Qt::LeftButton, Qt::RightButton, Qt::MiddleButton }) {
        if (m_real.held().testFlag(button))
            m_real.release(spot, button);
    }
    say("let go of what is gone");
    m_grab.clear();
}

} // namespace penwick::test
