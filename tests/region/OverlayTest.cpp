// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <array>
#include <chrono>
#include <cmath>
#include <limits>
#include <random>
#include <set>

#include "gmregion/Boolean.h"
#include "gmregion/CleanUp.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

constexpr double kNan = std::numeric_limits<double>::quiet_NaN();

RegionSet cleaned(const Paths& paths, FillRule rule = FillRule::kNonZero, double tolerance = 0.0) {
    const Outcome outcome = cleanUp(paths, {rule, tolerance});
    EXPECT_EQ(outcome.refusal.reason, Reason::kNone) << textOf(outcome.refusal.reason);
    return outcome.regions;
}

RegionSet cleaned(const Elements& loop, double tolerance = 0.0) {
    Paths paths;
    paths.add(loop, true);
    return cleaned(paths, FillRule::kNonZero, tolerance);
}

/// The areas of all four combinations, in their order.
std::array<double, 4> areas(const RegionSet& a, const RegionSet& b) {
    std::array<double, 4> found{};
    for (std::size_t i = 0; i < found.size(); ++i) {
        const Outcome outcome = combine(a, b, static_cast<Combination>(i));
        EXPECT_FALSE(outcome.refusal) << textOf(outcome.refusal.reason);
        found[i] = area(outcome.regions);
    }
    return found;
}

void expectLaws(const RegionSet& a, const RegionSet& b, double slack) {
    const auto [both, common, first, either] = areas(a, b);
    EXPECT_NEAR(both + common, area(a) + area(b), slack);
    EXPECT_NEAR(first + common, area(a), slack);
    EXPECT_NEAR(either, both - common, slack);
}

bool covers(FillRule rule, int winding) {
    if (rule == FillRule::kEvenOdd) return winding % 2 != 0;
    return rule == FillRule::kPositive ? winding > 0 : winding != 0;
}

TEST(CleanUp, AgreesWithWindingsAtRandomPoints) {
    std::mt19937 engine(7);
    for (int round = 0; round < 300; ++round) {
        Paths paths;
        for (std::size_t i = 0; i <= engine() % 4; ++i)
            paths.add(tangle(engine, 3 + engine() % 12, 10.0), true);
        for (const FillRule rule : {FillRule::kNonZero, FillRule::kEvenOdd, FillRule::kPositive}) {
            const RegionSet set = cleaned(paths, rule);
            for (int k = 0; k < 20; ++k) {
                const Vec2 p{uniform(engine, -2, 12), uniform(engine, -2, 12)};
                ASSERT_EQ(winding(set, p), covers(rule, winding(paths, p)) ? 1 : 0) << round;
            }
        }
    }
}

TEST(CleanUp, DecidesWhatTouchesByItsInterior) {
    struct Case {
        const char* what;
        std::vector<Elements> loops;
        std::size_t regions;
        std::size_t loopCount;
        double area;
    };
    Elements hole = circle({2, 2}, 1);
    for (Element& e : hole)
        e = {e.ep, e.sp, -e.bulge};
    std::swap(hole[0], hole[1]);
    const std::vector<Case> cases{
        {"squares corner to corner", {rectangle(0, 0, 1, 1), rectangle(1, 1, 1, 1)}, 2, 2, 2},
        {"a shared side", {rectangle(0, 0, 1, 1), rectangle(1, 0, 1, 1)}, 1, 1, 2},
        {"a part of a side", {rectangle(0, 0, 4, 1), rectangle(1, 1, 2, 1)}, 1, 1, 6},
        {"the same thrice",
         {rectangle(0, 0, 1, 1), rectangle(0, 0, 1, 1), rectangle(0, 0, 1, 1)},
         1,
         1,
         1},
        {"a hole that touches its outline", {rectangle(0, 0, 4, 3), hole}, 1, 2, 12 - kPi},
        {"there and back", {polygon({{0, 0}, {5, 0}, {3, 0}, {3, 0}})}, 0, 0, 0},
        {"a spike", {polygon({{0, 0}, {2, 0}, {2, 1}, {5, 1}, {2, 1}, {0, 1}})}, 1, 1, 2},
        {"circles that touch", {circle({0, 0}, 1), circle({2, 0}, 1)}, 2, 2, 2 * kPi},
        {"an element without length", {polygon({{0, 0}, {2, 0}, {2, 0}, {2, 2}})}, 1, 1, 2},
    };
    for (const Case& c : cases) {
        Paths paths;
        for (const Elements& loop : c.loops)
            paths.add(loop, true);
        const RegionSet set = cleaned(paths);
        EXPECT_EQ(set.regionCount(), c.regions) << c.what;
        EXPECT_EQ(set.loops().size(), c.loopCount) << c.what;
        EXPECT_NEAR(area(set), c.area, 1e-7) << c.what;
    }
}

TEST(CleanUp, NestsManyLoops) {
    Paths paths;
    paths.add(rectangle(0, 0, 100, 100), true);
    for (int i = 0; i < 10; ++i) {
        for (int j = 0; j < 10; ++j) {
            paths.add(circle({10.0 * i + 5, 10.0 * j + 5}, 4), true);
            paths.add(circle({10.0 * i + 5, 10.0 * j + 5}, 2), true);
        }
    }
    const RegionSet set = cleaned(paths, FillRule::kEvenOdd);
    EXPECT_EQ(set.regionCount(), 101U);
    ASSERT_EQ(set.loops().size(), 201U);
    for (const Loop& loop : set.loops())
        EXPECT_EQ(loop.hole, loop.region == set.loops().front().region && &loop != &set.loops()[0]);
    EXPECT_NEAR(area(set), 10000 - 1200 * kPi, 1e-6);
}

TEST(CleanUp, IsTheSameFromAnyStartInAnyOrderAndTwice) {
    std::mt19937 engine(3);
    for (int round = 0; round < 40; ++round) {
        std::vector<Elements> loops;
        for (int i = 0; i < 3; ++i)
            loops.push_back(tangle(engine, 9, 10.0));
        Paths one;
        Paths other;
        for (const Elements& loop : loops)
            one.add(loop, true);
        std::reverse(loops.begin(), loops.end());
        for (Elements& loop : loops) {
            std::rotate(loop.begin(), loop.begin() + 4, loop.end());
            other.add(loop, true);
        }
        const RegionSet set = cleaned(one);
        const RegionSet again = cleaned(other);
        EXPECT_EQ(set.loops().size(), again.loops().size());
        EXPECT_NEAR(area(set), area(again), 1e-9 * area(set));
        Paths itself;
        for (const Loop& loop : set.loops())
            itself.add(set.elements().data() + loop.first, set.elements().data() + loop.last, true,
                       0);
        const RegionSet twice = cleaned(itself, FillRule::kPositive, set.tolerance());
        EXPECT_EQ(twice.loops().size(), set.loops().size());
        EXPECT_EQ(twice.elements().size(), set.elements().size());
        EXPECT_NEAR(area(twice), area(set), 1e-9 * area(set));
    }
}

/// A node near the end of an element, where it came nearest to an arc, once left a piece between
/// them of a sixth of the tolerance.
TEST(CleanUp, LeavesNoElementBelowTheTolerance) {
    const Vec2 tip{-7.4505805969238281e-09, 9.0949470177292824e-13};
    const RegionSet set =
        cleaned(Elements{{tip, {0, 0}, 2.75}, {{0, 0}, {7.75, 4.125}, 0}, {{7.75, 4.125}, tip, 0}});
    for (const Element& e : set.elements())
        EXPECT_GE(lengthAlong(e), set.tolerance());
}

/// A flat sliver and itself the other way round, moved by less than the tolerance: where two sides
/// came nearest they had a node that the other two had not.
TEST(CleanUp, LeavesNothingOfWhatCancels) {
    const double flat = 9.0949470177292824e-13;
    Paths paths;
    paths.add(
        Elements{{{27.875, 27.25}, {8.875, 21.75}, 0}, {{8.875, 21.75}, {27.875, 27.25}, flat}},
        true);
    const Vec2 a{27.875000000029104, 27.249999999999993};
    const Vec2 b{8.8750000000292601, 21.749999999999453};
    paths.add(Elements{{a, b, -flat}, {b, a, 0}}, true);
    EXPECT_TRUE(cleaned(paths).empty());
}

TEST(CleanUp, RefusesWhatItCannotAnswer) {
    const auto reasonFor = [](const Elements& loop, bool isClosed, double tolerance) {
        Paths paths;
        paths.add(loop, isClosed);
        const Outcome outcome = cleanUp(paths, {FillRule::kNonZero, tolerance});
        EXPECT_EQ(outcome.refusal.reason == Reason::kNone, !outcome.regions.empty());
        return outcome.refusal.reason;
    };
    const Elements square = rectangle(0, 0, 1, 1);
    EXPECT_EQ(reasonFor(square, true, 0), Reason::kNone);
    EXPECT_EQ(reasonFor(square, false, 0), Reason::kOpenPath);
    EXPECT_EQ(reasonFor(square, true, -1), Reason::kTolerance);
    EXPECT_EQ(reasonFor(square, true, 1e-15), Reason::kTolerance);
    EXPECT_EQ(reasonFor(square, true, kNan), Reason::kTolerance);
    for (const double value : {kNan, HUGE_VAL, -HUGE_VAL, 1e13}) {
        Elements bad = square;
        bad[2].ep.x = value;
        const Reason wanted = value == 1e13 ? Reason::kOutOfRange : Reason::kNotFinite;
        EXPECT_EQ(reasonFor(bad, true, 0), wanted);
    }
    Elements bent = square;
    bent[1].bulge = kNan;
    EXPECT_EQ(reasonFor(bent, true, 0), Reason::kNotFinite);
    // An arc whose bulge has no square: it reached to 1e160 without being seen.
    bent[1].bulge = 1e160;
    EXPECT_EQ(reasonFor(bent, true, 0), Reason::kOutOfRange);
    Elements torn = square;
    torn[1].sp.x += 1e-3;
    EXPECT_EQ(reasonFor(torn, true, 0), Reason::kGap);
    EXPECT_EQ(reasonFor(torn, true, 1e-2), Reason::kNone);
    EXPECT_TRUE(cleaned(Paths{}).empty());
}

TEST(Boolean, AreasAddUp) {
    std::mt19937 engine(11);
    for (int round = 0; round < 200; ++round) {
        const RegionSet a = cleaned(tangle(engine, 3 + engine() % 10, 10.0));
        const RegionSet b = cleaned(tangle(engine, 3 + engine() % 10, 10.0));
        expectLaws(a, b, 1e-6);
    }
}

/// Parts against themselves, moved and turned by next to nothing.
TEST(Boolean, HoldsWhereSidesNearlyCoincide) {
    std::mt19937 engine(3);
    std::vector<Elements> parts{rectangle(0, 0, 10, 7), circle({3, 4}, 5)};
    for (int i = 0; i < 3; ++i)
        parts.push_back(star(engine, 8 + engine() % 20, {5, 5}, 6));
    for (const Elements& part : parts) {
        const RegionSet a = cleaned(part);
        for (int exponent = -16; exponent <= -3; ++exponent) {
            for (const double by :
                 {0.0, std::pow(10.0, exponent), 7.0 * std::pow(10.0, exponent)}) {
                const RegionSet alongX = cleaned(placed(part, {by, 0}, 0.0));
                const RegionSet aside = cleaned(placed(part, {-by, 0.3 * by}, 0.0));
                const RegionSet turned = cleaned(placed(part, {0, 0}, by));
                const double slack = 8.0 * a.tolerance() * perimeter(a);
                for (const RegionSet* b : {&alongX, &aside, &turned}) {
                    expectLaws(a, *b, slack);
                    const double grown =
                        area(combine(a, *b, Combination::kUnion).regions) - area(a);
                    EXPECT_GE(grown, -slack);
                    EXPECT_LE(grown, slack + 20.0 * by * perimeter(a));
                }
            }
        }
    }
}

/// Expects no element below the tolerance, and no loop without area.
void expectNothingThin(const RegionSet& set) {
    for (const Element& e : set.elements())
        EXPECT_GE(lengthAlong(e), set.tolerance());
    for (const Loop& loop : set.loops()) {
        double twice = 0.0;
        double length = 0.0;
        for (std::uint32_t i = loop.first; i < loop.last; ++i) {
            twice += sweptTwice(set.elements()[i], set.elements()[loop.first].sp);
            length += lengthAlong(set.elements()[i]);
        }
        EXPECT_GT(std::fabs(twice), 0.02 * set.tolerance() * length);
    }
}

/// At the coarser tolerance the finer set has elements that are too short and sides that are too
/// near. In the last of these cases joined pieces come to go there and back.
TEST(Boolean, OfUnlikeTolerancesLeavesNothingThin) {
    for (unsigned seed = 600; seed < 700; ++seed) {
        SCOPED_TRACE(seed);
        std::mt19937 engine(seed);
        const double toleranceOfA = std::pow(10.0, uniform(engine, -9, -2));
        const double toleranceOfB = std::pow(10.0, uniform(engine, -9, -2));
        const std::size_t count = 8 + engine() % 10;
        const RegionSet a = cleaned(tangle(engine, count, 10.0), toleranceOfA);
        const std::size_t other = 8 + engine() % 10;
        const RegionSet b = cleaned(tangle(engine, other, 10.0), toleranceOfB);
        for (const auto combination : {Combination::kUnion, Combination::kDifference}) {
            const Outcome outcome = combine(a, b, combination);
            ASSERT_FALSE(outcome.refusal);
            expectNothingThin(outcome.regions);
        }
    }
}

/// Loops in any order cost about what loops in rows do.
TEST(CleanUp, TakesShuffledLoopsAsQuicklyAsRows) {
    std::vector<Vec2> centres;
    for (int i = 0; i < 90 * 90; ++i)
        centres.push_back({3.0 * (i % 90), 3.0 * (i / 90)});
    const auto secondsFor = [&] {
        Paths heap;
        for (const Vec2 m : centres)
            heap.add(circle(m, 1), true);
        const auto start = std::chrono::steady_clock::now();
        EXPECT_EQ(cleaned(heap).regionCount(), centres.size());
        return std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    };
    const double inRows = secondsFor();
    std::mt19937 engine(1);
    std::shuffle(centres.begin(), centres.end(), engine);
    EXPECT_LT(secondsFor(), 8.0 * inRows);
}

TEST(Boolean, ManyAtOnceAreWhatOneAfterTheOtherIs) {
    std::mt19937 engine(5);
    std::vector<RegionSet> sets;
    RegionSet sum;
    Workspace workspace;
    Outcome outcome;
    for (int i = 0; i < 12; ++i) {
        const Vec2 m{uniform(engine, 0, 20), uniform(engine, 0, 20)};
        sets.push_back(cleaned(star(engine, 12, m, 5)));
        const RegionSet before = sum;
        ASSERT_TRUE(combine(before, sets.back(), Combination::kUnion, workspace, outcome));
        sum = outcome.regions;
    }
    ASSERT_TRUE(uniteAll(sets.data(), sets.size(), workspace, outcome));
    EXPECT_NEAR(area(outcome.regions), area(sum), 1e-6);
    EXPECT_EQ(outcome.regions.loops().size(), sum.loops().size());
    ASSERT_TRUE(uniteAll(nullptr, 0, workspace, outcome));
    EXPECT_TRUE(outcome.regions.empty());
}

TEST(Boolean, ElementsKnowWhereTheyComeFrom) {
    Paths first;
    first.add(rectangle(0, 0, 4, 2), true, 100);
    Paths second;
    second.add(rectangle(1, 1, 2, 1), true, 200);
    const RegionSet common =
        combine(cleaned(first), cleaned(second), Combination::kIntersection).regions;
    ASSERT_EQ(common.elements().size(), 4U);
    for (std::size_t i = 0; i < 4; ++i) {
        const Element& e = common.elements()[i];
        std::set<std::pair<std::int64_t, std::uint32_t>> from;
        for (const Origin& origin : common.origins(i))
            from.insert({origin.path, origin.element});
        if (e.sp.y == 2 && e.ep.y == 2) {
            EXPECT_EQ(from, (std::set<std::pair<std::int64_t, std::uint32_t>>{{100, 2}, {200, 2}}));
        } else {
            ASSERT_EQ(from.size(), 1U);
            EXPECT_EQ(from.begin()->first, 200);
        }
    }
}

TEST(CleanUp, RefusesMoreWorkThanAllowedAndGoesOnAfterwards) {
    Paths heap;
    std::mt19937 engine(11);
    heap.add(tangle(engine, 40, 10.0), true);
    Workspace workspace;
    Outcome free;
    ASSERT_TRUE(cleanUp(heap, {}, workspace, free));
    workspace.setWorkLimit(20);
    Outcome limited;
    EXPECT_FALSE(cleanUp(heap, {}, workspace, limited));
    EXPECT_EQ(limited.refusal.reason, Reason::kWorkLimit);
    EXPECT_TRUE(limited.regions.empty());
    workspace.setWorkLimit(1000000);
    ASSERT_TRUE(cleanUp(heap, {}, workspace, limited));
    EXPECT_EQ(area(limited.regions), area(free.regions));
}

/// Loops in a row, and loops in each other: none of them is allowed to cost a look at all others.
TEST(CleanUp, FindsWindingsAndNestingOfManyLoops) {
    Paths row;
    Paths rings;
    for (int i = 0; i < 300; ++i) {
        row.add(circle({3.0 * i, 0.0}, 1.0), true);
        rings.add(circle({0.0, 0.0}, 1.0 + i), true);
    }
    EXPECT_EQ(cleaned(row).regionCount(), 300U);
    const RegionSet nested = cleaned(rings, FillRule::kEvenOdd);
    EXPECT_EQ(nested.regionCount(), 150U);
    EXPECT_EQ(nested.loops().size(), 300U);
    EXPECT_NEAR(area(nested), 3.14159265358979 * (300.0 * 301.0 / 2.0), 1e-5);
}

/// Where a look for the nesting would meet two loops in one point, or an arc that is flat.
TEST(CleanUp, NestsLoopsThatTouchAtTheHeightOfTheirMiddle) {
    struct Case {
        Elements loop;
        double area;
    };
    const Elements square = rectangle(0, 0, 4, 4);
    const std::array<Case, 4> cases{{
        {polygon({{0, 2}, {-2, 1}, {-2, 3}}), 18.0},        // a tip from outside
        {polygon({{0, 2}, {1, 3}, {2, 2}, {1, 1}}), 14.0},  // the corner of a hole
        {polygon({{4, 2}, {3, 3}, {2, 2}, {3, 1}}), 14.0},
        {{{{1, 2}, {2, 2}, 0.05}, {{2, 2}, {1, 2}, 0.05}}, 16.0 - 0.0333499941},  // flat arcs
    }};
    for (const Case& c : cases) {
        for (const double angle : {0.0, 1.5707963267948966, 3.1415926535897931}) {
            Paths heap;
            heap.add(placed(square, {}, angle), true);
            heap.add(placed(c.loop, {}, angle), true);
            const RegionSet set = cleaned(heap, FillRule::kEvenOdd);
            EXPECT_EQ(set.loops().size(), 2U) << c.area << " " << angle;
            EXPECT_NEAR(area(set), c.area, 1e-8) << angle;
        }
    }
    std::mt19937 engine(5);
    for (int i = 0; i < 300; ++i) {
        Paths heap;
        for (int k = 0; k < 6; ++k) {
            std::vector<Vec2> corners;
            for (int c = 0; c < 3; ++c)
                corners.push_back({double(engine() % 7), double(engine() % 7)});
            heap.add(polygon(corners), true);
        }
        const RegionSet set = cleaned(heap, FillRule::kEvenOdd);
        EXPECT_NEAR(area(set), area(combine(set, set, Combination::kUnion).regions), 1e-8);
    }
}

/// Where two crossing sides are there twice, a part of the tolerance apart, their crossings lie
/// farther apart than the sides.
TEST(CleanUp, TakesCrossingBarsThatAreThereTwice) {
    constexpr double kTolerance = 1e-6;
    std::mt19937 engine(3);
    for (const double angle : {0.5, 0.2, 0.05, 0.01}) {
        for (const double apart : {0.02, 0.3, 0.9}) {
            for (int i = 0; i < 20; ++i) {
                Paths heap;
                for (const double turn : {0.0, angle}) {
                    const Elements bar = placed(rectangle(-5, -0.5, 10, 1), {}, turn);
                    const double way = apart * kTolerance;
                    const double to = uniform(engine, 0.0, 6.28);
                    heap.add(bar, true);
                    heap.add(placed(bar, {way * std::cos(to), way * std::sin(to)}, 0.0), true);
                }
                const RegionSet set = cleaned(heap, FillRule::kNonZero, kTolerance);
                const double common = std::min(10.0, 1.0 / std::sin(angle));
                EXPECT_EQ(set.regionCount(), 1U) << angle << " " << apart;
                EXPECT_LE(area(set), 20.0 - 0.5 * common);
            }
        }
    }
}

}  // namespace
