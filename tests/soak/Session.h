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

private:
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
    void copyElsewhere(const Step &step);
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
