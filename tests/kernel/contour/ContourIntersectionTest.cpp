// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <cmath>
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
        const double angle = *rc::gen::inRange(0, 3600) * 0.1;
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
