// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <random>

#include "gmregion/Boolean.h"
#include "gmregion/CleanUp.h"
#include "tests/support/RegionShapes.h"

namespace {

using namespace gmregion;
using namespace gmregion::shapes;

RegionSet cleaned(const Paths& paths, FillRule rule = FillRule::kNonZero, double tolerance = 0.0) {
    const Outcome outcome = cleanUp(paths, {rule, tolerance});
    EXPECT_EQ(outcome.refusal.reason, Reason::kNone)
        << textOf(outcome.refusal.reason) << " at " << outcome.refusal.at.x << " "
        << outcome.refusal.at.y;
    return outcome.regions;
}

TEST(CleanUp, AgreesWithWindingsAtRandomPoints) {
    std::mt19937 engine(7);
    int refused = 0;
    for (int round = 0; round < 3000; ++round) {
        Paths paths;
        const int loops = 1 + int(engine() % 4);
        for (int i = 0; i < loops; ++i)
            paths.add(tangle(engine, 3 + engine() % 12, 10.0), true);
        for (const FillRule rule : {FillRule::kNonZero, FillRule::kEvenOdd, FillRule::kPositive}) {
            const Outcome outcome = cleanUp(paths, {rule, 0.0});
            if (outcome.refusal) {
                ++refused;
                continue;
            }
            for (int k = 0; k < 20; ++k) {
                const Vec2 p{uniform(engine, -2, 12), uniform(engine, -2, 12)};
                const int w = winding(paths, p);
                const bool in = rule == FillRule::kNonZero   ? w != 0
                                : rule == FillRule::kEvenOdd ? w % 2 != 0
                                                             : w > 0;
                ASSERT_EQ(winding(outcome.regions, p), in ? 1 : 0)
                    << round << " " << p.x << " " << p.y;
            }
        }
    }
    EXPECT_EQ(refused, 0);
}

TEST(Boolean, AreasAddUp) {
    std::mt19937 engine(11);
    for (int round = 0; round < 2000; ++round) {
        Paths pa, pb;
        pa.add(tangle(engine, 3 + engine() % 10, 10.0), true);
        pb.add(tangle(engine, 3 + engine() % 10, 10.0), true);
        const RegionSet a = cleaned(pa), b = cleaned(pb);
        const auto get = [&](Combination c) {
            const Outcome o = combine(a, b, c);
            EXPECT_EQ(o.refusal.reason, Reason::kNone) << round << textOf(o.refusal.reason);
            return area(o.regions);
        };
        const double u = get(Combination::kUnion), i = get(Combination::kIntersection),
                     d = get(Combination::kDifference), x = get(Combination::kSymmetricDifference);
        ASSERT_NEAR(u + i, area(a) + area(b), 1e-6) << round;
        ASSERT_NEAR(d + i, area(a), 1e-6) << round;
        ASSERT_NEAR(x, u - i, 1e-6) << round;
    }
}

}  // namespace
