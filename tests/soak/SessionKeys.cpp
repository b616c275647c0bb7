// SPDX-License-Identifier: MIT
// The steps of the keys, and of whatever else reaches a box that is being edited.
#include "soak/Session.h"
#include "soak/Words.h"

namespace penwick::test {

namespace {

constexpr std::size_t longestText = 40; // that more is pasted into

} // namespace

void Session::write(const Step &step)
{
    for (int letter = 0; letter <= step.a % 3; ++letter)
        key({ step.kind, letter == 2 ? 4 : 0, 0 });
}

void Session::key(const Step &step)
{
    static const std::vector<std::string> names { "b", "t", "e", "c", "BackSpace", "BackSpace",
        "Return", "Tab", "Escape", "1", "2", "4", "9", "C-z", "C-z", "C-y", "C-Delete", "C-w" };
    std::string name = names[static_cast<std::size_t>(step.a) % names.size()];
    const bool isEditing = !m_plain->canvas().editedBox().empty();
    if (!isEditing && name == "BackSpace" && step.b % 2)
        name = "Delete";
    if (name != "C-w" || step.b <= 80)
        pressKey(name);
}

void Session::pressKey(const std::string &name)
{
    const bool isEditing = !m_plain->canvas().editedBox().empty();
    const bool isTyped = isEditing && (name.size() == 1 || name == "BackSpace");
    if (isTyped && isComposing())
        return; // the input method takes it
    if (isMenuOpen() && name == "Escape") {
        say("key " + name); // it is the menu's
        m_real.key(name);
        return m_plain->closeMenu();
    }
    // While a box is edited, keys with Ctrl are its editor's, which has an undo of its own. C-w
    // ends the session, so it is let through only seldom.
    const bool isEditors = isEditing && name.starts_with("C-") && name != "C-w";
    if (!canPoint() || isMenuOpen() || !m_plain->isKey() || isEditors)
        return;
    say("key " + name);
    if (isTyped)
        m_real.key("C-End"); // wherever a press has put the caret
    m_real.key(name);
    m_plain->key(name);
}

// The editor

bool Session::canType() const
{
    return canPoint() && m_plain->isKey() && !isMenuOpen()
        && !m_plain->canvas().editedBox().empty();
}

bool Session::isComposing() const
{
    const std::string box = m_plain->canvas().editedBox();
    return !box.empty() && !m_plain->canvas().allBoxes.at(box).text.composed().empty();
}

void Session::edit(const Step &step)
{
    static const std::vector<std::string> names { "C-z", "C-z", "C-y", "C-S-z", "C-a", "C-c", "C-x",
        "C-v", "Left", "Right", "Home", "End", "S-Left", "S-Left", "S-Right", "S-Home", "S-End",
        "C-S-Left", "BackSpace", "Delete", "C-BackSpace", "C-Delete", "S-Return", "u", "v", "w" };
    static const std::vector<std::string> texts { "", "p", "two\nlines", "of words" };
    if (step.b % 16 == 0)
        return copyElsewhere(texts[static_cast<std::size_t>(step.a) % texts.size()]);
    if (!isComposing() || step.b % 4 == 0) // an input method lets few keys through
        pressEditorsKey(names[static_cast<std::size_t>(step.a) % names.size()]);
}

void Session::pressEditorsKey(const std::string &name)
{
    if (!canType())
        return;
    const PlainText &text = m_plain->canvas().allBoxes.at(m_plain->canvas().editedBox()).text;
    if (name == "C-v" && text.now().size() > longestText)
        return;
    say("edit " + name);
    m_real.key(name);
    m_plain->edit(name);
}

void Session::copyElsewhere(const std::string &text)
{
    say("copy elsewhere " + quoted(text));
    RealBoard::copyElsewhere(text);
    m_plain->copyElsewhere(text);
}

// What is composed stays half composed while anything else happens, until a later step of these.
void Session::compose(const Step &step)
{
    static const std::vector<std::string> halves { "k", "ka", "kanji" };
    if (!canType())
        return;
    if (!isComposing() || step.a % 3)
        composeHalf(halves[static_cast<std::size_t>(step.b) % halves.size()]);
    else
        commit(step.b % 3 ? "K" : ""); // nothing: it is given up
}

void Session::composeHalf(const std::string &half)
{
    if (!canType())
        return;
    say("compose " + quoted(half));
    m_real.compose(half);
    m_plain->compose(half);
}

void Session::commit(const std::string &whole)
{
    if (!canType())
        return;
    say("commit " + quoted(whole));
    m_real.commit(whole);
    m_plain->commit(whole);
}

// Dragged over the board, and dropped by this step or a later one.
void Session::dragText(const Step &step)
{
    static const std::vector<std::string> texts { "d", "drop", "on\ntwo", "" };
    const std::string &text = texts[static_cast<std::size_t>(step.a) % texts.size()];
    const std::string box = m_plain->canvas().editedBox();
    const Spot spot = box.empty() || step.a % 5 == 0 ? spotFor(step) : m_real.middleOf(box);
    if (step.b % 3 == 0)
        dragOver(spot, text);
    else if (step.b % 3 == 1)
        drop(spot, text);
    else
        dragAway();
}

bool Session::canDragText() const
{
    return canPoint() && !isMenuOpen() && !m_real.held();
}

void Session::dragOver(Spot spot, const std::string &text)
{
    if (!canDragText())
        return;
    say("drag text " + quoted(text) + " over" + inWords(spot));
    m_real.dragOver(spot, text);
}

void Session::drop(Spot spot, const std::string &text)
{
    if (!canDragText())
        return;
    const std::string target = m_real.targetAt(spot);
    say("drop " + quoted(text) + " on " + target + inWords(spot));
    m_real.drop(spot, text);
    if (!text.empty())
        m_plain->dropOn(target, text);
}

void Session::dragAway()
{
    if (!canDragText())
        return;
    say("drag text away");
    m_real.dragAway();
}

// A menu is a loop of its own on some desktops; the host and its user's aids go on meanwhile.
void Session::hostGoesOn(const Step &step)
{
    using Kind = Step::Kind;
    static const std::vector<Kind> kinds { Kind::Close, Kind::HideOrShow, Kind::Minimise,
        Kind::OpenAnother, Kind::Tool, Kind::Tool, Kind::Tool, Kind::Deactivate };
    take({ kinds[static_cast<std::size_t>(step.a) % kinds.size()], step.a / 8, 0 });
}

// Opens the menu by its key, or chooses from the one that is open.
void Session::workMenu(const Step &step)
{
    if (!canPoint())
        return;
    if (isMenuOpen() && step.b % 4 == 0)
        return hostGoesOn(step);
    if (isMenuOpen()) {
        const std::vector<std::string> items = RealBoard::menuItems();
        if (items.empty())
            return;
        return useMenu(items[static_cast<std::size_t>(step.a) % items.size()], step.b % 2);
    }
    openMenuByKey();
}

void Session::useMenu(const std::string &item, bool byPointer)
{
    if (!canPoint() || !isMenuOpen())
        return;
    say("choose " + item + (byPointer ? " by pointer" : ""));
    m_real.chooseFromMenu(item, byPointer);
    m_plain->chooseFromMenu(item);
}

void Session::openMenuByKey()
{
    if (!canPoint() || isMenuOpen())
        return;
    const std::string responder = m_plain->canvas().responder();
    if (!m_plain->isKey() || m_real.held())
        return;
    say("menu key");
    m_real.openMenuByKey();
    if (m_plain->canvas().allBoxes.count(responder))
        m_plain->openMenu(responder);
}

} // namespace penwick::test
