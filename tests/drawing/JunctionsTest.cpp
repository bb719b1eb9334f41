// SPDX-License-Identifier: MIT
#include "drawing/contours/Junctions.h"

#include <gtest/gtest.h>
#include <rapidcheck/gtest.h>

#include <algorithm>
#include <cmath>
#include <set>

#include "drawing/InputError.h"
#include "drawing/curves/Placement.h"
#include "tests/support/PathShapes.h"

using namespace gmdrawing;
using namespace gmpart;
using namespace gmregion;
using path_shapes::polygon;

namespace {

constexpr double kTolerance = 1e-3;

using Joined = std::vector<std::optional<PathEnd>>;

Path loose(Vec2 a, Vec2 b, double bulge = 0.0) {
    return {{{a, b, bulge}}, false, "0"};
}

Path onLayer(Path path, const char* layer) {
    path.layer = layer;
    return path;
}

std::size_t pairsIn(const Joined& joined) {
    return static_cast<std::size_t>(
               std::count_if(joined.begin(), joined.end(), [](const auto& e) { return !!e; })) /
           2;
}

std::size_t pairsOf(const std::vector<Path>& paths) {
    return pairsIn(joinEnds(paths, kTolerance));
}

/// An end is joined to the one that is joined to it, and to none of its own.
bool isMutual(const Joined& joined) {
    for (PathEnd end = 0; end < joined.size(); ++end) {
        if (joined[end] && (*joined[end] == end || joined.at(*joined[end]) != end)) return false;
    }
    return true;
}

/// Pairs of ends: a start goes by the number of its path, counted from 1, an end by minus that.
using Numbers = std::set<std::set<int>>;

/// Paths that meet, and which of their ends belong together.
struct Scene {
    const char* name;
    std::vector<Path> paths;
    Numbers pairs;
};

std::vector<Scene> scenes() {
    return {
        {"a corner", {loose({0, 0}, {5, 0}), loose({5, 0}, {5, 5})}, {{-1, 2}}},
        {"a tee: the bar goes on",
         {loose({0, 0}, {0, 5}), loose({-5, 5}, {0, 5}), loose({5, 5.5}, {0, 5})},
         {{-2, -3}}},
        {"a cross: both go on",
         {loose({0, 0}, {5, 1}), loose({0, 0}, {1, -5}), loose({0, 0}, {-5, -1}),
          loose({0, 0}, {-1, 5})},
         {{1, 3}, {2, 4}}},
        {"what the straightest leave goes on too",
         {loose({0, 0}, {5, 0}), loose({0, 0}, {-5, 0.1}), loose({0, 0}, {-5, 2}),
          loose({0, 0}, {-1, 5})},
         {{1, 2}, {3, 4}}},
        {"an arc that leaves smoothly goes before a segment",
         {loose({-5, 0}, {0, 0}), loose({0, 0}, {5, -1}), loose({0, 0}, {3, 3}, std::tan(kPi / 8))},
         {{-1, 3}}},
        {"an arc that arrives smoothly",
         {loose({0, 0}, {5, 0}), loose({-5, 2}, {0, 0}, 0.19), loose({-5, 1.9}, {0, 0})},
         {{1, -2}}},
        {"turning back when there is nothing else",
         {loose({0, 0}, {5, 0}), loose({0, 0}, {9, 0})},
         {{1, 2}}},
        {"both ends of two paths",
         {loose({0, 0}, {5, 0}), loose({5, 0}, {0, 0}, 1.0)},
         {{-1, 2}, {1, -2}}},
        {"the ends of one path", {polygon({{0, 0}, {5, 0}, {2, 4}, {0, 0}}, false)}, {{1, -1}}},
        {"a loop that a bar passes",
         {polygon({{0, 0}, {5, 1}, {5, 5}, {0, 0}}, false), loose({-5, 0}, {0, 0}),
          loose({0, 0}, {5, 0})},
         {{-2, 3}, {1, -1}}},
        {"nothing", {loose({0, 0}, {5, 0}), loose({0, 1}, {5, 1})}, {}},
        {"a crossing within both", {loose({0, 0}, {6, 6}), loose({0, 6}, {6, 0})}, {}},
        {"an end on the middle of another", {loose({0, 0}, {6, 0}), loose({3, 0}, {3, 6})}, {}},
    };
}

/// Joins the paths in the given order, each run back where asked for, and names the ends as if
/// they had not been changed.
Numbers joinedInOrder(const std::vector<Path>& paths, const std::vector<std::size_t>& order,
                      const std::vector<bool>& back) {
    std::vector<Path> shuffled;
    for (const std::size_t i : order)
        shuffled.push_back(back[i] ? reversed(paths[i]) : paths[i]);
    const Joined joined = joinEnds(shuffled, kTolerance);
    EXPECT_EQ(joined.size(), 2 * paths.size());
    EXPECT_TRUE(isMutual(joined));
    const auto number = [&](PathEnd end) {
        const std::size_t i = order[pathOf(end)];
        const int n = static_cast<int>(i) + 1;
        return isStart(end) != back[i] ? n : -n;
    };
    Numbers pairs;
    for (PathEnd end = 0; end < joined.size(); ++end) {
        if (joined[end]) pairs.insert({number(end), number(*joined[end])});
    }
    return pairs;
}

Numbers joinedAnyhow(const std::vector<Path>& paths) {
    std::vector<std::size_t> order;
    std::vector<bool> back;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        const auto at = *rc::gen::inRange<std::size_t>(0, i + 1);
        order.insert(order.begin() + static_cast<std::ptrdiff_t>(at), i);
        back.push_back(*rc::gen::arbitrary<bool>());
    }
    return joinedInOrder(paths, order, back);
}

/// Ends in a row, each `step` from the one before, of paths that lead away upwards.
std::vector<Path> rowOfEnds(std::size_t count, double step) {
    std::vector<Path> paths;
    for (std::size_t i = 0; i < count; ++i) {
        const double x = step * static_cast<double>(i);
        paths.push_back(loose({x, 0}, {static_cast<double>(i), 50}));
    }
    return paths;
}

std::string complaint(const std::vector<Path>& paths) {
    try {
        joinEnds(paths, kTolerance);
    } catch (const InputError& error) {
        return error.what();
    }
    return "";
}

}  // namespace

TEST(Junctions, ArePassedStraightestInAnyOrderAndSense) {
    for (const Scene& scene : scenes()) {
        EXPECT_TRUE(
            rc::check(scene.name, [&] { RC_ASSERT(joinedAnyhow(scene.paths) == scene.pairs); }));
    }
}

RC_GTEST_PROP(Junctions, WithEquallyStraightPairsAreDecidedByTheirPlace, ()) {
    // Spokes at equal angles, turned anyhow but with none above another one.
    const int spokes = 3 + 2 * *rc::gen::inRange(0, 4);
    const double turn = kPi / spokes * (*rc::gen::inRange(0, 40) + 0.01 * *rc::gen::inRange(3, 98));
    const Vec2 at = 0.1 * Vec2{1.0 * *rc::gen::inRange(-99, 99), 1.0 * *rc::gen::inRange(-99, 99)};
    std::vector<Path> paths;
    for (int i = 0; i < spokes; ++i) {
        const double angle = turn + 2.0 * kPi * i / spokes;
        paths.push_back(loose(at, at + 7.0 * Vec2{std::cos(angle), std::sin(angle)}));
    }
    const Numbers pairs = joinedAnyhow(paths);
    RC_ASSERT(pairs.size() == paths.size() / 2);
    RC_ASSERT(pairs == joinedAnyhow(paths));
    // The first pair is that of the leftmost spoke with the left one of the two across.
    const auto isLeft = [&](int i, int k) {
        return paths[i].elements[0].ep < paths[k].elements[0].ep;
    };
    int leftmost = 0;
    for (int i = 1; i < spokes; ++i)
        leftmost = isLeft(i, leftmost) ? i : leftmost;
    const int across = (leftmost + spokes / 2) % spokes;
    const int next = (across + 1) % spokes;
    RC_ASSERT(pairs.count({leftmost + 1, (isLeft(across, next) ? across : next) + 1}) == 1U);
}

TEST(Junctions, HoldWhatIsWithinTheTolerance) {
    struct {
        const char* name;
        Vec2 gap;
        std::size_t pairs;
    } const rows[] = {{"nothing between", {0, 0}, 1},
                      {"along", {0.99 * kTolerance, 0}, 1},
                      {"back", {-0.99 * kTolerance, 0}, 1},
                      {"aslant", {0.7 * kTolerance, 0.7 * kTolerance}, 1},
                      {"aslant, beyond", {0.8 * kTolerance, -0.8 * kTolerance}, 0},
                      {"beyond", {1.01 * kTolerance, 0}, 0}};
    for (const auto& row : rows) {
        for (const double x : {0.0, 7.0005, -3e4}) {
            const Vec2 p{x, 0.5 * x};
            EXPECT_EQ(pairsOf({loose({-1e5, 3}, p), loose(p + row.gap, {1e5, 3})}), row.pairs)
                << row.name << " at " << x;
        }
    }
    // Ends that reach each other over a third one are at one place.
    const std::vector<Path> row = {loose({-9, 0}, {0, 0}), loose({0.9 * kTolerance, 0}, {0, 9}),
                                   loose({1.8 * kTolerance, 0}, {9, 0})};
    EXPECT_EQ(joinedInOrder(row, {1, 0, 2}, {false, false, false}), (Numbers{{-1, 3}}));
    EXPECT_EQ(joinedInOrder(row, {0, 2, 1}, {false, true, false}), (Numbers{{-1, 3}}));
}

TEST(Junctions, JoinWithinALayerOnly) {
    const Path bar = loose({-5, 0}, {0, 0});
    const Path straight = onLayer(loose({0, 0}, {5, 0}), "OTHER");
    EXPECT_EQ(pairsOf({bar, straight}), 0U);
    const Joined joined = joinEnds({bar, straight, loose({0, 0}, {0, 5})}, kTolerance);
    EXPECT_EQ(joined[otherEnd(startOf(0))], startOf(2));
    EXPECT_FALSE(joined[startOf(1)]);
}

TEST(Junctions, ClosePathsThatGoRoundSomething) {
    const double t = kTolerance;
    // Ends within the tolerance of each other, of a path of more than three tolerances or less.
    EXPECT_EQ(pairsOf({polygon({{0, 0}, {1.3 * t, 0}, {0, 0.5 * t}}, false)}), 0U);
    EXPECT_EQ(pairsOf({polygon({{0, 0}, {1.5 * t, 0}, {0, 0.8 * t}}, false)}), 1U);
    EXPECT_EQ(pairsOf({polygon({{0, 0}, {0.9 * t, 0}}, false)}), 0U);
    // One too short to go round is still passed by its neighbours.
    EXPECT_EQ(
        pairsOf({loose({-5, 0}, {0, 0}), loose({0, 0}, {0.9 * t, 0}), loose({0.9 * t, 0}, {5, 0})}),
        2U);
}

TEST(Junctions, RefusePlacesWithTooManyEnds) {
    EXPECT_EQ(complaint(rowOfEnds(200, 1e-9)), "");
    for (const double step : {1e-9, 0.9 * kTolerance}) {
        const std::string text = complaint(rowOfEnds(201, step));
        EXPECT_NE(text.find("more than 200 ends meet at ("), std::string::npos) << text;
    }
    EXPECT_EQ(complaint(rowOfEnds(400, 1.1 * kTolerance)), "");
    std::vector<Path> layers = rowOfEnds(300, 1e-9);
    for (std::size_t i = 0; i < layers.size(); i += 2)
        layers[i].layer = "OTHER";
    EXPECT_EQ(complaint(layers), "");
    EXPECT_TRUE(joinEnds({}, kTolerance).empty());
}
