// SPDX-License-Identifier: MIT
#include "drawing/contours/Duplicates.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

#include "tests/support/PathShapes.h"

using namespace gmdrawing;
using namespace gmpart;
using namespace gmregion;
using path_shapes::circle;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

constexpr double kNear = 0.9 * kKernelTolerance;
constexpr double kApart = 1.1 * kKernelTolerance;

/// A quarter of a circle, by its bulge.
const double kQuarter = std::tan(kPi / 8.0);

Path loose(Element e) {
    return {{e}, false, "0"};
}

Path onLayer(Path path, const char* layer) {
    path.layer = layer;
    return path;
}

Path opened(Path path) {
    path.closed = false;
    return path;
}

Path startedAt(Path path, std::ptrdiff_t first) {
    std::rotate(path.elements.begin(), path.elements.begin() + first, path.elements.end());
    return path;
}

Path moved(Path path, Vec2 by) {
    for (Element& e : path.elements)
        e = {e.sp + by, e.ep + by, e.bulge};
    return path;
}

Path turnedCircle(Vec2 m, double r, double start, double sweep) {
    Path path{{}, true, "0"};
    appendArc(path.elements, m, r, start, sweep);
    return path;
}

/// A closed path of two arcs over the chord from (-3, 0) to (3, 0).
Path twoArcs(double lower, double upper) {
    return {{{{-3, 0}, {3, 0}, lower}, {{3, 0}, {-3, 0}, upper}}, true, "0"};
}

struct Row {
    const char* name;
    Path a;
    Path b;
};

const Path kSegment = loose({{0, 0}, {8, 6}});
const Path kArc = loose({{4, 0}, {0, 4}, kQuarter});
const Path kAngle = polygon({{0, 0}, {10, 0}, {10, 4}, {4, 4}, {4, 10}, {0, 10}});

std::vector<Row> copies() {
    const Path farSegment = loose({{12345.6, -98765.4}, {12355.6, -98765.4}});
    return {
        {"a segment", kSegment, kSegment},
        {"a segment run the other way", kSegment, reversed(kSegment)},
        {"a segment off by less than the tolerance", kSegment, moved(kSegment, {0, kNear})},
        {"a segment far away, off by less", farSegment, moved(farSegment, {-kNear, 0})},
        {"an arc", kArc, kArc},
        {"an arc run the other way", kArc, reversed(kArc)},
        {"an arc too flat to leave its chord", kSegment, loose({{0, 0}, {8, 6}, 1e-5})},
        {"an open chain run the other way", opened(kAngle), reversed(opened(kAngle))},
        {"a closed path started elsewhere", kAngle, startedAt(kAngle, 2)},
        {"a closed path started elsewhere, run back", kAngle, reversed(startedAt(kAngle, 5))},
        {"a circle", circle({5, 5}, 2), circle({5, 5}, 2)},
        {"a circle cut at other places", circle({5, 5}, 2), turnedCircle({5, 5}, 2, 1, 2 * kPi)},
        {"a circle run the other way", circle({5, 5}, 2), turnedCircle({5, 5}, 2, 2, -2 * kPi)},
        {"a lens started elsewhere", twoArcs(0.5, 0.4), startedAt(twoArcs(0.5, 0.4), 1)},
    };
}

std::vector<Row> noCopies() {
    return {
        {"a segment off by more than the tolerance", kSegment, moved(kSegment, {0, kApart})},
        {"a segment with one end off", kSegment, loose({{0, 0}, {8, 6 + kApart}})},
        {"a segment that overlaps in part", kSegment, loose({{4, 3}, {12, 9}})},
        {"a segment within a longer one of the same middle", kSegment, loose({{2, 1.5}, {6, 4.5}})},
        {"the other diagonal", kSegment, loose({{0, 6}, {8, 0}})},
        {"an arc on the other side of its chord", kArc, loose({{4, 0}, {0, 4}, -kQuarter})},
        {"half circles that make up a circle", loose({{0, 0}, {4, 0}, 1}),
         loose({{0, 0}, {4, 0}, -1})},
        {"an arc and its chord", kArc, loose({{4, 0}, {0, 4}})},
        {"an arc that leaves its chord by more", kSegment, loose({{0, 0}, {8, 6}, 3e-5})},
        {"an S and its mirror image",
         {{{{-4, 0}, {0, 0}, 0.5}, {{0, 0}, {4, 0}, -0.5}}, false, "0"},
         {{{{-4, 0}, {0, 0}, -0.5}, {{0, 0}, {4, 0}, 0.5}}, false, "0"}},
        {"another corner within the same box", polygon({{0, 0}, {4, 0}, {8, 6}}, false),
         polygon({{0, 0}, {8, 0}, {8, 6}}, false)},
        {"a closed path and the same course open", kAngle, opened(kAngle)},
        {"an open course with its ends elsewhere", opened(kAngle), startedAt(opened(kAngle), 3)},
        {"the same corners in another order", rectangle({0, 0}, {4, 4}),
         polygon({{0, 0}, {4, 4}, {4, 0}, {0, 4}})},
        {"a wider circle", circle({5, 5}, 2), circle({5, 5}, 2 + kApart)},
        {"a circle and a lens over its diameter", twoArcs(1, 1), twoArcs(0.9, 0.9)},
        {"another layer", kSegment, onLayer(kSegment, "OTHER")},
        {"another layer, circles", circle({5, 5}, 2), onLayer(circle({5, 5}, 2), "OTHER")},
    };
}

std::size_t droppedOf(std::vector<Path> paths) {
    return dropDuplicates(paths);
}

}  // namespace

TEST(Duplicates, AreTheSameCourseWhicheverWayItRuns) {
    for (const Row& row : copies()) {
        EXPECT_EQ(droppedOf({row.a, row.b}), 1U) << row.name;
        EXPECT_EQ(droppedOf({row.b, row.a}), 1U) << row.name;
    }
}

TEST(Duplicates, AreNoPathsThatDifferAnywhere) {
    for (const Row& row : noCopies()) {
        EXPECT_EQ(droppedOf({row.a, row.b}), 0U) << row.name;
        EXPECT_EQ(droppedOf({row.b, row.a}), 0U) << row.name;
    }
}

TEST(Duplicates, LeaveTheFirstOfAllCopiesInItsPlace) {
    const Path other = circle({50, 0}, 1);
    std::vector<Path> paths = {kArc,   kSegment, reversed(kSegment),   other,
                               kAngle, kSegment, startedAt(kAngle, 1), reversed(kArc)};
    EXPECT_EQ(dropDuplicates(paths), 4U);
    ASSERT_EQ(paths.size(), 4U);
    EXPECT_EQ(paths[0].elements[0].sp, kArc.elements[0].sp);
    EXPECT_EQ(paths[1].elements[0].ep, kSegment.elements[0].ep);
    EXPECT_EQ(paths[2].elements.size(), other.elements.size());
    EXPECT_EQ(paths[3].elements[0].ep, kAngle.elements[0].ep);
    EXPECT_EQ(dropDuplicates(paths), 0U);
    std::vector<Path> none;
    EXPECT_EQ(dropDuplicates(none), 0U);
}

TEST(Duplicates, AreFoundWhereverTheyLieToEachOther) {
    // A copy is off by less than the tolerance in any direction, from many places of the plane, so
    // that every border between cells of the search is crossed.
    std::size_t dropped = 0;
    for (int i = 0; i < 40; ++i) {
        const Path path = moved(kSegment, {-4.0 + 0.3 * i * kKernelTolerance, -3.0});
        for (int turn = 0; turn < 8; ++turn) {
            const double angle = turn * kPi / 4.0;
            const Vec2 by = kNear * Vec2{std::cos(angle), std::sin(angle)};
            dropped += droppedOf({path, moved(path, by)});
        }
    }
    EXPECT_EQ(dropped, 320U);
}
