// SPDX-License-Identifier: MIT
#include "drawing/contours/Nesting.h"

#include <gtest/gtest.h>

#include "tests/support/PathShapes.h"

using namespace gmregion;
using namespace gmdrawing;
using path_shapes::circle;
using path_shapes::polygon;
using path_shapes::rectangle;

TEST(Nesting, CountsWhatLiesRound) {
    const auto depths = nestingDepths({circle({5, 5}, 1), rectangle({0, 0}, {10, 10}),
                                       circle({5, 5}, 2), rectangle({20, 0}, {30, 10}),
                                       polygon({{1, 1}, {2, 2}}, false), circle({25, 5}, 3)});
    EXPECT_EQ(depths[0], 2);
    EXPECT_EQ(depths[1], 0);
    EXPECT_EQ(depths[2], 1);
    EXPECT_EQ(depths[3], 0);
    EXPECT_FALSE(depths[4].has_value());
    EXPECT_EQ(depths[5], 1);
}

TEST(Nesting, GoesByTheArcsAndNotByTheirChords) {
    // Inside the half disc but on the far side of its chord, and in the box but outside the disc.
    const Path disc = circle({0, 0}, 10);
    const auto depths = nestingDepths({disc, circle({0, 9}, 0.5), circle({9, 9}, 0.5)});
    EXPECT_EQ(depths[1], 1);
    EXPECT_EQ(depths[2], 0);
}

TEST(Nesting, TouchingCrossingAndEqualPaths) {
    const Path outer = rectangle({0, 0}, {10, 10});
    const auto touching = nestingDepths({outer, rectangle({0, 0}, {5, 5}), circle({5, 9}, 1)});
    EXPECT_EQ(touching[1], 1);
    EXPECT_EQ(touching[2], 1);
    const auto beside = nestingDepths({outer, rectangle({10, 0}, {12, 10})});
    EXPECT_EQ(beside[1], 0);
    const auto crossing = nestingDepths({outer, rectangle({8, 8}, {12, 12})});
    EXPECT_EQ(crossing[0], 0);
    EXPECT_EQ(crossing[1], 0);
    const auto equal = nestingDepths({outer, reversed(outer)});
    EXPECT_EQ(equal[0], 0);
    EXPECT_EQ(equal[1], 0);
}

TEST(Nesting, OpenPathsAreHeldHoweverOftenTheyGoRound) {
    const std::vector<Vec2> round = {{1, 1}, {9, 1}, {9, 9}, {1, 9},
                                     {1, 2}, {9, 2}, {9, 8}, {2, 8}};
    using Holders = std::vector<std::vector<std::size_t>>;
    EXPECT_EQ(enclosingPaths({rectangle({0, 0}, {10, 10}), polygon(round, false),
                              polygon({{5, 5}, {15, 5}}, false), circle({5, 5}, 1)}),
              Holders({{}, {0}, {}, {0}}));
}
