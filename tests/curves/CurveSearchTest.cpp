#include <cmath>
#include <limits>

#include "curves/CurveCases.h"

using namespace cases;

namespace {

/// Opens the parts of a curve that derived classes use.
struct Probe : GmLine {
    using GmCurve::CheckDist;
    using GmCurve::CopyPtSol;
};

}  // namespace

TEST(CurveSearch, NearestPointsBeatSamples) {
    for (GmBase::eGmTypes const kind : Kinds()) {
        SCOPED_TRACE(NameOf(kind));
        EXPECT_TRUE(rc::check("on the curve and as near as any of its points", [&] {
            auto const curve = AnyCurve(kind);
            GmPoint const p = AnyGridPoint();
            double const exact = ExactDist(*curve, p);
            GmPoint const nearest = curve->MinDist(p, false);
            bool const centre = curve->IsCircle() && !nearest.CreationOK();
            if (centre) RC_ASSERT(static_cast<GmCircle const&>(*curve).M() == p);
            RC_PRE(!centre);
            RC_ASSERT(ExactDist(*curve, nearest) < 1e-9);
            RC_ASSERT(std::fabs(nearest.Dist(p) - exact) < 1e-9);

            double d = -1;
            GmPoint const searched = curve->MinDist(d, p, false);
            RC_ASSERT(std::fabs(d - exact) < 1e-9 && std::fabs(searched.Dist(p) - d) < 1e-9);
            if (!curve->IsBeam())
                RC_ASSERT(std::fabs(curve->Dist(p) - exact) < 1e-6 || curve->IsArc());
            RC_ASSERT(curve->Element(nearest) &&
                      !curve->Element(GmPoint(nearest + GmVec(0, 0, 1))));
        }));
    }
}

TEST(CurveSearch, PrefersTheStartPoint) {
    GmStretch const s(GmPoint(0, 0), GmPoint(10, 0));
    GmArc const half(GmPoint(0, 0), 5, 0, M_PI, GmBase::eRotCCW);
    double d = -1;
    EXPECT_TRUE(IsAt(half.MinDist(d, GmPoint(0, 0), false), 5, 0)) << "ties keep the earliest";
    EXPECT_EQ(d, 5);
    EXPECT_TRUE(IsAt(half.MinDist(d, GmPoint(-7, -1), false), -5, 0));
    EXPECT_TRUE(IsAt(half.MinDist(d, GmPoint(-8, -6), true), 4, 3)) << "the foot across the centre";
    EXPECT_DOUBLE_EQ(d, 15);
    EXPECT_TRUE(IsAt(s.MinDist(d, GmPoint(13, 4), true), 10, 0)) << "a stretch's foot is clamped";

    d = -9;
    GmCircle const circle(GmPoint(1, 1), 3, true);
    EXPECT_FALSE(circle.MinDist(d, GmPoint(1, 1), false).CreationOK());
    EXPECT_EQ(d, 3) << "without a candidate the root of the magnitude passed in";
}

TEST(CurveSearch, FindsTheApproachOfTwoCurves) {
    GmStretch const flat(GmPoint(0, 0), GmPoint(10, 0));
    GmStretch const slanted(GmPoint(14, 3), GmPoint(20, 9));
    GmStretch const dipping(GmPoint(4, 9), GmPoint(5, 2));
    GmLine const wall(GmPoint(12, 7), GmDir(0, 1));
    GmCircle const round(GmPoint(5, 8), 3, true);
    GmCircle const left(GmPoint(0, 0), 2, true);
    GmCircle const right(GmPoint(9, 0), 4, true);
    struct Case {
        char const* name;
        GmCurve const& a;
        GmCurve const& b;
        bool preferSP;
        double dist;
        GmPoint on;
    };
    Case const table[] = {
        {"end against start", flat, slanted, false, 5, GmPoint(10, 0)},
        {"end left out, its foot remains", flat, slanted, true, 5, GmPoint(10, 0)},
        {"foot of the other end", flat, dipping, false, 2, GmPoint(5, 0)},
        {"foot of the other start only", flat, dipping, true, 9, GmPoint(4, 0)},
        {"end against a line", flat, wall, false, 2, GmPoint(10, 0)},
        {"start against a line", flat, wall, true, std::sqrt(148.0) - 0, GmPoint(0, 0)},
        {"circle faces stretch", round, flat, false, 5, GmPoint(5, 5)},
        {"stretch faced by circle", flat, round, true, 5, GmPoint(5, 0)},
        {"of two circles the far sides", left, right, false, 3, GmPoint(-2, 0)},
    };
    for (Case const& c : table) {
        double d = -1;
        GmPoint const found = c.a.MinDist(d, &c.b, c.preferSP);
        EXPECT_TRUE(IsAt(found, c.on.X(), c.on.Y())) << c.name;
        EXPECT_NEAR(d, c.dist, 1e-9) << c.name;
    }
    for (GmBase::eGmTypes const first : Kinds()) {
        for (GmBase::eGmTypes const second : Kinds()) {
            SCOPED_TRACE(std::string(NameOf(first)) + ", " + NameOf(second));
            EXPECT_TRUE(rc::check("a point of the curve, not nearer than the curves are", [&] {
                auto const a = AnyCurve(first);
                auto const b = AnyCurve(second);
                double d = -1;
                GmPoint const found = a->MinDist(d, b.get(), false);
                RC_PRE(found.CreationOK());
                RC_ASSERT(ExactDist(*a, found) < 1e-9);
                RC_ASSERT(d > ExactDist(*b, found) - 1e-9);
            }));
        }
    }
}

TEST(CurveSearch, KeepsTheBestCandidate) {
    Probe const probe;
    GmPoint const near(1, 0), far(2, 0), reference(0, 0);
    double d = 7;
    GmPoint best;
    probe.CheckDist(d, best, near, GmPoint());
    EXPECT_TRUE(d == 7 && !best.CreationOK()) << "without a reference nothing is compared";
    probe.CheckDist(d, best, far, reference);
    EXPECT_TRUE(d == 4 && best == far);
    probe.CheckDist(d, best, near, reference);
    probe.CheckDist(d, best, GmPoint(-1, 0), reference);
    EXPECT_TRUE(d == 1 && best == near) << "a tie keeps the first";
    d = 0;
    best = GmPoint();
    probe.CheckDist(d, best, far, reference);
    EXPECT_EQ(d, 4) << "an undefined best point is always replaced";
}

TEST(CurveSearch, SortsAndFiltersPoints) {
    GmArc const arc(GmPoint(0, 0), 5, 0, M_PI, GmBase::eRotCW);
    GmPoint const low(0, -5), farEnd(-5, 0), beside(0, -7), onTop(0, 5);
    less_than_curve const before(&arc);
    EXPECT_TRUE(before(low, farEnd) && !before(farEnd, low)) << "along the arc";
    EXPECT_FALSE(before(low, beside) || before(beside, low)) << "only the direction counts";
    point_is_element const on(&arc);
    EXPECT_TRUE(on(low) && !on(onTop) && !on(beside));
    GmCircle const circle(arc);
    EXPECT_EQ(circle.DistSP(low), std::numeric_limits<double>::max());

    GmLine const crossed(GmPoint(0, 0), GmDir(1, 0)), up(GmPoint(3, 0), GmDir(0, 1));
    crossed.Intersection(&up);
    Probe probe;
    GmCurve const& bare = probe;
    EXPECT_FALSE(bare == crossed) << "solution lists of different length";
    probe.CopyPtSol(crossed);
    EXPECT_TRUE(bare == crossed) << "curves compare by their lists alone";
}
