// SPDX-License-Identifier: MIT
#include "sessions/Session.h"

#include <algorithm>
#include <sstream>

namespace penwick::sessions {

namespace {

constexpr int columns = 16; // places that the pointer goes to
constexpr int rows = 12;

std::string inWords(Spot spot)
{
    return " " + std::to_string(static_cast<int>(spot.x)) + ","
        + std::to_string(static_cast<int>(spot.y));
}

std::vector<std::string> linesOf(const std::string &text)
{
    std::vector<std::string> lines;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);)
        lines.push_back(line);
    return lines;
}

} // namespace

Session::Session() = default;

void Session::open(int number)
{
    const auto type = static_cast<WindowType>(number % 3);
    m_real.open(type);
    m_plain = std::make_unique<PlainBoard>();
    m_grab.clear();
    m_isBannerShown = false;
    say("open kind " + std::to_string(static_cast<int>(type)));
}

std::optional<std::string> Session::run(const Steps &steps)
{
    m_said.clear();
    open(steps.empty() ? 0 : steps.front().b);
    for (const Step &step : steps) {
        take(step);
        if (auto found = difference())
            return found;
        if (m_plain->isClosed())
            open(step.b); // the host has been told, drops the window and makes another
    }
    return std::nullopt;
}

std::optional<std::string> Session::difference()
{
    const std::string real = m_real.inWords();
    const std::string plain = m_plain->inWords();
    if (real == plain)
        return std::nullopt;
    const std::vector<std::string> is = linesOf(real);
    const std::vector<std::string> expected = linesOf(plain);
    std::string report = "after:\n";
    for (const std::string &line : m_said)
        report += "  " + line + "\n";
    for (std::size_t line = 0; line < is.size() && line < expected.size(); ++line) {
        if (is[line] != expected[line])
            report += "expected: " + expected[line] + "\n      is: " + is[line] + "\n";
    }
    return report;
}

void Session::take(const Step &step)
{
    using Kind = Step::Kind;
    switch (step.kind) {
    case Kind::Press:
        return press(spotFor(step), false);
    case Kind::DoublePress:
        return press(spotFor(step), true);
    case Kind::PressView:
        return pressView(step);
    case Kind::Drag:
        return drag(spotFor(step, -20));
    case Kind::Release:
        return release(spotFor(step));
    case Kind::Click:
        press(spotFor(step), false);
        return release(spotFor(step));
    case Kind::Stroke:
        return stroke(step);
    case Kind::OtherButton:
        return otherButton(step);
    case Kind::Tool:
        return clickTool(step);
    case Kind::Option:
        return chooseOption(step);
    case Kind::Write:
        return write(step);
    case Kind::Key:
        return key(step);
    default:
        takeWindowStep(step);
    }
}

// The pointer

Spot Session::spotFor(const Step &step, int margin) const
{
    const Spot size = m_real.size();
    // Whole points: what a pointer can point at.
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

void Session::press(Spot spot, bool isDouble)
{
    if (isGrabLost())
        releaseAll(spot);
    if (!canPoint() || m_real.held().testFlag(Qt::LeftButton))
        return;
    if (!m_real.held())
        m_grab = m_real.targetAt(spot);
    say("press " + m_grab + inWords(spot));
    m_real.press(spot);
    m_at = spot;
    m_plain->press(m_grab, spot, 1);
    if (!isDouble || m_real.held() != Qt::LeftButton || isGrabLost())
        return;
    release(spot);
    if (!canPoint())
        return;
    m_grab = m_real.targetAt(spot);
    say("press again " + m_grab);
    m_real.pressAgain(spot);
    m_plain->press(m_grab, spot, 2);
}

void Session::pressView(const Step &step)
{
    const auto &views = m_plain->canvas().views;
    if (!views.empty())
        press(m_real.middleOf(views[static_cast<std::size_t>(step.a) % views.size()]),
            step.b % 4 == 0);
    if (step.b % 2 && m_real.held())
        release(m_real.middleOf(m_grab));
}

// The toolkit reports the way to a place before what happens there.
void Session::goTo(Spot spot)
{
    if (!(spot == m_at) && m_plain->isHeld())
        m_plain->drag(spot);
    m_at = spot;
}

void Session::drag(Spot spot)
{
    if (isGrabLost())
        releaseAll(spot);
    if (!canPoint())
        return;
    say("move" + inWords(spot));
    m_real.move(spot);
    goTo(spot);
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
    press(spotFor(step), false);
    for (int part = 1; part <= 1 + step.b % 3; ++part)
        drag(spotFor({ step.kind, step.a + part * (step.b % 5), step.b + part }));
    release(spotFor({ step.kind, step.b, step.a }));
}

void Session::otherButton(const Step &step)
{
    const Qt::MouseButton button = step.a % 3 ? Qt::RightButton : Qt::MiddleButton;
    const Spot spot = spotFor(step);
    if (isGrabLost())
        releaseAll(spot);
    if (!canPoint())
        return;
    if (m_real.held().testFlag(button)) {
        say("release another button" + inWords(spot));
        m_real.release(spot, button);
        goTo(spot);
        if (!m_real.held())
            m_grab.clear();
        return;
    }
    const std::string target = m_real.held() ? m_grab : m_real.targetAt(spot);
    if (target != "canvas" && m_real.held())
        return; // a menu in the middle of a drag would take the release
    say("press another button on " + target + inWords(spot));
    m_real.press(spot, button);
    goTo(spot);
    RealBoard::closeMenu();
    if (target == "canvas")
        m_grab = target;
    else
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

// The tool bar

void Session::clickTool(const Step &step)
{
    // The end is rare, so that there is something to end.
    const auto &names = toolNames();
    const std::string &name = names[static_cast<std::size_t>(step.a) % names.size()];
    if (name == "state" && step.b > 20)
        return;
    const bool byPointer = !m_real.held() && canPoint() && step.b % 2;
    say("tool " + name + (byPointer ? " by pointer" : ""));
    m_real.clickTool(name, byPointer);
    m_plain->click(name);
}

void Session::chooseOption(const Step &step)
{
    const auto &options = optionsOf(m_plain->popover());
    if (!m_plain->isPopoverVisible() || options.empty())
        return;
    const std::string &name = options[static_cast<std::size_t>(step.a) % options.size()];
    const bool byPointer = !m_real.held() && canPoint() && step.b % 2;
    say("option " + name + (byPointer ? " by pointer" : ""));
    m_real.chooseOption(name, byPointer);
    m_plain->choose(name);
}

// Keys

void Session::write(const Step &step)
{
    for (int letter = 0; letter <= step.a % 3; ++letter)
        key({ step.kind, letter == 2 ? 4 : 0, 0 });
}

void Session::key(const Step &step)
{
    static const std::vector<std::string> names { "b", "t", "e", "c", "BackSpace", "BackSpace",
        "Return", "Tab", "Escape", "1", "2", "4", "9", "C-z", "C-z", "C-y", "C-Delete", "C-w" };
    const std::string &name = names[static_cast<std::size_t>(step.a) % names.size()];
    const bool isEditing = !m_plain->canvas().editedBox().empty();
    // The editor has an undo of its own; and the end is rare.
    const bool isEditors = isEditing && name.starts_with("C-") && name != "C-w";
    if (!canPoint() || !m_plain->isKey() || isEditors || (name == "C-w" && step.b > 80))
        return;
    say("key " + name);
    if (isEditing && (name.size() == 1 || name == "BackSpace"))
        m_real.key("C-End"); // wherever a press has put the caret
    m_real.key(name);
    m_plain->key(name);
}

// The windows

void Session::takeWindowStep(const Step &step)
{
    using Kind = Step::Kind;
    if (step.kind == Kind::HideOrShow)
        return hideOrShow();
    if (step.kind == Kind::Minimise)
        return minimiseOrRestore();
    if (step.kind == Kind::OpenAnother)
        return open(step.b);
    if (step.kind == Kind::Close) {
        say("close");
        m_real.close();
        return m_plain->close();
    }
    if (!canPoint())
        return;
    if (step.kind == Kind::Paint) {
        say("turn and paint");
        m_real.turn();
        m_plain->turn();
    } else if (step.kind == Kind::Activate || step.kind == Kind::Deactivate) {
        const bool isActive = step.kind == Kind::Activate;
        say(isActive ? "activate" : "deactivate");
        m_real.activate(isActive);
        m_plain->activate(isActive);
    } else if (step.kind == Kind::Banner) {
        m_isBannerShown = !m_isBannerShown;
        say("banner");
        m_real.showBanner(m_isBannerShown);
        m_plain->showBanner(m_isBannerShown);
    } else if (!m_real.held() && step.kind == Kind::PressPanel) {
        say("press the panel");
        m_real.pressPanel();
        m_plain->pressPanel();
    } else if (!m_real.held() && step.kind == Kind::ToolMissed) {
        say("press a tool and let go beside it");
        m_real.pressToolElsewhere(toolNames()[static_cast<std::size_t>(step.a) % 8]);
    }
}

void Session::hideOrShow()
{
    if (m_plain->isMinimised())
        return;
    const bool shows = !m_plain->isVisible();
    say(shows ? "show" : "hide");
    if (shows) {
        m_real.show();
        m_plain->show();
    } else {
        m_real.hide();
        m_plain->hide();
        m_grab.clear();
    }
}

void Session::minimiseOrRestore()
{
    if (!m_plain->isVisible())
        return;
    const bool minimises = !m_plain->isMinimised();
    say(minimises ? "minimise" : "restore");
    if (minimises) {
        m_real.activate(false);
        m_plain->activate(false);
    }
    m_real.minimise(minimises);
    m_grab.clear();
    m_plain->minimise(minimises);
    if (!minimises) {
        m_real.activate(true);
        m_plain->activate(true);
    }
}

} // namespace penwick::sessions
