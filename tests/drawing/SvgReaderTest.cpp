// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>

#include "drawing/InputError.h"
#include "drawing/files/PartReader.h"
#include "part/model/Area.h"

using namespace gmdrawing;
using gmpart::Path;
using gmregion::kPi;
using gmregion::Vec2;

namespace {

/// A page of 200 by 100 mm, a user unit a millimetre.
std::string page(const std::string& content,
                 const std::string& size = R"(width="200mm" height="100mm")",
                 const std::string& box = "0 0 200 100") {
    return R"(<?xml version="1.0" encoding="UTF-8"?><svg xmlns="http://www.w3.org/2000/svg" )" +
           size + " viewBox=\"" + box + "\">" + content + "</svg>";
}

Part read(const std::string& text, const ReadOptions& options = {}) {
    return partFromText(text, options);
}

Path only(const std::string& content) {
    const Part part = read(page(content));
    EXPECT_EQ(part.contours.size(), 1U);
    return part.contours.at(0);
}

std::string path(const std::string& data) {
    return "<path d=\"" + data + "\"/>";
}

void expectBox(const Path& contour, Vec2 low, Vec2 high, double tolerance = 1e-9) {
    const gmregion::Box box = boundingBox(contour);
    EXPECT_NEAR(box.low.x, low.x, tolerance);
    EXPECT_NEAR(box.low.y, low.y, tolerance);
    EXPECT_NEAR(box.high.x, high.x, tolerance);
    EXPECT_NEAR(box.high.y, high.y, tolerance);
}

std::string causeOf(const std::string& text) {
    try {
        read(text);
    } catch (const InputError& error) {
        return error.what();
    }
    return "";
}

}  // namespace

TEST(SvgReader, BasicShapesAreWhatTheyLookLike) {
    expectBox(only(R"(<rect x="10" y="20" width="30" height="15"/>)"), {10, 65}, {40, 80});
    const Path rounded = only(R"(<rect width="30" height="15" rx="2"/>)");
    EXPECT_EQ(arcCount(rounded), 4U);
    EXPECT_NEAR(std::abs(signedArea(rounded)), 450.0 - (4.0 - kPi) * 4.0, 1e-9);
    const Path oval = only(R"(<rect width="30" height="15" rx="99" ry="5"/>)");
    EXPECT_NEAR(std::abs(signedArea(oval)), 30.0 * 5.0 + kPi * 15.0 * 5.0, 0.5);
    const Path circle = only(R"(<circle cx="1cm" cy="50" r="10"/>)");
    EXPECT_EQ(circle.elements.size(), 2U);
    const double centimetre = 96.0 / 2.54;
    expectBox(circle, {centimetre - 10, 40}, {centimetre + 10, 60});
    const Path ellipse = only(R"(<ellipse cx="50" cy="50" rx="20" ry="10"/>)");
    EXPECT_TRUE(ellipse.closed);
    expectBox(ellipse, {30, 40}, {70, 60}, 0.01);
    EXPECT_FALSE(only(R"(<polyline points="0,0 10,0 10 10"/>)").closed);
    EXPECT_EQ(only(R"(<polygon points="0,0 10,0 10 10"/>)").elements.size(), 3U);
    expectBox(only(R"(<line x2="4" y2="3"/>)"), {0, 97}, {4, 100});
}

TEST(SvgReader, PathDataOfEveryKind) {
    // A slot with true half circles, once by each sweep.
    const Path slot = only(path("m10,10 h20 a5,5 0 0 1 0,10 H10 A5 5 0 0 1 10 10z"));
    EXPECT_EQ(arcCount(slot), 2U);
    expectBox(slot, {5, 80}, {35, 90});
    const Path bitten = only(path("M10,10 h20 a5,5 0 0 0 0,10 H10 A5 5 0 1 0 10 10z"));
    expectBox(bitten, {10, 80}, {30, 90});
    // Radii too small grow to a half circle; without radii there is a line.
    EXPECT_NEAR(length(only(path("M0 50 A 1 1 0 0 1 20 50"))), 10.0 * kPi, 1e-9);
    EXPECT_NEAR(length(only(path("M0 50 A 0 7 0 0 1 20 50"))), 20.0, 1e-9);
    // Three quarters of an ellipse, turned: the point farthest from its ends shows the side.
    const Path large = only(path("M 50 50 A 20 10 90 1 1 60 70"));
    expectBox(large, {50, 30}, {70, 70}, 0.01);
    const Path curves = only(path("M0 0 C 0 10 10 10 10 0 S 20 -10 20 0 Q 25 10 30 0 T 40 0"));
    EXPECT_TRUE(curves.elements.back().ep == (Vec2{40, 100}));
    expectBox(curves, {0, 92.5}, {40, 107.5}, 0.02);
    const Part two = read(page(path("M0 0 h10 v10 z m20 0 h5 v5 z l-3 -3")));
    ASSERT_EQ(two.contours.size(), 3U);
    EXPECT_TRUE(two.contours[1].closed);
    EXPECT_TRUE(two.contours[2].elements.front().sp == (Vec2{20, 100})) << "where the last started";
}

TEST(SvgReader, TransformationsAndReferences) {
    const std::string square = R"(<rect id="r" width="10" height="10"/>)";
    expectBox(only("<g transform=\"translate(50 20)\"><g transform=\"scale(2,1) rotate(90)\">" +
                   square + "</g></g>"),
              {30, 70}, {50, 80});
    const Path oval = only(R"svg(<circle r="10" transform="translate(50,50) scale(2,1)"/>)svg");
    EXPECT_NEAR(std::abs(signedArea(oval)), 200.0 * kPi, 0.6);
    expectBox(only("<defs>" + square + R"(</defs><use href="#r" x="5" y="7"/>)"), {5, 83},
              {15, 93});
    const Part part =
        read(page(square + R"(<use href="#none"/><g id="a"><use href="#a"/></g>)"
                           R"svg(<rect width="1" height="1" transform="scale(0)"/>)svg"));
    EXPECT_EQ(part.contours.size(), 1U);
    EXPECT_EQ(part.report.unusable.at({"use", "0", "refers to nothing"}), 1U);
    EXPECT_EQ(part.report.unusable.at({"rect", "0", "broken transformation"}), 1U);
    EXPECT_EQ(part.report.unusableCount(), 3U) << "what holds itself ends somewhere";
    std::string many = R"(<g id="g0"><circle r="1"/></g>)";
    for (int i = 1; i < 40; ++i) {
        const std::string inner = "<use href=\"#g" + std::to_string(i - 1) + "\"/>";
        many += "<g id=\"g" + std::to_string(i) + "\">" + inner + inner + "</g>";
    }
    EXPECT_NE(causeOf(page(many)).find("place more than"), std::string::npos);
}

TEST(SvgReader, SizeOfThePageSaysTheUnits) {
    const std::string square = R"(<rect width="96" height="96"/>)";
    const auto side = [&](const std::string& size, const std::string& box, ReadOptions options) {
        const Part part = read(page(square, size, box), options);
        return 0.25 * length(part.contours.at(0));
    };
    EXPECT_NEAR(side(R"(width="200mm" height="100mm")", "0 0 200 100", {}), 96.0, 1e-10);
    EXPECT_NEAR(side(R"(width="200mm" height="100mm")", "0 0 400 200", {}), 48.0, 1e-10);
    EXPECT_NEAR(side(R"(width="10in" height="5in")", "0 0 960 480", {}), 1.0, 1e-10);
    EXPECT_NEAR(side("", "0 0 960 480", {}), 25.4, 1e-10);
    ReadOptions options;
    options.units = kInch;
    EXPECT_NEAR(side(R"(width="200mm")", "0 0 960 480", options), 96.0, 1e-10);
    EXPECT_EQ(read(page(square, R"(width="10in")")).units.code, kInch);
    EXPECT_EQ(read(page(square, "")).units.source, UnitSource::kAssumed);
}

TEST(SvgReader, LayersAndWhatIsNotShown) {
    const std::string dot = R"(<circle r="1"/>)";
    const Part part = read(
        page(R"(<g inkscape:groupmode="layer" inkscape:label="Größe" id="l1">)" + dot +
             R"(<g id="not-a-layer">)" + dot + R"(</g><g inkscape:groupmode="layer" id="sub">)" +
             dot + R"(</g></g><g id="Layer_2" data-name="Layer 2">)" + dot + "</g>" + dot +
             R"(<g style="fill:none; display: none">)" + dot +
             R"(</g><text>a</text><title>b</title>)" + R"(<rect width="10%" height="1"/>)"));
    std::vector<std::string> layers;
    for (const Path& contour : part.contours)
        layers.push_back(contour.layer);
    EXPECT_EQ(layers, (std::vector<std::string>{"Größe", "sub", "Layer 2", "0"}))
        << "one of a layer twice in the same place is a duplicate";
    EXPECT_EQ(part.report.duplicates, 1U);
    EXPECT_EQ(part.report.leftOut.at({"g", "0", "not displayed"}), 1U);
    EXPECT_EQ(part.report.unusable.at({"text", "0", "kind cannot be used"}), 1U);
    EXPECT_EQ(part.report.unusable.at({"rect", "0", "broken"}), 1U);
}

TEST(SvgReader, DamagedTextsNameTheirCause) {
    EXPECT_NE(causeOf("<svg><g>").find("damaged SVG file"), std::string::npos);
    EXPECT_NE(causeOf("<html></html>").find("no SVG drawing"), std::string::npos);
    EXPECT_NE(causeOf(page(path("M 0 0 L nan 3"))).find("1 path on layer 0: broken"),
              std::string::npos);
    std::string deep;
    for (int i = 0; i < 100'000; ++i)
        deep += "<g>";
    deep += R"(<circle r="1"/>)";
    for (int i = 0; i < 100'000; ++i)
        deep += "</g>";
    EXPECT_NE(causeOf(page(deep)).find("nested too deeply"), std::string::npos);
    EXPECT_NE(causeOf(page(path("M0 0 A 1e-300 5 0 0 1 9 9"))).find("no contours"),
              std::string::npos);
}
