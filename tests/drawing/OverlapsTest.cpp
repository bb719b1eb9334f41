// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>

#include "drawing/contours/ChainBuilder.h"
#include "drawing/contours/Overlaps.h"
#include "part/model/Area.h"
#include "tests/support/PathShapes.h"

using namespace gmpart;
using namespace gmdrawing;
using gmregion::Element;
using gmregion::Vec2;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

constexpr double kJoin = 1e-3;

Path line(Vec2 from, Vec2 to) {
    return polygon({from, to}, false);
}

Path arc(Vec2 from, Vec2 to, double bulge) {
    return {{Element{from, to, bulge}}, false, ""};
}

double totalLength(const std::vector<Path>& paths) {
    double sum = 0.0;
    for (const Path& path : paths)
        sum += length(path);
    return sum;
}

}  // namespace

TEST(Overlaps, WhatCoversTheSamePlaceIsLeftOnce) {
    std::vector<Path> along = {line({0, 0}, {6, 0}), line({10, 0}, {4, 0}), line({5, 0}, {5.5, 0})};
    EXPECT_EQ(trimOverlaps(along, kJoin), 2U);
    EXPECT_NEAR(totalLength(along), 10.0, 1e-9);
    // Arcs of one circle, the longer way round and the other way, that share two ranges.
    std::vector<Path> arcs = {arc({0, -5}, {-5, 0}, std::tan(path_shapes::kPi * 3.0 / 8.0)),
                              arc({5, 0}, {0, -5}, -std::tan(path_shapes::kPi / 8.0)),
                              arc({0, -5}, {0, 5}, -1.0)};
    EXPECT_EQ(trimOverlaps(arcs, kJoin), 2U);
    EXPECT_NEAR(totalLength(arcs), 10.0 * path_shapes::kPi, 1e-6);
}

TEST(Overlaps, WhatOnlyTouchesOrCrossesStays) {
    std::vector<Path> paths = {line({0, 0}, {10, 0}), line({5, -5}, {5, 5}), line({10, 0}, {20, 0}),
                               arc({0, 0}, {10, 0}, 0.5), line({0, 0.01}, {10, 0.01})};
    const std::vector<Path> before = paths;
    EXPECT_EQ(trimOverlaps(paths, kJoin), 0U);
    EXPECT_EQ(paths.size(), before.size());
    // A slant that comes near only over a length like the tolerance.
    std::vector<Path> slanted = {line({0, 0}, {10, 0}), line({9.9995, 0}, {20, 5})};
    EXPECT_EQ(trimOverlaps(slanted, kJoin), 0U);
}

TEST(Overlaps, ClosedPathsStayAndOthersLoseWhatLiesOnThem) {
    std::vector<Path> paths = {line({2, 0}, {15, 0}), rectangle({0, 0}, {10, 10}),
                               rectangle({10, 2}, {20, 8})};
    EXPECT_EQ(trimOverlaps(paths, kJoin), 1U);
    ASSERT_EQ(paths.size(), 3U);
    EXPECT_NEAR(distance(paths[0].elements[0].sp, Vec2{10, 0}), 0.0, 1e-9);
    EXPECT_TRUE(paths[1].closed && paths[2].closed);
}

TEST(Overlaps, ChainsCloseOnceTheyAreGone) {
    // The lower side in two lines that overlap, one of them a little off.
    const std::vector<Path> drawn = {line({0, 0}, {6, 0}), line({4, 0.0004}, {10, 0}),
                                     line({10, 0}, {10, 10}), line({10, 10}, {0, 10}),
                                     line({0, 10}, {0, 0.0006})};
    const ChainResult mended = buildChains(drawn, kJoin);
    ASSERT_EQ(mended.contours.size(), 1U);
    EXPECT_TRUE(mended.contours.front().closed);
    EXPECT_NEAR(signedArea(mended.contours.front()), 100.0, 0.01);
    EXPECT_EQ(mended.mended.overlaps, 1U);
    EXPECT_GE(mended.mended.gaps, 1U);
    EXPECT_NEAR(mended.mended.largestGap, 0.0006, 1e-4);
}
