#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <cmath>
#include <stdexcept>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmRect.h"
#include "gmkernel/GmStretch.h"
#include "support/Contours.h"

namespace {

std::vector<GmPoint> Hits(GmContour const& contour, GmStretch const& probe) {
    contour.IntersectionWithCurve(&probe);
    return contour.GetPtSol();
}

GmContour MovedSquare(double dx, double dy) {
    GmContour square = shapes::Square(10);
    square.Translation(GmVec(dx, dy, 0));
    return square;
}

}  // namespace

TEST(ContourIntersection, ListsCrossingsInElementOrderAndJointsOnce) {
    const GmContour square = shapes::Square(10);
    EXPECT_EQ(Hits(square, GmStretch(GmPoint(5, -5), GmPoint(5, 15))),
              (std::vector<GmPoint>{GmPoint(5, 0), GmPoint(5, 10)}));
    for (GmPoint const& corner : {GmPoint(0, 0), GmPoint(10, 0), GmPoint(10, 10), GmPoint(0, 10)}) {
        const GmVec out = (corner - GmPoint(5, 5)) * 0.2;
        EXPECT_EQ(Hits(square, GmStretch(GmPoint(corner - out), GmPoint(corner + out))),
                  std::vector<GmPoint>{corner});
    }
    const GmContour open =
        shapes::Polyline({GmPoint(0, 0), GmPoint(10, 0), GmPoint(10, 10), GmPoint(0, 10)});
    EXPECT_EQ(Hits(open, GmStretch(GmPoint(-1, -1), GmPoint(1, 1))),
              std::vector<GmPoint>{GmPoint(0, 0)})
        << "the start of an open chain follows no element";
}

TEST(ContourIntersection, AFullCircleKeepsACrossingAtItsStart) {
    GmContour contour = shapes::Polyline({GmPoint(5, 5), GmPoint(1, 0)});
    contour.AddElement(GmArc(GmPoint(1, 0), GmPoint(1, 0), GmPoint(0, 0), GmBase::eRotCCW), false,
                       0);
    const std::vector<GmPoint> hits = Hits(contour, GmStretch(GmPoint(0.5, 0), GmPoint(3, 0)));
    EXPECT_EQ(hits, (std::vector<GmPoint>{GmPoint(1, 0), GmPoint(1, 0)}));
}

TEST(ContourIntersection, ARayFromTheMiddleOfAStarLeavesItOnce) {
    EXPECT_TRUE(rc::check([](unsigned seed, bool bWithArcs) {
        const double angle = *rc::gen::inRange(0, 3600) * 0.1;
        const GmContour star = shapes::RandomStar(seed, bWithArcs);
        std::vector<GmPoint> targets = {GmPoint(20 * std::cos(angle), 20 * std::sin(angle))};
        // Through the joints, too: there two elements report the same point.
        for (int i = 0; i < star.ElementCount(); ++i) {
            targets.push_back(GmPoint(star.GetElement(i)->SP() * 2.0));
        }
        for (auto const& variant : shapes::Variants(star)) {
            for (GmPoint const& target : targets) {
                const GmStretch ray(variant.Map(GmPoint(0, 0)), variant.Map(target));
                const std::vector<GmPoint> hits = Hits(variant.contour, ray);
                RC_ASSERT(hits.size() == 1u);
                RC_ASSERT(variant.contour.Dist(hits[0]) < GmBase::m_scdPrec);
                RC_ASSERT(ray.Intersection(&variant.contour) == 1);
            }
        }
    }));
}

TEST(ContourIntersection, TwoContoursMeetInsideTheirElementsOrAlsoAtEnds) {
    const GmContour square = shapes::Square(10);
    const GmContour shifted = MovedSquare(5, 5);
    for (const bool bAtEnds : {false, true}) {
        EXPECT_EQ(square.Intersection(&shifted, bAtEnds), 2);
        EXPECT_EQ(square.GetPtSol(), (std::vector<GmPoint>{GmPoint(10, 5), GmPoint(5, 10)}));
    }
    // A corner on the middle of a side: the crossings are ends of the elements of `diamond`.
    const GmContour diamond =
        shapes::Polygon({GmPoint(10, 5), GmPoint(15, 0), GmPoint(20, 5), GmPoint(15, 10)});
    EXPECT_EQ(square.Intersection(&diamond, false), 0);
    for (int first = 0; first < 4; ++first) {
        const GmContour turned = shapes::StartedAt(diamond, first);
        EXPECT_EQ(square.Intersection(&turned, true), 1);
        EXPECT_EQ(square.GetSolution(0), GmPoint(10, 5));
        EXPECT_EQ(turned.Intersection(&square, true), 1);
    }
    EXPECT_EQ(square.Intersection(static_cast<GmContour const*>(nullptr), true), 0);
}

TEST(ContourIntersection, CrossingsOfTwoStarsAreTheSameFromBothSides) {
    EXPECT_TRUE(rc::check([](unsigned seedA, unsigned seedB) {
        const GmContour a = shapes::RandomStar(seedA, true);
        GmContour b = shapes::RandomStar(seedB, true);
        b.Translation(GmVec(7.3, 2.1, 0));
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
    Hits(square, GmStretch(GmPoint(5, -5), GmPoint(5, 15)));
    const GmRect rect(GmPoint(1, 1), GmPoint(20, 20));
    EXPECT_THROW(square.IntersectionWithCurve(&rect), std::runtime_error);
    EXPECT_TRUE(square.GetPtSol().empty());
    Hits(square, GmStretch(GmPoint(5, -5), GmPoint(5, 15)));
    square.IntersectionWithCurve(nullptr);
    EXPECT_TRUE(square.GetPtSol().empty());
}
