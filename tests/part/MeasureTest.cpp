// SPDX-License-Identifier: MIT
#include "part/model/Area.h"
#include "part/model/Winding.h"
#include "region/model/Box.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include "tests/support/PathShapes.h"

using namespace gmpart;
using namespace gmregion;
using path_shapes::circle;
using path_shapes::kPi;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

/// Closed path over random corners with random bulges; it may cross itself.
rc::Gen<Path> anyClosedPath() {
    const auto coordinate =
        rc::gen::map(rc::gen::inRange(-100, 101), [](int i) { return 0.1 * i; });
    const auto bulge = rc::gen::map(rc::gen::inRange(-30, 31), [](int i) { return 0.1 * i; });
    const auto corner = rc::gen::apply(
        [](double x, double y, double b) {
            return Element{{x, y}, {}, b};
        },
        coordinate, coordinate, bulge);
    return rc::gen::map(rc::gen::container<std::vector<Element>>(5, corner),
                        [](std::vector<Element> corners) {
                            Path path{{}, true, "0"};
                            for (std::size_t i = 0; i < corners.size(); ++i) {
                                corners[i].ep = corners[(i + 1) % corners.size()].sp;
                                if (corners[i].sp != corners[i].ep)
                                    path.elements.push_back(corners[i]);
                            }
                            return path;
                        });
}

double distanceToHalvings(const Path& path) {
    double farthest = 0.0;
    for (const Element& e : path.elements) {
        farthest = std::max(farthest, distance(path, halvingPoint(e)));
    }
    return farthest;
}

}  // namespace

TEST(Measure, AreaIsExactForArcs) {
    EXPECT_NEAR(signedArea(circle({3, 4}, 2)), 4 * kPi, 1e-13);
    EXPECT_NEAR(signedArea(circle({1e6, -1e6}, 2)), 4 * kPi, 1e-8);
    // A slot: a rectangle and two half circles.
    const Path slot{
        {{{0, 0}, {10, 0}}, {{10, 0}, {10, 4}, 1.0}, {{10, 4}, {0, 4}}, {{0, 4}, {0, 0}, 1.0}},
        true,
        "0"};
    EXPECT_NEAR(signedArea(slot), 40 + 4 * kPi, 1e-12);
    EXPECT_NEAR(length(slot), 20 + 4 * kPi, 1e-12);
    // A crescent: the inner arc takes away what the outer one adds.
    const Path crescent{{{{0, 0}, {2, 0}, 1.0}, {{2, 0}, {0, 0}, -0.5}}, true, "0"};
    const double r = 1.25;  // of the arc with bulge 0.5 over a chord of 2
    const double half = 2.0 * std::atan(0.5);
    const double segment = r * r * (half - std::sin(half) * std::cos(half));
    EXPECT_NEAR(signedArea(crescent), 0.5 * kPi - segment, 1e-12);
}

TEST(Measure, BoundingBoxReachesTheExtremesOfArcs) {
    const Box box = boundingBox({{{{1, 0}, {0, 1}, -std::tan(3 * kPi / 8)}}, false, "0"});
    EXPECT_NEAR(box.low.x, -1, 1e-12);  // the long way round, clockwise
    EXPECT_NEAR(box.low.y, -1, 1e-12);
    EXPECT_NEAR(box.high.x, 1, 1e-12);
    EXPECT_NEAR(box.high.y, 1, 1e-12);
    const Box quarter = boundingBox({{{{1, 0}, {0, 1}, std::tan(kPi / 8)}}, false, "0"});
    EXPECT_NEAR(quarter.low.x, 0, 1e-12);
    EXPECT_NEAR(quarter.high.y, 1, 1e-12);
}

TEST(Measure, WindingAtTheHeightOfVerticesAndTangents) {
    const Path disc = circle({0, 0}, 1);
    const Path diamond = polygon({{1, 0}, {0, 1}, {-1, 0}, {0, -1}});
    for (const Path& path : {disc, diamond}) {
        EXPECT_EQ(windingNumber(path, {0, 0}), 1);
        EXPECT_EQ(windingNumber(path, {-0.5, 0}), 1);
        EXPECT_EQ(windingNumber(path, {-2, 0}), 0);   // ray through two vertices
        EXPECT_EQ(windingNumber(path, {-2, 1}), 0);   // ray touches the top
        EXPECT_EQ(windingNumber(path, {-2, -1}), 0);  // ray touches the bottom
        EXPECT_EQ(windingNumber(path, {2, 0}), 0);
        EXPECT_EQ(windingNumber(reversed(path), {0, 0}), -1);
    }
    // Vertical tangents without a vertex: the arcs are joined at top and bottom.
    Path turned{{}, true, "0"};
    appendArc(turned.elements, {0, 0}, 1, kPi / 2, 2 * kPi);
    EXPECT_EQ(windingNumber(turned, {0, 0}), 1);  // on both chords
    EXPECT_EQ(windingNumber(turned, {-0.999, 0}), 1);
    EXPECT_EQ(windingNumber(turned, {-1.001, 0}), 0);
    // A horizontal edge at the height of the point.
    EXPECT_EQ(windingNumber(rectangle({0, 0}, {2, 2}), {-1, 0}), 0);
    EXPECT_EQ(windingNumber(rectangle({0, 0}, {2, 2}), {1, 1e-9}), 1);
    EXPECT_EQ(windingNumber(rectangle({0, 0}, {2, 2}), {1, -1e-9}), 0);
}

RC_GTEST_PROP(MeasureLaws, ReversingNegatesAreaAndWinding, ()) {
    const Path path = *anyClosedPath();
    RC_PRE(!path.elements.empty());
    const Path back = reversed(path);
    RC_ASSERT(std::abs(signedArea(path) + signedArea(back)) < 1e-9);
    RC_ASSERT(std::abs(length(path) - length(back)) < 1e-9);
    const Vec2 p{0.1 * *rc::gen::inRange(-100, 101) + 0.033, 0.1 * *rc::gen::inRange(-100, 101)};
    RC_PRE(distance(path, p) > 1e-6);
    RC_ASSERT(windingNumber(path, p) == -windingNumber(back, p));
    RC_ASSERT(distanceToHalvings(path) < 1e-9);
}

RC_GTEST_PROP(MeasureLaws, AreaIsTheWindingNumberSummedOverThePlane, ()) {
    const Path path = *anyClosedPath();
    RC_PRE(!path.elements.empty());
    const Box box = boundingBox(path);
    constexpr int kCells = 150;
    const double dx = box.size().x / kCells;
    const double dy = box.size().y / kCells;
    double sum = 0.0;
    for (int i = 0; i < kCells; ++i) {
        for (int j = 0; j < kCells; ++j) {
            sum += windingNumber(path, box.low + Vec2{(i + 0.5) * dx, (j + 0.5) * dy});
        }
    }
    // A border crosses about its length over the cell width of cells, each right on average.
    const double border = length(path) * std::hypot(dx, dy);
    RC_ASSERT(std::abs(sum * dx * dy - signedArea(path)) <= 0.5 * border + 1e-9);
}
