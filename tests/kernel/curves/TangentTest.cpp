// SPDX-License-Identifier: MIT
#include <cmath>

#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

namespace {

bool isTrue() {
    return *rc::gen::arbitrary<bool>();
}

GmCircle anyCircle() {
    return GmCircle(AnyGridPoint(), *rc::gen::inRange(1, 24) / 4.0, true);
}

GmLine anyLine() {
    return GmLine(AnyStretch());
}

/// Signed distance of a point from a line, positive on its right.
double rightOf(GmLine const& line, GmPoint const& p) {
    const GmVec toP = p - line.SP();
    return toP.X() * line.Dir().Y() - toP.Y() * line.Dir().X();
}

double ahead(GmLine const& line, GmVec const& v) {
    return v * GmVec(line.Dir());
}

/// From the centre of `circle` to where it touches `c`.
GmVec toTouch(GmCircle const& circle, GmCircle const& c, bool bOutside) {
    const double sign = !bOutside && c.R() >= circle.R() ? -1.0 : 1.0;
    return sign * circle.R() * GmVec(GmDir(circle.M(), c.M()));
}

double distanceOfCentres(GmCircle const& c, double r, bool bOutside) {
    return bOutside ? c.R() + r : std::fabs(c.R() - r);
}

}  // namespace

TEST(Tangents, FromAPointTouchTheCircleOnTheSideAskedFor) {
    EXPECT_TRUE(rc::check([] {
        const GmPoint p = AnyGridPoint();
        const GmCircle c = anyCircle();
        const bool bRight = isTrue();
        const double dist = p.Dist(c.M());
        RC_PRE(std::fabs(dist - c.R()) > 0.01);
        const GmLine tangent(p, c, bRight);
        RC_ASSERT(tangent.CreationOK() == (dist > c.R()));
        if (dist < c.R()) return;
        RC_ASSERT(std::fabs(rightOf(tangent, c.M()) - (bRight ? c.R() : -c.R())) < 1e-8);
        RC_ASSERT(std::fabs(tangent.SP().Dist(c.M()) - c.R()) < 1e-8);
        RC_ASSERT(tangent.Dir() == GmDir(p, tangent.SP()));
    }));
    const GmLine onCircle(GmPoint(2, 0), Circle(0, 0, 2), true);
    EXPECT_EQ(Text(onCircle.SP()) + " " + Text(onCircle.Dir()), "2,0 0,-1");
    EXPECT_FALSE(GmLine(GmPoint(), Circle(0, 0, 2), true).CreationOK());
}

TEST(Tangents, OfTwoCirclesTouchBothOnTheSidesAskedFor) {
    EXPECT_TRUE(rc::check([] {
        const GmCircle c1 = anyCircle();
        const GmCircle c2 = anyCircle();
        const bool bRight1 = isTrue();
        const bool bRight2 = isTrue();
        const double dist = c1.M().Dist(c2.M());
        const double least = bRight1 != bRight2 ? c1.R() + c2.R() : std::fabs(c1.R() - c2.R());
        RC_PRE(std::fabs(dist - least) > 1e-6);
        const GmLine tangent(c1, bRight1, c2, bRight2);
        RC_ASSERT(tangent.CreationOK() == (dist > least));
        if (dist < least) return;
        RC_ASSERT(std::fabs(rightOf(tangent, c1.M()) - (bRight1 ? c1.R() : -c1.R())) < 1e-9);
        RC_ASSERT(std::fabs(rightOf(tangent, c2.M()) - (bRight2 ? c2.R() : -c2.R())) < 1e-9);
        RC_ASSERT(std::fabs(ahead(tangent, c2.M() - tangent.SP())) < 1e-9);
        RC_ASSERT(ahead(tangent, c2.M() - c1.M()) > 0.0);
    }));
    EXPECT_FALSE(GmLine(Circle(1, 1, 2), true, Circle(1, 1, 2), true).CreationOK());
    EXPECT_TRUE(GmLine(Circle(0, 0, 0.3), true, Circle(0.1, 0, 0.2), true).CreationOK())
        << "touching from inside";
}

TEST(TouchingCircles, GoThroughThreePoints) {
    EXPECT_TRUE(rc::check([] {
        const GmPoint p1 = AnyGridPoint();
        const GmPoint p2 = AnyGridPoint();
        const GmPoint p3 = AnyGridPoint();
        const GmCircle circle(p1, p2, p3);
        const bool collinear = std::fabs(((p2 - p1) % (p3 - p1)).Z()) < 1e-9;
        RC_ASSERT(circle.CreationOK() != collinear);
        for (GmPoint const& p : {p1, p2, p3})
            RC_ASSERT(collinear || std::fabs(circle.M().Dist(p) - circle.R()) < 1e-8 * circle.R());
    }));
    const GmPoint p(1, 2);
    EXPECT_FALSE(GmCircle(p, GmPoint(5, 5), GmPoint(5.00005, 5)).CreationOK());
}

TEST(TouchingCircles, OfThreeLinesFollowTheirDirections) {
    const GmPoint o(0, 0);
    const GmPoint a(4, 0);
    const GmPoint b(0, 3);
    EXPECT_EQ(Text(GmCircle(GmLine(o, a), GmLine(b, a), GmLine(b, o)).M()), "1,1");
    const GmCircle outer(GmLine(o, a), GmLine(a, b), GmLine(b, o));
    EXPECT_EQ(Text(outer.M()), "6,6");
    EXPECT_NEAR(outer.R(), 6, 1e-12);
    EXPECT_FALSE(
        GmCircle(GmLine(o, a), GmLine(b, GmPoint(4, 3)), GmLine(b, GmPoint(8, 3))).CreationOK());
}

TEST(TouchingCircles, OfTwoLinesLieBetweenTheirDirections) {
    EXPECT_TRUE(rc::check([] {
        const GmLine l1 = anyLine();
        const GmLine l2 = anyLine();
        const double r = AnyOffset();
        const GmCircle circle(l1, l2, r);
        RC_ASSERT(circle.CreationOK() != GmParallelDir(l1.Dir(), l2.Dir()));
        if (!circle.CreationOK()) return;
        const double bound = 1e-6 * (1.0 + circle.M().Length());
        const bool l2OnLeft = (GmVec(l1.Dir()) % GmVec(l2.Dir())).Z() > 0.0;
        const double side = l2OnLeft ? -1.0 : 1.0;
        RC_ASSERT(std::fabs(rightOf(l1, circle.M()) - side * std::fabs(r)) < bound);
        RC_ASSERT(std::fabs(rightOf(l2, circle.M()) + side * std::fabs(r)) < bound);
        RC_ASSERT(circle.R() == std::fabs(r));
    }));
}

TEST(TouchingCircles, OfACircleAndALineAreChosenByTheFlags) {
    EXPECT_TRUE(rc::check([] {
        const GmCircle c = anyCircle();
        const GmLine l = anyLine();
        const double r = std::fabs(AnyOffset());
        const bool bRight = isTrue();
        const bool bOutside = isTrue();
        const bool bAfter = isTrue();
        const double reach = distanceOfCentres(c, r, bOutside);
        const double beside = std::fabs(rightOf(l, c.M()) - (bRight ? r : -r));
        RC_PRE(std::fabs(reach - beside) > 0.01);
        const GmCircle circle(c, l, r, bRight, bOutside, bAfter);
        RC_ASSERT(circle.CreationOK() == (beside < reach));
        if (beside > reach) return;
        RC_ASSERT(std::fabs(rightOf(l, circle.M()) - (bRight ? r : -r)) < 1e-9);
        RC_ASSERT(std::fabs(circle.M().Dist(c.M()) - reach) < 1e-9);
        RC_ASSERT((ahead(l, toTouch(circle, c, bOutside)) > 0.0) == !bAfter);
    }));
}

TEST(TouchingCircles, OfTwoCirclesAreChosenByTheFlags) {
    EXPECT_TRUE(rc::check([] {
        const GmCircle c1 = anyCircle();
        const GmCircle c2 = anyCircle();
        const double r = std::fabs(AnyOffset());
        const bool bCW = isTrue();
        const bool bOutside1 = isTrue();
        const bool bOutside2 = isTrue();
        const double reach1 = distanceOfCentres(c1, r, bOutside1);
        const double reach2 = distanceOfCentres(c2, r, bOutside2);
        const double dist = c1.M().Dist(c2.M());
        RC_PRE(dist < reach1 + reach2 - 0.01);
        RC_PRE(dist > std::fabs(reach1 - reach2) + 0.01);
        const GmCircle circle(c1, c2, r, bCW, bOutside1, bOutside2, false);
        RC_ASSERT(std::fabs(circle.M().Dist(c1.M()) - reach1) < 1e-9);
        RC_ASSERT(std::fabs(circle.M().Dist(c2.M()) - reach2) < 1e-9);
        const GmVec to1 = toTouch(circle, c1, bOutside1);
        const GmVec to2 = toTouch(circle, c2, bOutside2);
        RC_ASSERT(((to1 % to2).Z() < 0.0) == bCW);
        const GmCircle other(c1, c2, r, bCW, bOutside1, bOutside2, true);
        RC_ASSERT(other == GmCircle(c1, c2, r, !bCW, bOutside1, bOutside2, false));
        RC_ASSERT(other.M() != circle.M());
    }));
    EXPECT_FALSE(
        GmCircle(Circle(0, 0, 1), Circle(3, 0, 1), 0.4, true, true, true, true).CreationOK());
    for (const double r : {0.0, -1.0, std::nan("")}) {
        EXPECT_FALSE(
            GmCircle(Circle(0, 0, 1), Circle(3, 0, 1), r, true, true, true, true).CreationOK());
        EXPECT_FALSE(
            GmCircle(Circle(0, 0, 2), GmLine(Stretch(-9, -2.5, 9, -2.5)), r, true, true, true)
                .CreationOK());
    }
}
