// SPDX-License-Identifier: MIT
// The steps of the tool bar and of the windows.
#include "soak/Session.h"
#include "soak/Words.h"

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
    useTool(name, step.b % 2);
}

void Session::useTool(const std::string &name, bool byPointer)
{
    byPointer = byPointer && !m_real.held() && canPoint() && !isMenuOpen();
    say("tool " + name + (byPointer ? " by pointer" : ""));
    m_real.clickTool(name, byPointer);
    if (byPointer)
        m_plain->pressBar();
    m_plain->click(name);
}

void Session::chooseOption(const Step &step)
{
    const auto &options = optionsOf(m_plain->popover());
    if (!options.empty())
        useOption(options[static_cast<std::size_t>(step.a) % options.size()], step.b % 2);
}

void Session::useOption(const std::string &name, bool byPointer)
{
    if (!m_plain->isPopoverVisible())
        return;
    byPointer = byPointer && !m_real.held() && canPoint() && !isMenuOpen();
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
    switch (step.kind) {
    case Kind::HideOrShow:
        return hideOrShow();
    case Kind::Minimise:
        return minimiseOrRestore();
    case Kind::OpenAnother:
        return open(step.b);
    case Kind::Close:
        return close();
    case Kind::Paint:
        return turn();
    case Kind::Activate:
        return activate();
    case Kind::Deactivate:
        return deactivate();
    case Kind::Banner:
        return turnBanner();
    case Kind::MoveWindow:
        return moveWindow(step);
    case Kind::ResizeWindow:
        return resizeWindow(step);
    case Kind::PressPanel:
        return pressPanel();
    case Kind::ToolMissed:
        return missTool(toolNames()[static_cast<std::size_t>(step.a) % 8]);
    default:
        break;
    }
}

void Session::close()
{
    say("close");
    m_real.close();
    m_plain->close();
}

void Session::turn()
{
    if (!canPoint())
        return;
    say("turn and paint");
    m_real.turn();
    m_plain->turn();
}

void Session::activate()
{
    if (!canPoint())
        return;
    say("activate");
    m_real.activate(true);
    m_plain->activate(true);
}

void Session::deactivate()
{
    if (!canPoint())
        return;
    say("deactivate");
    m_real.activate(false);
    m_plain->activate(false);
}

void Session::turnBanner()
{
    if (!canPoint())
        return;
    m_isBannerShown = !m_isBannerShown;
    say("banner");
    m_real.showBanner(m_isBannerShown);
    m_plain->showBanner(m_isBannerShown);
}

void Session::pressPanel()
{
    if (!canPoint() || isMenuOpen() || m_real.held())
        return;
    say("press the panel");
    m_real.pressPanel();
    m_plain->pressPanel();
}

void Session::missTool(const std::string &name)
{
    if (!canPoint() || isMenuOpen() || m_real.held())
        return;
    say("press beside tool " + name);
    m_real.pressToolElsewhere(name);
    m_plain->pressBar();
}

// By its title bar, in one or more steps.
void Session::moveWindow(const Step &step)
{
    for (int part = 0; part <= step.b % 2; ++part)
        moveWindowTo({ 3 * step.a - 200 + 8 * part, 2 * step.b - 100 });
    if (step.b % 3)
        rest();
}

void Session::moveWindowTo(QPoint corner)
{
    const QRect before = m_real.outerFrame();
    if (!canPoint() || isMenuOpen() || !m_hasTitleBar || corner == before.topLeft())
        return;
    say("move the window to" + inWords(Spot { double(corner.x()), double(corner.y()) }));
    m_real.moveTo({ corner, before.size() });
    m_plain->moveTo(plainFrame(m_real.outerFrame())); // a desktop may grant another place
    m_plain->turn();
}

void Session::resizeWindow(const Step &step)
{
    const QSize size(320 + 16 * (step.a % 20), 180 + 4 * (step.b % 60));
    if (!resizeWindowTo(size, step.a % 2))
        return;
    if (step.b % 3)
        rest();
}

// By its edges; at the left ones the right edge stays where it is.
bool Session::resizeWindowTo(QSize size, bool fromTheLeft)
{
    if (m_grab.starts_with('x'))
        return false; // the button might come to lie where no pointer can let go of it
    const QRect before = m_real.outerFrame();
    if (!canPoint() || isMenuOpen() || !m_hasTitleBar || size == before.size())
        return false;
    QRect outer(before.topLeft(), size);
    if (fromTheLeft)
        outer.moveBottomRight(before.bottomRight());
    say(std::string("resize the window ") + (fromTheLeft ? "from the left " : "") + "to"
        + inWords(Spot { double(size.width()), double(size.height()) }));
    m_real.moveTo(outer);
    m_plain->resizeTo(plainFrame(m_real.outerFrame()));
    m_plain->turn();
    return true;
}

void Session::rest()
{
    if (!canPoint() || isMenuOpen() || !m_hasTitleBar)
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
