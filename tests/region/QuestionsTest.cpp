// SPDX-License-Identifier: MIT
#include "gmregion/Questions.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <random>

#include "gmregion/CleanUp.h"
#include "region/locate/Moments.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using shapes::circle;
using shapes::rectangle;
using shapes::uniform;

RegionSet cleaned(const std::vector<shapes::Elements>& loops, FillRule rule = FillRule::kEvenOdd,
                  Vec2 by = {}) {
    Paths paths;
    for (shapes::Elements loop : loops) {
        for (Element& e : loop)
            e = {e.sp + by, e.ep + by, e.bulge};
        paths.add(loop, true);
    }
    return cleanUp(paths, {rule, 0.0}).regions;
}

RegionSet tangles(std::mt19937& engine) {
    std::vector<shapes::Elements> loops;
    for (std::size_t i = 0; i <= engine() % 3; ++i)
        loops.push_back(shapes::tangle(engine, 3 + engine() % 12, 10.0));
    return cleaned(loops);
}

/// The distance of a point from many points of every element: never below the true one, and above
/// it by no more than their spacing.
double sampledDistance(const RegionSet& set, Vec2 p) {
    double least = HUGE_VAL;
    for (const Element& e : set.elements()) {
        for (int k = 0; k <= 100; ++k)
            least = std::min(least, distance(p, pointAt(e, k / 100.0)));
    }
    return least;
}

void expectAgreement(const RegionSet& set, const Locator& locator, Vec2 p) {
    const bool in = shapes::winding(set, p) > 0;
    const BoundaryPoint near = locator.nearest(p).value();
    const double sampled = sampledDistance(set, p);
    const Loop& loop = set.loops()[near.loop];
    EXPECT_EQ(locator.where(p, -1.0), in ? Place::kInside : Place::kOutside);
    EXPECT_EQ(locator.regionAt(p).has_value(), in);
    EXPECT_LE(near.distance, sampled + 1e-12);
    EXPECT_GE(near.distance, sampled - 0.25);
    EXPECT_NEAR(near.distance, distance(p, near.at), 1e-12);
    EXPECT_LT(distance(near.at, nearestPoint(set.elements()[near.element], p)), 1e-9);
    EXPECT_TRUE(loop.first <= near.element && near.element < loop.last);
    EXPECT_EQ(locator.signedDistance(p).value(), in ? near.distance : -near.distance);
    EXPECT_EQ(locator.where(p, near.distance), Place::kOnBoundary);
    EXPECT_NE(locator.where(p, near.distance * (1 - 1e-9)), Place::kOnBoundary);
}

TEST(Locator, AgreesWithWindingsAndSampledDistances) {
    std::mt19937 engine(3);
    for (int round = 0; round < 100; ++round) {
        SCOPED_TRACE(round);
        const RegionSet set = tangles(engine);
        const Locator locator(set);
        for (int k = 0; k < 20; ++k)
            expectAgreement(set, locator, {uniform(engine, -2, 12), uniform(engine, -2, 12)});
    }
}

TEST(Locator, TellsSidesRightBesideTheBoundary) {
    std::mt19937 engine(4);
    int told = 0;
    for (int round = 0; round < 300; ++round) {
        const RegionSet set = tangles(engine);
        const Locator locator(set);
        for (const Element& e : set.elements()) {
            if (lengthAlong(e) < 1e-3) continue;
            const Vec2 p = pointAt(e, 0.37);
            const Vec2 left = -1e-13 * rightNormal(tangentAt(e, 0.37));
            if (std::fabs(*locator.signedDistance(p)) > 1e-14) continue;
            EXPECT_EQ(locator.where(p + left, -1.0), Place::kInside) << round;
            EXPECT_EQ(locator.where(p - left, -1.0), Place::kOutside) << round;
            EXPECT_EQ(locator.where(p), Place::kOnBoundary);
            ++told;
        }
    }
    EXPECT_GT(told, 1000);
}

TEST(Locator, AnswersWhatHasNoPlace) {
    const double infinity = std::numeric_limits<double>::infinity();
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const RegionSet square = cleaned({rectangle(0, 0, 2, 2)});
    const RegionSet none;
    const Locator onSquare(square);
    const Locator onNone(none);
    for (const Vec2 p : {Vec2{nan, 1}, {1, nan}, {infinity, 1}, {1, -infinity}, {1e300, 0}}) {
        EXPECT_EQ(onSquare.where(p, infinity), Place::kOutside);
        EXPECT_FALSE(onSquare.nearest(p));
        EXPECT_FALSE(onSquare.regionAt(p));
    }
    EXPECT_EQ(onSquare.where({1, 1}, nan), Place::kInside);
    EXPECT_EQ(onSquare.where({1, 1}, infinity), Place::kOnBoundary);
    EXPECT_NEAR(onSquare.nearest({1e90, 0})->distance, 1e90, 1e75);
    EXPECT_EQ(onNone.where({0, 0}, 1.0), Place::kOutside);
    EXPECT_FALSE(onNone.nearest({0, 0}) || onNone.signedDistance({0, 0}) || onNone.loopAbout(0));
    EXPECT_FALSE(centroid(none) || bounds(none));
    EXPECT_EQ(gmregion::area(none) + gmregion::perimeter(none), 0.0);
    EXPECT_TRUE(loopsOf(square, 7).empty());
    EXPECT_EQ(gmregion::area(square, {0, 99}), 4.0);
    EXPECT_FALSE(bounds(square, {5, 99}) || bounds(square, {1, 0}));
}

TEST(Locator, NestsRegionsInHoles) {
    // A ring with an island in it that has a hole with an island, a second hole and a stranger.
    const RegionSet set =
        cleaned({rectangle(0, 0, 30, 20), rectangle(1, 1, 15, 15), rectangle(2, 2, 10, 10),
                 circle({7, 7}, 4), circle({7, 7}, 2), rectangle(20, 2, 5, 5), circle({50, 0}, 3)});
    ASSERT_EQ(set.regionCount(), 4U);
    const Locator locator(set);
    const std::size_t ring = *locator.regionAt({0.5, 0.5});
    const std::size_t island = *locator.regionAt({2.5, 2.5});
    const std::size_t inner = *locator.regionAt({7, 7});
    EXPECT_EQ(locator.regionsIn(ring), std::vector<std::size_t>{island});
    EXPECT_EQ(locator.regionsIn(island), std::vector<std::size_t>{inner});
    EXPECT_TRUE(locator.regionsIn(inner).empty());
    EXPECT_EQ(loopsOf(set, ring).size(), 3U);
    EXPECT_EQ(loopsOf(set, island).size(), 2U);
    const LoopRange loops = loopsOf(set, island);
    EXPECT_EQ(*locator.loopAbout(loops.first + 1), loops.first);
    EXPECT_TRUE(set.loops()[*locator.loopAbout(loops.first)].hole);
    EXPECT_FALSE(locator.loopAbout(loopsOf(set, ring).first));
    EXPECT_FALSE(locator.loopAbout(99));
}

TEST(SetMeasures, AreExactOverArcsNearAndFar) {
    for (const Vec2 by : {Vec2{}, Vec2{1048576.0, -524288.0}}) {
        const RegionSet set =
            cleaned({rectangle(0, 0, 8, 4), circle({2, 2}, 1)}, FillRule::kEvenOdd, by);
        const double pi = kPi;
        EXPECT_NEAR(gmregion::area(set), 32 - pi, 1e-12);
        EXPECT_NEAR(gmregion::perimeter(set), 24 + 2 * pi, 1e-12);
        EXPECT_NEAR(gmregion::area(set, loopAlone(1)), -pi, 1e-12);
        EXPECT_NEAR(centroid(set)->x - by.x, (32 * 4 - 2 * pi) / (32 - pi), 1e-9);
        EXPECT_NEAR(centroid(set)->y - by.y, 2, 1e-9);
        EXPECT_LT(distance(*centroid(set, loopAlone(1)), by + Vec2{2, 2}), 1e-9);
        EXPECT_LT(distance(bounds(set, loopAlone(1))->low, by + Vec2{1, 1}), 1e-9);
        EXPECT_LT(distance(bounds(set)->high, by + Vec2{8, 4}), 1e-9);
    }
}

TEST(SetMeasures, HoldForArcsOfEveryTurn) {
    // A parabola's segment in the limit of a flat arc, and cut in two otherwise.
    for (const double b : {1e-9, 1e-3, 0.2499, 0.2501, 0.7, 1.0, 3.7}) {
        for (const double bulge : {b, -b}) {
            const Element e{{1, 2}, {4, 6}, bulge};
            const double half = bulge / (1.0 + std::sqrt(1.0 + bulge * bulge));
            const Vec2 m = middleOf(e);
            const Moment whole = sweptMoment(e, {3, 1});
            const Moment first = sweptMoment({e.sp, m, half}, {3, 1});
            const Moment second = sweptMoment({m, e.ep, half}, {3, 1});
            const double size = 1.0 + length(whole.first);
            EXPECT_NEAR(whole.area, first.area + second.area, 1e-13 * size);
            EXPECT_LT(length(whole.first - first.first - second.first), 1e-12 * size) << bulge;
            if (b > 1.0) continue;
            Box sampled;
            for (int k = 0; k <= 4000; ++k)
                sampled.include(pointAt(e, k / 4000.0));
            const Box box = closeBox(e);
            EXPECT_TRUE(box.grown(1e-12).holds(sampled)) << bulge;
            EXPECT_TRUE(sampled.grown(1e-6).holds(box)) << bulge;
        }
    }
    const Box flat = closeBox({{0, 0}, {1000, 0}, 1e-6});
    EXPECT_NEAR(flat.low.y, -5e-4, 1e-15);
    EXPECT_EQ(flat.high.y, 0.0);
}

}  // namespace
