// SPDX-License-Identifier: MIT
/// @file
/// What nearly coincides: nothing is refused, and areas are those that the construction tells.
#include <gtest/gtest.h>

#include <cmath>
#include <random>

#include "gmregion/Boolean.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Offset.h"
#include "gmregion/Verify.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

RegionSet cleaned(const Paths& heap, FillRule rule = FillRule::kNonZero, double tolerance = 0.0) {
    const Outcome outcome = cleanUp(heap, {rule, tolerance});
    EXPECT_FALSE(outcome.refusal);
    return outcome.regions;
}

RegionSet cleaned(const Elements& loop) {
    Paths heap;
    heap.add(loop, true);
    return cleaned(heap);
}

RegionSet offsetOf(const RegionSet& source, double distance) {
    const Outcome outcome = offset(source, distance);
    EXPECT_FALSE(outcome.refusal) << distance;
    EXPECT_TRUE(verifyOffset(source, distance, outcome.regions).isSound()) << distance;
    return outcome.regions;
}

/// A plate with a slot and a hole, moved along its sides and turned by next to nothing.
TEST(NearCoincidence, OffsetsOfAPartAndItsNearCopy) {
    Elements plate = rectangle(0, 0, 40, 30);
    plate[1] = {{40, 0}, {40, 30}, 0.2};
    for (int exponent = -15; exponent <= -3; ++exponent) {
        const double by = std::pow(10.0, exponent);
        for (const auto& [move, angle] :
             {std::pair(Vec2{by, 0}, 0.0), std::pair(Vec2{0, by}, 0.0), std::pair(Vec2{}, by)}) {
            Paths heap;
            heap.add(plate, true);
            heap.add(placed(plate, move, angle), true);
            const RegionSet both = cleaned(heap);
            const RegionSet alone = cleaned(plate);
            EXPECT_NEAR(area(both), area(alone), 2000 * by + 1e-4);
            for (const double d : {1.0, -1.0}) {
                EXPECT_NEAR(area(offsetOf(both, d)), area(offsetOf(alone, d)), 2000 * by + 1e-4);
            }
        }
    }
}

TEST(NearCoincidence, AHundredCopiesAndSharedSides) {
    std::mt19937 engine(4);
    const Elements part = star(engine, 18, {0, 0}, 10);
    std::vector<RegionSet> copies;
    Paths heap;
    for (int i = 0; i < 100; ++i) {
        const double by = 1e-9 * uniform(engine, -1, 1);
        const Elements copy = placed(part, {by, -by}, 0.1 * by);
        heap.add(copy, true);
        copies.push_back(cleaned(copy));
    }
    const double expected = area(copies.front());
    EXPECT_NEAR(area(cleaned(heap)), expected, 1e-5);
    Workspace workspace;
    Outcome outcome;
    ASSERT_TRUE(uniteAll(copies.data(), copies.size(), workspace, outcome));
    EXPECT_NEAR(area(outcome.regions), expected, 1e-5);
    EXPECT_EQ(outcome.regions.loops().size(), 1U);
    // A wall of bricks that share sides, and sides partly.
    Paths wall;
    for (int row = 0; row < 20; ++row) {
        for (int i = 0; i < 20; ++i)
            wall.add(rectangle(0.3 * (i + 0.5 * (row % 2)), 0.1 * row, 0.3, 0.1), true);
    }
    const RegionSet united = cleaned(wall);
    EXPECT_EQ(united.regionCount(), 1U);
    EXPECT_EQ(united.loops().size(), 1U);
    EXPECT_NEAR(area(united), 20 * 20 * 0.03, 1e-6);
}

/// Discs that share an arc with what is left of others.
TEST(NearCoincidence, SharedArcs) {
    const RegionSet disc = cleaned(circle({0, 0}, 5));
    const RegionSet half = cleaned(rectangle(0, -6, 6, 12));
    const RegionSet right = combine(disc, half, Combination::kIntersection).regions;
    const RegionSet left = combine(disc, half, Combination::kDifference).regions;
    const RegionSet whole = combine(left, right, Combination::kUnion).regions;
    EXPECT_NEAR(area(whole), 25 * M_PI, 1e-6);
    EXPECT_EQ(whole.loops().size(), 1U);
    EXPECT_LE(area(combine(left, right, Combination::kIntersection).regions), 1e-6);
}

TEST(NearCoincidence, SquaresCornerToCornerByTheThousand) {
    Paths board;
    for (int y = 0; y < 50; ++y) {
        for (int x = y % 2; x < 50; x += 2)
            board.add(rectangle(0.1 * x, 0.1 * y, 0.1, 0.1), true);
    }
    const RegionSet squares = cleaned(board);
    EXPECT_EQ(squares.regionCount(), 1250U);
    EXPECT_NEAR(area(squares), 12.5, 1e-6);
    const RegionSet grown = offsetOf(squares, 0.01);
    EXPECT_EQ(grown.regionCount(), 1U);
    EXPECT_EQ(offsetOf(squares, -0.01).regionCount(), 1250U);
}

TEST(NearCoincidence, HundredsOfElementsThroughOnePoint) {
    Paths fan;
    constexpr int kSpokes = 300;
    for (int i = 0; i < kSpokes; ++i) {
        const double angle = 2 * M_PI * i / kSpokes;
        const double next = 2 * M_PI * (i + 0.4) / kSpokes;
        const Vec2 p{10 * std::cos(angle), 10 * std::sin(angle)};
        const Vec2 q{10 * std::cos(next), 10 * std::sin(next)};
        fan.add(polygon({{0, 0}, p, q}), true);
    }
    const double wedge = 50 * std::sin(2 * M_PI * 0.4 / kSpokes);
    const RegionSet wedges = cleaned(fan);
    EXPECT_NEAR(area(wedges), kSpokes * wedge, 1e-5);
    EXPECT_EQ(wedges.regionCount(), std::size_t{kSpokes});
    EXPECT_EQ(offsetOf(wedges, 0.02).regionCount(), 1U);
}

/// Vertices in a row, each nearer to the next one than the tolerance, or about as near.
TEST(NearCoincidence, ChainsOfNearVertices) {
    for (const double step : {0.3, 0.7, 0.99, 1.01, 1.5, 3.0}) {
        constexpr double kTolerance = 1e-4;
        constexpr int kCount = 500;
        std::vector<Vec2> corners;
        for (int i = 0; i <= kCount; ++i)
            corners.push_back({step * kTolerance * i, 0.2 * kTolerance * (i % 2)});
        corners.push_back({step * kTolerance * kCount, 1.0});
        corners.push_back({0.0, 1.0});
        Paths heap;
        heap.add(polygon(corners), true);
        const RegionSet set = cleaned(heap, FillRule::kNonZero, kTolerance);
        for (const Element& e : set.elements())
            EXPECT_GE(lengthAlong(e), set.tolerance()) << step;
        EXPECT_NEAR(area(set), step * kTolerance * kCount, 4 * kTolerance) << step;
        offsetOf(set, 0.01);
    }
}

TEST(NearCoincidence, ArcsAlmostFullFlatAndOfTheDistance) {
    // A ring that is open by a millionth is closed by a segment.
    for (const double gap : {1e-3, 1e-6, 1e-8}) {
        const double bulge = std::tan((2 * M_PI - gap / 10) / 4);
        const Elements ring{{{0, 0}, {0, gap}, bulge}, {{0, gap}, {0, 0}, 0}};
        const RegionSet set = cleaned(ring);
        EXPECT_NEAR(area(set), 100 * M_PI, 1.0) << gap;
        offsetOf(set, 1.0);
        offsetOf(set, -1.0);
    }
    // A side of radius 1e8 is its chord within 2e-6, and is so from both sides.
    Elements flat = rectangle(0, 0, 30, 20);
    flat[0].bulge = -std::tan(std::asin(15 / 1e8) / 2);
    for (const double d : {2.0, -2.0})
        EXPECT_NEAR(area(offsetOf(cleaned(flat), d)),
                    area(offsetOf(cleaned(rectangle(0, 0, 30, 20)), d)), 1e-3);
    // Corners rounded by the distance, and by what is next to it, become corners.
    for (const double off : {0.0, 1e-12, -1e-12, 1e-9, -1e-9, 1e-6, -1e-6}) {
        const double r = 2.0 + off;
        const double b = std::tan(M_PI / 8);
        const Elements rounded{{{r, 0}, {30 - r, 0}, 0},   {{30 - r, 0}, {30, r}, b},
                               {{30, r}, {30, 20 - r}, 0}, {{30, 20 - r}, {30 - r, 20}, b},
                               {{30 - r, 20}, {r, 20}, 0}, {{r, 20}, {0, 20 - r}, b},
                               {{0, 20 - r}, {0, r}, 0},   {{0, r}, {r, 0}, b}};
        const RegionSet inner = offsetOf(cleaned(rounded), -2.0);
        EXPECT_NEAR(area(inner), 26.0 * 16.0, 1e-4) << off;
        EXPECT_EQ(inner.elements().size(), off > 1e-7 ? 8U : 4U) << off;
    }
}

TEST(NearCoincidence, TinyElementsBesideLargeOnesAndFarAway) {
    // An arc hardly longer than the tolerance, in a corner that it would turn inside out.
    const Elements corner{
        {{20, 20}, {20, 6.75}, 0},
        {{20, 6.75}, {20.000000014901161, 6.7499999962747097}, -2.4142135623730949},
        {{20.000000014901161, 6.7499999962747097}, {20, 20}, 0.41421356237309503}};
    const Elements without{{{20, 20}, {20, 6.75}, 0}, {{20, 6.75}, {20, 20}, 0.41421356237309503}};
    EXPECT_NEAR(area(offsetOf(cleaned(corner), 20)), area(offsetOf(cleaned(without), 20)), 1e-5);
    // A nick of a billionth in a side of a thousand.
    const Elements nicked = polygon({{0, 0},
                                     {500, 0},
                                     {500, 1e-9},
                                     {500 + 1e-9, 1e-9},
                                     {500 + 1e-9, 0},
                                     {1000, 0},
                                     {1000, 1000},
                                     {0, 1000}});
    const RegionSet plate = cleaned(nicked);
    EXPECT_NEAR(area(plate), 1e6, 1e-2);
    EXPECT_EQ(plate.elements().size(), 5U);
    EXPECT_NEAR(area(offsetOf(plate, -100)), 640000, 1e-1);
    // The same part near the origin and a million away.
    std::mt19937 engine(9);
    const Elements part = star(engine, 30, {0, 0}, 20);
    Paths here;
    here.add(part, true);
    Paths there;
    there.add(placed(part, {1e6, -2e6}, 0.0), true);
    constexpr double kTolerance = 1e-6;
    const RegionSet near = cleaned(here, FillRule::kNonZero, kTolerance);
    const RegionSet far = cleaned(there, FillRule::kNonZero, kTolerance);
    for (const double d : {1.5, -1.5})
        EXPECT_NEAR(area(offsetOf(near, d)), area(offsetOf(far, d)), 1e-3);
}

}  // namespace
