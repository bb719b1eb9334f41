#include <cmath>
#include <limits>
#include <stdexcept>

#include "curves/CurveCases.h"
#include "curves/dispatch/Distance.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmRect.h"

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
        GmPoint const p = Along(a, lower);
        if (ExactDist(b, p) < clear) found.push_back(p);
    }
    return found;
}

bool holds(std::vector<GmPoint> const& points, GmPoint const& p, double eps) {
    for (GmPoint const& q : points) {
        if (p.Dist(q) < eps) return true;
    }
    return false;
}

bool sameDigits(GmPoint const& p, GmPoint const& q) {
    return p.X() == q.X() && p.Y() == q.Y() && p.Z() == q.Z();
}

/// The swapped pair gives the very same points in the same order; two curves of one kind, where
/// nothing tells first from second, the same points but two of them in reversed order.
void assertSwapped(GmCurve const& a, GmCurve const& b) {
    std::vector<GmPoint> const points = a.GetPtSol();
    b.Intersection(&a);
    std::vector<GmPoint> const swapped = b.GetPtSol();
    RC_ASSERT(points.size() == swapped.size());
    bool const oneKind = a.GetType() == b.GetType();
    for (std::size_t i = 0; i < points.size(); ++i) {
        if (oneKind) {
            RC_ASSERT(points[i].Dist(swapped[points.size() - 1 - i]) < 1e-6);
        } else {
            RC_ASSERT(sameDigits(points[i], swapped[i]));
        }
    }
}

std::vector<std::unique_ptr<GmCurve>> hostileCurves(double v) {
    std::vector<std::unique_ptr<GmCurve>> curves;
    GmPoint const p(v, 1), q(2, v);
    curves.push_back(std::make_unique<GmLine>(p, q));
    curves.push_back(std::make_unique<GmBeam>(q, GmDir(v, 1)));
    curves.push_back(std::make_unique<GmStretch>(p, q));
    curves.push_back(std::make_unique<GmCircle>(p, v, true));
    curves.push_back(std::make_unique<GmArc>(q, v, v, 1, GmBase::eRotCW));
    curves.push_back(std::make_unique<GmArc>(p, q, GmPoint(0, 0)));
    curves.push_back(std::make_unique<GmArc>(p, q, GmPoint(v, v), GmBase::eRotCCW));
    curves.push_back(std::make_unique<GmArc>(p, q, v, true, GmBase::eRotCCW));
    return curves;
}

}  // namespace

TEST(Intersection, FindsTheCrossingsOfEveryPair) {
    for (GmBase::eGmTypes const first : Kinds()) {
        for (GmBase::eGmTypes const second : Kinds()) {
            SCOPED_TRACE(std::string(NameOf(first)) + ", " + NameOf(second));
            int crossings = 0;
            EXPECT_TRUE(rc::check("points on both curves, none missing, swapping allowed", [&] {
                auto const a = AnyCurve(first);
                auto const b = AnyCurve(second);
                int const count = a->Intersection(b.get());
                RC_ASSERT(count == static_cast<int>(a->GetPtSol().size()) && count <= 2);
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

TEST(Intersection, KeepsWhatLiesOnTheBoundedCurves) {
    GmStretch const flat(GmPoint(0, 0), GmPoint(10, 0));
    GmStretch const beyond(GmPoint(20, -5), GmPoint(20, 5));
    EXPECT_EQ(flat.Intersection(&beyond), 0);
    GmLine const carrier(beyond);
    EXPECT_EQ(GmLine(flat).Intersection(&carrier), 1);

    GmCircle const circle(GmPoint(0, 0), 5, true);
    GmBeam const beam(GmPoint(0, 0), GmDir(1, 0));
    EXPECT_EQ(beam.Intersection(&circle), 1);
    EXPECT_TRUE(IsAt(beam.GetSolution(0), 5, 0));
    EXPECT_EQ(GmLine(beam).Intersection(&circle), 2);

    GmStretch const touching(GmPoint(4.99995, 0), GmPoint(3, 0));
    EXPECT_EQ(touching.Intersection(&circle), 1) << "an end within the tolerance";
    EXPECT_EQ(GmStretch(GmPoint(4.9998, 0), GmPoint(3, 0)).Intersection(&circle), 0);
}

TEST(Intersection, KeepsItsListUntilTheNextOne) {
    GmLine const a(GmPoint(0, 0), GmDir(1, 0));
    GmLine const b(GmPoint(3, 0, 4), GmDir(1, 1));
    EXPECT_EQ(a.GetSolution(0), GmPoint(0, 0, 0));
    EXPECT_TRUE(a.GetSolution(0).CreationOK());
    EXPECT_EQ(a.Intersection(&b), 1);
    EXPECT_TRUE(IsAt(a.GetSolution(0), 3, 0, 0));
    EXPECT_TRUE(b.GetPtSol().empty());
    EXPECT_EQ(GmLine(a).GetPtSol().size(), 1U) << "copied with the curve";

    GmRect const rect(0, 0, 1, 1);
    GmPoint const p(1, 1);
    std::vector<GmPoint> points(1);
    try {
        a.Intersection(&rect);
        ADD_FAILURE() << "lines and rectangles do not intersect";
    } catch (std::runtime_error const& e) {
        EXPECT_STREQ(e.what(), "Function not found");
    }
    EXPECT_TRUE(a.GetPtSol().empty());
    EXPECT_THROW(Intersection(p, a, points), std::runtime_error);
    EXPECT_TRUE(points.empty());
    EXPECT_EQ(a.Intersection(nullptr), 0);
    GmContour const contour;
    for (GmBase::eGmTypes const kind : Kinds()) {
        rc::check("contours meet every kind", [&] {
            auto const curve = AnyCurve(kind);
            RC_ASSERT(curve->Intersection(&contour) == 0 && contour.Intersection(curve.get()) == 0);
        });
    }
    EXPECT_EQ(contour.Intersection(&contour), 0);
}

TEST(Intersection, SurvivesHostileNumbers) {
    double constexpr infinity = std::numeric_limits<double>::infinity();
    for (double const v : {std::nan(""), infinity, -infinity, 1e300, -1e160, 1e-300, 0.0}) {
        auto const curves = hostileCurves(v);
        auto const regular = hostileCurves(3.0);
        for (auto const& a : curves) {
            double d = 0;
            a->MinDist(d, GmPoint(v, v), false);
            a->MinDist(GmPoint(1, 1), false);
            a->NP(GmPoint(v, v));
            a->Tangent(a->SP());
            a->BoundingRect();
            a->Element(GmPoint(v, 0));
            a->DistSP(GmPoint(1, v));
            EXPECT_GE(a->GetTraceString().size(), 0U);
            for (auto const* others : {&curves, &regular}) {
                for (auto const& b : *others) {
                    int const count = a->Intersection(b.get());
                    EXPECT_TRUE(count >= 0 && count <= 2);
                    a->MinDist(d, b.get(), false);
                    Distance(*a, *b);
                    std::unique_ptr<GmCurve> const first(a->Clone()), next(b->Clone());
                    std::unique_ptr<GmCurve> const link(first->Concat(*next, 1));
                    first->Trim(next.get());
                    first->Concat(*next);
                    first->Transform(GmMatrix().Scale(v));
                    std::unique_ptr<GmCurve> const parallel(first->GetParallel(v));
                }
            }
            if (a->IsArc()) static_cast<GmArc const&>(*a).SectionPoint(1, 0);
        }
    }
}
