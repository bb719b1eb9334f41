// SPDX-License-Identifier: MIT
#include <cmath>
#include <limits>

#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

TEST(CurveSearch, NearestPointsBeatSamples) {
    for (GmBase::eGmTypes const kind : Kinds()) {
        SCOPED_TRACE(PairName(kind, kind));
        EXPECT_TRUE(rc::check("on the curve and as near as any of its points", [&] {
            auto const curve = AnyCurve(kind);
            GmPoint const p = AnyGridPoint();
            RC_PRE(!curve->IsCircle() || static_cast<GmCircle const&>(*curve).M() != p);
            double const exact = ExactDist(*curve, p);
            GmPoint const nearest = curve->MinDist(p, false);
            RC_ASSERT(ExactDist(*curve, nearest) < 1e-9);
            RC_ASSERT(std::fabs(nearest.Dist(p) - exact) < 1e-9);
            double d = -1;
            GmPoint const searched = curve->MinDist(d, p, false);
            RC_ASSERT(std::fabs(d - exact) < 1e-9 && std::fabs(searched.Dist(p) - d) < 1e-9);
            RC_ASSERT(curve->IsBeam() || curve->IsArc() ||
                      std::fabs(curve->Dist(p) - exact) < 1e-6);
        }));
    }
}

TEST(CurveSearch, PrefersTheStartPoint) {
    GmArc const half = Arc(0, 0, 5, 0, 180, CCW);
    EXPECT_EQ(Text(half.MinDist(GmPoint(0, 0), false)), "5,0") << "the centre answers the start";
    EXPECT_EQ(Text(half.MinDist(GmPoint(0, -3), false)), "-5,0") << "a tie goes to the end";
    EXPECT_EQ(Text(half.MinDist(GmPoint(-1, -3), true)), "5,0");
    double d = -1;
    EXPECT_EQ(Text(half.MinDist(d, GmPoint(0, 0), false)), "5,0") << "ties keep the earliest";
    EXPECT_EQ(Text(half.MinDist(d, GmPoint(-7, -1), false)), "-5,0");
    EXPECT_EQ(Text(half.MinDist(d, GmPoint(-7, -1), true)), "5,0") << "the end left out";
    d = -9;
    EXPECT_EQ(Text(Circle(1, 1, 3).MinDist(d, GmPoint(1, 1), false)), "none");
    EXPECT_EQ(d, 3) << "without a candidate the root of the magnitude passed in";
}

TEST(CurveSearch, FindsTheApproachOfTwoCurves) {
    GmStretch const flat = Stretch(0, 0, 10, 0), slanted = Stretch(14, 3, 20, 9);
    GmStretch const dipping = Stretch(4, 9, 5, 2);
    GmLine const wall(Stretch(12, 7, 12, 8));
    GmCircle const above = Circle(5, 8, 3), left = Circle(0, 0, 2), right = Circle(9, 0, 4);
    struct Case {
        char const* name;
        GmCurve const& a;
        GmCurve const& b;
        bool preferSP;
        double dist;
        char const* point;
    };
    Case const table[] = {
        {"end against start", flat, slanted, false, 5, "10,0"},
        {"foot of the other end", flat, dipping, false, 2, "5,0"},
        {"the other end left out", flat, dipping, true, std::sqrt(29), "0,0"},
        {"end against its foot on a line", flat, wall, false, 2, "10,0"},
        {"a line counts from its start", flat, wall, true, std::sqrt(53), "10,0"},
        {"circle faces stretch", above, flat, false, 5, "5,5"},
        {"stretch faced by circle", flat, above, true, 5, "5,0"},
        {"of two circles the far sides", left, right, false, 7, "-2,0"},
    };
    for (Case const& c : table) {
        double d = -1;
        EXPECT_EQ(Text(c.a.MinDist(d, &c.b, c.preferSP)), c.point) << c.name;
        EXPECT_NEAR(d, c.dist, 1e-9) << c.name;
    }
    for (GmBase::eGmTypes const first : Kinds()) {
        for (GmBase::eGmTypes const second : Kinds()) {
            SCOPED_TRACE(PairName(first, second));
            EXPECT_TRUE(rc::check("a point of the curve, not nearer than the curves are", [&] {
                auto const a = AnyCurve(first);
                auto const b = AnyCurve(second);
                double d = -1;
                GmPoint const found = a->MinDist(d, b.get(), false);
                RC_PRE(found.CreationOK());
                // Feet up to the point tolerance beyond an end count as on the curve.
                RC_ASSERT(ExactDist(*a, found) < 2 * GmBase::m_scdPrec);
                RC_ASSERT(d > ExactDist(*b, found) - 2 * GmBase::m_scdPrec);
            }));
        }
    }
}

TEST(CurveSearch, ComparesBareCurvesByTheirLists) {
    GmLine const a(Stretch(0, 0, 1, 0)), b(Stretch(3, 0, 3, 1)), c(Stretch(4, 0, 4, 1));
    GmCurve const &bareA = a, &bareB = b;
    EXPECT_TRUE(bareA == bareB) << "both without points";
    a.Intersection(&b);
    EXPECT_FALSE(bareA == bareB);
    b.Intersection(&a);
    EXPECT_TRUE(bareA == bareB);
    a.Intersection(&c);
    EXPECT_FALSE(bareA == bareB);
}
