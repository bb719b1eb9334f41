// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <algorithm>

#include "drawing/InputError.h"
#include "drawing/contours/Frame.h"
#include "drawing/files/PartReader.h"
#include "part/model/Area.h"
#include "tests/support/DrawingText.h"
#include "tests/support/PathShapes.h"

using namespace gmdrawing;
using namespace drawing_text;
using gmregion::kPi;
using gmregion::Vec2;
using path_shapes::rectangle;

namespace {

/// A drawing with a header and a table of layers before its entities.
std::string headed(const std::string& header, const std::string& layers,
                   const std::string& entities) {
    return "0\nSECTION\n2\nHEADER\n" + header + "0\nENDSEC\n0\nSECTION\n2\nTABLES\n" + layers +
           "0\nENDSEC\n" + drawing(entities);
}

std::string header(const std::string& variable, int code, const std::string& value) {
    return "9\n" + variable + "\n" + std::to_string(code) + "\n" + value + "\n";
}

std::string layerEntry(const std::string& name, int flags, int colour, int plotted) {
    return entity("LAYER", {{2, name},
                            {70, std::to_string(flags)},
                            {62, std::to_string(colour)},
                            {290, std::to_string(plotted)}});
}

std::string spline(int degree, const std::vector<double>& knots, const std::vector<Vec2>& points,
                   const std::vector<double>& weights, const std::vector<Vec2>& fitted) {
    std::string text = entity("SPLINE", {{8, "0"}, {70, "8"}, {71, std::to_string(degree)}});
    for (const double k : knots)
        text += "40\n" + number(k) + "\n";
    for (const double w : weights)
        text += "41\n" + number(w) + "\n";
    for (const Vec2 p : points)
        text += "10\n" + number(p.x) + "\n20\n" + number(p.y) + "\n30\n0\n";
    for (const Vec2 p : fitted)
        text += "11\n" + number(p.x) + "\n21\n" + number(p.y) + "\n31\n0\n";
    return text;
}

std::string ellipse(Vec2 m, Vec2 major, double ratio, double from, double to,
                    const char* normal = "1") {
    return entity("ELLIPSE", {{8, "0"},
                              {10, number(m.x)},
                              {20, number(m.y)},
                              {11, number(major.x)},
                              {21, number(major.y)},
                              {40, number(ratio)},
                              {41, number(from)},
                              {42, number(to)},
                              {210, normal == std::string("0") ? "1" : "0"},
                              {230, normal}});
}

Part read(const std::string& text, const ReadOptions& options = {}) {
    return partFromText(text, options);
}

std::string causeOf(const std::string& text, const ReadOptions& options = {}) {
    try {
        read(text, options);
    } catch (const InputError& error) {
        return error.what();
    }
    return "";
}

}  // namespace

TEST(Curves, SplinesCloseOutlinesWithLines) {
    // Half a circle by weights, closed by a line; and points alone from one corner to another.
    const double w = std::sqrt(0.5);
    const std::string half =
        spline(2, {0, 0, 0, 1, 1, 2, 2, 2}, {{10, 0}, {10, 10}, {0, 10}, {-10, 10}, {-10, 0}},
               {1, w, 1, w, 1}, {});
    const Part part = read(drawing(half + line({-10, 0}, {10, 0})));
    ASSERT_EQ(part.contours.size(), 1U);
    EXPECT_TRUE(part.contours[0].closed);
    EXPECT_NEAR(signedArea(part.contours[0]), 50.0 * kPi, 1e-6);
    EXPECT_EQ(part.report.used.at("SPLINE"), 1U);

    const Part wave = read(drawing(spline(3, {}, {}, {}, {{0, 0}, {5, 3}, {10, -3}, {15, 0}})));
    ASSERT_EQ(wave.contours.size(), 1U);
    EXPECT_TRUE(wave.contours[0].elements.back().ep == (Vec2{15, 0}));
    EXPECT_EQ(causeOf(drawing(spline(3, {0, 0, 0, 1, 1, 1}, {{0, 0}, {1, 1}}, {}, {}))),
              "the drawing holds no contours; cannot be used: 1 SPLINE on layer 0: too few control "
              "points");
}

TEST(Curves, EllipsesGoByTheirPlane) {
    const Part whole = read(drawing(ellipse({5, 5}, {3, 4}, 0.5, 0, 2 * kPi)));
    EXPECT_TRUE(whole.contours.at(0).closed);
    EXPECT_NEAR(signedArea(whole.contours.at(0)), 12.5 * kPi, 0.01 * 30);
    // Half of it, seen from above and from below: the other half.
    const Vec2 above =
        boundingBox(read(drawing(ellipse({0, 0}, {4, 0}, 0.5, 0, kPi))).contours[0]).low;
    const Vec2 below =
        boundingBox(read(drawing(ellipse({0, 0}, {4, 0}, 0.5, 0, kPi, "-1"))).contours[0]).low;
    EXPECT_NEAR(above.y, 0.0, 1e-12);
    EXPECT_NEAR(below.y, -2.0, 0.01);
    EXPECT_NE(causeOf(drawing(ellipse({0, 0}, {4, 0}, 0.5, 0, kPi, "0"))).find("tilted"),
              std::string::npos);
}

TEST(Curves, ToleranceGoesByUnitsAndOptions) {
    const std::string text = ellipse({0, 0}, {40, 0}, 0.4, 0, 2 * kPi);
    const auto elements = [&](const ReadOptions& options) {
        return read(drawing(text), options).contours.at(0).elements.size();
    };
    ReadOptions fine;
    fine.curves = Length{1e-4};
    ReadOptions inches;
    inches.units = kInch;
    EXPECT_GT(elements(fine), 2 * elements({}));
    EXPECT_DOUBLE_EQ(read(drawing(text), inches).curveTolerance, 0.0005);
    EXPECT_GT(elements(inches), elements({}));
}

TEST(Layers, HiddenAndUnwantedOnesAreLeftOutAndTold) {
    const std::string layers = layerEntry("OFF", 0, -7, 1) + layerEntry("ICE", 1, 7, 1) +
                               layerEntry("SCREEN", 0, 7, 0) + layerEntry("CUT", 0, 7, 1);
    const std::string entities = circle({0, 0}, 1, "OFF") + circle({0, 0}, 2, "ICE") +
                                 circle({0, 0}, 3, "SCREEN") + circle({0, 0}, 4, "CUT") +
                                 circle({0, 0}, 5, "Marks") + entity("TEXT", {{8, "OFF"}});
    const std::string text = headed("", layers, entities);
    const Part part = read(text);
    EXPECT_EQ(part.contours.size(), 2U);
    EXPECT_EQ(part.report.leftOut.at({"CIRCLE", "OFF", "its layer is off"}), 1U);
    EXPECT_EQ(part.report.leftOut.at({"TEXT", "OFF", "its layer is off"}), 1U);
    EXPECT_EQ(part.report.leftOut.at({"CIRCLE", "ICE", "its layer is frozen"}), 1U);
    EXPECT_EQ(part.report.leftOut.at({"CIRCLE", "SCREEN", "its layer is not plotted"}), 1U);
    EXPECT_EQ(part.report.unusableCount(), 0U);

    ReadOptions options;
    options.layers = {{"c*", "OFF"}, {}};
    EXPECT_EQ(read(text, options).contours.size(), 2U) << "one by pattern, a hidden one by name";
    options.layers = {{}, {"mark?"}};
    ASSERT_EQ(read(text, options).contours.size(), 1U);
    options.layers = {{"NONE"}, {}};
    EXPECT_NE(causeOf(text, options).find("1 CIRCLE on layer CUT: its layer is not wanted"),
              std::string::npos);
}

TEST(Layers, FrozenReferencesHideTheirBlocks) {
    const std::string blocks = block("B", {0, 0}, circle({0, 0}, 1, "CUT"));
    const auto placed = [&](const char* layer) {
        return entity("INSERT", {{2, "B"}, {8, layer}, {10, "0"}, {20, "0"}});
    };
    std::string text = drawing(placed("ICE") + placed("OFF"), blocks);
    text = "0\nSECTION\n2\nTABLES\n" + layerEntry("ICE", 1, 7, 1) + layerEntry("OFF", 0, -7, 1) +
           "0\nENDSEC\n" + text;
    const Part part = read(text);
    EXPECT_EQ(part.contours.size(), 1U) << "what a block holds on layers of its own is not off";
    EXPECT_EQ(part.report.leftOut.at({"INSERT", "ICE", "its layer is frozen"}), 1U);
}

TEST(Layers, NamesAreReadInTheirEncoding) {
    const std::string cyrillic = "\xD0\xA4\xD0\x9C";  // two letters
    const auto layerOf = [](const std::string& text) { return read(text).contours.at(0).layer; };
    EXPECT_EQ(layerOf(drawing(circle({0, 0}, 1, cyrillic))), cyrillic);
    EXPECT_EQ(
        layerOf(headed(header("$DWGCODEPAGE", 3, "ANSI_1251"), "", circle({0, 0}, 1, "\xD4\xCC"))),
        cyrillic);
    EXPECT_EQ(layerOf(drawing(circle({0, 0}, 1, "\\U+0424\\U+041c"))), cyrillic);
    EXPECT_EQ(layerOf(drawing(circle({0, 0}, 1, "\xE9\\U+D800\\U+04"))), "\xC3\xA9\\U+D800\\U+04");
}

TEST(Units, TolerancesGoByThem) {
    // A staircase of steps of 0.00098, and a gap of 0.0008.
    std::vector<gmregion::Element> stairs = {{{0, 0}, {}}};
    for (int i = 1; i <= 10; ++i)
        stairs.push_back({{0.00098 * ((i + 1) / 2), 0.00098 * (i / 2)}, {}});
    const std::string text =
        lightPolyline(stairs, false) + line({0, 1}, {0.5, 1}) + line({0.5008, 1}, {1, 1});
    const Part metric = read(headed(header("$INSUNITS", 70, "4"), "", text));
    const Part imperial = read(headed(header("$INSUNITS", 70, "1"), "", text));
    EXPECT_EQ(metric.contours.size(), 2U) << "the gap is closed";
    EXPECT_EQ(imperial.contours.size(), 3U);
    EXPECT_EQ(imperial.contours[0].elements.size(), 10U);
    EXPECT_EQ(imperial.units.source, UnitSource::kDrawing);
    EXPECT_EQ(read(drawing(text)).units.source, UnitSource::kAssumed);
    ReadOptions options;
    options.join = Length{0.1, kMillimetre};
    EXPECT_EQ(read(headed(header("$INSUNITS", 70, "1"), "", text), options).contours.size(), 2U);
}

TEST(Units, LengthsMayCarryThem) {
    const DrawingUnits inches{kInch, UnitSource::kDrawing};
    const auto length = [&](const char* text) {
        const auto parsed = parseLength(text);
        return parsed ? lengthIn(inches, *parsed) : NAN;
    };
    EXPECT_DOUBLE_EQ(length("6"), 6.0);
    EXPECT_DOUBLE_EQ(length("6.35mm"), 0.25);
    EXPECT_DOUBLE_EQ(length("1/4in"), 0.25);
    EXPECT_DOUBLE_EQ(length("1 1/4 IN"), 1.25);
    EXPECT_DOUBLE_EQ(length("-1-1/2\""), -1.5);
    EXPECT_DOUBLE_EQ(length("1e-1cm"), 0.1 / 2.54);
    EXPECT_DOUBLE_EQ(length("2'"), 24.0);
    for (const char* bad : {"", "mm", "1/0", "6 mmm", "6mm 7", "1/-2", "nan", "1e999in", "1//2"})
        EXPECT_TRUE(std::isnan(length(bad))) << bad;
}

TEST(Reading, OldLineEndsAndHeights) {
    std::string text = drawing(circle({0, 0}, 2));
    std::replace(text.begin(), text.end(), '\n', '\r');
    EXPECT_EQ(read(text).contours.size(), 1U);
    const auto at = [](const char* z1, const char* z2) {
        return entity("LINE", {{10, "0"}, {20, "0"}, {30, z1}, {11, "1"}, {21, "0"}, {31, z2}});
    };
    const Part tilted = read(drawing(at("-1.5", "2")));
    EXPECT_EQ(tilted.report.lowest, -1.5);
    EXPECT_EQ(tilted.report.highest, 2.0);
    const Part level = read(drawing(at("3", "3")));
    EXPECT_EQ(level.report.lowest, level.report.highest);
}

TEST(Reading, OverlapsAreMendedWithinTheirLayer) {
    const std::string u = line({0, 0}, {10, 0}) + line({10, 0}, {10, 10}) +
                          line({10, 10}, {0, 10}) + line({0, 10}, {0, 4}) + line({0, 6}, {0, 0});
    const Part part = read(drawing(u));
    ASSERT_EQ(part.contours.size(), 1U);
    EXPECT_TRUE(part.contours[0].closed);
    EXPECT_EQ(part.mended.overlaps, 1U);
    const Part marked = read(drawing(u + line({2, 0}, {5, 0}, "MARK")));
    EXPECT_EQ(marked.contours.size(), 2U) << "a line of another layer stays";
}

TEST(Reading, FramesAreFound) {
    gmpart::Path frame = rectangle({0, 0}, {100, 50});
    frame.layer = "FRAME";
    const gmpart::Path part = rectangle({10, 10}, {20, 20});
    EXPECT_EQ(frameOf({part, frame}), 1U);
    EXPECT_FALSE(frameOf({frame}));
    gmpart::Path same = frame;
    same.layer = part.layer;
    EXPECT_FALSE(frameOf({part, same})) << "the plate of the hole";
    gmpart::Path outside = rectangle({90, 10}, {110, 20});
    EXPECT_FALSE(frameOf({part, outside, frame}));
}
