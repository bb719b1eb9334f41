// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <cmath>
#include <limits>
#include <random>

#include "gmregion/Clearance.h"

#include "region/plane/Carrier.h"
#include "region/plane/ElementHalves.h"
#include "region/plane/Measures.h"
#include "region/plane/Nearest.h"

using namespace gmregion;

namespace {

constexpr int kSamples = 400;

double distanceTo(const Element& e, Vec2 p) {
    double least = HUGE_VAL;
    visitHalves(e, [&](const Element& half) {
        least = std::min(least, distance(nearestOn(half, carrierOf(half), p), p));
    });
    return least;
}

/// Points along an element, by halving.
void appendSamples(const Element& e, int count, std::vector<Vec2>& points) {
    points.push_back(e.sp);
    if (count <= 1) return;
    const double half = e.bulge / (1.0 + std::sqrt(1.0 + e.bulge * e.bulge));
    const Vec2 m = middle(e.sp, e.ep) + 0.5 * e.bulge * rightNormal(e.ep - e.sp);
    appendSamples({e.sp, m, half}, count / 2, points);
    appendSamples({m, e.ep, half}, count / 2, points);
}

Element anyElement() {
    const auto number = [] { return *rc::gen::inRange(-400, 400) * 0.025; };
    Element e{{number(), number()}, {number(), number()}, 0.0};
    if (*rc::gen::inRange(0, 2) == 0) e.bulge = number() * 0.3;
    if (e.sp == e.ep) e.ep.x += 1.0;
    return e;
}

}  // namespace

TEST(ClearanceIndex, IsNeitherLongerNorShorterThanSamplesSay) {
    EXPECT_TRUE(rc::check([] {
        Paths paths;
        for (int i = 0; i < 3; ++i)
            paths.add({anyElement()}, false);
        const Element e = anyElement();
        const std::optional<Clearance> found = ClearanceIndex(paths).of(e, HUGE_VAL);
        RC_ASSERT(found.has_value());
        const Element& other = *paths[found->path].begin();
        RC_ASSERT(distanceTo(e, found->from) < 1e-9);
        RC_ASSERT(distanceTo(other, found->to) < 1e-9);
        RC_ASSERT(std::abs(distance(found->from, found->to) - found->distance) < 1e-9);
        std::vector<Vec2> samples;
        appendSamples(e, kSamples, samples);
        double least = HUGE_VAL;
        for (const Vec2 p : samples) {
            for (std::size_t i = 0; i < paths.size(); ++i)
                least = std::min(least, distanceTo(*paths[i].begin(), p));
        }
        RC_ASSERT(found->distance <= least + 1e-9);
        RC_ASSERT(least <= found->distance + lengthAlong(e) / 256.0);
        // Limits only decide whether there is an answer.
        const ClearanceIndex index(paths);
        RC_ASSERT(!index.of(e, found->distance * 0.999 - 1e-9).has_value());
        const std::optional<Clearance> within = index.of(e, found->distance * 1.001 + 1e-9);
        RC_ASSERT(within.has_value());
        RC_ASSERT(std::abs(within->distance - found->distance) < 1e-9);
    }));
}

TEST(ClearanceIndex, KnownWays) {
    Paths paths;
    paths.add({{{0, 0}, {10, 0}}, {{10, 0}, {10, 10}}}, false);
    paths.add({{{30, 0}, {40, 0}, 1.0}, {{40, 0}, {30, 0}, 1.0}}, true);
    const ClearanceIndex index(paths);
    // Half circles face to face: the way goes through both centres.
    const std::optional<Clearance> arcs = index.of(Element{{26, 5}, {26, -5}, -1.0}, HUGE_VAL);
    ASSERT_TRUE(arcs.has_value());
    EXPECT_NEAR(arcs->distance, 0.0, 1e-12) << "a half circle of radius 5 about (26, 0) crosses";
    const std::optional<Clearance> apart = index.of(Element{{22, 2}, {22, -2}, -1.0}, HUGE_VAL);
    ASSERT_TRUE(apart.has_value());
    EXPECT_NEAR(apart->distance, 6.0, 1e-12);
    EXPECT_EQ(apart->path, 1U);
    const std::optional<Clearance> inside = index.of(Point{12, 4}, HUGE_VAL);
    ASSERT_TRUE(inside.has_value());
    EXPECT_EQ(inside->element, 1U);
    EXPECT_DOUBLE_EQ(inside->distance, 2.0);
    EXPECT_FALSE(index.of(Point{12, 4}, 1.9).has_value());
}

TEST(ClearanceIndex, ParallelsDoNotCrossByRounding) {
    std::mt19937 engine(11);
    std::uniform_int_distribution<int> number(-20, 20);
    for (int round = 0; round < 2000; ++round) {
        const Vec2 from{1.0 * number(engine), 1.0 * number(engine)};
        const Vec2 to{1.0 * number(engine), 1.0 * number(engine)};
        if (from == to) continue;
        Paths paths;
        paths.add({{from, to}}, false);
        const Vec2 by = 0.5 * rightNormal(unit(to - from));
        const Vec2 along = 0.1 * (to - from);
        const std::optional<Clearance> found =
            ClearanceIndex(paths).of(Element{from + by + along, to + by - along}, HUGE_VAL);
        ASSERT_TRUE(found.has_value());
        ASSERT_NEAR(found->distance, 0.5, 1e-12) << from.x << " " << from.y;
    }
}

TEST(ClearanceIndex, NumbersThatAreNoneAreNoneAndNothingIsNear) {
    constexpr double kNan = std::numeric_limits<double>::quiet_NaN();
    EXPECT_FALSE(ClearanceIndex(Paths()).of(Point{0, 0}, HUGE_VAL).has_value());
    Paths paths;
    paths.add({{{0, kNan}, {10, 0}}, {{10, 0}, {10, 10}, kNan}, {{5, 5}, {5, 5}}}, false);
    paths.add({{{7, 7}, {8, 8}}}, false);
    const ClearanceIndex index(paths);
    EXPECT_FALSE(index.of(Point{kNan, 0}, HUGE_VAL).has_value());
    EXPECT_FALSE(index.of(Element{{0, 0}, {1, 1}, HUGE_VAL}, HUGE_VAL).has_value());
    EXPECT_FALSE(index.of(Point{0, 0}, kNan).has_value());
    EXPECT_EQ(index.of(Point{10, 0}, HUGE_VAL)->path, 1U);
}
