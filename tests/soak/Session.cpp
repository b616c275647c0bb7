// SPDX-License-Identifier: MIT
#include "soak/Session.h"

#include <sstream>

namespace penwick::test {

namespace {

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
    m_plain->setFrames(m_real.frames());
    m_grab.clear();
    m_isBannerShown = false;
    m_hasTitleBar = type != WindowType::annotation;
    say("open kind " + std::to_string(static_cast<int>(type)));
}

std::optional<std::string> Session::run(const Steps &steps)
{
    m_said.clear();
    open(steps.empty() ? 0 : steps.front().b);
    for (const Step &step : steps) {
        take(step);
        adopt();
        if (auto found = difference())
            return found;
        if (m_plain->isClosed())
            open(step.b); // the host has been told, drops the window and makes another
    }
    return std::nullopt;
}

// What the step has left to the toolkit's editor.
void Session::adopt()
{
    for (const std::string &view : m_plain->canvas().views) {
        const auto box = m_plain->canvas().allBoxes.find(view);
        if (box != m_plain->canvas().allBoxes.end() && box->second.text.isOpen())
            m_plain->adopt(view, m_real.textOf(view), m_real.composedIn(view));
        if (box != m_plain->canvas().allBoxes.end() && m_real.isOnCanvas(view))
            m_plain->adoptFrame(view, m_real.cornerOf(view), m_real.sizeOf(view), m_real.size());
    }
    m_plain->adoptSize(m_real.size());
    m_plain->adoptShown(m_real.shownStrokes());
    m_plain->adoptClipboard(RealBoard::clipboard());
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
        return press(spotFor(step), 1);
    case Kind::DoublePress:
        return press(spotFor(step), 2);
    case Kind::PressView:
        return pressView(step);
    case Kind::Drag:
        return drag(spotFor(step, -20));
    case Kind::Release:
        return release(spotFor(step));
    case Kind::Click:
        press(spotFor(step), 1);
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
    case Kind::PressText:
        return pressText(step);
    case Kind::Edit:
        return edit(step);
    case Kind::Compose:
        return compose(step);
    case Kind::DragText:
        return dragText(step);
    case Kind::Menu:
        return workMenu(step);
    case Kind::Tremble:
        return tremble(step);
    default:
        takeWindowStep(step);
    }
}

} // namespace penwick::test
