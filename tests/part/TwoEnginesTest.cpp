// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <filesystem>
#include <iostream>

#include "drawing/files/PartReader.h"
#include "tests/support/DrawnParts.h"
#include "tests/support/TwoEngines.h"

using gmpart::Path;

namespace {

const std::vector<double> kDistances = {-12.0, -5.0, -1.5, -0.3, 0.3, 1.5, 5.0, 12.0};

/// Compares the engines on a contour by all distances; what differs fails the test.
void compareAll(const Path& contour, const std::string& name, engines::Tally& tally) {
    for (const double distance : kDistances) {
        const engines::Comparison found = engines::compare(contour, distance);
        tally.add(found);
        EXPECT_TRUE(!found.kernelHolds || found.agree)
            << name << " by " << distance << ": " << found.difference;
    }
}

void print(const std::string& what, const engines::Tally& tally) {
    std::cout << what << ": " << tally.compared << " of " << tally.asked
              << " offsets compared, in the others the kernel fails; " << tally.differ
              << " differ\n";
}

}  // namespace

TEST(TwoEngines, AgreeOnRandomContours) {
    engines::Tally tally;
    for (unsigned seed = 1; seed <= 1500; ++seed) {
        const Path contour = engines::randomContour(seed, 3 + seed % 30);
        compareAll(contour, "random contour " + std::to_string(seed), tally);
    }
    print("random contours", tally);
    EXPECT_GT(tally.compared, 9000U);
}

TEST(TwoEngines, AgreeOnContoursAsTheyAreDrawn) {
    engines::Tally tally;
    for (const gmregion::shapes::DrawnPart& part : gmregion::shapes::drawnParts()) {
        for (const gmregion::shapes::Drawing& drawing :
             {gmregion::shapes::Drawing{0.0, 6, 0}, {17.0, 6, 1}, {45.0, 3, 0}, {211.0, 4, 2}}) {
            for (const gmregion::shapes::Elements& loop : drawn(part, drawing))
                compareAll({loop, true, {}}, part.name, tally);
        }
    }
    print("drawing-like contours", tally);
    EXPECT_GT(tally.compared, 1000U);
}

TEST(TwoEngines, AgreeOnOurDrawings) {
    engines::Tally tally;
    for (const auto& file : std::filesystem::directory_iterator(GMPATH_EXAMPLE_PARTS)) {
        if (file.path().extension() != ".dxf") continue;
        for (const Path& contour : gmdrawing::readPart(file.path().string(), {}).contours) {
            if (contour.closed) compareAll(contour, file.path().filename().string(), tally);
        }
    }
    print("our drawings", tally);
    EXPECT_GT(tally.compared, 100U);
}
