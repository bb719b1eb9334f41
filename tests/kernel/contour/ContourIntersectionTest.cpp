// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <cmath>
#include <memory>
#include <stdexcept>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmRect.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"

namespace {

using shapes::Path;

std::vector<GmPoint> Hits(GmContour const& contour, GmPoint const& sp, GmPoint const& ep) {
    const GmStretch probe(sp, ep);
    contour.IntersectionWithCurve(&probe);
    return contour.GetPtSol();
}

/// A ring of teeth: segments and arcs in turn, with their joints at two radii in turn.
GmContour Ring(int count, double x, double y) {
    std::vector<shapes::StarCorner> corners;
    for (int i = 0; i < count; ++i)
        corners.push_back({i % 2 ? 9.6 : 10.3, i % 3 ? 0.0 : 0.4});
    return shapes::Moved(shapes::Star(corners), x, y);
}

bool IsEnd(GmPoint const& p, GmCurve const& curve) {
    return p == curve.SP() || p == curve.EP();
}

/// The points of all pairs of elements, but those at ends.
std::vector<GmPoint> PointsOfAllPairs(GmContour const& a, GmContour const& b) {
    std::vector<GmPoint> points;
    for (int i = 0; i < a.ElementCount(); ++i) {
        const std::unique_ptr<GmCurve> element(a.GetElement(i)->Clone());
        for (int j = 0; j < b.ElementCount(); ++j) {
            element->Intersection(b.GetElement(j));
            for (GmPoint const& p : element->GetPtSol()) {
                if (!IsEnd(p, *element) && !IsEnd(p, *b.GetElement(j))) points.push_back(p);
            }
        }
    }
    return points;
}

}  // namespace

TEST(ContourIntersection, ListsCrossingsInElementOrderAndJointsOnce) {
    struct {
        char const* contour;
        GmPoint sp, ep;
        std::vector<GmPoint> hits;
    } const rows[] = {
        {"0 0  9 0  9 9  0 9  0 0", {5, -5}, {5, 15}, {{5, 0}, {5, 9}}},
        {"0 0  9 0  9 9  0 9  0 0", {-1, -1}, {1, 1}, {{0, 0}}},
        {"0 0  9 0  9 9  0 9  0 0", {8, 8}, {10, 10}, {{9, 9}}},
        // The start of an open chain follows no element.
        {"0 0  9 0  9 9  0 9", {-1, -1}, {1, 1}, {{0, 0}}},
        // A full circle keeps a crossing at its start.
        {"5 5  1 0  ccw 0 0 1 0", {0.5, 0}, {3, 0}, {{1, 0}, {1, 0}}},
    };
    for (auto const& row : rows)
        EXPECT_EQ(Hits(Path(row.contour), row.sp, row.ep), row.hits) << row.contour;
}

TEST(ContourIntersection, ARayFromTheMiddleOfAStarLeavesItOnce) {
    EXPECT_TRUE(rc::check([](unsigned seed, bool bWithArcs) {
        // Whole tenths of degrees: never slopes from 1e4 to 1e6, whose points are less exact.
        const double angle = *rc::gen::inRange(0, 3600) * 0.1 * M_PI / 180.0;
        const GmContour star = shapes::RandomStar(seed, bWithArcs);
        std::vector<GmPoint> targets = {GmPoint(20 * std::cos(angle), 20 * std::sin(angle))};
        // Through the joints, too: there two elements report the same point.
        for (int i = 0; i < star.ElementCount(); ++i)
            targets.push_back(GmPoint(star.GetElement(i)->SP() * 2.0));
        for (auto const& variant : shapes::Variants(star)) {
            for (GmPoint const& target : targets) {
                const GmStretch ray(variant.Map(GmPoint(0, 0)), variant.Map(target));
                const std::vector<GmPoint> hits = Hits(variant.contour, ray.SP(), ray.EP());
                RC_ASSERT(hits.size() == 1u);
                RC_ASSERT(variant.contour.Dist(hits[0]) < GmBase::m_scdPrec);
                RC_ASSERT(ray.Intersection(&variant.contour) == 1);
            }
        }
    }));
}

TEST(ContourIntersection, TwoContoursMeetInsideTheirElementsOrAlsoAtEnds) {
    const GmContour square = shapes::Square(10);
    const GmContour shifted = shapes::Moved(square, 5, 5);
    // A corner on the middle of a side: the crossings are ends of the elements of `diamond`.
    const GmContour diamond = Path("10 5  15 0  20 5  15 10  10 5");
    for (const bool bAtEnds : {false, true}) {
        EXPECT_EQ(square.Intersection(&shifted, bAtEnds), 2);
        EXPECT_EQ(square.GetPtSol(), (std::vector<GmPoint>{GmPoint(10, 5), GmPoint(5, 10)}));
        for (int first = 0; first < 4; ++first) {
            const GmContour turned = shapes::StartedAt(diamond, first);
            EXPECT_EQ(square.Intersection(&turned, bAtEnds), bAtEnds);
            EXPECT_EQ(turned.Intersection(&square, bAtEnds), bAtEnds);
        }
    }
    EXPECT_EQ(square.Intersection(static_cast<GmContour const*>(nullptr), true), 0);
}

TEST(ContourIntersection, CrossingsOfTwoStarsAreTheSameFromBothSides) {
    EXPECT_TRUE(rc::check([](unsigned seedA, unsigned seedB) {
        const GmContour a = shapes::RandomStar(seedA, true);
        const GmContour b = shapes::Moved(shapes::RandomStar(seedB, true), 7.3, 2.1);
        const int count = a.Intersection(&b, true);
        RC_ASSERT(count >= 2);
        RC_ASSERT(b.Intersection(&a, true) == count);
        for (GmPoint const& p : a.GetPtSol()) {
            RC_ASSERT(a.Element(p, 0.001) && b.Element(p, 0.001));
        }
    }));
}

TEST(ContourIntersection, ACurveThatCannotBeIntersectedThrowsAndLeavesNoPoints) {
    const GmContour square = shapes::Square(10);
    EXPECT_EQ(Hits(square, GmPoint(5, -5), GmPoint(5, 15)).size(), 2u);
    const GmRect rect(GmPoint(1, 1), GmPoint(20, 20));
    EXPECT_THROW(square.IntersectionWithCurve(&rect), std::runtime_error);
    EXPECT_TRUE(square.GetPtSol().empty());
    Hits(square, GmPoint(5, -5), GmPoint(5, 15));
    square.IntersectionWithCurve(nullptr);
    EXPECT_TRUE(square.GetPtSol().empty());
}

TEST(ContourIntersection, OfLongContoursMissesNoPairOfElements) {
    struct {
        double x, y;
        std::size_t least;
    } const rows[] = {{0.21, 0.13, 100}, {7.3, 2.1, 2}, {19.7, 0.2, 1}, {1.0, 0.0, 20}};
    for (auto const& row : rows) {
        const GmContour a = Ring(600, 0, 0);
        const GmContour b = Ring(421, row.x, row.y);
        a.Intersection(&b, false);
        EXPECT_EQ(a.GetPtSol(), PointsOfAllPairs(a, b)) << row.x;
        EXPECT_GE(a.GetPtSol().size(), row.least) << row.x;
        for (int i = 0; i < a.ElementCount(); ++i) {
            const std::unique_ptr<GmCurve> element(a.GetElement(i)->Clone());
            element->Intersection(b.GetElement(420));
            EXPECT_EQ(a.GetElement(i)->GetPtSol(), element->GetPtSol()) << "that of the last pair";
        }
        std::vector<GmPoint> inTurn;
        for (int j = 0; j < b.ElementCount(); ++j) {
            GmCurve const& element = *b.GetElement(j);
            element.Intersection(&a);
            for (GmPoint const& p : element.GetPtSol()) {
                if (!IsEnd(p, element)) inTurn.push_back(p);
            }
        }
        EXPECT_EQ(inTurn.size(), PointsOfAllPairs(b, a).size()) << row.x;
    }
}

TEST(ContourIntersection, BoxesHideNothingUnusual) {
    GmContour ring = Ring(50, 0, 0);
    const GmStretch farAway(GmPoint(90, 0), GmPoint(91, 7));
    const GmContour farRing = Ring(50, 90, 0);
    EXPECT_EQ(ring.Intersection(&farRing, true), 0);
    // A segment that is given another line, and no longer runs from its start to its end.
    auto* const skew = dynamic_cast<GmStretch*>(ring.GetElement(1));
    ASSERT_NE(skew, nullptr);
    skew->SetEP(GmPoint(120, 0));
    static_cast<GmLine&>(*skew) = GmLine(GmPoint(0, 0), GmDir(1, 0.04));
    EXPECT_EQ(Hits(ring, farAway.SP(), farAway.EP()).size(), 1u);
    EXPECT_EQ(ring.Intersection(&farRing, true), 2);
    // An element that cannot be intersected is refused wherever it lies.
    static_cast<GmCurve&>(*ring.GetElement(30)) = GmRect(GmPoint(1, 1), GmPoint(2, 2));
    EXPECT_THROW(ring.IntersectionWithCurve(&farAway), std::runtime_error);
    EXPECT_THROW(ring.Intersection(&farRing, true), std::runtime_error);
    EXPECT_THROW(farRing.Intersection(&ring, false), std::runtime_error);
    EXPECT_TRUE(farRing.GetPtSol().empty());
}
