// SPDX-License-Identifier: MIT
#include "part/regions/Nesting.h"

#include <gtest/gtest.h>

#include "tests/support/PathShapes.h"

using namespace gmpart;
using namespace gmregion;
using path_shapes::circle;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

std::vector<int> depthsOf(const std::vector<Path>& contours) {
    const std::vector<std::size_t> depths = nestingOf(contours).depths;
    return {depths.begin(), depths.end()};
}

}  // namespace

TEST(Nesting, CountsWhatLiesRound) {
    const auto depths = depthsOf({circle({5, 5}, 1), rectangle({0, 0}, {10, 10}), circle({5, 5}, 2),
                                  rectangle({20, 0}, {30, 10}), polygon({{1, 1}, {2, 2}}, false),
                                  circle({25, 5}, 3)});
    EXPECT_EQ(depths[0], 2);
    EXPECT_EQ(depths[1], 0);
    EXPECT_EQ(depths[2], 1);
    EXPECT_EQ(depths[3], 0);
    EXPECT_EQ(depths[4], 1);
    EXPECT_EQ(depths[5], 1);
}

TEST(Nesting, GoesByTheArcsAndNotByTheirChords) {
    // Inside the half disc but on the far side of its chord, and in the box but outside the disc.
    const Path disc = circle({0, 0}, 10);
    const auto depths = depthsOf({disc, circle({0, 9}, 0.5), circle({9, 9}, 0.5)});
    EXPECT_EQ(depths[1], 1);
    EXPECT_EQ(depths[2], 0);
}

TEST(Nesting, TouchingCrossingAndEqualPaths) {
    const Path outer = rectangle({0, 0}, {10, 10});
    const auto touching = depthsOf({outer, rectangle({0, 0}, {5, 5}), circle({5, 9}, 1)});
    EXPECT_EQ(touching[1], 1);
    EXPECT_EQ(touching[2], 1);
    const auto beside = depthsOf({outer, rectangle({10, 0}, {12, 10})});
    EXPECT_EQ(beside[1], 0);
    const auto crossing = depthsOf({outer, rectangle({8, 8}, {12, 12})});
    EXPECT_EQ(crossing[0], 0);
    EXPECT_EQ(crossing[1], 0);
    const auto equal = depthsOf({outer, reversed(outer)});
    EXPECT_EQ(equal[0], 0);
    EXPECT_EQ(equal[1], 0);
}

TEST(Nesting, OpenPathsAreHeldHoweverOftenTheyGoRound) {
    const std::vector<Vec2> round = {{1, 1}, {9, 1}, {9, 9}, {1, 9},
                                     {1, 2}, {9, 2}, {9, 8}, {2, 8}};
    using Holders = std::vector<std::vector<std::size_t>>;
    EXPECT_EQ(nestingOf({rectangle({0, 0}, {10, 10}), polygon(round, false),
                         polygon({{5, 5}, {15, 5}}, false), circle({5, 5}, 1),
                         rectangle({-1, -1}, {11, 11})})
                  .holders,
              Holders({{4}, {0}, {}, {0}, {}}));
}

TEST(Nesting, FindsAToothThatPokesOutBetweenCorners) {
    // All corners of the inner one are inside; a notch of the outer cuts into one of its sides.
    const Path outer =
        polygon({{0, 0}, {10, 0}, {10, 10}, {5.02, 10}, {5, 1.5}, {4.98, 10}, {0, 10}});
    EXPECT_EQ(depthsOf({outer, rectangle({1, 1}, {9, 2})})[1], 0);
    EXPECT_EQ(depthsOf({outer, rectangle({1, 1}, {9, 1.4})})[1], 1);
}

TEST(Nesting, HoldersThatCrossEachOtherAllCount) {
    const std::vector<Path> contours = {rectangle({0, 0}, {10, 10}), rectangle({4, 0}, {14, 10}),
                                        circle({7, 5}, 1), rectangle({-1, -1}, {15, 11})};
    const Nesting nesting = nestingOf(contours);
    EXPECT_EQ(nesting.depths, (std::vector<std::size_t>{1, 1, 3, 0}));
    EXPECT_EQ(nesting.holders[2], (std::vector<std::size_t>{0, 1}));
}
