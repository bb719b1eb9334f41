// SPDX-License-Identifier: MIT
#include <algorithm>
#include <cmath>
#include <limits>

#include "kernel/curves/dispatch/Distance.h"
#include "tests/kernel/curves/CurveCases.h"

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
    GmStretch const flat = Stretch(0, 0, 10, 0), crossing = Stretch(5, -5, 5, 5);
    GmStretch const parallel = Stretch(0, 2, 10, 2), outer = Stretch(0, 10, 10, 0);
    GmArc const quarter = Arc(0, 0, 5, 0, 90, CCW), inner = Arc(0, 0, 3, 0, 90, CCW);
    GmArc const right = Arc(20, 0, 5, 90, -90, CCW);
    GmLine const line(parallel);
    struct Case {
        char const* name;
        GmBase const& a;
        GmBase const& b;
        double dist;
    };
    Case const table[] = {
        {"points", GmPoint(0, 0, 0), GmPoint(2, 3, 6), 7},
        {"point beside stretch", GmPoint(5, 3), flat, 3},
        {"point beyond stretch", GmPoint(13, 4), flat, 5},
        {"crossing stretches", flat, crossing, 0},
        {"parallel stretches", flat, parallel, 2},
        {"point outside arc", GmPoint(10, 10), quarter, std::sqrt(200) - 5},
        {"point behind arc", GmPoint(-10, 0), quarter, std::sqrt(125)},
        {"centre of arc", GmPoint(0, 0), quarter, 5},
        {"arc and stretch outside", quarter, outer, std::sqrt(50) - 5},
        {"arc and stretch meeting", quarter, flat, 0},
        {"arcs face to face", quarter, right, 10},
        {"concentric arcs", quarter, inner, 2},
        {"curves without an own function", flat, line, 2},
        {"no curves", GmPoint(1, 1), line, std::numeric_limits<double>::max()},
    };
    for (Case const& c : table) {
        EXPECT_NEAR(Distance(c.a, c.b), c.dist, 1e-9) << c.name;
        EXPECT_EQ(Distance(c.b, c.a), Distance(c.a, c.b)) << c.name;
    }
}

TEST(Distance, AgreesWithSamples) {
    for (GmBase::eGmTypes const first : {GmBase::eGmStretch, GmBase::eGmArc}) {
        for (GmBase::eGmTypes const second : {GmBase::eGmStretch, GmBase::eGmArc}) {
            SCOPED_TRACE(PairName(first, second));
            int apart = 0;
            EXPECT_TRUE(rc::check("symmetric and the smallest sampled distance", [&] {
                auto const a = AnyCurve(first);
                auto const b = AnyCurve(second);
                double const d = Distance(*a, *b);
                double sampled = std::numeric_limits<double>::max();
                for (int i = 0; i <= 500; ++i) {
                    sampled = std::min(sampled, ExactDist(*b, Along(*a, i / 500.0)));
                }
                RC_ASSERT(std::fabs(d - Distance(*b, *a)) < 1e-9);
                RC_ASSERT(d > sampled - a->Length() / 500);
                if (!nested(*a, *b)) RC_ASSERT(d < sampled + 1e-6);
                if (d > 0) ++apart;
            }));
            EXPECT_GT(apart, 0);
        }
    }
}
