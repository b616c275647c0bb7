// SPDX-License-Identifier: MIT
// A board that is written on with a real input method.
#pragma once

#include "desktop/support/InputMethod.h"
#include "desktop/support/TextBoxFixture.h"

namespace penwick::desktop {

/// Base of the tests that compose: a board with the text tool, and an input method beside it.
class InputMethodTest : public TextBoxTest, public testing::WithParamInterface<InputMethodKind>
{
protected:
    static constexpr QPoint place { 300, 150 };
    static constexpr QPoint elsewhere { 600, 300 };

    InputMethodTest();

    /// A box in which the next letter is composed; returns its corner.
    QPoint makeBoxToCompose(QPoint clicked = place);
    /// Edits the box at `corner` once more, before the text that is in it.
    ///
    /// What is waited for is the caret: a window manager may hold a press back that keys overtake.
    /// And a key would not do: fcitx5 hands back one that it does not want, and what is typed right
    /// after it may be composed before.
    void editAtTheBeginning(QPoint corner);
    void type(const char *letters) { desktop().keyboard().type(letters); }
    void press(const char *key) { desktop().keyboard().press(key); }

    /// Whether the box with the keyboard comes to have this text, and this composed in it.
    testing::AssertionResult comesToHold(const char *text, const char *composed);
    /// Asks what may be meant, and returns once there is a list of it.
    void askForCandidates();
    /// Where the list stands on the screen; null if there is none.
    [[nodiscard]] QRect candidates();
    [[nodiscard]] bool areCandidatesGone();

    /// Keeps a picture of the screen if the environment's PENWICK_PICTURES names a folder for it.
    void keepPicture(const char *name);

private:
    InputMethod m_method;
};

/// The input method's name in that of a test.
[[nodiscard]] std::string methodName(const testing::TestParamInfo<InputMethodKind> &kind);

} // namespace penwick::desktop
