// SPDX-License-Identifier: MIT
#include "drawing/svg/SvgWriter.h"

#include <gtest/gtest.h>

#include <cmath>

using namespace gmdrawing;

TEST(SvgWriter, TextsAndValuesCannotBreakThePicture) {
    const std::string anything = "a<b> & \"c\"\x01\n\x7F\xFF\xC3\xA9";
    const std::string escaped = "a&lt;b&gt; &amp; &quot;c&quot;????\xC3\xA9";
    SvgWriter svg;
    svg.element("text", {{"class", anything}}, anything);
    EXPECT_EQ(svg.finish(), "<text class=\"" + escaped + "\">" + escaped + "</text>\n");
}

TEST(SvgWriter, ElementsEndInTheReverseOrderOfTheirBeginning) {
    SvgWriter svg;
    svg.begin("svg", {{"width", 480.0}});
    svg.style(".a > b { fill: none; }\n");
    svg.begin("g", {});
    svg.begin("a", {});
    svg.end();
    svg.element("path", {{"d", "M 0 0"}, {"class", "c"}});
    EXPECT_EQ(svg.finish(),
              "<svg width=\"480\">\n<style>\n.a > b { fill: none; }\n</style>\n<g>\n<a>\n</a>\n"
              "<path d=\"M 0 0\" class=\"c\"/>\n</g>\n</svg>\n");
}

TEST(SvgWriter, NumbersAreThoseOfSvg) {
    EXPECT_EQ(svgNumbers({-0.0, -1e-300 * 1e-300, 2.0 / 3.0, 123456.789, -1e15}),
              "0 0 0.666666666667 123456.789 -1e+15");
    EXPECT_EQ(svgNumbers({std::nan(""), -HUGE_VAL}), "nan -inf");
    EXPECT_EQ(svgRule(".a", {{"stroke", "red"}, {"stroke-width", 0.5}}),
              ".a { stroke: red; stroke-width: 0.5; }\n");
}

TEST(SvgWriter, PathsOfFewSteps) {
    EXPECT_EQ(svgPathData({}, true), "");
    EXPECT_EQ(svgPathData({{1, -0.0}}, true), "M 1 0 Z");
    // An arc of no radius stays an arc; nothing turns into the start.
    EXPECT_EQ(svgPathData({{0, 0, 5, 1}, {1, 2, 0, -4}, {3, 4, HUGE_VAL, 0}}, false),
              "M 0 0 A 0 0 0 1 0 1 2 L 3 4");
}
