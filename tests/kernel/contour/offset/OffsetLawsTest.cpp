// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>
#include <string>
#include <vector>

#include "tests/support/Contours.h"
#include "tests/support/OffsetLaws.h"

namespace {

using shapes::Path;
using shapes::Star;

/// A shape and the distances to offset it by; all of them stay clear of the radii of its arcs and
/// of half its widths, where results are points.
struct Case {
    std::string name;
    GmContour contour;
    std::vector<double> distances;
};

std::vector<Case> ConvexCases() {
    return {
        {"square", shapes::Square(10), {1, 0.3, 20, -0.3, -4.9}},
        {"rounded", shapes::RoundedRectangle(), {1, 5, -1.5, -2.5, -4.4}},
        {"slot", shapes::Slot(), {0.5, 4, -1, -2.9}},
        {"two half circles", Path("5 0  ccw 0 0 -5 0  ccw 0 0 5 0"), {1, 7, -1, -4.5}},
        {"oval of four centres",
         Path("10 0  ccw 7 0 9.4 1.8  ccw 3 -3 3 5  ccw 3 -3 -3.4 1.8  ccw -1 0 -4 0  -4 -8  10 -8 "
              "10 0"),
         {1, 6, -1, -2.7, -4}},
        {"nearly collinear",
         Path("0 0  5 -0.002  10 0  10.4 4  10.4 8  5 8.01  0 8  0 0"),
         {1, 3, -1, -3.5}},
    };
}

std::vector<Case> OtherCases() {
    return {
        {"L", Path("0 0  10 0  10 4  4 4  4 10  0 10  0 0"), {0.5, 3, -1, -1.9}},
        {"neck",
         Path("0 0  8 0  8 3  12 3  12 0  20 0  20 8  12 8  12 5  8 5  8 8  0 8  0 0"),
         {1, 2.5, -0.7, -1.5, -3.5}},
        {"mouth",
         Path("0 0  12 0  12 5  9 5  9 3  3 3  3 9  9 9  9 7  12 7  12 12  0 12  0 0"),
         {0.6, 1.7, 2.9, 4, -0.6, -1.2}},
        {"notch",
         Path("0 0  12 0  12 6  7 6  cw 6 6 5 6  0 6  0 0"),
         {0.5, 1.5, 4, -0.5, -1.3, -2.2}},
        {"deep notch",
         Path("0 0  12 0  12 9  7 9  7 6  cw 6 6 5 6  5 9  0 9  0 0"),
         {0.5, 0.9, 1.5, -0.5, -2.2}},
        {"kidney",
         Path("4 0  ccw 7 0 10 0  ccw 0 0 -10 0  ccw -7 0 -4 0  cw 0 0 4 0"),
         {1, 3.5, 5, -1, -2.9}},
        {"star",
         Star(
             {{10, 0}, {4, 0}, {10, 0}, {4, 0}, {10, 0}, {4, 0}, {10, 0}, {4, 0}, {10, 0}, {4, 0}}),
         {0.8, 5, -0.8, -2}},
        {"zigzag", Path("0 0  6 1  7 8  9 2  15 3  16 10  8 12"), {0.5, 2, -0.5, -2, 6, -6}},
        {"wave",
         Path("0 0  cw 2 0 4 0  ccw 6.5 0 9 0  cw 10.5 0 12 0  12 -5"),
         {0.5, 1.8, 3, -0.5, -1.8, -3}},
        {"segment", Path("1 2  7 5"), {1, -1, 9}},
        {"arc", Path("3 0  ccw 0 0 0 -3"), {1, -1, -2.5, 4}},
    };
}

std::vector<Case> RandomCases() {
    std::vector<Case> cases;
    for (unsigned seed = 1; seed <= 12; ++seed) {
        cases.push_back({"star of seed " + std::to_string(seed),
                         shapes::RandomStar(seed, seed % 2 == 0),
                         {0.41, 1.3, 4.7, -0.41, -1.3, -3.7}});
    }
    return cases;
}

/// What must not change from variant to variant, in the measures of the original.
struct Fingerprint {
    size_t count = 0;
    double length = 0;
    double area = 0;
};

Fingerprint FingerprintOf(shapes::Variant const& variant) {
    Fingerprint print;
    for (GmContour const* result : offset_laws::Results(variant.contour)) {
        ++print.count;
        print.length += shapes::ChainLength(*result) / variant.scale;
        if (!variant.contour.IsClosed()) continue;
        print.area += std::fabs(offset_laws::Area(*result)) / (variant.scale * variant.scale);
    }
    return print;
}

/// Holds all laws up to each variant of a case; returns how many points were looked at.
int CheckLaws(Case const& c, double d) {
    int checked = 0;
    Fingerprint first;
    for (auto& v : shapes::Variants(c.contour)) {
        SCOPED_TRACE(c.name + ", " + v.name + ", d " + std::to_string(d));
        v.contour.Offsetting(v.MapOffset(d), 1000000, false);
        checked += offset_laws::ExpectOffsetLaws(v.contour, v.MapOffset(d));
        // The cap at the end of an open chain belongs to its offset, the one at the start does not.
        if (v.name == "reversed" && !v.contour.IsClosed()) continue;
        const Fingerprint print = FingerprintOf(v);
        if (v.name == "as it is") first = print;
        const double tolerance = 0.001 * (10 + first.length);
        EXPECT_EQ(print.count, first.count);
        EXPECT_NEAR(print.length, first.length, tolerance);
        EXPECT_NEAR(print.area, first.area, tolerance);
        EXPECT_GT(first.count, 0u);
    }
    return checked;
}

/// Stops at the first case with a fault, which would say the same at thousands of points.
int CheckLaws(std::vector<Case> const& cases) {
    int checked = 0;
    for (Case const& c : cases) {
        for (const double d : c.distances) {
            checked += CheckLaws(c, d);
            if (testing::Test::HasFailure()) return checked;
        }
    }
    return checked;
}

}  // namespace

TEST(OffsetLaws, HoldForConvexShapes) {
    EXPECT_GT(CheckLaws(ConvexCases()), 20000);
}

TEST(OffsetLaws, HoldForShapesWithInnerCornersAndOpenChains) {
    EXPECT_GT(CheckLaws(OtherCases()), 40000);
}

TEST(OffsetLaws, HoldForRandomStars) {
    EXPECT_GT(CheckLaws(RandomCases()), 50000);
}
