// SPDX-License-Identifier: MIT
#include "drawing/files/PartReader.h"

#include <gtest/gtest.h>

#include <locale>

#include "drawing/InputError.h"
#include "region/model/Box.h"
#include "tests/support/DrawingText.h"
#include "tests/support/PathShapes.h"

using namespace gmpart;
using namespace gmregion;
using namespace gmdrawing;
using namespace drawing_text;
using path_shapes::kPi;

namespace {

Part read(const std::string& entities, const std::string& blocks = "") {
    return partFromText(drawing(entities, blocks), {});
}

std::string causeOf(const std::string& text) {
    try {
        partFromText(text, {});
    } catch (const InputError& error) {
        return error.what();
    }
    return "";
}

void expectBox(const Path& path, Vec2 low, Vec2 high) {
    const Box box = boundingBox(path);
    EXPECT_NEAR(box.low.x, low.x, 1e-9);
    EXPECT_NEAR(box.low.y, low.y, 1e-9);
    EXPECT_NEAR(box.high.x, high.x, 1e-9);
    EXPECT_NEAR(box.high.y, high.y, 1e-9);
}

std::size_t unusable(const Part& part, const std::string& reason) {
    std::size_t count = 0;
    for (const auto& [kind, times] : part.report.unusable) {
        if (kind.reason == reason) count += times;
    }
    return count;
}

/// One kind of entity, and what its contour measures.
struct EntityCase {
    const char* name;
    std::string text;
    bool closed;
    std::size_t elements;
    double length;
};

std::vector<EntityCase> entityCases() {
    const std::vector<Element> slot = {
        {{0, 0}, {}, 0}, {{10, 0}, {}, 1}, {{10, 4}, {}, 0}, {{0, 4}, {}, 1}};
    return {
        {"line", line({0, 0}, {3, 4}), false, 1, 5},
        {"arc", arc({0, 0}, 2, 350, 80), false, 1, kPi},
        {"long arc", arc({0, 0}, 2, 10, 350), false, 2, 34.0 / 9.0 * kPi},
        {"full arc", arc({0, 0}, 2, 30, 390), true, 2, 4 * kPi},
        {"circle", circle({7, 7}, 3), true, 2, 6 * kPi},
        {"light polyline", lightPolyline(slot, true), true, 4, 20 + 4 * kPi},
        {"old polyline", oldPolyline(slot, true), true, 4, 20 + 4 * kPi},
        {"open polyline", oldPolyline(slot, false), false, 3, 20 + 2 * kPi},
        {"vertices miscounted", lightPolyline(slot, true, 2), true, 4, 20 + 4 * kPi},
        {"vertices overcounted", lightPolyline(slot, true, 2'000'000'000), true, 4, 20 + 4 * kPi},
        {"huge bulge", lightPolyline({{{0, 0}, {}, 1e4}, {{1e-2, 0}, {}, 0}}, true), true, 3,
         50 * kPi},
    };
}

}  // namespace

TEST(PartReader, EveryKindOfEntity) {
    for (const EntityCase& c : entityCases()) {
        SCOPED_TRACE(c.name);
        const Part part = read(c.text);
        ASSERT_EQ(part.contours.size(), 1U);
        EXPECT_EQ(part.contours[0].closed, c.closed);
        EXPECT_EQ(part.contours[0].elements.size(), c.elements);
        EXPECT_NEAR(length(part.contours[0]), c.length, 1e-4 * c.length);
        EXPECT_EQ(part.report.unusableCount(), 0U);
    }
}

TEST(PartReader, EntitiesOnTheBackOfThePlaneAreMirrored) {
    const Part part = read(arc({5, 0}, 2, 0, 90, -1));
    expectBox(part.contours[0], {-7, 0}, {-5, 2});
    EXPECT_LT(part.contours[0].elements[0].bulge, 0);
    EXPECT_EQ(
        unusable(read(line({0, 0}, {1, 0}) + arc({5, 0}, 2, 0, 90, 0) +
                      entity("CIRCLE", {{10, "0"}, {20, "0"}, {40, "1"}, {210, "1"}, {230, "1"}})),
                 "in a tilted plane"),
        1U);
}

TEST(PartReader, BlocksArePlaced) {
    const std::string flag = block("FLAG", {1, 1}, arc({1, 1}, 2, 0, 90) + line({1, 1}, {3, 1}));
    const std::string pole =
        block("POLE", {0, 0},
              entity("INSERT", {{2, "FLAG"}, {8, "0"}, {10, "10"}, {20, "0"}, {50, "90"}}));
    // Turned by 90 degrees about its base.
    expectBox(
        read(entity("INSERT", {{2, "FLAG"}, {10, "5"}, {20, "6"}, {50, "90"}}), flag).contours[0],
        {3, 6}, {5, 8});
    // Mirrored and twice as large.
    const Part mirrored =
        read(entity("INSERT", {{2, "FLAG"}, {10, "0"}, {20, "0"}, {41, "-2"}, {42, "2"}}), flag);
    expectBox(mirrored.contours[0], {-4, 0}, {0, 4});
    // Within another block that is mirrored as a whole, on the layer of the outermost reference.
    const Part nested =
        read(entity("INSERT", {{2, "POLE"}, {8, "OUTER"}, {10, "0"}, {20, "0"}, {230, "-1"}}),
             flag + pole);
    expectBox(nested.contours[0], {-10, 0}, {-8, 2});
    EXPECT_EQ(nested.contours[0].layer, "OUTER");
    // Two columns and three rows along the turned axes.
    const Part grid = read(entity("INSERT", {{2, "FLAG"},
                                             {10, "0"},
                                             {20, "0"},
                                             {50, "90"},
                                             {70, "2"},
                                             {71, "3"},
                                             {44, "10"},
                                             {45, "100"}}),
                           flag);
    ASSERT_EQ(grid.contours.size(), 6U);
    Box box;
    for (const Path& path : grid.contours)
        box.include(boundingBox(path));
    EXPECT_NEAR(box.low.x, -202, 1e-9);
    EXPECT_NEAR(box.high.y, 12, 1e-9);
}

TEST(PartReader, ReferencesThatCannotBePlaced) {
    const std::string good = line({0, 0}, {1, 0});
    const std::string loop =
        block("A", {0, 0}, entity("INSERT", {{2, "B"}, {10, "0"}, {20, "0"}})) +
        block("B", {0, 0}, good + entity("INSERT", {{2, "A"}, {10, "0"}, {20, "0"}}));
    EXPECT_EQ(unusable(read(entity("INSERT", {{2, "A"}, {10, "0"}, {20, "0"}}), loop),
                       "block places itself"),
              1U);
    EXPECT_EQ(unusable(read(good + entity("INSERT", {{2, "NONE"}, {10, "0"}, {20, "0"}})),
                       "block is not defined"),
              1U);
    const std::string box = block("BOX", {0, 0}, good);
    const std::string flat = entity("INSERT", {{2, "BOX"}, {10, "0"}, {20, "0"}, {41, "0"}});
    EXPECT_EQ(unusable(read(good + flat, box), "its scale is 0"), 1U);
}

TEST(PartReader, BlocksThatMultiplyEndWithAnError) {
    std::string blocks = block("B0", {0, 0}, line({0, 0}, {1, 0}));
    for (int i = 1; i < 30; ++i) {
        const std::string inner = "B" + std::to_string(i - 1);
        const std::string reference = entity("INSERT", {{2, inner}, {10, "0"}, {20, "0"}});
        blocks += block("B" + std::to_string(i), {0, 0}, reference + reference);
    }
    const std::string top = entity("INSERT", {{2, "B29"}, {10, "0"}, {20, "0"}});
    EXPECT_NE(causeOf(drawing(top, blocks)).find("place more than"), std::string::npos);
    const std::string array =
        entity("INSERT", {{2, "B0"}, {10, "0"}, {20, "0"}, {70, "2000000000"}, {71, "2000000000"}});
    EXPECT_NE(causeOf(drawing(array, blocks)).find("place more than"), std::string::npos);
}

TEST(PartReader, UnusableEntitiesAreCountedByKindLayerAndReason) {
    const Part part =
        read(line({0, 0}, {1, 0}) +
             entity("SPLINE", {{8, "A"}, {70, "8"}, {73, "99999999"}, {10, "1"}}) +
             entity("SPLINE", {{8, "A"}}) + entity("TEXT", {{8, "B"}, {1, "no"}}) +
             entity("LINE", {{8, "A"}, {10, "nan"}, {20, "0"}, {11, "1"}, {21, "1"}}) +
             entity("LINE", {{8, "A"}, {10, "1e300"}, {20, "0"}, {11, "1"}, {21, "1"}}) +
             entity("LINE", {{8, "A"}, {10, "1"}, {20, "0"}}) +
             entity("CIRCLE", {{8, "A"}, {10, "1"}, {20, "0"}, {40, ""}}) +
             entity("CIRCLE", {{8, "S"}, {67, "1"}, {10, "1"}, {20, "0"}, {40, "1"}}) +
             entity("POLYLINE", {{8, "A"}, {70, "64"}}) + entity("VERTEX", {{10, "0"}, {20, "0"}}) +
             entity("POLYLINE", {{8, "A"}}) + entity("VERTEX", {{10, "0"}, {20, "inf"}}) +
             entity("SEQEND", {}) + entity("VIEWPORT", {{67, "1"}}));
    EXPECT_EQ(part.contours.size(), 1U);
    EXPECT_EQ((part.report.unusable.at({"SPLINE", "A", "too few control points"})), 1U);
    EXPECT_EQ((part.report.unusable.at({"SPLINE", "A", "too few points"})), 1U);
    EXPECT_EQ((part.report.unusable.at({"TEXT", "B", "kind cannot be used"})), 1U);
    EXPECT_EQ(unusable(part, "broken number"), 3U);
    EXPECT_EQ(unusable(part, "incomplete"), 2U);
    EXPECT_EQ(unusable(part, "in the paper space"), 1U);
    EXPECT_EQ(unusable(part, "a mesh"), 1U);
    EXPECT_EQ(part.report.unusableCount(), 10U);
}

TEST(PartReader, DamagedTextsNameTheirCause) {
    const std::string whole = drawing(circle({0, 0}, 1));
    EXPECT_NE(causeOf("hello\nworld\n").find("no DXF file"), std::string::npos);
    EXPECT_NE(causeOf("1\n2\n3\n4\n").find("no DXF file"), std::string::npos);
    EXPECT_NE(causeOf(std::string("0\nSECTION\n\0\1", 12)).find("binary"), std::string::npos);
    EXPECT_NE(causeOf("0\nSECTION\n2\nHEADER\n0\nENDSEC\n0\nEOF\n").find("no section"),
              std::string::npos);
    EXPECT_NE(causeOf(drawing("")).find("no contours"), std::string::npos);
    EXPECT_NE(causeOf(drawing(entity("TEXT", {}))).find("1 TEXT on layer 0"), std::string::npos);
    // Wherever the text is cut, it is refused and nothing worse happens.
    std::size_t cuts = 0;
    for (std::size_t size = 0; size + 4 < whole.size(); ++size, ++cuts) {
        EXPECT_NE(causeOf(whole.substr(0, size)), "") << size;
    }
    EXPECT_GT(cuts, 50U);
}

TEST(PartReader, RefusesALocaleThatReadsOtherNumbers) {
    struct CommaPoint : std::numpunct<char> {
        char do_decimal_point() const override { return ','; }
    };
    struct GroupedDigits : std::numpunct<char> {
        char do_thousands_sep() const override { return ','; }
        std::string do_grouping() const override { return "\3"; }
    };
    const std::string text = drawing(circle({1.5, 0.25}, 0.125));
    const std::locale before;
    for (const std::locale& other :
         {std::locale(before, new CommaPoint), std::locale(before, new GroupedDigits)}) {
        std::locale::global(other);
        EXPECT_NE(causeOf(text).find("locale"), std::string::npos);
        EXPECT_EQ(std::locale(), other) << "left as it is";
    }
    std::locale::global(before);
    expectBox(partFromText(text, {}).contours[0], {1.375, 0.125}, {1.625, 0.375});
}
