// SPDX-License-Identifier: MIT
// A cursor's hot spot and pixels at each scale, and its identity.
#include "platform/view/Cursor.h"

#include "platform/RecordingView.h"
#include "platform/SvgFile.h"

#include <QEvent>
#include <QIconEngine>
#include <QPixmap>

#include <gtest/gtest.h>

namespace penwick::platform {

namespace {

struct Scale
{
    double factor;
    QSize pixels; // of an image of 20 x 10 points
};

/// Counts how often its icon is rendered.
class CountingEngine final : public QIconEngine
{
public:
    explicit CountingEngine(int &count)
        : m_count(count)
    { }
    void paint(QPainter *, const QRect &, QIcon::Mode, QIcon::State) override { }
    QPixmap pixmap(const QSize &size, QIcon::Mode, QIcon::State) override
    {
        ++m_count;
        return QPixmap(size);
    }
    QSize actualSize(const QSize &, QIcon::Mode, QIcon::State) override { return { 20, 10 }; }
    [[nodiscard]] QIconEngine *clone() const override { return new CountingEngine(*this); }

private:
    int &m_count;
};

/// Counts how often a view's cursor is set.
class CursorChanges final : public QObject
{
public:
    explicit CursorChanges(RecordingView &view) { view.installEventFilter(this); }
    bool eventFilter(QObject *, QEvent *event) override
    {
        count += event->type() == QEvent::CursorChange;
        return false;
    }

    int count = 0;
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

TEST(Cursor, isRenderedOnceForEachScaleWhoeverHasACopy)
{
    int renderings = 0;
    const Cursor cursor(QIcon(new CountingEngine(renderings)), { 3.0, 7.0 });
    const Cursor copy = cursor; // NOLINT(performance-unnecessary-copy-initialization): the subject

    EXPECT_EQ(cursor.forScale(1.0), copy.forScale(1.0));
    EXPECT_EQ(renderings, 1);
    EXPECT_NE(cursor.forScale(2.0), cursor.forScale(1.0));
    EXPECT_EQ(cursor.forScale(2.0), copy.forScale(2.0));
    EXPECT_EQ(renderings, 2);
}

TEST(Cursor, cursorThatIsShownAlreadyIsNotGivenToTheDesktopAgain)
{
    const SvgFile artwork(20, 10);
    const Cursor cursor(artwork.icon(), { 3.0, 7.0 });
    RecordingView view;
    CursorChanges changes(view);

    cursor.set(view);
    cursor.set(view);
    EXPECT_EQ(changes.count, 1);

    Cursor::arrow().set(view);
    Cursor::arrow().set(view);
    EXPECT_EQ(changes.count, 2);
    EXPECT_EQ(Cursor::currentCursor(), Cursor::arrow());
}

TEST(Cursor, arrowIsGivenToAViewThatHasNoCursorOfItsOwn)
{
    RecordingView view;

    Cursor::arrow().set(view);

    EXPECT_TRUE(view.testAttribute(Qt::WA_SetCursor));
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
