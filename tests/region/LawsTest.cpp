// SPDX-License-Identifier: MIT
/// @file
/// Laws that hold for every part, on parts as they are drawn and on random ones: the same answer
/// however it is asked, one offset after the other, booleans in any order.
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <functional>
#include <random>

#include "gmregion/Boolean.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Offset.h"
#include "gmregion/Verify.h"
#include "tests/support/DrawnParts.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

using Loops = std::vector<Elements>;

/// The drawn parts, with three decimals and turned, and random ones.
std::vector<Loops> someParts() {
    std::vector<Loops> parts;
    double degrees = 0.0;
    for (const DrawnPart& part : drawnParts())
        parts.push_back(drawn(part, {degrees += 7.0, 3, 0}));
    std::mt19937 engine(21);
    for (int i = 0; i < 6; ++i)
        parts.push_back({tangle(engine, 5 + engine() % 12, 40), star(engine, 14, {20, 20}, 25)});
    return parts;
}

RegionSet setOf(const Loops& loops, double tolerance) {
    Paths paths;
    for (const Elements& loop : loops)
        paths.add(loop, true);
    const Outcome outcome = cleanUp(paths, {FillRule::kEvenOdd, tolerance});
    EXPECT_FALSE(outcome.refusal);
    return outcome.regions;
}

/// Another way to ask for the same: what becomes of every element.
struct Way {
    const char* name;
    double scale;
    std::function<Element(const Element&)> map;
    bool shuffles = false;  ///< loops begin elsewhere, and come in another order
};

std::vector<Way> ways() {
    const auto mapped = [](const auto& point, double sense) {
        return [=](const Element& e) { return Element{point(e.sp), point(e.ep), sense * e.bulge}; };
    };
    const double c = std::cos(0.7);
    const double s = std::sin(0.7);
    return {
        {"moved", 1.0,
         mapped(
             [](Vec2 p) {
                 return Vec2{p.x + 1234.5, p.y - 777.1};
             },
             1.0)},
        {"turned", 1.0,
         mapped(
             [=](Vec2 p) {
                 return Vec2{c * p.x - s * p.y, s * p.x + c * p.y};
             },
             1.0)},
        {"mirrored", 1.0,
         mapped(
             [](Vec2 p) {
                 return Vec2{-p.x, p.y};
             },
             -1.0)},
        {"reversed", 1.0,
         [](const Element& e) {
             return Element{e.ep, e.sp, -e.bulge};
         }},
        {"in inches", 1.0 / 25.4,
         mapped(
             [](Vec2 p) {
                 return Vec2{p.x / 25.4, p.y / 25.4};
             },
             1.0)},
        {"begun elsewhere", 1.0, [](const Element& e) { return e; }, true},
    };
}

Loops asked(const Loops& loops, const Way& way) {
    Loops result;
    for (const Elements& loop : loops) {
        Elements other;
        for (const Element& e : loop)
            other.push_back(way.map(e));
        const bool isBackward = other[0].sp == loop[0].ep && other[0].ep == loop[0].sp;
        if (isBackward) std::reverse(other.begin(), other.end());
        if (way.shuffles) std::rotate(other.begin(), other.begin() + other.size() / 3, other.end());
        result.push_back(other);
    }
    if (way.shuffles) std::reverse(result.begin(), result.end());
    return result;
}

struct Figures {
    double area;
    double length;
    std::size_t loops;
    bool marginal;
};

Figures figuresOf(const RegionSet& source, double distance) {
    const Outcome outcome = offset(source, distance);
    EXPECT_FALSE(outcome.refusal);
    const Verdict verdict = verifyOffset(source, distance, outcome.regions);
    EXPECT_TRUE(verdict.isSound());
    return {area(outcome.regions), perimeter(outcome.regions), outcome.regions.loops().size(),
            !outcome.marginal.empty()};
}

TEST(Laws, TheSameAnswerHoweverItIsAsked) {
    constexpr double kTolerance = 1e-7;
    int compared = 0;
    for (const Loops& part : someParts()) {
        const RegionSet source = setOf(part, kTolerance);
        for (const double d : {0.37, -0.37, 2.9, -2.9}) {
            const Figures one = figuresOf(source, d);
            for (const Way& way : ways()) {
                SCOPED_TRACE(way.name);
                const RegionSet other = setOf(asked(part, way), kTolerance * way.scale);
                const Figures two = figuresOf(other, d * way.scale);
                const double slack = 8.0 * kTolerance * (one.length + perimeter(source));
                EXPECT_NEAR(two.area / (way.scale * way.scale), one.area, slack);
                if (one.marginal || two.marginal) continue;
                EXPECT_EQ(two.loops, one.loops);
                EXPECT_NEAR(two.length / way.scale, one.length, 1e-4 * (1.0 + one.length));
                ++compared;
            }
        }
    }
    EXPECT_GT(compared, 200);
}

/// Discs of two radii, one after the other, are a disc of their sum, on either side.
TEST(Laws, OffsetsAddUpAndOpeningAndClosingAreIdempotent) {
    Workspace workspace;
    Outcome once;
    Outcome twice;
    for (const Loops& part : someParts()) {
        const RegionSet source = setOf(part, 0.0);
        const double slack = 100.0 * source.tolerance() * (perimeter(source) + 100.0);
        for (const auto& [a, b] : {std::pair(0.4, 1.3), std::pair(-0.4, -1.3)}) {
            const RegionSet first = offset(source, a).regions;
            EXPECT_NEAR(area(offset(first, b).regions), area(offset(source, a + b).regions), slack);
        }
        for (const auto open : {true, false}) {
            const auto apply = open ? opened : closed;
            ASSERT_TRUE(apply(source, 0.8, workspace, once));
            ASSERT_TRUE(apply(once.regions, 0.8, workspace, twice));
            EXPECT_NEAR(area(once.regions), area(twice.regions), slack);
            // What opening leaves lies within, what closing gives lies about.
            const RegionSet& inner = open ? once.regions : source;
            const RegionSet& outer = open ? source : once.regions;
            const RegionSet beyond = combine(inner, outer, Combination::kDifference).regions;
            EXPECT_LE(area(beyond), slack);
        }
    }
}

TEST(Laws, BooleansDoNotDependOnTheOrderAndPartsAreDisjoint) {
    const std::vector<Loops> parts = someParts();
    for (std::size_t i = 1; i < parts.size(); ++i) {
        const RegionSet a = setOf(parts[i - 1], 0.0);
        const RegionSet b = setOf(parts[i], 0.0);
        const double slack =
            20.0 * std::max(a.tolerance(), b.tolerance()) * (perimeter(a) + perimeter(b));
        const auto areaOf = [&](const RegionSet& p, const RegionSet& q, Combination combination) {
            const Outcome outcome = combine(p, q, combination);
            EXPECT_FALSE(outcome.refusal);
            EXPECT_TRUE(verifyBoolean(p, q, combination, outcome.regions).isSound());
            return area(outcome.regions);
        };
        for (const Combination both :
             {Combination::kUnion, Combination::kIntersection, Combination::kSymmetricDifference})
            EXPECT_NEAR(areaOf(a, b, both), areaOf(b, a, both), slack);
        EXPECT_NEAR(areaOf(a, a, Combination::kUnion), area(a), slack);
        EXPECT_NEAR(areaOf(a, a, Combination::kIntersection), area(a), slack);
        EXPECT_LE(areaOf(a, a, Combination::kSymmetricDifference), slack);
        const RegionSet rest = combine(a, b, Combination::kDifference).regions;
        EXPECT_LE(areaOf(rest, b, Combination::kIntersection), slack);
        EXPECT_NEAR(areaOf(rest, b, Combination::kUnion), areaOf(a, b, Combination::kUnion), slack);
    }
}

}  // namespace
