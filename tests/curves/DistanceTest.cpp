#include <cmath>
#include <limits>

#include "curves/CurveCases.h"
#include "curves/dispatch/Distance.h"

using namespace cases;

namespace {

/// One circle inside the other: the only pair of facing points tried is then not the nearest one.
bool nested(GmCurve const& a, GmCurve const& b) {
    if (!a.IsArc() || !b.IsArc()) return false;
    auto const& first = static_cast<GmCircle const&>(a);
    auto const& second = static_cast<GmCircle const&>(b);
    return first.M().Dist(second.M()) < std::fabs(first.R() - second.R()) + GmBase::m_scdPrec;
}

}  // namespace

TEST(Distance, OfPointsStretchesAndArcs) {
    GmStretch const flat(GmPoint(0, 0), GmPoint(10, 0));
    GmArc const quarter(GmPoint(0, 0), 5, 0, M_PI / 2, GmBase::eRotCCW);
    GmArc const inner(GmPoint(0, 0), 3, 0, M_PI / 2, GmBase::eRotCCW);
    GmPoint const above(5, 3), beyond(13, 4), outside(10, 10), behind(-10, 0), centre(0, 0);
    GmStretch const crossing(GmPoint(5, -5), GmPoint(5, 5));
    GmStretch const parallel(GmPoint(0, 2), GmPoint(10, 2));
    GmStretch const outer(GmPoint(0, 10), GmPoint(10, 0));
    GmArc const right(GmPoint(20, 0), 5, M_PI / 2, -M_PI / 2, GmBase::eRotCCW);
    struct Case {
        char const* name;
        GmBase const& a;
        GmBase const& b;
        double dist;
    };
    Case const table[] = {
        {"points", GmPoint(0, 0, 0), GmPoint(2, 3, 6), 7},
        {"point beside stretch", above, flat, 3},
        {"point beyond stretch", beyond, flat, 5},
        {"crossing stretches", flat, crossing, 0},
        {"parallel stretches", flat, parallel, 2},
        {"point outside arc", outside, quarter, std::sqrt(200) - 5},
        {"point behind arc", behind, quarter, std::sqrt(125)},
        {"centre of arc", centre, quarter, 5},
        {"arc and stretch outside", quarter, outer, std::sqrt(50) - 5},
        {"arc and stretch crossing", quarter, flat, 0},
        {"arcs face to face", quarter, right, 10},
        {"concentric arcs", quarter, inner, 2},
    };
    for (Case const& c : table) {
        EXPECT_NEAR(Distance(c.a, c.b), c.dist, 1e-9) << c.name;
        EXPECT_EQ(Distance(c.b, c.a), Distance(c.a, c.b)) << c.name;
    }
}

TEST(Distance, OfOtherObjectsFallsBack) {
    GmPoint const p(1, 1);
    GmLine const line(p, GmDir(1, 0));
    EXPECT_EQ(Distance(p, line), std::numeric_limits<double>::max());
    EXPECT_EQ(Distance(GmVec(1, 1, 1), p), std::numeric_limits<double>::max());
    GmStretch const above(GmPoint(3, 4), GmPoint(5, 9));
    EXPECT_DOUBLE_EQ(Distance(above, line), 3) << "the nearest approach of curves";
    EXPECT_DOUBLE_EQ(Distance(GmCircle(GmPoint(0, 5), 2, true), line), 2);
}

TEST(Distance, AgreesWithSamples) {
    std::vector<GmBase::eGmTypes> const bounded = {GmBase::eGmStretch, GmBase::eGmArc};
    for (GmBase::eGmTypes const first : bounded) {
        for (GmBase::eGmTypes const second : bounded) {
            SCOPED_TRACE(std::string(NameOf(first)) + ", " + NameOf(second));
            int apart = 0;
            EXPECT_TRUE(rc::check("symmetric and the smallest sampled distance", [&] {
                auto const a = AnyCurve(first);
                auto const b = AnyCurve(second);
                double const d = Distance(*a, *b);
                Sampled const sampled = SampledDist(*a, *b);
                RC_ASSERT(std::fabs(d - Distance(*b, *a)) < 1e-9);
                RC_ASSERT(d > sampled.dist - sampled.step);
                if (!nested(*a, *b)) RC_ASSERT(d < sampled.dist + 1e-6);
                if (d > 0) ++apart;
            }));
            EXPECT_GT(apart, 0);
        }
    }
}
