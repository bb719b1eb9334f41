// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <sys/wait.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <string>
#include <utility>
#include <vector>

#include "tests/support/DrawingText.h"
#include "tests/support/PathShapes.h"
#include "tests/support/Scratch.h"

using path_shapes::rectangle;

namespace {

struct Outcome {
    int exitCode;
    std::string out;
    std::string err;
};

class Program : public testing::Test {
protected:
    Outcome run(const std::string& arguments) const {
        const std::string command = "cd " + m_scratch.directory() + " && " + GMPATH_PROGRAM + " " +
                                    arguments + " >out.txt 2>err.txt";
        const int status = std::system(command.c_str());
        Outcome outcome{WIFEXITED(status) ? WEXITSTATUS(status) : -1, m_scratch.content("out.txt"),
                        m_scratch.content("err.txt")};
        std::filesystem::remove(m_scratch.file("out.txt"));
        std::filesystem::remove(m_scratch.file("err.txt"));
        return outcome;
    }

    const Scratch m_scratch;
};

const std::string kBracket = std::string(GMPATH_TEST_DATA) + "/bracket.dxf";

const std::string kDrawingInFeet =
    "0\nSECTION\n2\nHEADER\n9\n$INSUNITS\n70\n2\n0\nENDSEC\n0\nSECTION\n2\nENTITIES\n"
    "0\nCIRCLE\n8\n0\n10\n5\n20\n5\n40\n3\n0\nCIRCLE\n8\n0\n10\n5\n20\n5\n40\n0.5\n"
    "0\nENDSEC\n0\nEOF\n";

bool isOneLine(const std::string& text) {
    return std::count(text.begin(), text.end(), '\n') == 1 && text.back() == '\n';
}

/// Command lines that cannot be used, and what the line on the error stream must hold.
std::vector<std::pair<std::string, std::string>> unusableCommands() {
    return {
        {"info none.dxf", "none.dxf"},
        {"info folder.dxf", "folder.dxf"},
        {"info empty.dxf", "empty"},
        {"info prose.dxf", "no DXF file"},
        {"info cut.dxf", "truncated"},
        {"info binary.dxf", "binary"},
        {"info bare.dxf", "no contours"},
        {"info " + kBracket + " --join nan", "--join"},
        {"info " + kBracket + " --scale 0", "--scale"},
        {"offset bare.dxf --distance 1 -o a.svg", "no contours"},
        {"offset " + kBracket + " --distance nan -o a.svg", "--distance"},
        {"offset " + kBracket + " --distance 1e999 -o a.svg", "--distance"},
        {"offset " + kBracket + " --distance abc -o a.svg", "--distance"},
        {"offset " + kBracket + " --distance \"\" -o a.svg", "--distance"},
        {"corners " + kBracket + " --radius 1,5 -o a.svg", "--radius"},
        {"offset " + kBracket + " --distance 1 --count 2.5 -o a.svg", "--count"},
        {"offset " + kBracket + " --distance 1 --count 0 -o a.svg", "--count"},
        {"offset " + kBracket + " --distance 1 --count 9 --step inf -o a.svg", "--step"},
        {"offset " + kBracket + " --distance 1 --side up -o a.svg", "--side"},
        {"offset " + kBracket + " --distance 1 -o no/a.svg", "no/a.svg"},
        {"offset " + kBracket + " --distance 1 -o folder.dxf", "folder.dxf"},
        {"offset " + kBracket + " --distance 1 -o a.svg -o a.pdf", "a.pdf"},
        {"offset " + kBracket + " --distance 1 --strict -o a.svg", "TEXT"},
        {"offset " + kBracket + " -o a.svg", "--distance"},
        {"offset " + kBracket + " --distance 1", "--output"},
        {"toolpath " + kBracket + " -o a.ngc", "--tool"},
        {"toolpath " + kBracket + " --tool nan -o a.ngc", "--tool"},
        {"toolpath " + kBracket + " --tool 4 -o a.dxf", ".ngc or .nc or .tap or .gcode or .svg"},
        {"toolpath " + kBracket + " --tool 4 --stock -1 -o a.ngc", "--stock"},
        {"toolpath " + kBracket + " --tool 4 --lead 3 -o a.ngc", "--lead"},
        {"toolpath " + kBracket + " --tool 4 --lead spiral -o a.ngc", "--lead"},
        {"toolpath " + kBracket + " --tool 4 --lead-angle inf -o a.ngc", "--lead-angle"},
        {"toolpath " + kBracket + " --tool 4 --depth 20 --step-down 0.01 -o a.ngc", "--step-down"},
        {"toolpath " + kBracket + " --tool 4 --safe-z 0 -o a.ngc", "--safe-z"},
        {"toolpath " + kBracket + " --tool 4 --plunge 1e-9 -o a.ngc", "--plunge"},
        {"toolpath " + kBracket + " --tool 4 --count 9 --step 9e8 -o a.ngc", "--step"},
        {"toolpath " + kBracket + " --tool 4 --climb --conventional -o a.ngc", "excludes"},
        {"toolpath feet.dxf --tool 4 -o a.ngc", "feet"},
        {"", "subcommand"},
        {"corners " + kBracket + " -o a.svg", "--radius"},
        {"corners " + kBracket + " --radius 1 --chamfer 2 -o a.svg", "Exactly 1"},
        {"corners " + kBracket + " --radius 1 --bend nan -o a.svg", "--bend"},
        {"corners " + kBracket + " --chamfer-length nan -o a.svg", "--chamfer-length"},
        {"melt " + kBracket + " -o a.svg", "PARTS"},
        {"melt " + kBracket + " none.dxf -o a.svg", "none.dxf"},
        {"melt bare.dxf " + kBracket + " -o a.svg", "bare.dxf"},
        {"melt " + kBracket + " " + kBracket + " -o a.ngc", ".svg or .dxf"},
    };
}

}  // namespace

/// Lines of a table of contours between its head and what follows.
std::ptrdiff_t contourRows(const std::string& table) {
    const auto end = table.begin() + static_cast<std::ptrdiff_t>(table.find("units: "));
    return std::count(table.begin(), end, '\n') - 1;
}

TEST_F(Program, InfoListsContoursAndWhatWasSkipped) {
    const Outcome info = run("info " + kBracket);
    EXPECT_EQ(info.exitCode, 0);
    EXPECT_EQ(contourRows(info.out), 4);
    EXPECT_NE(info.out.find("skipped: 1 TEXT on layer NOTES"), std::string::npos);
    EXPECT_NE(info.out.find("dropped: 1 duplicate\n"), std::string::npos);
    EXPECT_NE(info.err.find("1 TEXT on layer NOTES"), std::string::npos);
    EXPECT_EQ(run("info --strict " + kBracket).exitCode, 2);
}

TEST_F(Program, OffsetWritesEveryOutput) {
    const Outcome offset =
        run("offset " + kBracket + " --distance 2 --count 3 --step 2.5 -o a.svg -o a.dxf");
    EXPECT_EQ(offset.exitCode, 0);
    EXPECT_EQ(m_scratch.files(), 2U);
    EXPECT_NE(m_scratch.content("a.svg").find("pass-3"), std::string::npos);
    EXPECT_NE(offset.err.find("nothing left at distance 7"), std::string::npos);
    const Outcome back = run("info a.dxf");
    EXPECT_EQ(back.exitCode, 0);
    EXPECT_NE(back.out.find("OFFSET_3"), std::string::npos);
    EXPECT_EQ(run("offset " + kBracket + " --distance 2 --layers source -o b.dxf").exitCode, 0);
    const std::string onLayers = run("info b.dxf").out;
    EXPECT_EQ(onLayers.find("OFFSET"), std::string::npos);
    EXPECT_NE(onLayers.find("  CUT "), std::string::npos);
    EXPECT_EQ(run("offset " + kBracket + " --distance -1 --side both -o b.svg").exitCode, 0);
}

TEST_F(Program, ToolpathWritesProgramAndPicture) {
    m_scratch.store("feet.dxf", kDrawingInFeet);
    const Outcome cut =
        run("toolpath feet.dxf --scale 12 --units inch --tool 14 --lead arc --spindle 8000 "
            "-o a.NGC -o a.svg");
    EXPECT_EQ(cut.exitCode, 0);
    EXPECT_EQ(cut.err,
              "gmpath: feet.dxf: contour 2 on layer 0 near (66, 60): the tool does not fit\n");
    EXPECT_EQ(cut.out.find("2 contours, cuts 270.2 in, "), 0U) << cut.out;
    EXPECT_NE(m_scratch.content("a.NGC").find("\nG20\n"), std::string::npos);
    EXPECT_NE(m_scratch.content("a.NGC").find("\nM3 S8000.000\n"), std::string::npos);
    for (const std::string part : {"source", "cut", "lead", "rapid"}) {
        EXPECT_NE(m_scratch.content("a.svg").find("<path class=\"" + part), std::string::npos);
    }
}

TEST_F(Program, CornersAndMeltSayWhatTheyDid) {
    using drawing_text::drawing;
    using drawing_text::lightPolyline;
    m_scratch.store("a.dxf", drawing(lightPolyline(rectangle({0, 0}, {10, 10}).elements, true)));
    m_scratch.store("b.dxf", drawing(lightPolyline(rectangle({6, 2}, {9, 30}).elements, true) +
                                     lightPolyline(rectangle({1, 1}, {2, 2}).elements, true)));
    const Outcome corners = run("corners b.dxf --chamfer 1.2 -o c.svg -o c.dxf");
    EXPECT_EQ(corners.exitCode, 0);
    EXPECT_EQ(corners.out, "2 contours, 4 corners done, 4 not done\n");
    EXPECT_EQ(corners.err,
              "gmpath: b.dxf: contour 2 on layer 0 near (1, 1): no room at 4 of 4 corners\n");
    const Outcome rounded = run("info c.dxf");
    EXPECT_EQ(contourRows(rounded.out), 2) << "no sources beside";
    const Outcome melt = run("melt a.dxf b.dxf -o m.svg -o m.dxf");
    EXPECT_EQ(melt.exitCode, 0);
    EXPECT_EQ(
        melt.out,
        "outlines: 1 outline, 0 holes, area 160\ncommon parts: 2 outlines, 0 holes, area 25\n");
    EXPECT_NE(run("info m.dxf").out.find("COMMON"), std::string::npos);
    EXPECT_NE(m_scratch.content("m.svg").find("id=\"contour-B2\""), std::string::npos);
    m_scratch.store("c.dxf", drawing(lightPolyline(rectangle({5, 0}, {15, 10}).elements, true)));
    EXPECT_EQ(run("union a.dxf c.dxf -o m.dxf").out, "union: 1 outline, 0 holes, area 150\n");
    EXPECT_EQ(run("intersect a.dxf c.dxf -o m.dxf").out,
              "common part: 1 outline, 0 holes, area 50\n");
    EXPECT_EQ(run("subtract a.dxf b.dxf c.dxf -o m.dxf").out,
              "difference: 1 outline, 1 hole, area 49\n");
}

TEST_F(Program, OffsetsThatMeetAndPlacesOnTheVergeAreTold) {
    using drawing_text::drawing;
    using drawing_text::lightPolyline;
    m_scratch.store("a.dxf", drawing(lightPolyline(rectangle({0, 0}, {10, 10}).elements, true) +
                                     lightPolyline(rectangle({14, 0}, {24, 10}).elements, true)));
    const Outcome met = run("offset a.dxf --distance 3 -o a.svg");
    EXPECT_EQ(met.exitCode, 0);
    EXPECT_EQ(met.out, "2 contours, 1 offset\n");
    EXPECT_EQ(met.err,
              "gmpath: a.dxf: the offsets at distance 3 of contours 1 and 2 meet and are one\n");
    EXPECT_EQ(run("offset a.dxf --distance 3 --each -o a.svg").out, "2 contours, 2 offsets\n");
    EXPECT_NE(run("offset a.dxf --distance 2 -o a.svg").err.find("just twice as wide"),
              std::string::npos);
    const Outcome cut = run("toolpath a.dxf --tool 6 -o a.svg");
    EXPECT_EQ(cut.exitCode, 1);
    EXPECT_EQ(cut.err,
              "gmpath: a.dxf: contours 1 and 2 cut as one: the tool does not fit between them\n");
}

TEST_F(Program, FaultyOffsetsOfTheKernelAreNamedAndDashed) {
    // Of a polygon that crosses itself the kernel makes no closed offset; regions do.
    const std::vector<gmregion::Element> crossing = {
        {{0, 0}, {}}, {{20, 12}, {}}, {{20, 0}, {}}, {{0, 10}, {}}};
    m_scratch.store("a.dxf", drawing_text::drawing(drawing_text::lightPolyline(crossing, true)));
    EXPECT_EQ(run("offset a.dxf --distance 1 --side left -o a.svg").exitCode, 0);
    EXPECT_EQ(m_scratch.content("a.svg").find("dashed: faulty"), std::string::npos);
    const Outcome offset =
        run("offset a.dxf --engine kernel --distance 1 --side left -o a.svg -o b.dxf");
    EXPECT_EQ(offset.exitCode, 1);
    EXPECT_EQ(offset.err.find(
                  "gmpath: a.dxf: contour 1 on layer 0 near (0, 0): the offset at distance 1 is "
                  "faulty: "),
              0U)
        << offset.err;
    EXPECT_EQ(m_scratch.files(), 3U);
    const std::string svg = m_scratch.content("a.svg");
    EXPECT_NE(svg.find("class=\"result pass-1 doubtful\""), std::string::npos);
    EXPECT_NE(svg.find("dashed: faulty"), std::string::npos);
}

TEST_F(Program, CleanTellsWhatItMended) {
    using drawing_text::drawing;
    using drawing_text::lightPolyline;
    const std::vector<gmregion::Element> side = {{{3, 0}, {}}, {{12, 0}, {}}};
    m_scratch.store("a.dxf", drawing(lightPolyline(rectangle({0, 0}, {10, 10}).elements, true) +
                                     lightPolyline(rectangle({5, 0}, {15, 10}).elements, true) +
                                     lightPolyline(side, false)));
    const Outcome clean = run("clean a.dxf -o c.dxf -o c.svg");
    EXPECT_EQ(clean.exitCode, 0);
    EXPECT_NE(clean.out.find("overlapping elements cut              1\n"), std::string::npos);
    EXPECT_NE(clean.out.find("outlines                              1\n"), std::string::npos);
    const Outcome info = run("info c.dxf");
    EXPECT_EQ(contourRows(info.out), 1);
    EXPECT_NE(info.out.find("150.0000"), std::string::npos);
}

TEST_F(Program, NoProgramWhereContoursAreBroken) {
    using drawing_text::circle;
    using drawing_text::drawing;
    using drawing_text::entity;
    using drawing_text::line;
    // An outline that lacks a side, with a hole; beside it a whole part.
    const std::string torn = line({0, 0}, {40, 0}) + line({40, 0}, {40, 20}) +
                             line({0, 20}, {0, 0}) + circle({20, 10}, 5);
    const std::string whole = circle({80, 10}, 12) + circle({80, 10}, 6);
    m_scratch.store("a.dxf", drawing(torn + line({40, 20}, {30, 20}) + whole));
    const Outcome refused = run("toolpath a.dxf --tool 2 -o a.ngc -o a.svg");
    EXPECT_EQ(refused.exitCode, 1);
    EXPECT_NE(refused.err.find("is open by 30 but runs round others"), std::string::npos);
    EXPECT_EQ(m_scratch.files(), 1U) << "no output is written";

    // The side is there, but of a kind that cannot be read.
    const std::string side =
        entity("MLINE", {{8, "0"}, {10, "40"}, {20, "20"}, {11, "0"}, {21, "20"}});
    m_scratch.store("a.dxf", drawing(torn + side + whole));
    const Outcome skipped = run("toolpath a.dxf --tool 2 -o a.ngc");
    EXPECT_EQ(skipped.exitCode, 1);
    EXPECT_NE(skipped.err.find("ends where a MLINE on layer 0 was skipped"), std::string::npos);
    EXPECT_EQ(m_scratch.files(), 1U);
    const Outcome anyway = run("toolpath a.dxf --tool 2 --anyway -o a.ngc");
    EXPECT_EQ(anyway.exitCode, 1);
    EXPECT_NE(anyway.err.find("contours 1 and 2 are not cut"), std::string::npos);
    const std::string program = m_scratch.content("a.ngc");
    EXPECT_NE(program.find("(contour 3)"), std::string::npos);
    EXPECT_NE(program.find("(contour 4)"), std::string::npos);
    EXPECT_EQ(program.find("(contour 1)"), std::string::npos);
    EXPECT_EQ(program.find("(contour 2)"), std::string::npos);
    // Texts may lie where they will, and slits may be open.
    m_scratch.store(
        "a.dxf", drawing(whole + line({80, 0}, {80, 2}) + entity("TEXT", {{10, "80"}, {20, "2"}})));
    EXPECT_EQ(run("toolpath a.dxf --tool 0.5 -o b.ngc").exitCode, 0);
}

TEST_F(Program, NoProgramWhereCutsEnterOthers) {
    using drawing_text::circle;
    using drawing_text::drawing;
    using drawing_text::line;
    m_scratch.store("a.dxf", drawing(circle({0, 0}, 10) + line({-20, 0}, {20, 0}, "SLIT")));
    const Outcome refused = run("toolpath a.dxf --tool 2 -o a.ngc -o a.svg");
    EXPECT_EQ(refused.exitCode, 1);
    EXPECT_NE(refused.err.find("no program is written"), std::string::npos);
    EXPECT_EQ(m_scratch.files(), 2U) << "the picture shows why";
    EXPECT_EQ(run("toolpath a.dxf --tool 2 --anyway -o a.ngc").exitCode, 1);
    EXPECT_EQ(m_scratch.files(), 3U);
}

TEST_F(Program, LikeRemarksAreOneLine) {
    using drawing_text::circle;
    using drawing_text::drawing;
    std::string dots;
    for (int i = 0; i < 50; ++i)
        dots += circle({10.0 * i, 0}, 1);
    m_scratch.store("a.dxf", drawing(dots));
    const Outcome outcome = run("offset a.dxf --distance -2 -o a.svg");
    EXPECT_EQ(outcome.err,
              "gmpath: a.dxf: 50 times: contour 1 on layer 0 near (1, 0): nothing left at distance "
              "-2; contour 2 on layer 0 near (11, 0): nothing left at distance -2; contour 3 on "
              "layer 0 near (21, 0): nothing left at distance -2; and 47 more\n");
}

TEST_F(Program, RefusedContoursAreToldWithTheCause) {
    const std::vector<gmregion::Element> touching = {
        {{0, 0}, {}}, {{10, 0}, {}}, {{10, 10}, {}}, {{0.00005, 0}, {}}};
    m_scratch.store("a.dxf", drawing_text::drawing(drawing_text::lightPolyline(touching, false)));
    const Outcome outcome = run("corners a.dxf --radius 1 -o b.svg --join 1e-6");
    EXPECT_EQ(outcome.exitCode, 1);
    EXPECT_NE(outcome.err.find("gmpath: a.dxf: contour 1 on layer 0 near "), std::string::npos);
    EXPECT_NE(outcome.err.find("open, but its end comes within 0.0001 of its start"),
              std::string::npos);
    EXPECT_EQ(run("offset a.dxf --distance 1 -o b.svg").exitCode, 0) << "closed by the joining";
}

TEST_F(Program, BadInputIsOneLineAndExitCodeTwo) {
    m_scratch.store("empty.dxf", "");
    m_scratch.store("prose.dxf", "This is no drawing.\nNot at all.\n");
    m_scratch.store("cut.dxf", "0\nSECTION\n2\nENTITIES\n0\nLINE\n8\n0\n10\n");
    m_scratch.store("binary.dxf", std::string("\x7F"
                                              "ELF\0\0\1\2",
                                              8));
    m_scratch.store("bare.dxf", "0\nSECTION\n2\nENTITIES\n0\nENDSEC\n0\nEOF\n");
    m_scratch.store("feet.dxf", kDrawingInFeet);
    std::filesystem::create_directory(m_scratch.file("folder.dxf"));
    const std::size_t before = m_scratch.files();
    for (const auto& [arguments, cause] : unusableCommands()) {
        SCOPED_TRACE(arguments);
        const Outcome outcome = run(arguments);
        EXPECT_EQ(outcome.exitCode, 2);
        EXPECT_TRUE(isOneLine(outcome.err)) << outcome.err;
        EXPECT_NE(outcome.err.find(cause), std::string::npos) << outcome.err;
        EXPECT_EQ(outcome.out, "");
        EXPECT_EQ(m_scratch.files(), before);
    }
}

TEST_F(Program, HelpHasAnExamplePerSubcommand) {
    EXPECT_NE(run("info --help").out.find("Example: gmpath info"), std::string::npos);
    EXPECT_NE(run("offset --help").out.find("Example: gmpath offset"), std::string::npos);
    EXPECT_NE(run("toolpath --help").out.find("Example: gmpath toolpath"), std::string::npos);
    const Outcome version = run("--version");
    EXPECT_EQ(version.exitCode, 0);
    EXPECT_EQ(version.out.find("gmpath "), 0U);
    EXPECT_NE(version.out.find("pugixml 1."), std::string::npos);
}
