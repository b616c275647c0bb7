// SPDX-License-Identifier: MIT
// A session written down: what was said of one is done again, line by line.
#include "soak/Session.h"
#include "soak/Words.h"

#include <functional>
#include <map>
#include <utility>

namespace penwick::test {

namespace {

constexpr const char *gone = "let go of what is gone"; // which the next line does by itself

const std::string byPointer = " by pointer";

QPoint inWholePoints(Spot spot)
{
    return { static_cast<int>(spot.x), static_cast<int>(spot.y) };
}

QSize sizeOf(QPoint point)
{
    return { point.x(), point.y() };
}

} // namespace

std::optional<std::string> Session::play(const std::vector<std::string> &lines)
{
    m_said.clear();
    for (const std::string &line : lines) {
        if (line == gone)
            continue;
        act(line);
        if (m_said.empty() || m_said.back() != line)
            return "cannot be done, or not any more: " + line + "\nthe last that was done: "
                + (m_said.empty() ? "nothing" : m_said.back()) + "\n";
        adopt();
        if (auto found = difference())
            return found;
    }
    return std::nullopt;
}

void Session::act(const std::string &line)
{
    if (!actAsIs(line) && !actWithPlace(line))
        actWithName(line);
}

bool Session::actAsIs(const std::string &line)
{
    static const std::map<std::string, void (Session::*)()> acts {
        { "press the panel", &Session::pressPanel },
        { "drag text away", &Session::dragAway },
        { "menu key", &Session::openMenuByKey },
        { "hide", &Session::hideOrShow },
        { "show", &Session::hideOrShow },
        { "minimise", &Session::minimiseOrRestore },
        { "restore", &Session::minimiseOrRestore },
        { "close", &Session::close },
        { "turn and paint", &Session::turn },
        { "activate", &Session::activate },
        { "deactivate", &Session::deactivate },
        { "banner", &Session::turnBanner },
        { "let the window rest", &Session::rest },
    };
    const auto found = acts.find(line);
    if (found != acts.end())
        (this->*found->second)();
    return found != acts.end();
}

bool Session::actWithPlace(const std::string &line)
{
    const Spot spot = spotIn(line);
    const auto says = [&line](const char *beginning) { return line.starts_with(beginning); };
    if (says("press again "))
        pressAgain(spot, 2);
    else if (says("press a third time "))
        pressAgain(spot, 3);
    else if (says("press the right ") || says("release the right "))
        otherButton(Qt::RightButton, spot);
    else if (says("press the middle ") || says("release the middle "))
        otherButton(Qt::MiddleButton, spot);
    else if (says("move the window to "))
        moveWindowTo(inWholePoints(spot));
    else if (says("resize the window "))
        resizeWindowTo(sizeOf(inWholePoints(spot)), says("resize the window from the left "));
    else if (says("press ") && !says("press beside "))
        press(spot, 1);
    else if (says("move "))
        drag(spot);
    else if (says("release "))
        release(spot);
    else if (says("drag text "))
        dragOver(spot, textIn(line));
    else if (says("drop "))
        drop(spot, textIn(line));
    else
        return false;
    return true;
}

void Session::actWithName(const std::string &line)
{
    using Act = std::function<void(Session &, const std::string &name, bool byPointer)>;
    static const std::vector<std::pair<std::string, Act>> acts {
        { "open kind ", [](auto &s, auto &name, bool) { s.open(std::stoi(name)); } },
        { "press beside tool ", [](auto &s, auto &name, bool) { s.missTool(name); } },
        { "tool ", [](auto &s, auto &name, bool byPointer) { s.useTool(name, byPointer); } },
        { "option ", [](auto &s, auto &name, bool byPointer) { s.useOption(name, byPointer); } },
        { "choose ", [](auto &s, auto &name, bool byPointer) { s.useMenu(name, byPointer); } },
        { "key ", [](auto &s, auto &name, bool) { s.pressKey(name); } },
        { "edit ", [](auto &s, auto &name, bool) { s.pressEditorsKey(name); } },
        { "copy elsewhere ", [](auto &s, auto &name, bool) { s.copyElsewhere(textIn(name)); } },
        { "compose ", [](auto &s, auto &name, bool) { s.composeHalf(textIn(name)); } },
        { "commit ", [](auto &s, auto &name, bool) { s.commit(textIn(name)); } },
    };
    for (const auto &[beginning, act] : acts) {
        if (line.starts_with(beginning)) {
            const bool isByPointer = line.ends_with(byPointer);
            const auto end = line.size() - (isByPointer ? byPointer.size() : 0);
            return act(*this, line.substr(beginning.size(), end - beginning.size()), isByPointer);
        }
    }
}

} // namespace penwick::test
