// SPDX-License-Identifier: MIT
#include "region/offset/OffsetJob.h"

#include <gtest/gtest.h>

#include "region/offset/CheckedOffset.h"
#include "tests/support/PathShapes.h"

using namespace gmregion;
using path_shapes::circle;
using path_shapes::kPi;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

using Distances = std::vector<double>;

const ProgressCall kNoProgress = [](std::size_t, std::size_t) {};

/// Largest difference between the offset's distance from its source and d, sampled.
double deviation(const Path& offset, const Path& source, double d) {
    double worst = 0.0;
    for (const Element& e : offset.elements) {
        worst = std::max(worst, std::abs(distance(source, e.sp) - std::abs(d)));
        worst = std::max(worst, std::abs(distance(source, halvingPoint(e)) - std::abs(d)));
    }
    return worst;
}

}  // namespace

TEST(OffsetJob, SideByDepthAndSense) {
    const Path ccw = rectangle({0, 0}, {10, 10});
    const Path cw = reversed(ccw);
    EXPECT_EQ(signedDistances(ccw, 0, Side::kWaste, 2), Distances({2}));
    EXPECT_EQ(signedDistances(cw, 0, Side::kWaste, 2), Distances({-2}));
    EXPECT_EQ(signedDistances(ccw, 1, Side::kWaste, 2), Distances({-2}));
    EXPECT_EQ(signedDistances(cw, 3, Side::kWaste, 2), Distances({2}));
    EXPECT_EQ(signedDistances(ccw, 1, Side::kOutside, 2), Distances({2}));
    EXPECT_EQ(signedDistances(cw, 0, Side::kInside, 2), Distances({2}));
    EXPECT_EQ(signedDistances(cw, 0, Side::kRight, 2), Distances({2}));
    EXPECT_EQ(signedDistances(cw, 0, Side::kLeft, 2), Distances({-2}));
    EXPECT_EQ(signedDistances(ccw, 0, Side::kBoth, 2), Distances({2, -2}));
    const Path open = polygon({{0, 0}, {5, 0}}, false);
    EXPECT_EQ(signedDistances(open, 0, Side::kWaste, 2), Distances({2, -2}));
    EXPECT_EQ(signedDistances(open, 0, Side::kInside, 2), Distances({2, -2}));
    EXPECT_EQ(signedDistances(open, 0, Side::kLeft, 2), Distances({-2}));
    EXPECT_EQ(signedDistances(open, 0, Side::kWaste, 0).size(), 1U);
}

TEST(OffsetByKernel, OffsetsKeepTheirDistance) {
    Path slot{{{{0, 0}, {20, 0}},
               {{20, 0}, {20, 8}, 1.0},
               {{20, 8}, {12, 8}},
               {{12, 8}, {8, 8}, -0.6},
               {{8, 8}, {0, 8}},
               {{0, 8}, {0, 0}, 1.0}},
              true,
              "0"};
    std::size_t checked = 0;
    for (const Path& source : {slot, reversed(slot)}) {
        for (const double d : {0.5, -0.5, 2.0, -2.0, 6.0}) {
            for (const Path& result : offsetByKernel(source, d).results) {
                EXPECT_TRUE(result.closed);
                EXPECT_LT(deviation(result, source, d), 2e-4) << d;
                ++checked;
            }
        }
    }
    EXPECT_GE(checked, 9U);
}

TEST(OffsetByKernel, TinyElementsDoNotTearTheResult) {
    // A hook of 4e-4 against the direction of travel, as rounding in a drawing leaves it.
    const Path hooked = polygon({{0, 0}, {10, 0}, {10, 10}, {5, 11}, {5.0004, 11}, {0, 10}});
    const KernelOffset offset = offsetChecked(hooked, 1.0).offset;
    ASSERT_EQ(offset.results.size(), 1U);
    EXPECT_TRUE(offset.results[0].closed);
    EXPECT_LT(deviation(offset.results[0], hooked, 1.0), 1e-3);
}
