// SPDX-License-Identifier: MIT
#include "gmregion/Offset.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <random>

#include "gmregion/CleanUp.h"
#include "region/operations/Scratch.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

RegionSet cleaned(const std::vector<Elements>& loops, FillRule rule = FillRule::kNonZero) {
    Paths paths;
    for (const Elements& loop : loops)
        paths.add(loop, true);
    const Outcome outcome = cleanUp(paths, {rule, 0.0});
    EXPECT_FALSE(outcome.refusal) << textOf(outcome.refusal.reason);
    return outcome.regions;
}

RegionSet tangles(std::mt19937& engine) {
    std::vector<Elements> loops;
    for (std::size_t i = 0; i <= engine() % 4; ++i)
        loops.push_back(tangle(engine, 3 + engine() % 12, 10.0));
    return cleaned(loops);
}

RegionSet offsetOf(const RegionSet& source, double d, const OffsetOptions& options = {}) {
    const Outcome outcome = offset(source, d, options);
    EXPECT_FALSE(outcome.refusal) << textOf(outcome.refusal.reason) << " at " << d;
    return outcome.regions;
}

/// Compares an offset with distances at random points of a square; counts the points.
int comparePoints(const RegionSet& source, double d, const RegionSet& result, double size,
                  std::mt19937& engine) {
    OffsetSource index;
    index.take(source);
    int count = 0;
    for (int k = 0; k < 40; ++k) {
        const Vec2 p{uniform(engine, -0.3 * size, 1.3 * size),
                     uniform(engine, -0.3 * size, 1.3 * size)};
        Index guess = kNone;
        const double away = index.distanceBelow(p, 10 * size, 0.0, guess);
        if (std::fabs(away - std::fabs(d)) < 8 * source.tolerance()) continue;
        const bool inside = winding(source, p) > 0;
        const bool expected = d > 0 ? inside || away < d : inside && away > -d;
        EXPECT_EQ(winding(result, p), expected ? 1 : 0) << p.x << " " << p.y << ", " << d;
        ++count;
    }
    return count;
}

TEST(Offset, AgreesWithDistancesAtRandomPoints) {
    std::mt19937 engine(5);
    int compared = 0;
    for (int round = 0; round < 400; ++round) {
        const RegionSet source = tangles(engine);
        const double d = uniform(engine, -2, 3);
        compared += comparePoints(source, d, offsetOf(source, d), 10.0, engine);
    }
    EXPECT_GT(compared, 12000);
}

TEST(Offset, ByParallelsIsTheOneByStrips) {
    std::mt19937 engine(6);
    Workspace workspace;
    OverlayScratch& overlay = workspace.begin().overlay;
    OffsetScratch& offsets = workspace.begin().offset;
    Outcome parallels;
    Outcome strips;
    for (int round = 0; round < 100; ++round) {
        const RegionSet source = tangles(engine);
        const double d = uniform(engine, -2, 3);
        OriginSource origins;
        origins.first = &source;
        offsets.source.take(source);
        for (const bool trims : {true, false}) {
            ASSERT_TRUE(
                roundOffset(overlay, offsets, origins, d, source.tolerance(), trims, parallels));
            ASSERT_TRUE(stripOffset(overlay, offsets, origins, d, source.tolerance(), {}, strips));
            const double slack =
                10 * source.tolerance() * (perimeter(source) + perimeter(parallels.regions) + 1);
            EXPECT_NEAR(area(parallels.regions), area(strips.regions), slack) << round;
            EXPECT_EQ(parallels.regions.loops().size(), strips.regions.loops().size()) << round;
        }
    }
}

/// A plate with rounded corners and a hole in each, turned, its numbers rounded to some decimals.
RegionSet plate(double r, double degrees, int decimals) {
    constexpr double kWidth = 60;
    constexpr double kHeight = 40;
    const double quarter = 0.41421356237309503;
    const std::vector<Vec2> p{
        {r, 0},       {kWidth - r, 0},  {kWidth, r}, {kWidth, kHeight - r}, {kWidth - r, kHeight},
        {r, kHeight}, {0, kHeight - r}, {0, r}};
    std::vector<Elements> loops{polygon(p)};
    for (std::size_t i = 1; i < 8; i += 2)
        loops[0][i].bulge = quarter;
    for (const Vec2 m :
         {Vec2{r, r}, Vec2{kWidth - r, r}, Vec2{kWidth - r, kHeight - r}, Vec2{r, kHeight - r}})
        loops.push_back(circle(m, 0.4 * r));
    const double unit = std::pow(10.0, decimals);
    for (Elements& loop : loops) {
        loop = placed(loop, {0, 0}, degrees * kPi / 180);
        for (Element& e : loop) {
            for (Vec2* v : {&e.sp, &e.ep})
                *v = {std::round(v->x * unit) / unit, std::round(v->y * unit) / unit};
        }
    }
    return cleaned(loops, FillRule::kEvenOdd);
}

/// The quick way must not need the others: they would hide what is wrong with it.
TEST(Offset, OfRoundedPlatesComesOutByParallelsAtOnce) {
    Workspace workspace;
    OverlayScratch& overlay = workspace.begin().overlay;
    OffsetScratch& offsets = workspace.begin().offset;
    Outcome outcome;
    for (int decimals = 2; decimals <= 12; ++decimals) {
        const RegionSet source = plate(5.0, 7.0 * decimals, decimals);
        OriginSource origins;
        origins.first = &source;
        offsets.source.take(source);
        for (const double d : {0.1, 1.5, -0.1, -1.5}) {
            EXPECT_TRUE(
                roundOffset(overlay, offsets, origins, d, source.tolerance(), true, outcome));
            // Tangents stay joined, where the bends that rounding leaves are small enough.
            const std::size_t corners = decimals < 6 ? 4 : 0;
            EXPECT_LE(outcome.regions.elements().size(), source.elements().size() + corners);
        }
    }
}

TEST(Offset, ByLittleKeepsTheToleranceOfItsSource) {
    std::mt19937 engine(12);
    for (int round = 0; round < 100; ++round) {
        Paths heap;
        heap.add(tangle(engine, 12, 10), true);
        const RegionSet source = cleanUp(heap, {FillRule::kNonZero, 1e-5}).regions;
        for (const double d : {8e-6, 3e-5, 2e-4, -8e-6, -2e-4}) {
            const RegionSet result = offsetOf(source, d);
            EXPECT_EQ(result.tolerance(), source.tolerance()) << d;
            for (const Element& e : result.elements())
                EXPECT_GE(lengthAlong(e), result.tolerance()) << d;
        }
    }
}

/// The exact area of a plate's outward offset.
double plateArea(double r, double d) {
    const double hole = std::max(0.0, 0.4 * r - d);
    const double corners = (4 - kPi) * (r + d) * (r + d);
    return (60 + 2 * d) * (40 + 2 * d) - corners - 4 * kPi * hole * hole;
}

TEST(Offset, KeepsPlatesWhateverTheirDecimals) {
    for (int decimals = 2; decimals <= 12; ++decimals) {
        for (int degrees = decimals % 4; degrees < 90; degrees += 4) {
            for (const double r : {1.0, 5.0}) {
                const RegionSet source = plate(r, degrees, decimals);
                const double slack = 3000 * std::pow(10.0, -decimals) + 1e-6;
                for (const double d : {0.001, 0.1, 0.4, 1.0, 5.0})
                    EXPECT_NEAR(area(offsetOf(source, d)), plateArea(r, d), slack)
                        << decimals << " " << degrees << " " << r << " " << d;
                // Where holes grow to the edge and where corners come to a point.
                for (const double d : {-0.001, -0.1, -0.3, -0.6, -1.0, -5.0}) {
                    const RegionSet shrunk = offsetOf(source, d);
                    EXPECT_LT(area(shrunk), area(source));
                    EXPECT_LE(area(offsetOf(shrunk, -d)), area(source) + slack);
                }
                EXPECT_TRUE(offsetOf(source, -20.1).empty());
            }
        }
    }
}

TEST(Offset, JoinsAndEndsAreExact) {
    const RegionSet square = cleaned({rectangle(0, 0, 10, 10)});
    const auto grown = [&](Join join, double limit) {
        return area(offsetOf(square, 1, {join, End::kRound, limit}));
    };
    EXPECT_NEAR(grown(Join::kRound, 4), 140 + kPi, 1e-7);
    EXPECT_NEAR(grown(Join::kMiter, 4), 144, 1e-7);
    EXPECT_NEAR(grown(Join::kMiter, 1.2), 142, 1e-7);
    EXPECT_NEAR(grown(Join::kBevel, 4), 142, 1e-7);
    EXPECT_NEAR(area(offsetOf(square, -1, {Join::kMiter, End::kRound, 4})), 64, 1e-7);
    Paths line;
    line.add(Elements{{{0, 0}, {10, 0}, 0}}, false);
    Workspace workspace;
    Outcome outcome;
    const auto drawn = [&](const Paths& paths, End end) {
        EXPECT_TRUE(thicken(paths, 1, 0, {Join::kRound, end, 4}, workspace, outcome));
        return area(outcome.regions);
    };
    EXPECT_NEAR(drawn(line, End::kRound), 20 + kPi, 1e-7);
    EXPECT_NEAR(drawn(line, End::kSquare), 24, 1e-7);
    EXPECT_NEAR(drawn(line, End::kButt), 20, 1e-7);
    Paths ring;
    ring.add(circle({0, 0}, 5), true);
    EXPECT_NEAR(drawn(ring, End::kButt), 20 * kPi, 1e-6);
    EXPECT_EQ(outcome.regions.loops().size(), 2U);
    Paths corner;
    corner.add(Elements{{{0, 0}, {10, 0}, 0}, {{10, 0}, {10, 10}, 0}}, false);
    EXPECT_NEAR(drawn(corner, End::kButt), 40 - 1 + kPi / 4, 1e-7);
}

TEST(Offset, DecidesWhatIsExactlyAsWideAsTheDistance) {
    struct Case {
        const char* what;
        std::vector<Elements> loops;
        double d;
        std::size_t loopCount;
        double area;
        bool isMarginal;
    };
    const double half = 1.0;
    const Elements slot{{{0, -1}, {8, -1}, 0},
                        {{8, -1}, {8, 1}, half},
                        {{8, 1}, {0, 1}, 0},
                        {{0, 1}, {0, -1}, half}};
    const std::vector<Case> cases{
        {"a slot as wide as the tool", {slot}, -1, 0, 0, true},
        {"a circle of the same radius", {circle({0, 0}, 2)}, -2, 0, 0, true},
        {"a hole that closes",
         {rectangle(-5, -5, 10, 10), circle({0, 0}, 1)},
         1,
         1,
         140 + kPi,
         true},
        {"a gap that closes",
         {rectangle(0, 0, 4, 4), rectangle(6, 0, 4, 4)},
         1,
         1,
         64 + 2 * kPi,
         true},
        {"a neck that parts",
         {polygon({{0, 0},
                   {4, 0},
                   {4, 1},
                   {6, 1},
                   {6, 0},
                   {10, 0},
                   {10, 4},
                   {6, 4},
                   {6, 3},
                   {4, 3},
                   {4, 4},
                   {0, 4}})},
         -1,
         2,
         12 - kPi,
         true},
        {"corners that touch", {rectangle(0, 0, 4, 4), rectangle(4, 4, 4, 4)}, -1, 2, 8, false},
    };
    for (const Case& c : cases) {
        const Outcome outcome = offset(cleaned(c.loops, FillRule::kEvenOdd), c.d);
        const RegionSet& result = outcome.regions;
        EXPECT_EQ(outcome.marginal.empty(), !c.isMarginal) << c.what;
        EXPECT_EQ(result.loops().size(), c.loopCount) << c.what;
        EXPECT_NEAR(area(result), c.area, 1e-6) << c.what;
    }
}

TEST(Offset, SeriesOpeningAndClosing) {
    std::mt19937 engine(8);
    Workspace workspace;
    for (int round = 0; round < 40; ++round) {
        const RegionSet source = tangles(engine);
        const std::array<double, 3> distances{0.3, 0.0, -0.2};
        std::array<Outcome, 3> outcomes;
        ASSERT_TRUE(offsetSeries(source, distances.data(), 3, {}, workspace, outcomes.data()));
        for (std::size_t i = 0; i < 3; ++i)
            EXPECT_EQ(area(outcomes[i].regions), area(offsetOf(source, distances[i])));
        const double slack = 20 * source.tolerance() * perimeter(source);
        Outcome outcome;
        ASSERT_TRUE(opened(source, 0.2, workspace, outcome));
        EXPECT_LE(area(outcome.regions), area(source) + slack);
        EXPECT_GE(area(outcome.regions), area(outcomes[2].regions) - slack);
        ASSERT_TRUE(closed(source, 0.3, workspace, outcome));
        EXPECT_GE(area(outcome.regions), area(source) - slack);
        EXPECT_LE(area(outcome.regions), area(outcomes[0].regions) + slack);
        // By one distance and then another is by both at once, outward.
        EXPECT_NEAR(area(offsetOf(outcomes[0].regions, 0.5)), area(offsetOf(source, 0.8)),
                    10 * slack);
    }
}

TEST(Offset, ElementsKnowWhereTheyComeFrom) {
    const RegionSet result = offsetOf(cleaned({rectangle(0, 0, 10, 10)}), 1);
    ASSERT_EQ(result.elements().size(), 8U);
    int corners = 0;
    for (std::size_t i = 0; i < 8; ++i) {
        ASSERT_EQ(result.origins(i).size(), 1U);
        const bool isArc = result.elements()[i].bulge != 0;
        EXPECT_EQ(result.origins(i).begin()->kind,
                  isArc ? OriginKind::kCorner : OriginKind::kParallel);
        corners += isArc ? 1 : 0;
    }
    EXPECT_EQ(corners, 4);
}

TEST(Offset, RefusesWhatItCannotAnswer) {
    const RegionSet square = cleaned({rectangle(0, 0, 10, 10)});
    const double nan = std::numeric_limits<double>::quiet_NaN();
    EXPECT_EQ(offset(square, nan).refusal.reason, Reason::kNotFinite);
    EXPECT_EQ(offset(square, HUGE_VAL).refusal.reason, Reason::kNotFinite);
    EXPECT_EQ(offset(square, 1e13).refusal.reason, Reason::kOutOfRange);
    EXPECT_EQ(offset(square, 1, {Join::kMiter, End::kRound, 0.5}).refusal.reason,
              Reason::kOutOfRange);
    EXPECT_TRUE(offset(RegionSet{}, 1).regions.empty());
    // Distances about and below the tolerance are no trouble.
    for (double d = 1e-18; d < 1e-4; d *= 3.7) {
        for (const double distance : {d, -d})
            EXPECT_NEAR(area(offsetOf(square, distance)), 100 + 40 * distance,
                        40 * square.tolerance() + 8 * d * d);
    }
    Workspace workspace;
    Outcome outcome;
    EXPECT_FALSE(thicken(Paths{}, -1, 0, {}, workspace, outcome));
    EXPECT_TRUE(thicken(Paths{}, 1, 0, {}, workspace, outcome));
    EXPECT_TRUE(outcome.regions.empty());
    // So thin that a share of the tolerance is no step any more: nesting never came to an end.
    Paths thin;
    thin.add(Elements{{{16.75, 31}, {16.74993896484375, 30.999999999068677}, 0},
                      {{16.74993896484375, 30.999999999068677}, {16.75, 31}, 1}},
             true);
    EXPECT_TRUE(thicken(thin, 1e-12, 0, {Join::kRound, End::kSquare, 4}, workspace, outcome));
    EXPECT_LT(area(outcome.regions), 1e-14);
}

}  // namespace
