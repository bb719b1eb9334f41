// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>

#include "region/boolean/MeltJob.h"
#include "region/corners/CornerJob.h"
#include "region/model/Area.h"
#include "tests/support/PathShapes.h"

using namespace gmregion;
using path_shapes::circle;
using path_shapes::kPi;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

const Path kAngle = polygon({{0, 0}, {10, 0}, {10, 4}, {4, 4}, {4, 10}, {0, 10}});

CornerResult broken(const Path& path, const CornerRequest& request) {
    return breakCorners({path}, request).front();
}

/// The area that a corner of 90 degrees loses.
double cutOff(CornerKind kind, double value) {
    switch (kind) {
        case CornerKind::kRounding:
            return (1.0 - kPi / 4.0) * value * value;
        case CornerKind::kChamferDistance:
            return value * value / 2.0;
        case CornerKind::kChamferLength:
            break;
    }
    return value * value / 4.0;
}

}  // namespace

TEST(Corners, ChosenOnesLoseOrGainWhatTheirShapeTells) {
    struct {
        CornerChoice choice;
        int convex, concave;
    } const choices[] = {
        {CornerChoice::kAll, 5, 1}, {CornerChoice::kConvex, 5, 0}, {CornerChoice::kConcave, 0, 1}};
    for (const Path& path : {kAngle, reversed(kAngle)}) {
        for (const CornerKind kind :
             {CornerKind::kRounding, CornerKind::kChamferDistance, CornerKind::kChamferLength}) {
            for (const auto& c : choices) {
                const CornerResult result = broken(path, {kind, 1.5, c.choice});
                EXPECT_EQ(result.done, static_cast<std::size_t>(c.convex + c.concave));
                EXPECT_EQ(result.notDone, 0U);
                EXPECT_TRUE(result.path.closed);
                const double lost = (c.convex - c.concave) * cutOff(kind, 1.5);
                EXPECT_NEAR(std::abs(signedArea(result.path)), 64.0 - lost, 1e-6);
                EXPECT_EQ(sense(result.path), sense(path));
            }
        }
    }
}

TEST(Corners, WithoutRoomAreCountedAndStay) {
    const CornerResult none = broken(kAngle, {CornerKind::kChamferDistance, 10.5});
    EXPECT_EQ(none.done, 0U);
    EXPECT_EQ(none.notDone, 6U);
    EXPECT_EQ(none.path.elements.size(), kAngle.elements.size());
    EXPECT_EQ(broken(circle({3, 3}, 2), {CornerKind::kRounding, 1}).done, 0U);
    // Open paths have no inside: every corner counts. The bend of half a degree is none,
    // unless it is asked for.
    const Path open = polygon({{0, 0}, {10, 0}, {20, 0.08}, {20, 10}, {30, 10}}, false);
    const CornerResult some = broken(open, {CornerKind::kRounding, 1, CornerChoice::kConvex});
    EXPECT_EQ(some.done, 2U);
    EXPECT_FALSE(some.path.closed);
    const CornerRequest slight{CornerKind::kChamferDistance, 1, CornerChoice::kAll, 0.005};
    EXPECT_EQ(broken(open, slight).done, 3U);
}

TEST(Corners, TouchNeitherTheirContourNorAnother) {
    // A spike comes near to the inner corner from within; a small hole lies in an outer corner,
    // another one would be cut by the rounding.
    const Path spiked =
        polygon({{0, 0}, {30, 0}, {30, 5}, {5, 5}, {5, 15}, {5.8, 5.9}, {8, 15}, {5, 30}, {0, 30}});
    const CornerResult result = broken(spiked, {CornerKind::kRounding, 4, CornerChoice::kConcave});
    EXPECT_EQ(result.done, 0U);
    // The tip of the notch lies in the corner; its sides are the elements next but one.
    const Path notched = polygon({{20, 0}, {0, 0}, {0, 20}, {1.5, 1.5}});
    for (const Path& path : {notched, reversed(notched)})
        EXPECT_EQ(broken(path, {CornerKind::kRounding, 8, CornerChoice::kConvex}).done, 0U);
    const Path plate = rectangle({0, 0}, {30, 20});
    const std::vector<CornerResult> results = breakCorners(
        {plate, circle({0.6, 0.6}, 0.3), circle({28.5, 18.5}, 0.5)}, {CornerKind::kRounding, 5});
    EXPECT_EQ(results[0].done, 2U);
    EXPECT_EQ(results[0].notDone, 2U);
}

TEST(Melt, SortsLoopsOfEveryPairOfContours) {
    // A bar across a U: two common parts, and the bar closes in a hole.
    const Path u = polygon({{0, 0}, {12, 0}, {12, 10}, {9, 10}, {9, 3}, {3, 3}, {3, 10}, {0, 10}});
    const Path bar = reversed(rectangle({-2, 6}, {15, 8}));
    const std::vector<MeltedPair> pairs = meltContours({u, circle({6, 7}, 0.5)}, {bar});
    ASSERT_EQ(pairs.size(), 2U);
    EXPECT_EQ(pairs[0].outcome, MeltOutcome::kLoops);
    double common = 0.0;
    double outlines = 0.0;
    for (const MeltLoop& loop : pairs[0].loops) {
        EXPECT_TRUE(loop.path.closed);
        (loop.kind == LoopKind::kCommon ? common : outlines) += signedArea(loop.path);
    }
    EXPECT_EQ(pairs[0].loops.size(), 4U);
    EXPECT_NEAR(common, 12.0, 1e-9);
    EXPECT_NEAR(outlines, 78.0 + 34.0 - 12.0, 1e-9);
    EXPECT_EQ(pairs[1].outcome, MeltOutcome::kFirstInside);
    EXPECT_TRUE(pairs[1].loops.empty());
}

TEST(Melt, AnswersPairsWithoutLoops) {
    const Path square = rectangle({0, 0}, {10, 10});
    const Path cap = polygon({{9, 12}, {12, 9}, {12, 12}});
    EXPECT_TRUE(meltContours({square}, {rectangle({11, 0}, {20, 10})}).empty());
    EXPECT_EQ(meltContours({square}, {cap}).at(0).outcome, MeltOutcome::kApart);
    EXPECT_EQ(meltContours({square}, {circle({5, 5}, 2)}).at(0).outcome,
              MeltOutcome::kSecondInside);
    EXPECT_EQ(meltContours({circle({5, 5}, 2)}, {circle({5, 5}, 2)}).at(0).outcome,
              MeltOutcome::kSame);
    // A corner on a side is no crossing; what the kernel makes of that does not pass for loops.
    const Path diamond = polygon({{5, 0}, {10, 5}, {5, 10}, {0, 5}});
    const Path wedge = polygon({{10, 5}, {4, 7}, {4, 3}});
    for (const Path& touching : {diamond, wedge, square})
        EXPECT_NE(meltContours({square}, {touching}).at(0).outcome, MeltOutcome::kLoops);
    // Sides lie on each other in part: the common part comes twice, as only the areas tell.
    const Path slanted = polygon({{0, 3}, {1, 1}, {3, 1}, {1, 3}});
    const Path flush = polygon({{0, 3}, {2, 1}, {3, 1}, {3, 3}});
    EXPECT_EQ(meltContours({slanted}, {flush}).at(0).outcome, MeltOutcome::kFailed);
    EXPECT_TRUE(meltContours({square}, {polygon({{1, 1}, {5, 5}, {30, 4}}, false)}).empty());
}
