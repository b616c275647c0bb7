// SPDX-License-Identifier: MIT
// One session, gone through by the component and by the second model side by side.
#pragma once

#include "soak/PlainBoard.h"
#include "soak/RealBoard.h"
#include "soak/Step.h"

#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace penwick::test {

/// Takes steps on both sides and compares all that can be seen after each.
class Session
{
public:
    Session();

    /// Takes `steps`. Answers what differed, and how it came to that; nothing if nothing did.
    std::optional<std::string> run(const Steps &steps);
    /// The same with what a session has said of itself, or what somebody has written in such words:
    /// "tool text", "press canvas 200,100", "key Escape". Each line must do what it says.
    std::optional<std::string> play(const std::vector<std::string> &lines);
    /// What was done, in the words that play() takes.
    [[nodiscard]] const std::vector<std::string> &said() const { return m_said; }

private:
    // Each does what it is told where that can be done, on both sides, and says so.
    void act(const std::string &line);
    bool actAsIs(const std::string &line);
    bool actWithPlace(const std::string &line);
    void actWithName(const std::string &line);
    void pressAgain(Spot spot, int click);
    void otherButton(Qt::MouseButton button, Spot spot);
    void useTool(const std::string &name, bool byPointer);
    void useOption(const std::string &name, bool byPointer);
    void missTool(const std::string &name);
    void pressKey(const std::string &name);
    void pressEditorsKey(const std::string &name);
    void copyElsewhere(const std::string &text);
    void composeHalf(const std::string &half);
    void commit(const std::string &whole);
    void dragOver(Spot spot, const std::string &text);
    void drop(Spot spot, const std::string &text);
    void dragAway();
    void openMenuByKey();
    void useMenu(const std::string &item, bool byPointer);
    void moveWindowTo(QPoint corner);
    bool resizeWindowTo(QSize size, bool fromTheLeft);
    void activate();
    void deactivate();
    void turn();
    void pressPanel();
    void turnBanner();
    void close();

    // Each chooses what a step of its kind does.
    void open(int number); ///< a window of one of the kinds
    void take(const Step &step);
    void takeWindowStep(const Step &step);

    void press(Spot spot, int clicks);
    void pressView(const Step &step);
    void pressText(const Step &step);
    void goTo(Spot spot);
    void drag(Spot spot);
    void tremble(const Step &step);
    void release(Spot spot);
    void stroke(const Step &step);
    void otherButton(const Step &step);
    void releaseAll(Spot spot);
    void clickTool(const Step &step);
    void chooseOption(const Step &step);
    void write(const Step &step);
    void key(const Step &step);
    void edit(const Step &step);
    void compose(const Step &step);
    void dragText(const Step &step);
    void workMenu(const Step &step);
    void hostGoesOn(const Step &step);
    void moveWindow(const Step &step);
    void resizeWindow(const Step &step);
    void rest();
    void hearPlace();
    void hideOrShow();
    void minimiseOrRestore();

    [[nodiscard]] Spot spotFor(const Step &step, int margin = 6) const;
    [[nodiscard]] bool canPoint() const;
    [[nodiscard]] bool isGrabLost() const;
    [[nodiscard]] bool isMenuOpen() const { return !m_plain->menu().empty(); }
    [[nodiscard]] bool canType() const; ///< into a box
    [[nodiscard]] bool isComposing() const;
    [[nodiscard]] bool canDragText() const;
    void adopt();
    [[nodiscard]] std::optional<std::string> difference();
    void say(const std::string &what) { m_said.push_back(what); }

    RealBoard m_real;
    std::unique_ptr<PlainBoard> m_plain;
    std::string m_grab; // where the buttons that are held down were pressed
    QPointF m_at; // the pointer, on the desktop
    Spot m_spot; // and where it last pointed at
    bool m_isBannerShown = false;
    bool m_hasTitleBar = false;
    std::vector<std::string> m_said;
};

} // namespace penwick::test
