// SPDX-License-Identifier: MIT
#include "drawing/contours/ChainBuilder.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include "drawing/InputError.h"
#include "part/model/Area.h"
#include "tests/support/PathShapes.h"

using namespace gmpart;
using namespace gmregion;
using namespace gmdrawing;
using path_shapes::circle;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

constexpr double kTolerance = 1e-3;

Path loose(Element e) {
    return {{e}, false, "0"};
}

std::vector<Path> looseElements(const Path& path) {
    std::vector<Path> paths;
    for (const Element& e : path.elements)
        paths.push_back(loose(e));
    return paths;
}

/// A slot with a notch, and an open zigzag that ends in an arc.
std::vector<Path> slotAndZigzag() {
    const Path slot{{{{0, 0}, {10, 0}},
                     {{10, 0}, {10, 4}, 1.0},
                     {{10, 4}, {6, 4}},
                     {{6, 4}, {5, 3}},
                     {{5, 3}, {4, 4}},
                     {{4, 4}, {0, 4}},
                     {{0, 4}, {0, 0}, 1.0}},
                    true,
                    "0"};
    const Path zigzag{
        {{{30, 0}, {31, 2}}, {{31, 2}, {32, 0}}, {{32, 0}, {33, 1}, -0.4}}, false, "0"};
    std::vector<Path> paths = looseElements(slot);
    for (const Path& path : looseElements(zigzag))
        paths.push_back(path);
    return paths;
}

bool isConnected(const Path& path) {
    for (std::size_t i = 0; i + 1 < path.elements.size(); ++i) {
        if (path.elements[i].ep != path.elements[i + 1].sp) return false;
    }
    return !path.closed || path.elements.back().ep == path.elements.front().sp;
}

bool isSameCourse(const Path& a, const Path& b) {
    if (a.closed != b.closed || a.elements.size() != b.elements.size()) return false;
    for (std::size_t i = 0; i < a.elements.size(); ++i) {
        if (distance(a.elements[i].sp, b.elements[i].sp) > 1e-9) return false;
        if (std::abs(a.elements[i].bulge - b.elements[i].bulge) > 1e-9) return false;
    }
    return true;
}

}  // namespace

RC_GTEST_PROP(ChainLaws, OrderAndSenseOfThePiecesDoNotMatter, ()) {
    std::vector<Path> pieces = slotAndZigzag();
    const std::vector<Path> expected = buildChains(pieces, kTolerance).contours;
    RC_ASSERT(expected.size() == 2U);
    const std::size_t count = pieces.size();
    for (std::size_t i = count - 1; i > 0; --i) {
        std::swap(pieces[i], pieces[*rc::gen::inRange<std::size_t>(0, i + 1)]);
    }
    for (Path& piece : pieces) {
        if (*rc::gen::arbitrary<bool>()) piece = reversed(piece);
    }
    std::vector<Path> found = buildChains(pieces, kTolerance).contours;
    RC_ASSERT(found.size() == 2U);
    if (!found[0].closed) std::swap(found[0], found[1]);
    RC_ASSERT(isSameCourse(found[0], expected[0]));
    RC_ASSERT(isSameCourse(found[1], expected[1]));
    RC_ASSERT(sense(found[0]) == Sense::kCounterClockwise);
}

TEST(ChainBuilder, EndsWithinTheToleranceAreMadeToMeet) {
    const double gap = 0.9 * kTolerance;
    const std::vector<Path> pieces = {loose({{0, 0}, {10, gap}}), loose({{10, 0}, {0, gap}, 1.0})};
    const auto chains = buildChains(pieces, kTolerance).contours;
    ASSERT_EQ(chains.size(), 1U);
    EXPECT_TRUE(chains[0].closed);
    EXPECT_TRUE(isConnected(chains[0]));
    EXPECT_NEAR(std::abs(signedArea(chains[0])), 12.5 * path_shapes::kPi, 0.02);
    EXPECT_EQ(buildChains(pieces, 0.5 * kTolerance).contours.size(), 2U);
}

TEST(ChainBuilder, AJunctionIsPassedStraightest) {
    // A bar across, met by a stem: the bar goes on, the stem stays free.
    const auto tee =
        buildChains({loose({{0, 0}, {0, 5}}), loose({{-5, 5}, {0, 5}}), loose({{5, 5.5}, {0, 5}})},
                    kTolerance)
            .contours;
    ASSERT_EQ(tee.size(), 2U);
    EXPECT_EQ(tee[0].elements.size(), 1U);
    EXPECT_EQ(tee[1].elements.size(), 2U);
    // Tangents decide, not chords: the arc leaves the bar smoothly.
    const auto fork = buildChains({loose({{-5, 0}, {0, 0}}), loose({{0, 0}, {5, -1}}),
                                   loose({{0, 0}, {3, 3}, std::tan(path_shapes::kPi / 8)})},
                                  kTolerance)
                          .contours;
    ASSERT_EQ(fork.size(), 2U);
    EXPECT_EQ(arcCount(fork[0]), 1U);
    // Two closed figures that touch in a point stay figures that pass the point straight.
    std::vector<Path> crossing;
    for (const Vec2 v : {Vec2{1, 1}, Vec2{-1, 1}, Vec2{-1, -1}, Vec2{1, -1}}) {
        crossing.push_back(loose({{0, 0}, v}));
    }
    for (const Path& chain : buildChains(crossing, kTolerance).contours) {
        EXPECT_NEAR(distance(chain.elements.front().sp, chain.elements.back().ep), 2 * std::sqrt(2),
                    1e-9);
    }
}

TEST(ChainBuilder, DuplicatesAreDroppedAndCounted) {
    Path turned{{}, true, "0"};
    appendArc(turned.elements, {5, 5}, 2, 1.0, -2 * path_shapes::kPi);
    Path otherLayer = loose({{0, 0}, {1, 0}});
    otherLayer.layer = "OTHER";
    const Path square = rectangle({20, 0}, {21, 1});
    Path shifted = square;
    std::rotate(shifted.elements.begin(), shifted.elements.begin() + 2, shifted.elements.end());
    const auto result =
        buildChains({loose({{0, 0}, {1, 0}}), loose({{1, 0}, {0, 0}}), loose({{0, 0}, {1, 0}, 0.5}),
                     loose({{1, 1e-5}, {0, 0}, -0.5}), otherLayer, circle({5, 5}, 2), turned,
                     square, reversed(shifted), loose({{0, 0}, {1.01, 0}})},
                    kTolerance);
    EXPECT_EQ(result.duplicates, 4U);
}

TEST(ChainBuilder, ShortElementsAreDroppedWithoutLosingTheirCourse) {
    // A row of elements below the tolerance is no single element that may vanish.
    std::vector<Vec2> corners;
    for (int i = 0; i <= 1000; ++i)
        corners.push_back({4e-5 * i, 0});
    const auto row = buildChains({polygon(corners, false)}, kTolerance);
    ASSERT_EQ(row.contours.size(), 1U);
    EXPECT_NEAR(length(row.contours[0]), 0.04, 1e-4);
    EXPECT_EQ(row.shortElements + row.contours[0].elements.size(), 1000U);
    // A closed polyline that repeats vertices, the first one at its end included.
    const Path repeated = polygon({{0, 0}, {4, 0}, {4, 0}, {4, 3}, {0, 3}, {0, 1e-5}, {0, 0}});
    const auto square = buildChains({repeated}, kTolerance);
    ASSERT_EQ(square.contours.size(), 1U);
    EXPECT_TRUE(isConnected(square.contours[0]));
    EXPECT_EQ(square.contours[0].elements.size(), 4U);
    EXPECT_EQ(square.shortElements, 3U);
    EXPECT_TRUE(
        buildChains({circle({0, 0}, 1e-5), loose({{1, 1}, {1, 1}})}, kTolerance).contours.empty());
}
