// SPDX-License-Identifier: MIT
// Elements in, elements out, and the general path made of them.
#include <penwick/platform/BezierPath.h>

#include <gtest/gtest.h>

namespace {

using penwick::platform::BezierPath;
using penwick::platform::Point;
using penwick::platform::Rect;
using Kind = BezierPath::ElementKind;

void expectElement(
    const QPainterPath &path, int index, QPainterPath::ElementType type, double x, double y)
{
    const QPainterPath::Element element = path.elementAt(index);
    EXPECT_EQ(element.type, type) << "element " << index;
    EXPECT_EQ(element.x, x) << "element " << index;
    EXPECT_EQ(element.y, y) << "element " << index;
}

TEST(BezierPath, newPathHasNoElementsAndPlainLineAttributes)
{
    const BezierPath path;

    EXPECT_EQ(path.elementCount(), 0);
    EXPECT_EQ(path.lineWidth(), 1.0);
    EXPECT_EQ(path.lineCapStyle(), penwick::platform::LineCapStyle::Butt);
    EXPECT_EQ(path.lineJoinStyle(), penwick::platform::LineJoinStyle::Miter);
    EXPECT_EQ(static_cast<int>(penwick::platform::LineCapStyle::Round), 1);
    EXPECT_EQ(static_cast<int>(penwick::platform::LineJoinStyle::Round), 1);
}

TEST(BezierPath, elementsComeBackInTheOrderInWhichTheyWereAppended)
{
    BezierPath path;
    path.moveToPoint({ 1, 2 });
    path.lineToPoint({ 3, 4 });
    path.curveToPoint({ 9, 10 }, { 5, 6 }, { 7, 8 });
    path.closePath();

    ASSERT_EQ(path.elementCount(), 4);
    EXPECT_EQ(path.elementAtIndex(0).kind, Kind::MoveTo);
    EXPECT_EQ(path.elementAtIndex(0).points[0], (Point { 1, 2 }));
    EXPECT_EQ(path.elementAtIndex(1).kind, Kind::LineTo);
    EXPECT_EQ(path.elementAtIndex(1).points[0], (Point { 3, 4 }));
    EXPECT_EQ(path.elementAtIndex(2).kind, Kind::CurveTo);
    EXPECT_EQ(path.elementAtIndex(2).points[0], (Point { 5, 6 }));
    EXPECT_EQ(path.elementAtIndex(2).points[1], (Point { 7, 8 }));
    EXPECT_EQ(path.elementAtIndex(2).points[2], (Point { 9, 10 }));
    EXPECT_EQ(path.elementAtIndex(3).kind, Kind::ClosePath);
}

TEST(BezierPath, linesThatFollowEachOtherAreAChainOfPointsAndKeepTheirElements)
{
    BezierPath path;
    EXPECT_TRUE(path.chain().empty());
    for (const double x : { 0.0, 1.0, 2.0 }) {
        path.moveToPoint({ x, 1 });
        path.lineToPoint({ x + 1, 1 });
    }

    ASSERT_EQ(path.chain().size(), 4U);
    EXPECT_EQ(path.chain()[3], (Point { 3, 1 }));
    ASSERT_EQ(path.elementCount(), 6);
    for (int index = 0; index < 6; ++index) {
        const BezierPath::Element element = path.elementAtIndex(index);
        EXPECT_EQ(element.kind, index % 2 == 0 ? Kind::MoveTo : Kind::LineTo) << index;
        const int place = (index + 1) / 2;
        EXPECT_EQ(element.points[0], (Point { static_cast<double>(place), 1 })) << index;
    }
}

TEST(BezierPath, pathThatStopsBeingAChainKeepsItsElements)
{
    const auto chainOfOne = [] {
        auto path = std::make_unique<BezierPath>();
        path->moveToPoint({ 0, 0 });
        path->lineToPoint({ 1, 0 });
        path->moveToPoint({ 1, 0 });
        return path;
    };
    const auto expectStart = [](const BezierPath &path, Kind last, Point point) {
        EXPECT_TRUE(path.chain().empty());
        ASSERT_EQ(path.elementCount(), 4);
        EXPECT_EQ(path.elementAtIndex(0).points[0], (Point { 0, 0 }));
        EXPECT_EQ(path.elementAtIndex(1).points[0], (Point { 1, 0 }));
        EXPECT_EQ(path.elementAtIndex(2).kind, Kind::MoveTo);
        EXPECT_EQ(path.elementAtIndex(2).points[0], (Point { 1, 0 }));
        EXPECT_EQ(path.elementAtIndex(3).kind, last);
        EXPECT_EQ(path.elementAtIndex(3).points[0], point);
    };

    const auto moved = chainOfOne();
    moved->moveToPoint({ 1, 0 });
    expectStart(*moved, Kind::MoveTo, { 1, 0 });
    const auto curved = chainOfOne();
    curved->curveToPoint({ 9, 9 }, { 5, 5 }, { 7, 7 });
    expectStart(*curved, Kind::CurveTo, { 5, 5 });
    const auto closed = chainOfOne();
    closed->closePath();
    expectStart(*closed, Kind::ClosePath, {});

    BezierPath apart;
    apart.moveToPoint({ 0, 0 });
    apart.lineToPoint({ 1, 0 });
    apart.moveToPoint({ 1, 5 });
    EXPECT_TRUE(apart.chain().empty());
    EXPECT_EQ(apart.elementAtIndex(2).points[0], (Point { 1, 5 }));

    BezierPath withoutMove;
    withoutMove.lineToPoint({ 1, 0 });
    EXPECT_TRUE(withoutMove.chain().empty());
    EXPECT_EQ(withoutMove.elementAtIndex(0).kind, Kind::LineTo);
}

TEST(BezierPath, generalPathOfNothingIsEmpty)
{
    EXPECT_EQ(BezierPath().CGPath().elementCount(), 0);
}

TEST(BezierPath, generalPathOfOneCurveIsOneMoveAndOneCurveWithControlPointsInOrder)
{
    BezierPath path;
    path.moveToPoint({ 0, 1 });
    path.curveToPoint({ 60, 70 }, { 20, 30 }, { 40, 50 });

    const QPainterPath general = path.CGPath();

    ASSERT_EQ(general.elementCount(), 4); // a curve takes three: two controls and the end
    expectElement(general, 0, QPainterPath::MoveToElement, 0, 1);
    expectElement(general, 1, QPainterPath::CurveToElement, 20, 30);
    expectElement(general, 2, QPainterPath::CurveToDataElement, 40, 50);
    expectElement(general, 3, QPainterPath::CurveToDataElement, 60, 70);
}

TEST(BezierPath, generalPathKeepsEverySubpathApart)
{
    BezierPath path;
    path.moveToPoint({ 0, 0 });
    path.lineToPoint({ 10, 0 });
    path.moveToPoint({ 10, 0 });
    path.lineToPoint({ 10, 10 });

    const QPainterPath general = path.CGPath();

    ASSERT_EQ(general.elementCount(), 4);
    expectElement(general, 0, QPainterPath::MoveToElement, 0, 0);
    expectElement(general, 1, QPainterPath::LineToElement, 10, 0);
    expectElement(general, 2, QPainterPath::MoveToElement, 10, 0);
    expectElement(general, 3, QPainterPath::LineToElement, 10, 10);
}

TEST(BezierPath, closingLeadsTheGeneralPathBackToTheStartOfItsSubpath)
{
    BezierPath path;
    path.moveToPoint({ 1, 1 });
    path.lineToPoint({ 5, 1 });
    path.lineToPoint({ 5, 5 });
    path.closePath();

    const QPainterPath general = path.CGPath();

    ASSERT_EQ(general.elementCount(), 4);
    expectElement(general, 3, QPainterPath::LineToElement, 1, 1);
}

TEST(BezierPath, generalPathOfAStrokeKeepsItsDotAndItsSixElements)
{
    BezierPath path;
    path.moveToPoint({ 5, 5 });
    path.lineToPoint({ 9, 5 });
    path.moveToPoint({ 9, 5 });
    path.lineToPoint({ 9, 5 }); // the pointer moved by less than a point
    path.moveToPoint({ 9, 5 });
    path.lineToPoint({ 9, 9 });

    const QPainterPath general = path.CGPath();

    ASSERT_EQ(general.elementCount(), path.elementCount());
    for (int index = 0; index < path.elementCount(); ++index) {
        const BezierPath::Element element = path.elementAtIndex(index);
        const bool isMove = element.kind == BezierPath::ElementKind::MoveTo;
        expectElement(general, index,
            isMove ? QPainterPath::MoveToElement : QPainterPath::LineToElement, element.points[0].x,
            element.points[0].y);
    }
}

TEST(BezierPath, generalPathKeepsLinesAndCurvesThatLeadNowhereOrHardlyAnywhere)
{
    const double hardly = 1000.0000000001; // which a comparison with a tolerance takes for the same
    BezierPath path;
    path.moveToPoint({ 0, 0 });
    path.lineToPoint({ 0, 0 });
    path.curveToPoint({ 0, 0 }, { 0, 0 }, { 0, 0 });
    path.moveToPoint({ 1000, 1000 });
    path.lineToPoint({ hardly, 1000 });
    path.curveToPoint({ 1000, 1000 }, { 1000, hardly }, { hardly, 1000 });

    const QPainterPath general = path.CGPath();

    ASSERT_EQ(general.elementCount(), 10);
    expectElement(general, 1, QPainterPath::LineToElement, 0, 0);
    expectElement(general, 2, QPainterPath::CurveToElement, 0, 0);
    expectElement(general, 4, QPainterPath::CurveToDataElement, 0, 0);
    expectElement(general, 6, QPainterPath::LineToElement, hardly, 1000);
    expectElement(general, 7, QPainterPath::CurveToElement, 1000, hardly);
    expectElement(general, 8, QPainterPath::CurveToDataElement, hardly, 1000);
    expectElement(general, 9, QPainterPath::CurveToDataElement, 1000, 1000);
}

TEST(BezierPath, ofMovesInARowTheGeneralPathHoldsTheLast)
{
    BezierPath path;
    path.moveToPoint({ 1, 1 });
    path.moveToPoint({ 2, 2 });
    path.lineToPoint({ 3, 3 });
    path.moveToPoint({ 4, 4 });

    const QPainterPath general = path.CGPath();

    ASSERT_EQ(general.elementCount(), 3);
    expectElement(general, 0, QPainterPath::MoveToElement, 2, 2);
    expectElement(general, 1, QPainterPath::LineToElement, 3, 3);
    expectElement(general, 2, QPainterPath::MoveToElement, 4, 4);
}

TEST(BezierPath, closingIsNothingWhereTheSubpathIsBackAtItsStartAndALineAfterItBeginsThere)
{
    BezierPath path;
    path.moveToPoint({ 1, 1 });
    path.lineToPoint({ 5, 1 });
    path.lineToPoint({ 1, 1 });
    path.closePath();
    path.lineToPoint({ 1, 1 });

    const QPainterPath general = path.CGPath();

    ASSERT_EQ(general.elementCount(), 5);
    expectElement(general, 2, QPainterPath::LineToElement, 1, 1);
    expectElement(general, 3, QPainterPath::MoveToElement, 1, 1);
    expectElement(general, 4, QPainterPath::LineToElement, 1, 1);
}

TEST(BezierPath, lineOfAPathThatBeginsWithNoMoveBeginsAtTheOriginInTheGeneralPath)
{
    BezierPath path;
    path.lineToPoint({ 0, 0 });

    const QPainterPath general = path.CGPath();

    ASSERT_EQ(general.elementCount(), 2);
    expectElement(general, 0, QPainterPath::MoveToElement, 0, 0);
    expectElement(general, 1, QPainterPath::LineToElement, 0, 0);
}

TEST(BezierPath, generalPathIsMadeAnewAndDoesNotFollowThePath)
{
    BezierPath path;
    path.moveToPoint({ 0, 0 });
    path.lineToPoint({ 1, 1 });
    const QPainterPath before = path.CGPath();

    path.lineToPoint({ 2, 2 });

    EXPECT_EQ(before.elementCount(), 2);
    EXPECT_EQ(path.CGPath().elementCount(), 3);
}

TEST(BezierPath, boundsHoldEveryPointOfThePath)
{
    BezierPath path;
    EXPECT_EQ(path.controlPointBounds(), (Rect { 0, 0, 0, 0 }));

    path.moveToPoint({ 10, 20 });
    EXPECT_EQ(path.controlPointBounds(), (Rect { 10, 20, 0, 0 }));

    path.lineToPoint({ 4, 25 });
    EXPECT_EQ(path.controlPointBounds(), (Rect { 4, 20, 6, 5 }));

    path.curveToPoint({ 5, 21 }, { 30, 0 }, { 0, 22 });
    path.closePath();
    EXPECT_EQ(path.controlPointBounds(), (Rect { 0, 0, 30, 25 }));
}

TEST(BezierPath, equalPathsHaveDifferentHashesThatStay)
{
    BezierPath first;
    const BezierPath second;
    const std::int64_t hash = first.hash();

    first.moveToPoint({ 1, 1 });
    first.setLineWidth(7.0);

    EXPECT_EQ(first.hash(), hash);
    EXPECT_NE(first.hash(), second.hash());
}

} // namespace
