// SPDX-License-Identifier: MIT
#include "gmregion/Parallels.h"

#include <gtest/gtest.h>

#include <cmath>
#include <random>

#include "region/plane/Nearest.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

Paths open(const Elements& elements) {
    Paths paths;
    paths.add(elements, false, 5);
    return paths;
}

double lengthOf(const Parallels& parallels) {
    double sum = 0.0;
    for (const Element& e : parallels.elements)
        sum += lengthAlong(e);
    return sum;
}

/// The nearest element of a path of half turns at the most, and how far off it is.
std::pair<std::size_t, double> nearest(const Elements& path, Vec2 p) {
    std::pair<std::size_t, double> best{0, HUGE_VAL};
    for (std::size_t i = 0; i < path.size(); ++i) {
        const Vec2 away = nearestOn(path[i], carrierOf(path[i]), p) - p;
        const double distance = std::sqrt(dot(away, away));
        if (distance < best.second) best = {i, distance};
    }
    return best;
}

Elements reversed(const Elements& path) {
    Elements back;
    for (auto e = path.rbegin(); e != path.rend(); ++e)
        back.push_back({e->ep, e->sp, -e->bulge});
    return back;
}

TEST(Parallels, LieOnTheSideAskedForAndInThePathsDirection) {
    const Paths angle = open({{{0, 0}, {10, 0}, 0}, {{10, 0}, {10, 10}, 0}});
    const Parallels right = makeParallels(angle, 1);
    ASSERT_EQ(right.parts.size(), 1U);
    ASSERT_EQ(right.elements.size(), 3U);
    EXPECT_EQ(right.elements.front().sp, (Vec2{0, -1}));
    EXPECT_EQ(right.elements.back().ep, (Vec2{11, 10}));
    EXPECT_EQ(right.origins[1].kind, OriginKind::kCorner);
    EXPECT_EQ(right.origins[2].element, 1U);
    EXPECT_EQ(right.origins[2].path, 5);
    const Parallels left = makeParallels(angle, -1);
    ASSERT_EQ(left.elements.size(), 2U);
    EXPECT_EQ(left.elements[0].sp, (Vec2{0, 1}));
    EXPECT_EQ(left.elements[0].ep, left.elements[1].sp);
    EXPECT_EQ(left.elements[1].ep, (Vec2{9, 10}));
    OffsetOptions miter;
    miter.join = Join::kMiter;
    const Parallels sharp = makeParallels(angle, 1, miter);
    EXPECT_NEAR(lengthOf(sharp), 22.0, 1e-7);
    EXPECT_EQ(sharp.parts.size(), 1U);
}

TEST(Parallels, AreClosedWithinALoopOfThePathAndBesideClosedPaths) {
    const Paths loop =
        open({{{0, 0}, {20, 0}, 0}, {{20, 0}, {10, -10}, -1}, {{10, -10}, {10, 5}, 0}});
    const Parallels inner = makeParallels(loop, 1);
    ASSERT_EQ(inner.parts.size(), 3U);
    EXPECT_FALSE(inner.parts[0].closed);
    EXPECT_TRUE(inner.parts[1].closed);
    EXPECT_FALSE(inner.parts[2].closed);
    EXPECT_EQ(inner.elements.back().ep, (Vec2{11, 5}));
    Paths ring;
    ring.add(circle({3, 4}, 2), true);
    for (const double distance : {0.5, -0.5}) {
        const Parallels beside = makeParallels(ring, distance);
        ASSERT_EQ(beside.parts.size(), 1U);
        EXPECT_TRUE(beside.parts[0].closed);
        EXPECT_NEAR(lengthOf(beside), 2 * M_PI * (2 + distance), 1e-8);
    }
    EXPECT_TRUE(makeParallels(ring, -2.5).parts.empty());
}

/// Every point has the distance, and lies on the side asked for; both sides, and no more than the
/// half circles about the ends, bound the thickened path; the way back gives the same.
TEST(Parallels, OfRandomPathsBoundTheirThickening) {
    std::mt19937 engine(3);
    Workspace workspace;
    for (int i = 0; i < 300; ++i) {
        Elements path = tangle(engine, 4 + engine() % 8, 10);
        path.pop_back();
        for (Element& e : path)
            e.bulge = std::min(1.0, std::max(-1.0, e.bulge));
        const double d = uniform(engine, 0.05, 3.0);
        SCOPED_TRACE(i);
        double sides = 0.0;
        for (const double distance : {d, -d}) {
            const Parallels found = makeParallels(open(path), distance);
            ASSERT_FALSE(found.refusal);
            sides += lengthOf(found);
            for (const ParallelPart& part : found.parts) {
                for (std::uint32_t k = part.first; k + 1 < part.last; ++k)
                    EXPECT_EQ(found.elements[k].ep, found.elements[k + 1].sp);
            }
            for (std::size_t k = 0; k < found.elements.size(); ++k) {
                const Vec2 p = middleOf(found.elements[k]);
                const auto [number, away] = nearest(path, p);
                EXPECT_NEAR(away, d, 1e-6);
                if (found.origins[k].kind == OriginKind::kCorner) continue;
                EXPECT_LT(signedDistance(carrierOf(path[number]), p) * distance, 1e-6);
            }
            const Parallels back = makeParallels(open(reversed(path)), -distance);
            if (!found.marginal.empty()) continue;
            EXPECT_NEAR(lengthOf(back), lengthOf(found), 1e-5);
        }
        Outcome thick;
        ASSERT_TRUE(thicken(open(path), d, 0, {}, workspace, thick));
        EXPECT_LE(sides, perimeter(thick.regions) + 1e-5);
        EXPECT_GE(sides, perimeter(thick.regions) - 2 * M_PI * d - 1e-5);
    }
}

TEST(Parallels, RefuseWhatHasNone) {
    const Paths line = open({{{0, 0}, {10, 0}, 0}});
    EXPECT_EQ(makeParallels(line, 0).refusal.reason, Reason::kTolerance);
    EXPECT_EQ(makeParallels(line, std::nan("")).refusal.reason, Reason::kNotFinite);
    EXPECT_EQ(makeParallels(line, 1e300).refusal.reason, Reason::kOutOfRange);
    EXPECT_TRUE(makeParallels(Paths{}, 1).parts.empty());
}

}  // namespace
