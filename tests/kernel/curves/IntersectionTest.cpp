// SPDX-License-Identifier: MIT
#include <algorithm>
#include <cmath>
#include <limits>
#include <stdexcept>

#include "gmkernel/GmContour.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmRect.h"
#include "kernel/curves/dispatch/Distance.h"
#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

namespace {

/// On which side of the infinite line or the full circle of a curve does a point lie?
double side(GmCurve const& curve, GmPoint const& p) {
    if (curve.IsCircle() || curve.IsArc()) {
        auto const& circle = static_cast<GmCircle const&>(curve);
        return p.Dist(circle.M()) - circle.R();
    }
    auto const& line = static_cast<GmLine const&>(curve);
    return (GmVec(line.Dir()) % (p - line.SP())).Z();
}

/// Crossings found without any kernel: where samples of `a` change the side of `b`.
std::vector<GmPoint> bisectedCrossings(GmCurve const& a, GmCurve const& b) {
    int constexpr n = 331;
    double constexpr clear = 1e-9;
    std::vector<GmPoint> found;
    for (int i = 0; i < n; ++i) {
        double lower = i / double(n);
        double upper = (i + 1) / double(n);
        double const before = side(b, Along(a, lower));
        double const after = side(b, Along(a, upper));
        if (std::fabs(before) < clear || std::fabs(after) < clear || before * after > 0) continue;
        for (int step = 0; step < 60; ++step) {
            double const middle = (lower + upper) / 2;
            (side(b, Along(a, middle)) * before > 0 ? lower : upper) = middle;
        }
        if (ExactDist(b, Along(a, lower)) < clear) found.push_back(Along(a, lower));
    }
    return found;
}

bool holds(std::vector<GmPoint> const& points, GmPoint const& p, double eps) {
    for (GmPoint const& q : points) {
        if (p.Dist(q) < eps) return true;
    }
    return false;
}

/// The swapped pair gives the very same points in the same order; two curves of one kind, where
/// nothing tells first from second, the same points but two of them in reversed order.
void assertSwapped(GmCurve const& a, GmCurve const& b) {
    auto const& points = a.GetPtSol();
    b.Intersection(&a);
    auto const& swapped = b.GetPtSol();
    RC_ASSERT(points.size() == swapped.size());
    bool const oneKind = a.GetType() == b.GetType();
    for (std::size_t i = 0; i < points.size(); ++i) {
        double const d = points[i].Dist(swapped[oneKind ? points.size() - 1 - i : i]);
        RC_ASSERT(d <= (oneKind ? 1e-6 : 0.0));
    }
}

/// A curve of a kind through (3, 4), there along `dir` if it is straight.
std::unique_ptr<GmCurve> curveThroughCrossing(GmBase::eGmTypes kind, GmDir const& dir, bool second,
                                              double z) {
    // Circles of radius 5 about two centres, and their quarters about the crossing.
    GmPoint const m(0, second ? 8 : 0, z);
    double const start = second ? -M_PI / 2 : 0;
    if (kind == GmBase::eGmCircle) return std::make_unique<GmCircle>(m, 5, true);
    if (kind == GmBase::eGmArc) return std::make_unique<GmArc>(m, 5, start, start + M_PI / 2, CCW);
    GmPoint const sp(GmPoint(3, 4, z) - 2 * GmVec(dir));
    if (kind == GmBase::eGmLine) return std::make_unique<GmLine>(sp, dir);
    if (kind == GmBase::eGmBeam) return std::make_unique<GmBeam>(sp, dir);
    return std::make_unique<GmStretch>(sp, GmPoint(sp + 4 * GmVec(dir)));
}

/// Does the first of two curves give the z of their crossings? Round ones do before straight ones,
/// otherwise what has more points; of two alike the first does. An upright line stands back.
bool zComesFromFirst(GmBase::eGmTypes first, GmDir const& dirFirst, GmBase::eGmTypes second,
                     GmDir const& dirSecond) {
    std::vector<GmBase::eGmTypes> const order = {GmBase::eGmCircle, GmBase::eGmArc, GmBase::eGmLine,
                                                 GmBase::eGmBeam, GmBase::eGmStretch};
    auto const place = [&](auto kind) { return std::find(order.begin(), order.end(), kind); };
    bool const firstGoesBefore = place(first) <= place(second);
    auto const straight = [&](auto kind) { return place(kind) >= place(GmBase::eGmLine); };
    bool const upright = (firstGoesBefore ? dirSecond : dirFirst) == GmDir(0, 1);
    return firstGoesBefore != (straight(first) && straight(second) && upright);
}

/// Curves of every kind and from every constructor with one number in all places.
std::vector<std::unique_ptr<GmCurve>> curvesOf(double v) {
    GmPoint const p(v, 1), q(2, v);
    std::vector<std::unique_ptr<GmCurve>> curves;
    curves.push_back(std::make_unique<GmLine>(p, q));
    curves.push_back(std::make_unique<GmBeam>(q, GmDir(v, 1)));
    curves.push_back(std::make_unique<GmStretch>(p, q));
    curves.push_back(std::make_unique<GmCircle>(p, v, true));
    curves.push_back(std::make_unique<GmArc>(q, v, v, 1, CW));
    curves.push_back(std::make_unique<GmArc>(p, q, GmPoint(0, 0)));
    curves.push_back(std::make_unique<GmArc>(p, q, GmPoint(v, v), CCW));
    curves.push_back(std::make_unique<GmArc>(p, q, v, true, CCW));
    return curves;
}

/// Runs what two curves can do together; only the result's shape can be judged.
void exercise(GmCurve const& a, GmCurve const& b, double v) {
    int const count = a.Intersection(&b);
    EXPECT_TRUE(count >= 0 && count <= 2);
    double d = v;
    a.MinDist(d, &b, false);
    a.MinDist(d, GmPoint(v, v), false);
    a.BoundingRect();
    Distance(a, b);
    std::unique_ptr<GmCurve> const first(a.Clone()), next(b.Clone()), parallel(a.GetParallel(v));
    std::unique_ptr<GmCurve> const link(first->Concat(*next, 1));
    first->Trim(next.get());
    first->Concat(*next);
    first->Transform(GmMatrix().Scale(v));
    EXPECT_EQ(first->GetType(), a.GetType());
    if (a.IsArc()) static_cast<GmArc const&>(a).SectionPoint(1, 0);
}

}  // namespace

TEST(Intersection, FindsTheCrossingsOfEveryPair) {
    for (GmBase::eGmTypes const first : Kinds()) {
        for (GmBase::eGmTypes const second : Kinds()) {
            SCOPED_TRACE(PairName(first, second));
            int crossings = 0;
            EXPECT_TRUE(rc::check("points on both curves, none missing, swapping allowed", [&] {
                auto const a = AnyCurve(first);
                auto const b = AnyCurve(second);
                int const count = a->Intersection(b.get());
                RC_ASSERT(count == static_cast<int>(a->GetPtSol().size()));
                for (GmPoint const& p : a->GetPtSol()) {
                    RC_ASSERT(ExactDist(*a, p) < 2 * GmBase::m_scdPrec);
                    RC_ASSERT(ExactDist(*b, p) < 2 * GmBase::m_scdPrec);
                }
                for (GmPoint const& p : bisectedCrossings(*a, *b)) {
                    RC_ASSERT(holds(a->GetPtSol(), p, 1e-3));
                    ++crossings;
                }
                std::vector<GmPoint> points(1, GmPoint(7, 7));
                Intersection(*a, *b, points);
                RC_ASSERT(points == a->GetPtSol());
                assertSwapped(*a, *b);
            }));
            EXPECT_GT(crossings, 0);
        }
    }
}

TEST(Intersection, TakesZFromOneCurveOfThePair) {
    // Heights within the tolerance, so that bounded curves accept each other's points.
    double constexpr zFirst = 2e-5;
    double constexpr zSecond = 7e-5;
    struct {
        GmDir first, second;
    } const ways[] = {
        {GmDir(1, 1), GmDir(1, -2)}, {GmDir(0, 1), GmDir(1, -2)}, {GmDir(1, 1), GmDir(0, 1)}};
    for (GmBase::eGmTypes const first : Kinds()) {
        for (GmBase::eGmTypes const second : Kinds()) {
            for (auto const& way : ways) {
                SCOPED_TRACE(PairName(first, second) + " along " + Text(way.first) + " and " +
                             Text(way.second));
                auto const a = curveThroughCrossing(first, way.first, false, zFirst);
                auto const b = curveThroughCrossing(second, way.second, true, zSecond);
                ASSERT_GE(a->Intersection(b.get()), 1);
                bool const fromFirst = zComesFromFirst(first, way.first, second, way.second);
                for (GmPoint const& p : a->GetPtSol())
                    EXPECT_EQ(p.Z(), fromFirst ? zFirst : zSecond);
            }
        }
    }
}

TEST(Intersection, KeepsItsListUntilTheNextOne) {
    GmLine const a(GmPoint(0, 0), GmDir(1, 0)), steep(GmPoint(3, 0, 4), GmDir(1, 1));
    EXPECT_EQ(Text(a.GetSolution(0)), "0,0") << "beyond the list the defined origin";
    EXPECT_EQ(a.Intersection(&steep), 1);
    EXPECT_EQ(Text(a.GetSolution(0)), "3,0") << "z comes from the first";
    EXPECT_TRUE(steep.GetPtSol().empty() && GmLine(a).GetPtSol().size() == 1);
    EXPECT_EQ(a.Intersection(nullptr), 0);

    GmRect const rect(0, 0, 1, 1);
    std::vector<GmPoint> points(1);
    a.Intersection(&steep);
    try {
        a.Intersection(&rect);
        ADD_FAILURE() << "lines and rectangles do not intersect";
    } catch (std::runtime_error const& e) {
        EXPECT_STREQ(e.what(), "Function not found");
    }
    EXPECT_TRUE(a.GetPtSol().empty());
    EXPECT_THROW(Intersection(GmPoint(1, 1), a, points), std::runtime_error);
    EXPECT_TRUE(points.empty());
    GmContour const contour;
    EXPECT_EQ(contour.Intersection(&contour), 0);
    for (auto const& curve : curvesOf(3.0)) {
        EXPECT_EQ(curve->Intersection(&contour) + contour.Intersection(curve.get()), 0);
    }
}

TEST(Intersection, SurvivesHostileNumbers) {
    double constexpr infinity = std::numeric_limits<double>::infinity();
    auto const regular = curvesOf(3.0);
    for (double const v : {std::nan(""), infinity, -infinity, 1e300, -1e160, 1e-300, 0.0}) {
        for (auto const& a : curvesOf(v)) {
            for (auto const& b : curvesOf(v))
                exercise(*a, *b, v);
            for (auto const& b : regular)
                exercise(*a, *b, v);
        }
    }
}
