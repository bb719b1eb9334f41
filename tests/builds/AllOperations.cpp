// SPDX-License-Identifier: MIT
#include "tests/builds/AllOperations.h"

#include <random>

#include "gmregion/Boolean.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Clip.h"
#include "gmregion/Offset.h"
#include "gmregion/Parallels.h"
#include "tests/support/RegionShapes.h"

namespace gmregion {

namespace {

constexpr double kTolerance = 0.01;  // of simplify
constexpr double kDistances[]{0.3, -0.3, 1.1, -1.1};

/// A rounded plate with holes of several sizes that touch each other and the outline here and
/// there.
Paths plate(std::mt19937& engine) {
    using shapes::uniform;
    Paths paths;
    shapes::Elements outline = shapes::rectangle(0, 0, 24, 16);
    outline.insert(outline.begin() + 2, {{24, 16}, {20, 16}, 0.0});
    outline[3] = {{20, 16}, {0, 16}, -0.2};
    paths.add(outline, true, 0);
    for (std::int64_t i = 1; i < 12; ++i) {
        const Vec2 m{double(2 * (engine() % 12) + 1), double(2 * (engine() % 8) + 1)};
        const double r = uniform(engine, 0.4, 1.2);
        const bool isRound = engine() % 2 == 0;
        paths.add(isRound ? shapes::circle(m, r) : shapes::rectangle(m.x, m.y, r, 2 * r), true, i);
    }
    return paths;
}

/// A line that wanders, and comes near itself.
shapes::Elements wanderer(std::mt19937& engine, int count) {
    shapes::Elements path;
    Vec2 at{0.0, 0.0};
    Vec2 along{0.1, 0.0};
    for (int i = 0; i < count; ++i) {
        along = {along.x + shapes::uniform(engine, -0.02, 0.02),
                 along.y + shapes::uniform(engine, -0.02, 0.02)};
        const Vec2 to{at.x + along.x, at.y + along.y};
        path.push_back({at, to, engine() % 4 == 0 ? shapes::uniform(engine, -0.3, 0.3) : 0.0});
        at = to;
    }
    return path;
}

void callBooleans(const Sources& sources, Workspace& workspace, Outcome& outcome,
                  ResultBits& bits) {
    const RegionSet& first = sources.sets.front();
    for (const RegionSet& second : sources.sets) {
        for (int i = 0; i < 4; ++i) {
            const auto combination = static_cast<Combination>(i);
            combine(first, second, combination, workspace, outcome);
            bits.add(outcome);
            bits.add(verifyBoolean(first, second, combination, outcome.regions));
        }
    }
    uniteAll(sources.sets.data(), sources.sets.size(), workspace, outcome);
    bits.add(outcome);
}

void callOffsets(const RegionSet& set, Workspace& workspace, Outcome& outcome, ResultBits& bits) {
    for (const Join join : {Join::kRound, Join::kMiter, Join::kBevel}) {
        const OffsetOptions options{join, End::kRound, 3.0};
        for (const double d : kDistances) {
            offset(set, d, options, workspace, outcome);
            bits.add(outcome);
            bits.add(verifyOffset(set, d, outcome.regions, options));
        }
    }
    Outcome series[4];
    offsetSeries(set, kDistances, 4, {}, workspace, series);
    for (const Outcome& one : series)
        bits.add(one);
    opened(set, 0.5, workspace, outcome);
    bits.add(outcome);
    closed(set, 0.5, workspace, outcome);
    bits.add(outcome);
}

void ask(const RegionSet& set, const Locator& locator, ResultBits& bits) {
    bits.add(area(set));
    bits.add(perimeter(set));
    if (const auto centre = centroid(set)) bits.add(*centre);
    if (const auto box = bounds(set)) {
        bits.add(box->low);
        bits.add(box->high);
    }
    std::mt19937 engine(17);
    for (int i = 0; i < 200; ++i) {
        const Point p{shapes::uniform(engine, -4, 28), shapes::uniform(engine, -4, 20)};
        bits.add(static_cast<std::uint64_t>(locator.where(p)));
        bits.add(std::uint64_t{locator.regionAt(p).value_or(set.regionCount())});
        if (const auto depth = locator.signedDistance(p)) bits.add(*depth);
        if (const auto nearest = locator.nearest(p)) bits.add(nearest->at);
    }
    for (std::size_t i = 0; i < set.loops().size(); ++i)
        bits.add(std::uint64_t{locator.loopAbout(i).value_or(set.loops().size())});
}

}  // namespace

Sources makeSources(unsigned seed) {
    std::mt19937 engine(seed);
    Sources sources;
    for (int i = 0; i < 3; ++i)
        sources.heap.add(shapes::tangle(engine, 14, 20.0), true);
    sources.open.add(wanderer(engine, 300), false);
    for (int i = 0; i < 3; ++i)
        sources.sets.push_back(cleanUp(plate(engine), {FillRule::kEvenOdd, 0.0}).regions);
    sources.sets.push_back(cleanUp(sources.heap).regions);
    for (const RegionSet& set : sources.sets)
        sources.locators.emplace_back(set);
    for (int i = 0; i <= 20; ++i) {
        const double t = i / 5.0 - 2.0;
        sources.curve.push_back({{t, t * t}, {1.0, 2.0 * t}});
    }
    return sources;
}

void callAll(const Sources& sources, Workspace& workspace, ResultBits& bits) {
    Outcome outcome;
    for (const FillRule rule : {FillRule::kNonZero, FillRule::kEvenOdd, FillRule::kPositive}) {
        cleanUp(sources.heap, {rule, 0.0}, workspace, outcome);
        bits.add(outcome);
    }
    callBooleans(sources, workspace, outcome, bits);
    for (const RegionSet& set : sources.sets)
        callOffsets(set, workspace, outcome, bits);
    for (const End end : {End::kRound, End::kSquare, End::kButt}) {
        thicken(sources.open, 0.2, 0.0, {Join::kRound, end, 3.0}, workspace, outcome);
        bits.add(outcome);
    }
    Parallels parallels;
    for (const double d : kDistances) {
        makeParallels(sources.open, d, 0.0, {}, workspace, parallels);
        for (const Element& e : parallels.elements)
            bits.add(e);
    }
    Clipping clipping;
    for (const RegionSet& set : sources.sets) {
        clip(sources.open, set, workspace, clipping);
        for (const Element& e : clipping.elements)
            bits.add(e);
    }
    for (std::size_t i = 0; i < sources.sets.size(); ++i)
        ask(sources.sets[i], sources.locators[i], bits);
    Simplified simplified;
    SimplifyOptions options;
    options.tolerance = kTolerance;
    simplify(sources.open, options, simplified);
    bits.add(simplified);
    simplify(sources.heap, options, simplified);
    bits.add(simplified);
    simplifyCurve(sources.curve.data(), sources.curve.size(), false, options, simplified);
    bits.add(simplified);
}

}  // namespace gmregion
