// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <sys/stat.h>

#include <filesystem>
#include <regex>

#include "drawing/InputError.h"
#include "drawing/dxf/DxfWriter.h"
#include "drawing/files/AtomicFile.h"
#include "drawing/files/OutputFiles.h"
#include "drawing/files/PartReader.h"
#include "drawing/svg/ResultPicture.h"
#include "drawing/svg/SvgPage.h"
#include "tests/support/PathShapes.h"
#include "tests/support/Scratch.h"

using namespace gmpart;
using namespace gmregion;
using namespace gmdrawing;
using path_shapes::circle;
using path_shapes::kPi;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

std::vector<Path> someContours() {
    Path named = rectangle({-3.25, 1.0 / 3.0}, {123456.789, 40});
    named.layer = "<\"A&B\">\x01";
    return {named,
            reversed(circle({10, 10}, 2)),
            {{{{0, 0}, {2, 1}, 2.4}, {{2, 1}, {5, 1}}, {{5, 1}, {6, 0}, -0.3}}, false, "0"}};
}

/// Every contour with itself as the result of two passes.
struct Sample {
    std::vector<Path> contours = someContours();
    ResultDrawing drawing() const {
        ResultDrawing drawing{
            contours, {}, {{"offset 1.5", "OFFSET_1"}, {"offset 2.5", "OFFSET_2"}}};
        for (const Path& path : contours)
            drawing.results.push_back({{0, path}, {1, path}});
        return drawing;
    }
};

/// End points of the commands of SVG path data, in the drawing's own y direction.
std::vector<Vec2> commandEnds(const std::string& data) {
    std::vector<Vec2> ends;
    const std::regex command("([ML]|A \\S+ \\S+ 0 [01] [01]) (\\S+) (\\S+)");
    for (std::sregex_iterator it(data.begin(), data.end(), command), end; it != end; ++it) {
        ends.push_back({std::stod((*it)[2]), -std::stod((*it)[3])});
    }
    return ends;
}

}  // namespace

TEST(DxfWriter, GeometryIsReadBack) {
    const Scratch scratch;
    const Sample sample;
    ASSERT_TRUE(writeDxf(sample.drawing(), scratch.file("a.dxf")));
    const Part part = readPart(scratch.file("a.dxf"), {});
    ASSERT_EQ(part.contours.size(), 9U);
    EXPECT_EQ(part.contours[0].layer, "SOURCE");
    EXPECT_EQ(part.contours[3].layer, "OFFSET_1");
    EXPECT_EQ(part.contours[4].layer, "OFFSET_2");
    for (std::size_t i = 0; i < 3; ++i) {
        const Path& source = sample.contours[i];
        const Path& found = part.contours[i];
        EXPECT_EQ(found.closed, source.closed);
        ASSERT_EQ(found.elements.size(), source.elements.size());
        for (std::size_t j = 0; j < source.elements.size(); ++j) {
            EXPECT_LT(distance(found.elements[j].ep, source.elements[j].ep), 1e-9);
            EXPECT_NEAR(found.elements[j].bulge, source.elements[j].bulge, 1e-9);
        }
    }
}

TEST(ResultPicture, PathDataEndsWhereTheElementsEnd) {
    for (const Path& path : someContours()) {
        const std::string data = svgPathData(path);
        const std::vector<Vec2> ends = commandEnds(data);
        ASSERT_EQ(ends.size(), path.elements.size() + 1);
        for (std::size_t i = 0; i < path.elements.size(); ++i) {
            EXPECT_LT(distance(ends[i + 1], path.elements[i].ep), 1e-5);
        }
        EXPECT_EQ(data.back() == 'Z', path.closed);
    }
    // Seen with y upwards, counter-clockwise is against the positive angles of the picture.
    EXPECT_EQ(svgPathData({{{{1, 0}, {0, 1}, std::tan(kPi / 8)}}, false, ""}),
              "M 1 0 A 1 1 0 0 0 0 -1");
    EXPECT_EQ(svgPathData({{{{1, 0}, {0, 1}, -std::tan(3 * kPi / 8)}}, false, ""}),
              "M 1 0 A 1 1 0 1 1 0 -1");
}

TEST(ResultPicture, PictureIsWellFormedAndFits) {
    const Sample sample;
    const std::string svg = svgOf(sample.drawing());
    // Every tag is closed in order, and the layer's name did not open one.
    std::vector<std::string> open;
    const std::regex tag("<(/?)([a-z]+)[^<>]*?(/?)>");
    for (std::sregex_iterator it(svg.begin(), svg.end(), tag), end; it != end; ++it) {
        const std::smatch& match = *it;
        if (match[1].length() > 0) {
            ASSERT_FALSE(open.empty());
            EXPECT_EQ(open.back(), match[2]);
            open.pop_back();
        } else if (match[3].length() == 0) {
            open.push_back(match[2]);
        }
    }
    EXPECT_TRUE(open.empty());
    EXPECT_NE(svg.find("&lt;&quot;A&amp;B&quot;&gt;?"), std::string::npos);
    std::smatch box;
    ASSERT_TRUE(std::regex_search(svg, box, std::regex("viewBox=\"(\\S+) (\\S+) (\\S+) (\\S+)\"")));
    const Vec2 low{std::stod(box[1]), std::stod(box[2])};
    const Vec2 high = low + Vec2{std::stod(box[3]), std::stod(box[4])};
    for (const Path& path : sample.contours) {
        for (const Element& e : path.elements) {
            EXPECT_TRUE(low.x < e.sp.x && e.sp.x < high.x && low.y < -e.sp.y && -e.sp.y < high.y);
        }
    }
    EXPECT_NE(svg.find("id=\"contour-3\""), std::string::npos);
}

TEST(OutputFiles, AllOrNoneAreWritten) {
    const Scratch scratch;
    const Sample sample;
    writeOutputs(sample.drawing(), {scratch.file("a.svg"), scratch.file("a.DXF")});
    EXPECT_EQ(scratch.files(), 2U);
    EXPECT_THROW(writeOutputs(sample.drawing(), {scratch.file("b.svg"), scratch.file("no/b.dxf")}),
                 InputError);
    EXPECT_EQ(scratch.files(), 2U);
    const std::vector<std::vector<std::string>> refused = {
        {scratch.file("a.png")},
        {scratch.file("a")},
        {scratch.file("in.dxf")},
        {scratch.file("no/a.svg")},
        {scratch.file("c.svg"), scratch.file("./c.svg")}};
    for (const auto& names : refused) {
        EXPECT_THROW(checkOutputs(names, scratch.file("in.dxf")), InputError) << names[0];
    }
    EXPECT_EQ(scratch.files(), 2U);
}

TEST(AtomicFile, TakesItsPlaceAsAWholeWithOrdinaryPermissions) {
    const Scratch scratch;
    const std::string name = scratch.file("a.txt");
    scratch.store("a.txt", "old");
    {
        AtomicFile dropped(name);
        dropped.write("never seen");
        EXPECT_EQ(scratch.files(), 2U);
    }
    EXPECT_EQ(scratch.files(), 1U);
    const mode_t before = umask(027);
    AtomicFile file(name);
    AtomicFile other(scratch.file("b.txt"));
    umask(before);
    file.write("new");
    file.synchronise();
    EXPECT_EQ(scratch.content("a.txt"), "old");
    file.commit();
    other.commit();
    EXPECT_EQ(scratch.content("a.txt"), "new");
    EXPECT_EQ(scratch.files(), 2U);
    using std::filesystem::perms;
    const perms expected = perms::owner_read | perms::owner_write | perms::group_read;
    EXPECT_EQ(std::filesystem::status(name).permissions(), expected);
}
