// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>

#include "part/model/Area.h"
#include "part/offset/KernelOffset.h"
#include "part/offset/PartOffset.h"
#include "part/regions/PartRegions.h"
#include "tests/support/PathShapes.h"

using namespace gmpart;
using gmregion::Join;
using gmregion::kPi;
using gmregion::Vec2;
using path_shapes::circle;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

using Numbers = std::vector<std::size_t>;

PartOffsets offsets(const std::vector<Path>& contours, const OffsetRequest& request) {
    return offsetPart(contours, request, [](std::size_t, std::size_t) {});
}

/// The areas of all results, holes negative, smallest first.
std::vector<double> areas(const PartOffsets& found) {
    std::vector<double> all;
    for (const OffsetPath& path : found.paths)
        all.push_back(signedArea(path.path));
    std::sort(all.begin(), all.end());
    return all;
}

void expectAreas(const PartOffsets& found, const std::vector<double>& wanted) {
    EXPECT_TRUE(found.faults.empty());
    EXPECT_TRUE(found.refusals.empty());
    const std::vector<double> all = areas(found);
    ASSERT_EQ(all.size(), wanted.size());
    for (std::size_t i = 0; i < all.size(); ++i)
        EXPECT_NEAR(all[i], wanted[i], 1e-4) << i;
}

double roundedSquare(double side, double d) {
    return side * side + 4.0 * side * d + kPi * d * d;
}

/// A plate with a hole that holds an island; all clockwise but the hole, which does not matter.
const std::vector<Path> kPlate = {reversed(rectangle({0, 0}, {40, 40})), circle({20, 20}, 10),
                                  reversed(rectangle({18, 18}, {22, 22}))};

}  // namespace

TEST(PartOffset, SidesGoByWhatContoursAre) {
    const double disc9 = kPi * 81.0;
    const double disc11 = kPi * 121.0;
    expectAreas(offsets(kPlate, {Side::kWaste, {1.0}, {}}),
                {-disc9, roundedSquare(4, 1), roundedSquare(40, 1)});
    expectAreas(offsets(kPlate, {Side::kMaterial, {1.0}, {}}), {-disc11, 4.0, 38.0 * 38.0});
    expectAreas(offsets(kPlate, {Side::kWaste, {-1.0}, {}}), {-disc11, 4.0, 38.0 * 38.0});
    expectAreas(offsets(kPlate, {Side::kInside, {1.0}, {}}), {4.0, disc9, 38.0 * 38.0});
    expectAreas(offsets(kPlate, {Side::kOutside, {1.0}, {}}),
                {roundedSquare(4, 1), disc11, roundedSquare(40, 1)});
    // Clockwise squares have their inside on the right, the circle on the left.
    expectAreas(offsets(kPlate, {Side::kRight, {1.0}, {}}), {4.0, disc11, 38.0 * 38.0});
    EXPECT_EQ(offsets(kPlate, {Side::kBoth, {1.0}, {}}).paths.size(), 6U);
}

TEST(PartOffset, WhatMeetsMergesAndIsNamed) {
    const std::vector<Path> pair = {rectangle({0, 0}, {10, 10}), rectangle({13, 0}, {23, 10})};
    const PartOffsets apart = offsets(pair, {Side::kWaste, {1.0}, {}});
    EXPECT_EQ(apart.paths.size(), 2U);
    const PartOffsets met = offsets(pair, {Side::kWaste, {2.0}, {}});
    ASSERT_EQ(met.paths.size(), 1U);
    EXPECT_EQ(met.paths.front().contours, Numbers({0, 1}));
    // They share a strip of one by ten and the lens of two corner discs.
    const double lens = 2.0 * (4.0 * std::acos(0.75) - 1.5 * std::sqrt(4.0 - 2.25));
    EXPECT_NEAR(signedArea(met.paths.front().path), 2.0 * roundedSquare(10, 2) - 10.0 - lens, 1e-4);
    EXPECT_EQ(offsets(pair, {Side::kWaste, {2.0}, {}, true}).paths.size(), 2U);
    EXPECT_TRUE(apart.marginal.front().empty());
    EXPECT_FALSE(offsets(pair, {Side::kWaste, {1.5}, {}}).marginal.front().empty());
}

TEST(PartOffset, HolesAndIslandsMeetWhereTheGapIsNarrow) {
    const PartOffsets found = offsets(kPlate, {Side::kWaste, {3.8}, {}});
    // Circle 6 and the island's corners at 2.83 + 4: they cross four times, in the axes they do
    // not.
    EXPECT_EQ(found.paths.size(), 5U);
    for (const OffsetPath& path : found.paths) {
        const Numbers wanted = path.main == 0 ? Numbers({0}) : Numbers({1, 2});
        EXPECT_EQ(path.contours, wanted);
    }
}

TEST(PartOffset, LayersAreThoseOfTheContoursThatMostComesFrom) {
    std::vector<Path> pair = {rectangle({0, 0}, {2, 2}), rectangle({2.5, 0}, {30, 10})};
    pair[0].layer = "SMALL";
    pair[1].layer = "LARGE";
    const PartOffsets found = offsets(pair, {Side::kWaste, {1.0}, {}});
    ASSERT_EQ(found.paths.size(), 1U);
    EXPECT_EQ(found.paths.front().path.layer, "LARGE");
}

TEST(PartOffset, OpenContoursAreRunRoundOnceOrOffsetToASide) {
    const Path stroke = polygon({{0, 0}, {10, 0}}, false);
    const Path crossing = polygon({{5, -5}, {5, 5}}, false);
    expectAreas(offsets({stroke}, {Side::kWaste, {1.0}, {}}), {20.0 + kPi});
    expectAreas(offsets({stroke, crossing}, {Side::kWaste, {1.0}, {}}), {36.0 + 2.0 * kPi});
    expectAreas(offsets({stroke, crossing}, {Side::kWaste, {1.0}, {}, true}),
                {20.0 + kPi, 20.0 + kPi});
    const PartOffsets right = offsets({stroke}, {Side::kRight, {1.0}, {}});
    ASSERT_EQ(right.paths.size(), 1U);
    EXPECT_FALSE(right.paths.front().path.closed);
    EXPECT_EQ(right.paths.front().path.elements.front().sp, (Vec2{0, -1}));
    EXPECT_EQ(right.paths.front().path.elements.back().ep, (Vec2{10, -1}));
    // What goes there and back on itself encloses nothing and counts as open.
    Path fold = polygon({{0, 0}, {10, 0}});
    expectAreas(offsets({fold}, {Side::kWaste, {1.0}, {}}), {20.0 + kPi});
}

TEST(PartOffset, CornersAreAsAskedFor) {
    const std::vector<Path> square = {rectangle({0, 0}, {10, 10})};
    expectAreas(offsets(square, {Side::kWaste, {1.0}, {Join::kMiter}}), {144.0});
    expectAreas(offsets(square, {Side::kWaste, {1.0}, {Join::kBevel}}), {142.0});
}

TEST(PartOffset, TheKernelAgreesWhereItsOffsetHolds) {
    const auto byKernel = [](const std::vector<Path>& contours, double d) {
        return offsetPartByKernel(contours, {Side::kWaste, {d}, {}}, [](auto, auto) {});
    };
    const PartOffsets found = byKernel(kPlate, 1.0);
    EXPECT_TRUE(found.faults.empty());
    std::vector<double> sizes;
    for (const double a : areas(found))
        sizes.push_back(std::abs(a));
    std::sort(sizes.begin(), sizes.end());
    ASSERT_EQ(sizes.size(), 3U);
    EXPECT_NEAR(sizes[0], roundedSquare(4, 1), 1e-4);
    EXPECT_NEAR(sizes[1], kPi * 81.0, 1e-4);
    EXPECT_NEAR(sizes[2], roundedSquare(40, 1), 1e-4);
}

TEST(PartOffset, ChecksOfTheKernelsOffsetsSeeWhatIsWrong) {
    const gmregion::RegionSet square = PartRegions({rectangle({0, 0}, {10, 10})}).part().regions;
    const auto isSound = [&](const std::vector<Path>& loops) {
        return checkKernelOffset(square, -1.0, loops).verdict.isSound();
    };
    EXPECT_TRUE(isSound({rectangle({1, 1}, {9, 9})}));
    EXPECT_FALSE(isSound({rectangle({1, 1}, {9, 9.002})}));
    EXPECT_FALSE(isSound({}));
    EXPECT_FALSE(isSound({polygon({{1, 1}, {9, 1}, {9, 9}, {1, 9}}, false)}));
    EXPECT_FALSE(isSound({rectangle({1, 1}, {9, 9}), rectangle({1, 1}, {9, 9})}));
    EXPECT_FALSE(isSound({rectangle({1, 1}, {9, 9}), circle({5, 5}, 1)}));
}
