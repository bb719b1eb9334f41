// SPDX-License-Identifier: MIT
/// @file
/// A train of gears, meshing so tightly that their flanks overlap, becomes one region. Bores and
/// the gaps between teeth stay as holes, and every element tells which gear it comes from.
#include <cmath>
#include <iostream>

#include "SvgPicture.h"
#include "gmregion/Boolean.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Verify.h"

using examples::Style;
using gmregion::Combination;
using gmregion::Element;
using gmregion::Point;
using gmregion::RegionSet;

namespace {

constexpr double kPi = 3.14159265358979323846;

/// With a pitch radius of as many units as it has teeth, so that all of them mesh.
struct Gear {
    double teeth;
    Point m;
    double start;  ///< direction of the middle of a tooth, in radians

    double step() const { return 2 * kPi / teeth; }
    Point at(double r, double angle) const {
        return {m.x + r * std::cos(angle), m.y + r * std::sin(angle)};
    }
    /// A gear beside this one in a direction: its gaps are where the teeth of this one are.
    Gear next(double count, double direction) const {
        const double turned = (start - direction) * teeth / count;
        return {count, at(teeth + count, direction), direction + kPi - turned + kPi / count};
    }
};

/// Feet and tips of the teeth are arcs about the centre, flanks are bent a little.
RegionSet regionOf(const Gear& gear, std::int64_t number) {
    const double step = gear.step();
    std::vector<Element> rim;
    for (int i = 0; i < gear.teeth; ++i) {
        const double middle = gear.start + i * step;
        const Point corners[] = {gear.at(gear.teeth - 2.6, middle - 0.36 * step),
                                 gear.at(gear.teeth + 1.7, middle - 0.18 * step),
                                 gear.at(gear.teeth + 1.7, middle + 0.18 * step),
                                 gear.at(gear.teeth - 2.6, middle + 0.36 * step)};
        const Point before = i > 0 ? rim.back().ep : corners[0];
        rim.push_back({before, corners[0], std::tan(0.28 * step / 4)});
        rim.push_back({corners[0], corners[1], 0.12});
        rim.push_back({corners[1], corners[2], std::tan(0.36 * step / 4)});
        rim.push_back({corners[2], corners[3], 0.12});
    }
    rim.front().sp = rim.back().ep;
    const Point left = gear.at(0.35 * gear.teeth, kPi);
    const Point right = gear.at(0.35 * gear.teeth, 0);
    gmregion::Paths paths;
    paths.add(rim, true, number);
    paths.add({{left, right, 1}, {right, left, 1}}, true, number);
    return cleanUp(paths, {gmregion::FillRule::kEvenOdd, 0}).regions;
}

/// Draws the runs of elements that come from one gear in the style of that gear.
void drawByOrigin(examples::SvgPicture& picture, const RegionSet& set, const Style* styles) {
    const auto gearOf = [&](std::size_t i) { return set.origins(i).begin()->path; };
    for (const gmregion::Loop& loop : set.loops()) {
        for (std::size_t i = loop.first; i < loop.last;) {
            std::vector<Element> run;
            const std::int64_t gear = gearOf(i);
            for (; i < loop.last && gearOf(i) == gear; ++i)
                run.push_back(set.elements()[i]);
            picture.add(run, false, styles[gear]);
        }
    }
}

}  // namespace

int main(int argc, char** argv) {
    std::vector<Gear> train = {{12, {0, 0}, 0}};
    train.push_back(train.back().next(8, -0.7));
    train.push_back(train.back().next(14, 0.5));
    constexpr Style kStyles[] = {Style::kResult, Style::kOther, Style::kThird};

    examples::SvgPicture picture;
    std::vector<RegionSet> gears;
    double area = 0;
    for (const Gear& gear : train) {
        gears.push_back(regionOf(gear, static_cast<std::int64_t>(gears.size())));
        area += gmregion::area(gears.back());
    }
    for (std::size_t i = 1; i < gears.size(); ++i)
        area -= gmregion::area(combine(gears[i - 1], gears[i], Combination::kIntersection).regions);

    gmregion::Workspace workspace;
    gmregion::Outcome outcome;
    gmregion::uniteAll(gears.data(), gears.size(), workspace, outcome);
    const RegionSet& whole = outcome.regions;
    const std::size_t holes = whole.loops().size() - whole.regionCount();
    std::cout << "gears of " << area << " together: " << whole.regionCount() << " region with "
              << holes << " holes, area " << gmregion::area(whole) << '\n';

    const RegionSet pair = combine(gears[0], gears[1], Combination::kUnion).regions;
    const bool good = std::fabs(gmregion::area(whole) - area) < 1e-6 &&
                      verifyBoolean(pair, gears[2], Combination::kUnion, whole).isSound();

    picture.fill(whole, Style::kGiven);
    for (const RegionSet& gear : gears)
        picture.add(gear, Style::kHelp);
    drawByOrigin(picture, whole, kStyles);
    for (std::size_t i = 0; i < train.size(); ++i)
        picture.legend(kStyles[i],
                       "gear of " + std::to_string(std::lround(train[i].teeth)) + " teeth");
    picture.legend(Style::kHelp, "within the union");
    const bool saved = picture.save(argc > 1 ? argv[1] : "union_of_gears.svg");
    return saved && good && whole.regionCount() == 1 && holes == 7 ? 0 : 1;
}
