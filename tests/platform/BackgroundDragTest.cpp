// SPDX-License-Identifier: MIT
// A window dragged by its background, as values: no window is needed.
#include "platform/window/BackgroundDrag.h"

#include "platform/window/ScreenCoordinates.h"

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

constexpr Rect frame { 100.0, 200.0, 300.0, 150.0 };

} // namespace

TEST(BackgroundDrag, frameGoesWithThePointerThatHoldsIt)
{
    const QPoint grabbed = toDesktop(frame).topLeft() + QPoint(20, 10);
    BackgroundDrag drag;

    drag.begin(frame, grabbed);

    EXPECT_EQ(drag.moved(frame, grabbed), frame);
    EXPECT_EQ(
        drag.moved(frame, grabbed + QPoint(7, 5)), (Rect { 107.0, 195.0, 300.0, 150.0 })); // y up
}

TEST(BackgroundDrag, sizeThatTheWindowHasMeanwhileIsKept)
{
    const QPoint grabbed = toDesktop(frame).topLeft() + QPoint(20, 10);
    BackgroundDrag drag;

    drag.begin(frame, grabbed);

    const Rect wider { 100.0, 200.0, 320.0, 150.0 };
    EXPECT_EQ(drag.moved(wider, grabbed + QPoint(-3, 0)), (Rect { 97.0, 200.0, 320.0, 150.0 }));
}

TEST(BackgroundDrag, nothingMovesWhatIsNotHeld)
{
    BackgroundDrag drag;
    EXPECT_EQ(drag.moved(frame, QPoint(1, 1)), std::nullopt);

    drag.begin(frame, QPoint(0, 0));
    drag.end();

    EXPECT_EQ(drag.moved(frame, QPoint(1, 1)), std::nullopt);
}

} // namespace penwick::platform
