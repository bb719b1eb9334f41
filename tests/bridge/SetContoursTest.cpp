// SPDX-License-Identifier: MIT
#include "gmbridge/SetContours.h"

#include <gtest/gtest.h>

#include <cmath>
#include <random>

#include "gmbridge/Curves.h"
#include "gmkernel/gmkernel.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Offset.h"
#include "gmregion/Questions.h"
#include "tests/support/Contours.h"
#include "tests/support/OffsetLaws.h"

namespace {

using namespace gmbridge;
using gmregion::Element;
using gmregion::Point;

gmregion::RegionSet cleaned(const gmregion::Paths& paths,
                            gmregion::FillRule rule = gmregion::FillRule::kEvenOdd) {
    const gmregion::Outcome outcome = gmregion::cleanUp(paths, {rule, 0.0});
    EXPECT_FALSE(outcome.refusal) << gmregion::textOf(outcome.refusal.reason);
    return outcome.regions;
}

gmregion::RegionSet cleaned(const std::vector<std::vector<Point>>& polygons) {
    gmregion::Paths paths;
    for (const std::vector<Point>& corners : polygons) {
        std::vector<Element> loop;
        for (std::size_t i = 0; i < corners.size(); ++i)
            loop.push_back({corners[i], corners[(i + 1) % corners.size()]});
        paths.add(loop, true);
    }
    return cleaned(paths);
}

std::vector<Point> square(double x, double y, double side) {
    return {{x, y}, {x + side, y}, {x + side, y + side}, {x, y + side}};
}

/// Expects a closed chain whose joints meet, without elements that the kernel cannot hold.
void expectClosedChain(const GmContour& contour) {
    EXPECT_TRUE(contour.IsClosed());
    const auto count = static_cast<int>(contour.ElementCount());
    ASSERT_GE(count, 2);
    for (int i = 0; i < count; ++i) {
        const GmCurve& e = *contour.GetElement(i);
        EXPECT_TRUE(e.CreationOK());
        EXPECT_NE(e.SP(), e.EP());
        EXPECT_EQ(e.EP().Dist(contour.GetElement((i + 1) % count)->SP()), 0.0) << i;
    }
}

TEST(SetContours, OutlinesStandBeforeTheirHolesInTheSenseAskedFor) {
    const gmregion::RegionSet set = cleaned(
        {square(0, 0, 20), square(2, 2, 5), square(12, 2, 6), square(14, 4, 2), square(30, 0, 4)});
    for (const auto sense : {GmBase::eRotCCW, GmBase::eRotCW}) {
        const SetContours found = contoursOf(set, {}, sense);
        ASSERT_EQ(found.loops.size(), 5U);
        double sum = 0.0;
        std::size_t region = 0;
        int holes = 0;
        for (const LoopContour& loop : found.loops) {
            expectClosedChain(*loop.contour);
            const double area = offset_laws::Area(*loop.contour) * sense;
            EXPECT_EQ(area < 0.0, loop.hole);
            if (&loop != found.loops.data() && !loop.hole) ++region;
            EXPECT_EQ(loop.region, region);
            holes += loop.hole ? 1 : 0;
            sum += area;
        }
        EXPECT_EQ(holes, 2);
        EXPECT_NEAR(sum, 400.0 - 25.0 - 36.0 + 4.0 + 16.0, 1e-9);
    }
}

/// The kernel's offsets, which have corners where the source has, and those of a set give each
/// corner the same identifier; here the law itself, where the kernel has no answer: the element
/// with the identifier of a corner's arc goes through its centre.
TEST(SetContours, CornersCarryAnElementThatMeetsThere) {
    int corners = 0;
    for (const bool reversed : {false, true}) {
        ContourPaths paths;
        std::vector<std::unique_ptr<GmContour>> sources;
        for (const double x : {0.0, 6.0}) {
            sources.push_back(std::make_unique<GmContour>());
            const GmContour shape = shapes::Moved(shapes::Square(10), x, 0.5 * x);
            for (int i = 0; i < 4; ++i)
                sources.back()->AddElement(*shape.GetElement(i), false,
                                           i + 1 + 10 * static_cast<long>(sources.size()));
            if (reversed) sources.back()->Invert();
            ASSERT_FALSE(paths.add(*sources.back()));
        }
        const auto set = cleaned(paths.paths(), gmregion::FillRule::kNonZero);
        for (const double d : {-1.0, 1.0}) {
            const gmregion::Outcome offset = gmregion::offset(set, d);
            const SetContours found = contoursOf(offset.regions, paths);
            ASSERT_EQ(found.loops.size(), 1U);
            const GmContour& loop = *found.loops[0].contour;
            for (int i = 0; i < loop.ElementCount(); ++i) {
                const GmContElement& e = *loop.GetContElement(i);
                EXPECT_EQ(e.bInserted, e.pCurve->IsArc());
                if (!e.bInserted) continue;
                const GmContour& source = *sources[static_cast<std::size_t>(e.lId / 10 - 1)];
                int number = 0;
                while (source.GetContElement(number)->lId != e.lId)
                    ++number;
                const GmPoint m = static_cast<const GmArc&>(*e.pCurve).M();
                EXPECT_LT(source.GetElement(number)->Dist(m), 1e-9) << e.lId;
                ++corners;
            }
        }
    }
    EXPECT_EQ(corners, 2 * (2 + 6));  // two crossings inside, six corners outside
}

TEST(SetContours, ShortElementsAreClosedUp) {
    // A step, a corner that is cut off, and a row of short sides in place of a corner.
    std::vector<Point> corners = {{0, 0},        {5, 0},        {5, 0.00005},
                                  {10, 0.00005}, {10, 9.99995}, {9.99995, 10}};
    for (int i = 0; i <= 100; ++i) {
        const double angle = 1.5707963267948966 * (1.0 + i / 100.0);
        corners.push_back({0.003 + 0.003 * std::cos(angle), 9.997 + 0.003 * std::sin(angle)});
    }
    const gmregion::RegionSet set = cleaned({corners});
    const SetContours found = contoursOf(set, {});
    ASSERT_EQ(found.loops.size(), 1U);
    const GmContour& contour = *found.loops[0].contour;
    expectClosedChain(contour);
    EXPECT_EQ(found.closedUp.size(),
              set.elements().size() - static_cast<std::size_t>(contour.ElementCount()));
    EXPECT_GT(found.closedUp.size(), 50U);
    EXPECT_GT(contour.ElementCount(), 15);
    for (const Element& e : set.elements())
        EXPECT_LT(offset_laws::DistanceFrom(contour, GmPoint(e.sp.x, e.sp.y)), 2e-4);
    EXPECT_NEAR(offset_laws::Area(contour), gmregion::area(set), 2e-3);
}

TEST(SetContours, HoldsLoopsOfAnyShortElements) {
    std::mt19937 engine(3);
    const auto share = [&] { return double(engine()) / 4294967296.0; };
    int loops = 0;
    int lost = 0;
    for (int round = 0; round < 3000; ++round) {
        const double size = std::pow(10.0, -4.5 + 2.5 * share());
        const std::size_t count = 3 + engine() % 12;
        std::vector<Point> corners;
        for (std::size_t i = 0; i < count; ++i) {
            const double angle = 6.283185307179586 * (double(i) + share()) / double(count);
            const double r = size * (0.3 + 0.7 * share());
            corners.push_back({5 + r * std::cos(angle), r * std::sin(angle)});
        }
        const gmregion::RegionSet set = cleaned({corners});
        const SetContours found = contoursOf(set, {});
        ASSERT_EQ(found.loops.size() + found.lost.size(), set.loops().size());
        lost += static_cast<int>(found.lost.size());
        for (const LoopContour& loop : found.loops) {
            expectClosedChain(*loop.contour);
            for (const Element& e : set.elements())
                EXPECT_LT(offset_laws::DistanceFrom(*loop.contour, GmPoint(e.sp.x, e.sp.y)), 4e-4);
            ++loops;
        }
    }
    EXPECT_GT(loops, 1500);
    EXPECT_GT(lost, 300);
}

TEST(SetContours, LoopsTooSmallForTheKernelAreNamed) {
    const gmregion::RegionSet set = cleaned(
        {square(0, 0, 10), square(3, 3, 0.0001), square(6, 6, 0.0003), square(20, 0, 0.00015)});
    ASSERT_EQ(set.loops().size(), 4U);
    const SetContours found = contoursOf(set, {});
    ASSERT_EQ(found.loops.size(), 2U);
    for (const LoopContour& loop : found.loops)
        expectClosedChain(*loop.contour);
    ASSERT_EQ(found.lost.size(), 2U);
    EXPECT_LT(found.lost[0].Dist(GmPoint(3, 3)), 0.001);
    EXPECT_LT(found.lost[1].Dist(GmPoint(20, 0)), 0.001);
    EXPECT_TRUE(found.closedUp.empty());
}

TEST(SetContours, PiecesOfOneArcBecomeOneWhereTheKernelTellsItsEndsApart) {
    // A slit from the right into a disc, so wide that its ends are apart, and then not.
    for (const double half : {0.5, 0.00003}) {
        GmContour slit;
        const double x = std::sqrt(25.0 - half * half);
        slit.AddElement(GmArc(GmPoint(x, half), GmPoint(x, -half), GmPoint(0, 0), GmBase::eRotCCW),
                        false, 1);
        slit.AddElement(GmStretch(GmPoint(x, -half), GmPoint(0, 0)), false, 2);
        slit.AddElement(GmStretch(GmPoint(0, 0), GmPoint(x, half)), false, 3);
        ContourPaths paths;
        ASSERT_FALSE(paths.add(slit));
        ASSERT_EQ(paths.paths()[0].size(), 4U);
        const SetContours found = contoursOf(cleaned(paths.paths()), paths);
        ASSERT_EQ(found.loops.size(), 1U);
        expectClosedChain(*found.loops[0].contour);
        EXPECT_EQ(shapes::Identifiers(*found.loops[0].contour),
                  half > 0.1 ? std::vector<long>({1, 2, 3}) : std::vector<long>({1, 1, 2, 3}));
    }
}

TEST(SetContours, ArcsAsFlatAsRoundingBecomeSegments) {
    EXPECT_TRUE(curveOf({{0, 0}, {10, 0}, 1e-9})->IsStretch());
    EXPECT_TRUE(curveOf({{0, 0}, {10, 0}, -1e-6})->IsArc());
    EXPECT_TRUE(curveOf({{3, 4}, {3, 4}, 0.5})->IsStretch());
}

}  // namespace
