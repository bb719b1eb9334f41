// SPDX-License-Identifier: MIT
/// @file
/// Cleans a heap of loops as drawings have them: some cross themselves, some are drawn twice, one
/// is folded back on itself, some run the other way round. What they run round becomes regions.
#include <cmath>
#include <iostream>

#include "SvgPicture.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Questions.h"

using examples::Style;
using gmregion::Element;
using gmregion::Point;

namespace {

using Loop = std::vector<Element>;

constexpr double kPi = 3.14159265358979323846;

Loop polygon(const std::vector<Point>& corners) {
    Loop loop;
    for (std::size_t i = 0; i < corners.size(); ++i)
        loop.push_back({corners[i], corners[(i + 1) % corners.size()], 0});
    return loop;
}

/// Counter-clockwise with a sense of 1, clockwise with -1.
Loop circle(Point m, double r, double sense) {
    return {{{m.x - r, m.y}, {m.x + r, m.y}, sense}, {{m.x + r, m.y}, {m.x - r, m.y}, sense}};
}

/// A star of five tips in one line.
Loop pentagram(Point m, double r) {
    std::vector<Point> tips;
    for (int i = 0; i < 5; ++i) {
        const double angle = kPi / 2 + i * 4 * kPi / 5;
        tips.push_back({m.x + r * std::cos(angle), m.y + r * std::sin(angle)});
    }
    return polygon(tips);
}

/// A plate with a round end; its upper side goes on by a spike and comes back.
Loop plate(double spike) {
    return {{{38, 24}, {54, 24}, 0},
            {{54, 24}, {54, 44}, 1},
            {{54, 44}, {38 - spike, 44}, 0},
            {{38 - spike, 44}, {38, 44}, 0},
            {{38, 44}, {38, 24}, 0}};
}

/// What the loops cover: the star has ten triangles of an inner and an outer corner each, the discs
/// have their common part neither way.
double expectedArea() {
    const double inner = std::sin(kPi / 10) / std::sin(3 * kPi / 10);
    const double star = 5 * 16 * 16 * inner * std::sin(kPi / 5);
    const double plateWithHole = 16 * 20 + kPi * 100 / 2 - kPi * 25;
    const double half = std::acos(6.0 / 8.0);
    const double common = 2 * 64 * (half - std::sin(half) * std::cos(half));
    const double twoTriangles = 2 * 0.5 * 14 * 11;
    return star + plateWithHole + 2 * (kPi * 64 - common) + twoTriangles;
}

}  // namespace

int main(int argc, char** argv) {
    const std::vector<Loop> heap = {
        pentagram({16, 36}, 16), plate(8),
        circle({52, 34}, 5, -1), plate(0),
        circle({52, 34}, 5, -1), circle({10, 8}, 8, 1),
        circle({22, 8}, 8, -1),  polygon({{40, 1}, {62, 15}, {62, 1}, {40, 15}})};
    gmregion::Paths paths;
    examples::SvgPicture picture;
    for (const Loop& loop : heap) {
        paths.add(loop, true);
        picture.add(loop, true, Style::kGiven);
        picture.arrow(loop.front(), Style::kGiven);
    }
    const gmregion::Outcome cleaned =
        gmregion::cleanUp(paths);  // not as often one way as the other
    const gmregion::RegionSet& set = cleaned.regions;

    picture.moveNext({78, 0});
    picture.fill(set, Style::kGiven);
    std::size_t holes = 0;
    for (const gmregion::Loop& loop : set.loops()) {
        const Element* const elements = set.elements().data();
        const Style style = loop.hole ? Style::kOther : Style::kResult;
        picture.add(Loop(elements + loop.first, elements + loop.last), true, style);
        picture.arrow(elements[loop.first], style);
        holes += loop.hole ? 1 : 0;
    }
    const double area = gmregion::area(set);
    std::cout << heap.size() << " loops cover " << set.regionCount() << " regions with " << holes
              << " hole, area " << area << '\n';
    const bool good = !cleaned.refusal && set.regionCount() == 6 && holes == 1 &&
                      std::fabs(area - expectedArea()) < 1e-6;
    picture.legend(Style::kGiven, "loops as they are drawn, plate and hole twice");
    picture.legend(Style::kResult, "outlines, counter-clockwise");
    picture.legend(Style::kOther, "hole, clockwise");
    return picture.save(argc > 1 ? argv[1] : "clean_up_heap.svg") && good ? 0 : 1;
}
