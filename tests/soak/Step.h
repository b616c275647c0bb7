// SPDX-License-Identifier: MIT
// What a random session is made of.
#pragma once

#include <rapidcheck.h>

#include <cstdint>
#include <iosfwd>
#include <vector>

namespace penwick::test {

/// One thing that a user or a host may do. What `a` and `b` choose (a place, a button, a tool)
/// depends on the kind.
struct Step
{
    enum class Kind
    {
        Press,
        Drag,
        Release,
        Click,
        DoublePress,
        PressView, ///< a text box or a delete button, if there is one
        Stroke, ///< press, some drags, release
        OtherButton, ///< right or middle, pressed or let go
        Tool,
        ToolMissed, ///< pressed and let go beside it
        Option,
        Write, ///< letters, if a box is being edited
        Key,
        Paint,
        Activate,
        Deactivate,
        Minimise,
        HideOrShow,
        PressPanel,
        Banner,
        Close,
        OpenAnother,
        PressText, ///< once, twice or three times into what is being edited
        Edit, ///< a key that is the editor's
        Compose, ///< an input method goes on, commits or gives up
        DragText, ///< from another application
        Menu, ///< of a box: opened by its key, or chosen from
        MoveWindow,
        ResizeWindow,
        Tremble ///< the pointer goes a few points on
    };

    Kind kind = Kind::Press;
    int a = 0;
    int b = 0;
};

using Steps = std::vector<Step>;

std::ostream &operator<<(std::ostream &stream, const Step &step);

/// Steps at random, no more than the generator's size.
[[nodiscard]] rc::Gen<Steps> anySteps();
/// The `count` steps that belong to `seed`, and what they can be made shorter to.
[[nodiscard]] rc::Shrinkable<Steps> stepsOf(std::uint64_t seed, int count);

} // namespace penwick::test
