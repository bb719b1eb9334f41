// SPDX-License-Identifier: MIT
/// @file
/// Offsets of a part with holes and an island in one of them, in a series outward and inward. All
/// boundaries are offset together: what meets merges, what closes vanishes.
#include <array>
#include <cmath>
#include <iostream>

#include "SvgPicture.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Offset.h"
#include "gmregion/Verify.h"

using examples::Style;
using gmregion::Point;

namespace {

constexpr double kPi = 3.14159265358979323846;

void addCircle(gmregion::Paths& paths, Point m, double r) {
    paths.add({{{m.x - r, m.y}, {m.x + r, m.y}, 1}, {{m.x + r, m.y}, {m.x - r, m.y}, 1}}, true);
}

/// A plate of 120 x 80 with corners of radius 10.
void addPlate(gmregion::Paths& paths) {
    const double quarter = std::tan(kPi / 8);
    paths.add({{{10, 0}, {110, 0}, 0},
               {{110, 0}, {120, 10}, quarter},
               {{120, 10}, {120, 70}, 0},
               {{120, 70}, {110, 80}, quarter},
               {{110, 80}, {10, 80}, 0},
               {{10, 80}, {0, 70}, quarter},
               {{0, 70}, {0, 10}, 0},
               {{0, 10}, {10, 0}, quarter}},
              true);
}

/// The area at a distance at which nothing meets: plate, large hole, island, two small holes.
double areaAt(double d) {
    const double plate = (120 + 2 * d) * (80 + 2 * d) - (4 - kPi) * (10 + d) * (10 + d);
    return plate - kPi * ((21 - d) * (21 - d) - (10 + d) * (10 + d) + 2 * (5 - d) * (5 - d));
}

}  // namespace

int main(int argc, char** argv) {
    gmregion::Paths paths;
    addPlate(paths);
    addCircle(paths, {80, 40}, 21);  // a hole with an island in it
    addCircle(paths, {75, 40}, 10);
    addCircle(paths, {20, 20}, 5);
    addCircle(paths, {20, 60}, 5);
    const gmregion::RegionSet part = cleanUp(paths, {gmregion::FillRule::kEvenOdd, 0}).regions;

    const std::array<double, 6> distances = {2, 4, 6, -3, -6, -9};
    std::array<gmregion::Outcome, 6> offsets;
    gmregion::Workspace workspace;
    bool good = gmregion::offsetSeries(part, distances.data(), distances.size(), {}, workspace,
                                       offsets.data());
    examples::SvgPicture picture;
    picture.fill(part, Style::kGiven);
    picture.add(part, Style::kGiven);
    std::string loopCounts;
    for (std::size_t i = 0; i < distances.size(); ++i) {
        const gmregion::RegionSet& offset = offsets[i].regions;
        const double d = distances[i];
        std::cout << "distance " << d << ": " << offset.regionCount() << " regions, "
                  << offset.loops().size() << " loops, area " << gmregion::area(offset) << '\n';
        loopCounts += std::to_string(offset.loops().size());
        good = good && gmregion::verifyOffset(part, d, offset).isSound();
        // Up to there all five boundaries keep clear of each other.
        if (d > -6 && d < 3) good = good && std::fabs(gmregion::area(offset) - areaAt(d)) < 1e-6;
        picture.add(offset, d > 0 ? Style::kOther : Style::kResult);
    }
    picture.legend(Style::kGiven, "part with holes and an island");
    picture.legend(Style::kOther, "2, 4 and 6 outward: the island meets its hole");
    picture.legend(Style::kResult, "3, 6 and 9 inward: small holes break through");
    const bool saved = picture.save(argc > 1 ? argv[1] : "offset_part.svg");
    return saved && good && loopCounts == "542555" ? 0 : 1;
}
