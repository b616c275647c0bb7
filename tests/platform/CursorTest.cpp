// SPDX-License-Identifier: MIT
// A cursor's hot spot and pixels at each scale, and its identity.
#include "platform/Cursor.h"

#include "platform/RecordingView.h"
#include "platform/SvgFile.h"

#include <QPixmap>

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

struct Scale
{
    double factor;
    QSize pixels; // of an image of 20 x 10 points
};

class CursorScale : public testing::TestWithParam<Scale>
{ };

} // namespace

TEST(Cursor, arrowIsTheDesktopsOwn)
{
    EXPECT_EQ(Cursor::arrow().forScale(1.0).shape(), Qt::ArrowCursor);
    EXPECT_TRUE(Cursor::arrow().image().isNull());
    EXPECT_EQ(Cursor::arrow(), Cursor::arrow());
}

TEST(Cursor, copiesAreTheSameCursorAndTwinsAreNot)
{
    const SvgFile artwork(20, 10);
    const Cursor cursor(artwork.icon(), { 3.0, 7.0 });
    const Cursor twin(artwork.icon(), { 3.0, 7.0 });
    const Cursor copy = cursor; // NOLINT(performance-unnecessary-copy-initialization): the subject

    EXPECT_EQ(copy, cursor);
    EXPECT_FALSE(twin == cursor);
    EXPECT_EQ(cursor.hotSpot(), (Point { 3.0, 7.0 }));
}

TEST(Cursor, setCursorIsShownOverTheViewAndIsTheCurrentOne)
{
    const SvgFile artwork(20, 10);
    const Cursor cursor(artwork.icon(), { 3.0, 7.0 });
    RecordingView view;

    cursor.set(view);

    EXPECT_EQ(Cursor::currentCursor(), cursor);
    EXPECT_EQ(view.cursor().hotSpot(), QPoint(3, 7));
    Cursor::arrow().set(view);
    EXPECT_EQ(Cursor::currentCursor(), Cursor::arrow());
    EXPECT_EQ(view.cursor().shape(), Qt::ArrowCursor);
}

TEST(Cursor, cursorThatSomebodyElseReplacedIsNotTheCurrentOne)
{
    const SvgFile artwork(20, 10);
    const Cursor cursor(artwork.icon(), { 3.0, 7.0 });
    RecordingView view;
    cursor.set(view);

    view.setCursor(Qt::WaitCursor);

    EXPECT_EQ(Cursor::currentCursor(), Cursor::arrow());
    cursor.set(view);
    EXPECT_EQ(Cursor::currentCursor(), cursor);
}

// Off X11 Qt takes the hot spot in points, whatever the scale.
TEST_P(CursorScale, imageIsSharpAndTheHotSpotStays)
{
    const SvgFile artwork(20, 10);
    const Cursor cursor(artwork.icon(), { 3.0, 7.0 });

    const QCursor made = cursor.forScale(GetParam().factor);

    EXPECT_EQ(made.pixmap().size(), GetParam().pixels);
    EXPECT_EQ(made.pixmap().devicePixelRatio(), GetParam().factor);
    EXPECT_EQ(made.hotSpot(), QPoint(3, 7));
}

INSTANTIATE_TEST_SUITE_P(Cursor, CursorScale,
    testing::Values(
        Scale { 1.0, { 20, 10 } }, Scale { 1.5, { 30, 15 } }, Scale { 2.0, { 40, 20 } }),
    [](const auto &scale) { return "at" + std::to_string(std::lround(scale.param.factor * 100)); });

} // namespace penwick::platform
