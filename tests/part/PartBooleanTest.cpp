// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>

#include "gmregion/Questions.h"

#include "part/boolean/PartBoolean.h"
#include "tests/support/PathShapes.h"

using namespace gmpart;
using gmregion::Combination;
using gmregion::kPi;
using path_shapes::circle;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

const std::vector<Path> kPlate = {rectangle({0, 0}, {20, 10}), circle({5, 5}, 2)};

PartCombination combined(const std::vector<Path>& a, const std::vector<Path>& b,
                         Combination combination) {
    return combineParts({&a, &b}, combination);
}

void expectSound(const PartCombination& found, double wantedArea, std::size_t wantedLoops) {
    EXPECT_FALSE(found.result.refusal);
    EXPECT_TRUE(found.verdict.isSound());
    EXPECT_NEAR(area(found.result.regions), wantedArea, 1e-6);
    EXPECT_EQ(found.result.regions.loops().size(), wantedLoops);
}

}  // namespace

TEST(PartBoolean, WholePartsWithTheirHoles) {
    const std::vector<Path> bar = {rectangle({4, -5}, {6, 15})};
    const double plate = 200.0 - 4.0 * kPi;
    // The bar divides the hole in two and stands out on both sides.
    const double barInPlate = 20.0 - 2.0 * (std::sqrt(3.0) + 4.0 * std::asin(0.5));
    expectSound(combined(kPlate, bar, Combination::kUnion), plate + 40.0 - barInPlate, 3);
    expectSound(combined(kPlate, bar, Combination::kIntersection), barInPlate, 2);
    expectSound(combined(kPlate, bar, Combination::kDifference), plate - barInPlate, 2);
}

TEST(PartBoolean, FlushSidesMeltEvenWhereTheyMissByALittle) {
    for (const double gap : {0.0, 1e-5, -1e-5}) {
        const std::vector<Path> beside = {rectangle({20 + gap, 2}, {30, 8})};
        const PartCombination melted = combined(kPlate, beside, Combination::kUnion);
        EXPECT_TRUE(melted.verdict.isSound());
        EXPECT_EQ(melted.result.regions.loops().size(), 2U);
        EXPECT_NEAR(area(melted.result.regions), 260.0 - 4.0 * kPi, 1e-3);
        EXPECT_TRUE(combined(kPlate, beside, Combination::kIntersection).result.regions.empty());
    }
    // A plug that fills the hole, and the part itself.
    expectSound(combined(kPlate, {circle({5, 5}, 2)}, Combination::kUnion), 200.0, 1);
    expectSound(combined(kPlate, kPlate, Combination::kDifference), 0.0, 0);
}

TEST(PartBoolean, MoreThanTwoAndWhatEnclosesNothing) {
    const std::vector<Path> second = {rectangle({15, 0}, {25, 10}),
                                      polygon({{0, 20}, {5, 20}}, false)};
    const std::vector<Path> third = {rectangle({18, 0}, {40, 10})};
    const PartCombination common =
        combineParts({&kPlate, &second, &third}, Combination::kIntersection);
    expectSound(common, 20.0, 1);
    EXPECT_EQ(common.hasRegions, (std::vector<bool>{true, true, true, false, true}));
    expectSound(combineParts({&kPlate, &second, &third}, Combination::kDifference),
                150.0 - 4.0 * kPi, 2);
}
