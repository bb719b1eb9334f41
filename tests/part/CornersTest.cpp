// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>

#include "part/corners/CornerJob.h"
#include "part/model/Area.h"
#include "tests/support/PathShapes.h"

using namespace gmpart;
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
