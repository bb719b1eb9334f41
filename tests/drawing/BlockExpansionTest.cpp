// SPDX-License-Identifier: MIT
#include "drawing/dxf/BlockExpansion.h"

#include <gtest/gtest.h>

#include <cmath>

#include "drawing/InputError.h"
#include "tests/support/PathShapes.h"

using namespace gmdrawing;
using namespace gmpart;
using namespace gmregion;

namespace {

Shape loose(Element e, const char* layer = "0") {
    return {"LINE", layer, false, {e}};
}

/// A quarter of a circle about the base, counter-clockwise.
Shape quarter(Vec2 base) {
    return loose({base + Vec2{1, 0}, base + Vec2{0, 1}, std::tan(kPi / 8.0)});
}

ExpansionRules ruled(const Placement& placement) {
    ExpansionRules rules;
    rules.placement = placement;
    return rules;
}

BlockReference refer(const char* block, Vec2 at = {}, const char* layer = "0") {
    BlockReference reference;
    reference.block = block;
    reference.layer = layer;
    reference.at = at;
    return reference;
}

BlockReference shaped(BlockReference reference, Vec2 scale, double degrees, bool mirrored = false) {
    reference.scale = scale;
    reference.angle = degrees * kPi / 180.0;
    reference.mirrored = mirrored;
    return reference;
}

BlockReference array(BlockReference reference, int columns, int rows, Vec2 spacing) {
    reference.columns = columns;
    reference.rows = rows;
    reference.spacing = spacing;
    return reference;
}

/// A drawing that places a block "Q" with one quarter of a circle about its base.
Drawing placing(const BlockReference& reference, Vec2 base = {7, -3}) {
    Drawing drawing;
    drawing.blocks["Q"] = {base, {quarter(base)}, {}, {}};
    drawing.model.references = {reference};
    return drawing;
}

void expectPoint(Vec2 p, Vec2 expected) {
    EXPECT_NEAR(p.x, expected.x, 1e-9);
    EXPECT_NEAR(p.y, expected.y, 1e-9);
}

/// Expects the quarter where its centre and the directions of its ends have come to lie.
void expectQuarter(const Path& path, Vec2 m, Vec2 start, Vec2 end) {
    ASSERT_EQ(path.elements.size(), 1U);
    const Element& e = path.elements[0];
    expectPoint(e.sp, m + start);
    expectPoint(e.ep, m + end);
    expectPoint(halvingPoint(e), m + std::sqrt(0.5) * (start + end));
}

std::vector<Vec2> centresOf(const PlacedPaths& expanded) {
    std::vector<Vec2> centres;
    for (const Path& path : expanded.paths)
        centres.push_back(centre(path.elements.front()));
    return centres;
}

std::size_t skipped(const PlacedPaths& expanded, const char* kind, const char* layer,
                    const char* reason) {
    const auto found = expanded.report.unusable.find({kind, layer, reason});
    return found == expanded.report.unusable.end() ? 0 : found->second;
}

/// Blocks "0", "1", ... up to the depth, each placing the next one beside a line of its own.
Drawing tower(int depth) {
    Drawing drawing;
    drawing.model.references = {refer("0")};
    for (int i = 0; i < depth; ++i) {
        Block& block = drawing.blocks[std::to_string(i)];
        block.shapes = {loose({{0, 0}, {1, 0}})};
        if (i + 1 < depth) block.references = {refer(std::to_string(i + 1).c_str())};
    }
    return drawing;
}

/// A path just within the largest coordinate, and one beyond it in one way.
struct FarCase {
    const char* name;
    Element within, beyond;
};

}  // namespace

TEST(BlockExpansion, PlacesABlockByItsBase) {
    const double s = std::sqrt(0.5);
    struct {
        const char* name;
        BlockReference reference;
        Vec2 m, start, end;
    } const rows[] = {
        {"moved", refer("Q", {5, 6}), {5, 6}, {1, 0}, {0, 1}},
        {"scaled", shaped(refer("Q", {5, 6}), {3, 3}, 0), {5, 6}, {3, 0}, {0, 3}},
        {"turned", shaped(refer("Q", {5, 6}), {1, 1}, 90), {5, 6}, {0, 1}, {-1, 0}},
        {"turned by 45 degrees",
         shaped(refer("Q"), {2, 2}, 45),
         {},
         {2 * s, 2 * s},
         {-2 * s, 2 * s}},
        {"mirrored in x", shaped(refer("Q", {5, 6}), {-2, 2}, 0), {5, 6}, {-2, 0}, {0, 2}},
        {"mirrored in y", shaped(refer("Q", {5, 6}), {2, -2}, 0), {5, 6}, {2, 0}, {0, -2}},
        {"mirrored in both", shaped(refer("Q", {5, 6}), {-1, -1}, 0), {5, 6}, {-1, 0}, {0, -1}},
        {"mirrored, then turned", shaped(refer("Q"), {-1, 1}, 90), {}, {0, -1}, {-1, 0}},
        {"on the back", shaped(refer("Q", {5, 6}), {1, 1}, 0, true), {-5, 6}, {-1, 0}, {0, 1}},
        {"turned, on the back",
         shaped(refer("Q", {5, 6}), {1, 1}, 90, true),
         {-5, 6},
         {0, 1},
         {1, 0}},
        {"mirrored, on the back", shaped(refer("Q"), {-1, 1}, 0, true), {}, {1, 0}, {0, 1}},
        {"nearly uniform", shaped(refer("Q"), {1, 1 + 5e-7}, 0), {}, {1, 0}, {0, 1}},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.name);
        const PlacedPaths expanded = expandBlocks(placing(row.reference), {});
        ASSERT_EQ(expanded.paths.size(), 1U);
        expectQuarter(expanded.paths[0], row.m, row.start, row.end);
        // The same once more under the placement of the whole.
        const Placement whole = Placement::toAxes({2, 0}, {0, 1}, {-1, 0});
        const auto turn = [](Vec2 v) { return Vec2{-v.y, v.x}; };
        expectQuarter(expandBlocks(placing(row.reference), ruled(whole)).paths.at(0),
                      Vec2{1, 1} + turn(row.m - Vec2{1, 1}), turn(row.start), turn(row.end));
    }
}

TEST(BlockExpansion, PlacesBlocksWithinBlocksFromTheInside) {
    // Scaled and moved within a block with a base of its own, which is mirrored and turned.
    Drawing drawing = placing(shaped(refer("OUTER", {100, 0}), {-1, 1}, 90));
    drawing.blocks["OUTER"] = {{10, 10}, {}, {shaped(refer("Q", {14, 10}), {2, 2}, 0)}, {}};
    const PlacedPaths expanded = expandBlocks(drawing, ruled(Placement::scaling(10)));
    ASSERT_EQ(expanded.paths.size(), 1U);
    expectQuarter(expanded.paths[0], {1000, -40}, {0, -20}, {-20, 0});
}

TEST(BlockExpansion, RepeatsABlockAlongTheTurnedAxes) {
    struct {
        const char* name;
        BlockReference reference;
        std::vector<Vec2> places;
    } const rows[] = {
        {"one row", array(refer("Q"), 3, 1, {10, 99}), {{0, 0}, {10, 0}, {20, 0}}},
        {"rows and columns", array(refer("Q"), 2, 2, {10, 4}), {{0, 0}, {10, 0}, {0, 4}, {10, 4}}},
        {"backwards", array(refer("Q", {1, 1}), 1, 3, {99, -4}), {{1, 1}, {1, -3}, {1, -7}}},
        {"turned",
         array(shaped(refer("Q"), {1, 1}, 90), 2, 2, {10, 4}),
         {{0, 0}, {0, 10}, {-4, 0}, {-4, 10}}},
        {"scaled and mirrored, which the spacing is not",
         array(shaped(refer("Q"), {-3, 3}, 0), 2, 1, {10, 4}),
         {{0, 0}, {10, 0}}},
        {"on the back",
         array(shaped(refer("Q", {1, 1}), {1, 1}, 0, true), 2, 2, {10, 4}),
         {{-1, 1}, {-11, 1}, {-1, 5}, {-11, 5}}},
        {"no columns", array(refer("Q"), 0, 5, {10, 4}), {}},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.name);
        const std::vector<Vec2> centres = centresOf(expandBlocks(placing(row.reference), {}));
        ASSERT_EQ(centres.size(), row.places.size());
        for (std::size_t i = 0; i < centres.size(); ++i)
            expectPoint(centres[i], row.places[i]);
    }
    Drawing nested = placing(array(refer("ROW"), 1, 2, {0, 100}));
    nested.blocks["ROW"].references = {array(refer("Q"), 3, 1, {10, 0}), refer("Q", {50, 0})};
    EXPECT_EQ(expandBlocks(nested, {}).paths.size(), 8U);
}

TEST(BlockExpansion, GivesLayerZeroTheLayerOfTheReference) {
    Drawing drawing;
    drawing.model.shapes = {loose({{0, 0}, {1, 0}}), loose({{0, 1}, {1, 1}}, "M")};
    drawing.model.references = {refer("OUTER", {}, "A"), refer("OUTER")};
    drawing.blocks["OUTER"].references = {refer("INNER"), refer("INNER", {}, "B")};
    Block& inner = drawing.blocks["INNER"];
    inner.shapes = {loose({{0, 0}, {1, 0}}), loose({{0, 1}, {1, 1}}, "OWN")};
    inner.report.unusable = {{{"TEXT", "0", "no"}, 3}, {{"TEXT", "OWN", "no"}, 1}};
    const PlacedPaths expanded = expandBlocks(drawing, {});
    std::vector<std::string> layers;
    for (const Path& path : expanded.paths)
        layers.push_back(path.layer);
    EXPECT_EQ(layers,
              (std::vector<std::string>{"0", "M", "A", "OWN", "B", "OWN", "0", "OWN", "B", "OWN"}));
    EXPECT_EQ(skipped(expanded, "TEXT", "A", "no"), 3U);
    EXPECT_EQ(skipped(expanded, "TEXT", "B", "no"), 6U);
    EXPECT_EQ(skipped(expanded, "TEXT", "0", "no"), 3U);
    EXPECT_EQ(skipped(expanded, "TEXT", "OWN", "no"), 4U);
}

TEST(BlockExpansion, CountsReferencesThatCannotBePlaced) {
    struct {
        const char* name;
        BlockReference reference;
        const char* reason;
    } const rows[] = {
        {"missing", array(refer("NONE", {}, "L"), 3, 3, {1, 1}), "block is not defined"},
        {"without size", shaped(refer("Q", {}, "L"), {0, 0}, 0), "its scale is 0"},
        {"without height", array(shaped(refer("Q", {}, "L"), {1, 0}, 0), 3, 3, {1, 1}),
         "its scale is 0"},
        {"within itself", refer("SELF", {}, "L"), "block places itself"},
    };
    for (const auto& row : rows) {
        SCOPED_TRACE(row.name);
        Drawing drawing = placing(row.reference);
        drawing.blocks["SELF"].references = {refer("SELF", {9, 9})};
        drawing.model.references.push_back(refer("Q"));
        const PlacedPaths expanded = expandBlocks(drawing, {});
        EXPECT_EQ(expanded.paths.size(), 1U) << "the other reference";
        EXPECT_EQ(skipped(expanded, "INSERT", "L", row.reason), 1U);
        EXPECT_EQ(expanded.report.unusableCount(), 1U);
    }
}

TEST(BlockExpansion, FollowsBlocksUntilTheyComeBackOrLieTooDeep) {
    Drawing ring = placing(refer("A"));
    ring.blocks["A"].references = {refer("Q"), refer("B")};
    ring.blocks["B"].references = {refer("Q"), refer("A"), refer("Q"), refer("B")};
    const PlacedPaths expanded = expandBlocks(ring, {});
    EXPECT_EQ(expanded.paths.size(), 3U) << "one block may be placed side by side";
    EXPECT_EQ(skipped(expanded, "INSERT", "0", "block places itself"), 2U);
    EXPECT_EQ(expandBlocks(tower(64), {}).report.unusableCount(), 0U);
    const PlacedPaths deep = expandBlocks(tower(70), {});
    EXPECT_EQ(deep.paths.size(), 64U);
    EXPECT_EQ(skipped(deep, "INSERT", "0", "nested too deeply"), 1U);
}

TEST(BlockExpansion, LeavesOutPathsBeyondTheLargestCoordinate) {
    const FarCase cases[] = {
        {"the start", {{1e9, 0}, {0, 0}}, {{1.001e9, 0}, {0, 0}}},
        {"the end", {{0, 0}, {0, -1e9}}, {{0, 0}, {0, -1.001e9}}},
        {"the middle of an arc", {{1e9, 0}, {1e9, 10}}, {{1e9, 0}, {1e9, 10}, 1.0}},
        {"no number", {{0, 0}, {1, 0}}, {{0, 0}, {std::nan(""), 0}}},
    };
    for (const FarCase& c : cases) {
        Drawing drawing;
        drawing.model.shapes = {loose(c.within), loose(c.beyond)};
        const PlacedPaths expanded = expandBlocks(drawing, {});
        EXPECT_EQ(expanded.paths.size(), 1U) << c.name;
        EXPECT_EQ(skipped(expanded, "LINE", "0", "beyond the largest coordinate"), 1U) << c.name;
    }
    // It is where a path comes to lie that counts, not where it was drawn.
    const Drawing moved = placing(refer("Q", {5e8, 0}), {9e9, 0});
    EXPECT_EQ(expandBlocks(moved, {}).paths.size(), 1U);
    EXPECT_TRUE(expandBlocks(moved, ruled(Placement::scaling(3))).paths.empty());
}

TEST(BlockExpansion, EndsWithAnErrorWhenBlocksMultiply) {
    const auto expanded = [](const char* block, int rows) {
        Drawing drawing = placing(array(refer(block), 1000, rows, {2, 2}));
        drawing.blocks["THREE"].shapes.assign(3, quarter({0, 0}));
        drawing.blocks["EMPTY"];
        return expandBlocks(drawing, {}).paths.size();
    };
    EXPECT_EQ(expanded("THREE", 60), 180000U);
    EXPECT_THROW(expanded("THREE", 700), InputError);
    EXPECT_EQ(expanded("EMPTY", 1900), 0U);
    EXPECT_THROW(expanded("EMPTY", 2001), InputError);
}
