// SPDX-License-Identifier: MIT
// The steps of the tool bar and of the windows.
#include "soak/Session.h"

namespace penwick::test {

namespace {

constexpr int screenHeight = 540; // points

PlainFrame plainFrame(const QRect &outer)
{
    return { static_cast<double>(outer.x()),
        static_cast<double>(screenHeight - outer.y() - outer.height()),
        static_cast<double>(outer.width()), static_cast<double>(outer.height()) };
}

} // namespace

void Session::clickTool(const Step &step)
{
    // The end is rare, so that there is something to end.
    const auto &names = toolNames();
    const std::string &name = names[static_cast<std::size_t>(step.a) % names.size()];
    if (name == "state" && step.b > 20)
        return;
    const bool byPointer = !m_real.held() && canPoint() && !isMenuOpen() && step.b % 2;
    say("tool " + name + (byPointer ? " by pointer" : ""));
    m_real.clickTool(name, byPointer);
    if (byPointer)
        m_plain->pressBar();
    m_plain->click(name);
}

void Session::chooseOption(const Step &step)
{
    const std::string popover = m_plain->popover();
    const auto &options = optionsOf(popover);
    if (!m_plain->isPopoverVisible() || options.empty())
        return;
    const std::string name = options[static_cast<std::size_t>(step.a) % options.size()];
    const bool byPointer = !m_real.held() && canPoint() && !isMenuOpen() && step.b % 2;
    say("option " + name + (byPointer ? " by pointer" : ""));
    m_real.chooseOption(name, byPointer);
    if (byPointer)
        m_plain->pressBar();
    m_plain->choose(name);
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
    } else if (isMenuOpen()) {
        return; // the pointer is the menu's
    } else if (step.kind == Kind::MoveWindow) {
        moveWindow(step);
    } else if (step.kind == Kind::ResizeWindow) {
        resizeWindow(step);
    } else if (!m_real.held() && step.kind == Kind::PressPanel) {
        say("press the panel");
        m_real.pressPanel();
        m_plain->pressPanel();
    } else if (!m_real.held() && step.kind == Kind::ToolMissed) {
        say("press a tool and let go beside it");
        m_real.pressToolElsewhere(toolNames()[static_cast<std::size_t>(step.a) % 8]);
        m_plain->pressBar();
    }
}

// By its title bar, in one or more steps.
void Session::moveWindow(const Step &step)
{
    for (int part = 0; m_hasTitleBar && part <= step.b % 2; ++part) {
        const QRect before = m_real.outerFrame();
        const QRect outer(
            3 * step.a - 200 + 8 * part, 2 * step.b - 100, before.width(), before.height());
        if (outer == before)
            continue;
        say("move the window");
        m_real.moveTo(outer);
        m_plain->moveTo(plainFrame(m_real.outerFrame())); // a desktop may grant another place
        m_plain->turn();
    }
    if (step.b % 3)
        rest();
}

// By its edges; at the left ones the right edge stays where it is.
void Session::resizeWindow(const Step &step)
{
    if (m_grab.starts_with('x'))
        return; // the button might come to lie where no pointer can let go of it
    const QRect before = m_real.outerFrame();
    const QSize size(320 + 16 * (step.a % 20), 180 + 4 * (step.b % 60));
    if (!m_hasTitleBar || size == before.size())
        return;
    QRect outer(before.topLeft(), size);
    if (step.a % 2)
        outer.moveBottomRight(before.bottomRight());
    say("resize the window to " + std::to_string(size.width()) + "x"
        + std::to_string(size.height()));
    m_real.moveTo(outer);
    m_plain->resizeTo(plainFrame(m_real.outerFrame()));
    m_plain->turn();
    if (step.b % 3)
        rest();
}

void Session::rest()
{
    if (!m_hasTitleBar)
        return;
    say("let the window rest");
    m_real.rest();
    m_plain->rest(plainFrame(m_real.outerFrame()));
    m_plain->turn();
}

// A desktop may bring a window back to another place than it left.
void Session::hearPlace()
{
    const PlainFrame place = plainFrame(m_real.outerFrame());
    if (!m_plain->frames().isAt(place))
        m_plain->moveTo(place);
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
        // One over an image is brought inside the screen, and its popover closed.
        const PlainFrame place = plainFrame(m_real.outerFrame());
        if (!m_plain->frames().isAt(place))
            m_plain->comeUpAt(place);
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
        hearPlace();
        m_plain->turn();
    }
    if (!minimises) {
        m_real.activate(true);
        m_plain->activate(true);
    }
}

} // namespace penwick::test
