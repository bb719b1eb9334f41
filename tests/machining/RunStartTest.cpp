// SPDX-License-Identifier: MIT
#include "machining/runs/RunStart.h"

#include <gtest/gtest.h>

#include "tests/support/PathShapes.h"

using namespace gmmachining;
using namespace gmregion;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

/// Results of one segment each, by its start and its origin.
KernelOffset offsetOf(const std::vector<std::pair<Vec2, std::size_t>>& starts) {
    KernelOffset offset;
    for (const auto& [start, origin] : starts) {
        offset.results.push_back(polygon({start, start + Vec2{1, 0}}, false));
        offset.origins.push_back({origin});
    }
    return offset;
}

const Path kAlongX = polygon({{0, 0}, {10, 0}, {10, 10}}, false);

}  // namespace

TEST(RunStart, IsNearestToTheStartMovedToTheSideOfTheOffset) {
    const KernelOffset offset = offsetOf({{{0, 2}, 0}, {{2, -1}, 0}, {{-4, 0}, 0}});
    EXPECT_EQ(runStart(kAlongX, 1.0, offset), (Vec2{2, -1})) << "right of travel";
    EXPECT_EQ(runStart(kAlongX, -1.0, offset), (Vec2{0, 2})) << "left of travel";
}

TEST(RunStart, LiesOnWhatComesFromTheEarliestElement) {
    const KernelOffset offset = offsetOf({{{0, -1}, 2}, {{50, 50}, 1}, {{40, 40}, 1}});
    EXPECT_EQ(runStart(kAlongX, 1.0, offset), (Vec2{40, 40}));
    EXPECT_EQ(runStart(kAlongX, 1.0, {}), std::nullopt);
}

TEST(RunStart, ShortElementsHaveNoSayInTheDirection) {
    Path path = kAlongX;
    path.elements.insert(path.elements.begin(), Element{{0, 0}, {0, 0.0002}});
    path.elements[1].sp = {0, 0.0002};
    const KernelOffset offset = offsetOf({{{0, -1}, 1}, {{1, 0}, 1}, {{-1, 0}, 1}});
    EXPECT_EQ(runStart(path, 1.0, offset), (Vec2{0, -1}));
}

TEST(RunStart, OfARectangleIsItsCornerMovedInwards) {
    const Path source = rectangle({0, 0}, {10, 6});
    const auto start = runStart(source, -1.0, offsetByKernel(source, -1.0));
    ASSERT_TRUE(start.has_value());
    EXPECT_NEAR(distance(*start, {1, 1}), 0.0, 1e-9);
}
