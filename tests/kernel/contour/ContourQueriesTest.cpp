// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <algorithm>
#include <cmath>
#include <limits>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmLine.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"

namespace {

using shapes::Path;

constexpr double kLargest = std::numeric_limits<double>::max();

GmPoint RandomPoint() {
    return GmPoint(*rc::gen::inRange(-200, 200) * 0.1, *rc::gen::inRange(-200, 200) * 0.1);
}

double NearestSample(GmContour const& contour, GmPoint const& p) {
    double nearest = kLargest;
    for (GmPoint const& sample : shapes::Samples(contour, 60))
        nearest = std::min(nearest, sample.Dist(p));
    return nearest;
}

}  // namespace

TEST(ContourQueries, MinDistIsTheDistanceOfAPointOfTheContour) {
    EXPECT_TRUE(rc::check([](unsigned seed) {
        const GmPoint p = RandomPoint();
        const double scaleOfSampling = 0.08;  // a sample lies within this of every point of a star
        for (auto const& variant : shapes::Variants(shapes::RandomStar(seed, true))) {
            const GmPoint mapped = variant.Map(p);
            double d = 0;
            const GmPoint foot = variant.contour.MinDist(d, mapped, false);
            RC_ASSERT(std::fabs(d - foot.Dist(mapped)) < 1e-9 * (1 + d));
            RC_ASSERT(variant.contour.Element(foot, 0.001));
            const double sampled = NearestSample(variant.contour, mapped);
            RC_ASSERT(d <= sampled + 2 * GmBase::m_scdPrec);
            const double reach = scaleOfSampling * variant.scale;
            RC_ASSERT(sampled * sampled <= d * d + 2 * d * reach + 4 * reach * reach);
        }
    }));
}

TEST(ContourQueries, MinDistPrefersTheFirstOrThePointNearerToASecondOne) {
    GmContour square = shapes::Square(10);
    double d = 0;
    EXPECT_EQ(square.MinDist(d, GmPoint(5, 5), false), GmPoint(5, 0)) << "the first of equal ones";
    EXPECT_FALSE(square.MinDist(GmPoint(5, -3), false).CreationOK());
    EXPECT_FALSE(square.NP(GmPoint(5, -3)).CreationOK());
    struct {
        GmPoint p, second, foot;
    } const rows[] = {{{5, 5}, {5, 20}, {5, 10}},
                      {{5, 5}, {20, 5}, {10, 5}},
                      {{5, 5}, {5, 5}, {5, 0}},
                      {{5, 4.9}, {5, 20}, {5, 0}}};
    for (auto const& row : rows) {
        EXPECT_EQ(square.MinDist(d, row.p, row.second, false), row.foot);
        EXPECT_DOUBLE_EQ(d, row.foot.Dist(row.p));
        EXPECT_DOUBLE_EQ(square.Dist(row.p), d);
    }
}

TEST(ContourQueries, MinDistToACurveIsTheSameFromBothContours) {
    const GmContour square = shapes::Square(10);
    const GmStretch segment(GmPoint(20, 5), GmPoint(12, 5));  // nearest with its end
    double d = 0;
    EXPECT_EQ(square.MinDist(d, &segment, true), GmPoint(10, 5));
    EXPECT_DOUBLE_EQ(d, 2);
    EXPECT_TRUE(rc::check([](unsigned seedA, unsigned seedB) {
        const GmContour a = shapes::RandomStar(seedA, true);
        const GmContour b = shapes::Moved(shapes::RandomStar(seedB, true), 25, 3);
        double ab = 0;
        double ba = 0;
        const GmPoint onA = a.MinDist(ab, &b, false);
        const GmPoint onB = b.MinDist(ba, &a, false);
        RC_ASSERT(std::fabs(ab - ba) < 1e-9);
        double rest = 0;
        b.MinDist(rest, onA, false);
        RC_ASSERT(std::fabs(rest - ab) < 1e-6);
        a.MinDist(rest, onB, false);
        RC_ASSERT(std::fabs(rest - ab) < 1e-6);
    }));
}

TEST(ContourQueries, NearestAndFarthestVertices) {
    GmContour square = shapes::Square(10);
    EXPECT_EQ(square.NearPointElem(GmPoint(5, 0)), 0) << "the first of equally near starts";
    EXPECT_EQ(square.NearPointElem(GmPoint(5.00004, 0)), 0) << "nearer by less than 1e-4";
    EXPECT_EQ(square.NearPointElem(GmPoint(5.0001, 0)), 1);
    EXPECT_EQ(square.FarPoint(GmPoint(5, 5)), GmPoint(0, 0)) << "the first of equally far ones";
    EXPECT_EQ(square.FarPoint(GmPoint(5, 4.99995)), GmPoint(0, 0)) << "farther by less than 1e-4";
    EXPECT_EQ(square.FarPoint(GmPoint(5, 4.9999)), GmPoint(10, 10));
    GmContour open = Path("0 0  10 0  10 10");
    EXPECT_EQ(open.NearPoint(GmPoint(10, 11)), GmPoint(10, 0)) << "the last end is no candidate";
    EXPECT_EQ(open.FarPoint(GmPoint(0, 0)), GmPoint(10, 10));
    EXPECT_EQ(open.FarPoint(GmPoint(10, 10)), GmPoint(0, 0));
    // A tie goes to the later start unless the earlier is nearer to the second point.
    const GmPoint middle(5, 5);
    EXPECT_EQ(square.NearPointElem(middle, middle), 3);
    EXPECT_EQ(square.NearPointElem(middle, GmPoint(-1, 11)), 1);
    EXPECT_EQ(square.NearPointElem(middle, GmPoint(11, 11)), 0);
    EXPECT_EQ(square.NearPointElem(GmPoint(9, 9), GmPoint(0, 0)), 2);
}

TEST(ContourQueries, AJointBelongsToTheLaterElement) {
    const GmContour square = shapes::Square(10);
    EXPECT_EQ(square.LastPointElem(GmPoint(10, 0)), 1);
    EXPECT_EQ(square.LastPointElem(GmPoint(0, 0)), 3);
    EXPECT_TRUE(square.Element(GmPoint(5, 0.00009)));
    EXPECT_FALSE(square.Element(GmPoint(5, 0.0002)));
    EXPECT_TRUE(square.Element(GmPoint(5, 0.4), 0.5));
    EXPECT_EQ(square.Tangent(GmPoint(10, 0)).Dir(), GmDir(0, 1, 0));
    const GmContour slot = shapes::Slot();
    EXPECT_EQ(slot.LastPointElem(GmPoint(11.005, 3)), 1) << "arcs have their own tolerance";
    EXPECT_EQ(slot.Tangent(GmPoint(11, 3)).Dir(), GmDir(0, -1, 0)) << "clockwise on every arc";
}

TEST(ContourQueries, InAndOutAroundAnAngle) {
    // The probe from the notch runs through the middle of the first element and on through the leg.
    GmContour angle = Path("10 1  1 1  1 10  0 10  0 0  10 0  10 1");
    EXPECT_TRUE(!angle.In(GmPoint(5.5, 5)) && angle.Out(GmPoint(5.5, 5)));
    EXPECT_TRUE(angle.In(GmPoint(5.5, 0.5)) && !angle.Out(GmPoint(5.5, 0.5)));
    EXPECT_FALSE(angle.In(GmPoint(3, 1)) || angle.Out(GmPoint(3, 1)));
}

TEST(ContourQueries, TheMiddleOfAStarIsInAndPointsFarAwayAreOut) {
    EXPECT_TRUE(rc::check([](unsigned seed, bool bWithArcs) {
        for (auto variant : shapes::Variants(shapes::RandomStar(seed, bWithArcs))) {
            const GmPoint middle = variant.Map(GmPoint(0, 0));
            RC_ASSERT(variant.contour.In(middle) && !variant.contour.Out(middle));
            const GmPoint away = variant.Map(GmPoint(11, 11));
            RC_ASSERT(!variant.contour.In(away) && variant.contour.Out(away));
            const GmPoint joint = variant.contour.GetElement(2)->EP();
            RC_ASSERT(!variant.contour.In(joint) && !variant.contour.Out(joint));
        }
    }));
}

TEST(ContourQueries, TheSenseOfRotationIsTheSameFromEveryPoint) {
    EXPECT_TRUE(rc::check([](unsigned seed, bool bWithArcs) {
        const GmPoint p = RandomPoint();
        for (auto variant : shapes::Variants(shapes::RandomStar(seed, bWithArcs))) {
            const auto sense = variant.bReversed ? GmBase::eRotCW : GmBase::eRotCCW;
            RC_ASSERT(variant.contour.Dir(variant.Map(p)) == sense);
            variant.contour.RemoveElement(static_cast<int>(variant.contour.ElementCount()) - 1);
            GmContour open(variant.contour);
            RC_ASSERT(!open.IsClosed());
            RC_ASSERT(open.Dir(variant.Map(p)) == sense);
        }
    }));
}

TEST(ContourQueries, TheSenseOfArcsCountsWhereTheJointsEncloseNothing) {
    EXPECT_EQ(Path("2 0  cw 0 0 -2 0  cw 0 0 2 0").Dir(GmPoint(7, 3)), GmBase::eRotCW);
    EXPECT_EQ(Path("2 0  ccw 0 0 -2 0  ccw 0 0 2 0").Dir(GmPoint(7, 3)), GmBase::eRotCCW);
    EXPECT_EQ(shapes::Square(10).Dir(GmPoint(1e20, 1e20)), GmBase::eRotCCW) << "cancels to 0";
    for (const double x : {0, 4})
        EXPECT_EQ(Path("0 0  8 0  0 0").Dir(GmPoint(x, 0)), GmBase::eRotNone);
    GmContour noHeight;
    const double inf = std::numeric_limits<double>::infinity();
    noHeight.AddElement(GmStretch(GmPoint(0, 0, inf), GmPoint(1, 0, inf)), false, 0);
    EXPECT_EQ(noHeight.Dir(GmPoint(0, 0)), GmBase::eRotNone) << "the start equals no point";
}
