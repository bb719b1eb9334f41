// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <filesystem>

#include "drawing/InputError.h"
#include "drawing/dxf/DxfHeader.h"
#include "drawing/files/PartReader.h"
#include "machining/ToolpathJob.h"
#include "machining/gcode/GcodeWriter.h"
#include "part/model/Area.h"
#include "part/model/PathStart.h"
#include "tests/support/GcodeReader.h"
#include "tests/support/PathShapes.h"

using namespace gmpart;
using namespace gmregion;
using namespace gmdrawing;
using namespace gmmachining;
using path_shapes::circle;
using path_shapes::kPi;
using path_shapes::polygon;
using path_shapes::rectangle;

namespace {

constexpr double kSafeZ = 5.0;

/// How far offsets may fall short of their distance.
constexpr double kOffsetTolerance = 1e-3;

ToolpathResult toolpath(const std::vector<Path>& contours, const ToolpathRequest& request) {
    return makeToolpath(contours, request, [](std::size_t, std::size_t) {});
}

ToolpathRequest request(double distance, LeadKind lead = LeadKind::kNone,
                        PartSide part = PartSide::kRight) {
    return {{distance}, part, {lead, 2.0, 2.0, 90.0}, {-1.0}, kSafeZ};
}

/// Distance of the nearest contour to any point cut below the surface.
double clearance(const GcodeProgram& program, const std::vector<Path>& contours) {
    double nearest = HUGE_VAL;
    for (const GcodeMove& move : program.moves) {
        if (!move.cuts()) continue;
        for (const Vec2 p : move.points(0.25)) {
            for (const Path& contour : contours)
                nearest = std::min(nearest, distance(contour, p));
        }
    }
    return nearest;
}

std::vector<Path> examplePart(const std::filesystem::path& file, double scale) {
    ReadOptions options;
    options.scale = scale;
    return readPart(file.string(), options).contours;
}

/// The least distance between a path and a contour, by points of the path.
double clearanceBetween(const Path& path, const Path& contour) {
    constexpr int kPoints = 50;
    double nearest = HUGE_VAL;
    for (const Element& e : path.elements) {
        for (int i = 0; i < kPoints; ++i)
            nearest = std::min(nearest, distance(contour, pointAt(e, 1.0 * i / kPoints)));
    }
    return nearest;
}

std::vector<Path> movesOfKind(const Toolpath& moves, MoveKind kind) {
    std::vector<Path> paths;
    for (const Move& move : moves) {
        if (move.kind == kind && !move.path.elements.empty()) paths.push_back(move.path);
    }
    return paths;
}

}  // namespace

TEST(Toolpath, MachineAcceptsEveryExampleAndThePartKeepsItsStock) {
    std::size_t checked = 0;
    for (const auto& entry : std::filesystem::directory_iterator(GMPATH_EXAMPLE_PARTS)) {
        if (entry.path().extension() != ".dxf") continue;
        for (const LeadKind lead :
             {LeadKind::kNone, LeadKind::kLine, LeadKind::kPerpendicular, LeadKind::kArc}) {
            for (const Units units : {Units::kMillimetres, Units::kInches}) {
                SCOPED_TRACE(entry.path().filename().string());
                const double unit = units == Units::kInches ? 1.0 / 25.4 : 1.0;
                const std::vector<Path> contours = examplePart(entry.path(), unit);
                ToolpathRequest asked = request(2.5 * unit, lead);
                asked.distances = {5.5 * unit, 2.5 * unit};
                asked.levels = {-1.0, -1.5};
                asked.lead.length = asked.lead.radius = 3.0 * unit;
                const ToolpathResult made = toolpath(contours, asked);
                const GcodeProgram program =
                    readGcode(gcodeOf(made.moves, {units, 800.0, 200.0, 9000.0, 5.0, "part"}), 5.0);
                EXPECT_TRUE(program.faults.empty()) << program.faults.front();
                EXPECT_EQ(program.inches, units == Units::kInches);
                EXPECT_NEAR(clearance(program, contours), 2.5 * unit, kOffsetTolerance);
                for (const ContourCut& cut : made.contours) {
                    EXPECT_TRUE(cut.fits);
                    EXPECT_EQ(cut.leads.made + cut.leads.dropped > 0, lead != LeadKind::kNone);
                }
                ++checked;
            }
        }
    }
    EXPECT_GE(checked, 24U);
}

TEST(Toolpath, ThePartLiesOnTheChosenSide) {
    // An island within a hole, and both senses of the sources.
    const std::vector<Path> contours = {reversed(rectangle({0, 0}, {60, 40})),
                                        rectangle({10, 10}, {50, 30}), circle({30, 20}, 4),
                                        polygon({{70, 0}, {80, 0}, {80, 20}}, false)};
    for (const PartSide part : {PartSide::kRight, PartSide::kLeft}) {
        const bool climb = part == PartSide::kRight;
        for (const Move& move : toolpath(contours, request(1.5, LeadKind::kNone, part)).moves) {
            if (move.kind != MoveKind::kCut) continue;
            const bool hole = move.contour == 1;
            if (move.path.closed) {
                EXPECT_EQ(sense(move.path) == Sense::kClockwise, climb != hole) << move.contour;
                continue;
            }
            const Element& first = move.path.elements.front();
            const Vec2 right = rightNormal(unit(first.ep - first.sp));
            const double ahead = distance(contours[3], halvingPoint(first) + right);
            EXPECT_EQ(ahead < 1.5, climb);
        }
    }
}

TEST(Toolpath, WhatIsInsideComesFirstAndTheNearestIsNext) {
    const std::vector<Path> contours = {rectangle({0, 0}, {60, 40}),
                                        circle({50, 20}, 5),
                                        circle({10, 20}, 5),
                                        polygon({{20, 20}, {30, 20}}, false),
                                        rectangle({100, 0}, {120, 40}),
                                        circle({110, 20}, 5)};
    std::vector<std::size_t> order;
    for (const Move& move : toolpath(contours, request(2)).moves) {
        if (move.kind == MoveKind::kCut && (order.empty() || order.back() != move.contour)) {
            order.push_back(move.contour);
        }
    }
    EXPECT_EQ(order, std::vector<std::size_t>({2, 3, 1, 0, 5, 4}));
}

TEST(Toolpath, LeadsGiveWayToThePartAndItsNeighbours) {
    // A pocket little wider than the tool, and a neighbour 6 away from the side where the cut of
    // the first outline begins.
    const std::vector<Path> contours = {rectangle({0, 0}, {60, 40}), rectangle({20, 10}, {27, 30}),
                                        rectangle({-5, -46}, {65, -6})};
    std::size_t shortened = 0;
    for (const LeadKind kind : {LeadKind::kLine, LeadKind::kPerpendicular, LeadKind::kArc}) {
        ToolpathRequest asked = request(2.5, kind);
        asked.lead.length = asked.lead.radius = 3.0;
        const ToolpathResult made = toolpath(contours, asked);
        for (const ContourCut& cut : made.contours) {
            EXPECT_EQ(cut.leads.made + cut.leads.dropped, 2U);
            EXPECT_EQ(cut.leads.shortened > 0, cut.leads.smallest < 3.0);
            shortened += cut.leads.shortened;
        }
        for (const Path& lead : movesOfKind(made.moves, MoveKind::kLead)) {
            for (int i = 0; i <= 100; ++i) {
                const Element& e = lead.elements.front();
                const Vec2 p = pointAt(e, 0.01 * i);
                for (const Path& contour : contours)
                    EXPECT_GT(distance(contour, p), 2.5 - 2e-3);
            }
        }
    }
    EXPECT_GT(shortened, 0U);
    // A lead that is far too long does not jump over the wall either.
    ToolpathRequest longest = request(2.5, LeadKind::kLine);
    longest.lead.length = 1e9;
    const ToolpathResult hole = toolpath({contours[0], circle({40, 20}, 5)}, longest);
    EXPECT_EQ(hole.contours[1].leads.dropped, 2U);
    // Nor does a tight arc pass between two looks at the wall of a hole little wider than the tool.
    const std::vector<Path> slot = {rectangle({-90, -90}, {90, 90}), rectangle({0, 0}, {12, 6.03})};
    ToolpathRequest tight = request(3.0, LeadKind::kArc);
    tight.lead.radius = 0.02;
    tight.lead.angle = 180.0;
    for (const Path& lead : movesOfKind(toolpath(slot, tight).moves, MoveKind::kLead)) {
        for (int i = 0; i <= 100; ++i) {
            for (const Element& e : lead.elements)
                EXPECT_GT(distance(slot[1], pointAt(e, 0.01 * i)), 3.0 - 2e-3);
        }
    }
    // Left alone, a lead has the size and the angle that were asked for.
    const ToolpathResult free = toolpath({contours[0]}, request(2.5, LeadKind::kArc));
    const std::vector<Path> leads = movesOfKind(free.moves, MoveKind::kLead);
    ASSERT_EQ(leads.size(), 2U);
    const Path cut = movesOfKind(free.moves, MoveKind::kCut).front();
    for (const Path& lead : leads) {
        EXPECT_NEAR(radius(lead.elements[0]), 2.0, 1e-6);
        EXPECT_NEAR(sweep(lead.elements[0]), 0.5 * kPi, 1e-6);
    }
    const Vec2 along = tangentStart(cut.elements[0]);
    EXPECT_GT(dot(tangentEnd(leads[0].elements[0]), along), 1.0 - 1e-9);
    EXPECT_GT(dot(tangentStart(leads[1].elements[0]), tangentEnd(cut.elements.back())), 1.0 - 1e-9);
}

TEST(Toolpath, LevelsOfAClosedCutFollowWithoutLifting) {
    ToolpathRequest asked = request(2);
    asked.levels = {-1, -2, -3};
    const ToolpathResult made = toolpath({rectangle({10, 10}, {30, 30})}, asked);
    std::vector<double> heights;
    for (const Move& move : made.moves) {
        if (move.path.elements.empty()) heights.push_back(move.z);
    }
    EXPECT_EQ(heights, std::vector<double>({kSafeZ, -1, -2, -3, kSafeZ}));
    const std::vector<Path> cuts = movesOfKind(made.moves, MoveKind::kCut);
    ASSERT_EQ(cuts.size(), 3U);
    // The start is beside the start of the contour, in either direction.
    EXPECT_LT(distance(cuts[0].elements[0].sp, Vec2{10, 8}), 1e-6);
    asked.part = PartSide::kLeft;
    const ToolpathResult other = toolpath({rectangle({10, 10}, {30, 30})}, asked);
    EXPECT_LT(distance(movesOfKind(other.moves, MoveKind::kCut)[0].elements[0].sp, Vec2{10, 8}),
              1e-6);
}

TEST(Toolpath, ATightHoleIsLeftOutAndTheRestIsCut) {
    const ToolpathResult made =
        toolpath({rectangle({0, 0}, {60, 40}), circle({30, 20}, 2)}, request(2.5));
    EXPECT_FALSE(made.contours[1].fits);
    EXPECT_TRUE(made.contours[0].fits);
    EXPECT_EQ(movesOfKind(made.moves, MoveKind::kCut).size(), 1U);
}

TEST(Toolpath, WhereTheToolDoesNotFitBetweenContoursTheyAreCutAsOne) {
    const std::vector<Path> contours = {rectangle({0, 0}, {60, 40}), rectangle({66, 0}, {80, 40}),
                                        rectangle({10, 10}, {50, 30}), circle({30, 20}, 3)};
    const auto made = [&](double last, double first) {
        ToolpathRequest asked = request(last);
        asked.distances = {first, last};
        return toolpath(contours, asked);
    };
    using Together = std::vector<std::vector<std::size_t>>;
    EXPECT_EQ(made(2.9, 2.9).together, Together());
    EXPECT_EQ(made(3.1, 3.1).together, Together({{0, 1}}));
    // Only the last pass parts contours.
    const ToolpathResult wide = made(1.0, 4.0);
    EXPECT_EQ(wide.together, Together());
    // No cut goes through a neighbour, neither of a far pass.
    for (const Path& cut : movesOfKind(made(2.9, 5.0).moves, MoveKind::kCut)) {
        for (const Path& contour : contours)
            EXPECT_GT(clearanceBetween(cut, contour), 2.9 - 1e-3);
    }
    EXPECT_EQ(movesOfKind(made(2.9, 5.0).moves, MoveKind::kCut).size(), 7U);
}

TEST(Obstacles, AgreeWithDenseSamples) {
    const std::vector<Path> contours = {circle({0, 0}, 0.01), rectangle({5, -3}, {5.02, 3}),
                                        polygon({{-4, 2}, {-4, 8}, {2, 8}}, false)};
    const Obstacles obstacles(contours, 1e-4);
    EXPECT_TRUE(rc::check([&] {
        const auto number = [] { return *rc::gen::inRange(-1000, 1000) * 0.01; };
        const double clearance = 0.05 + std::abs(number()) * 0.1;
        const Element e{{number(), number()}, {number(), number()}, number() * 0.2};
        double nearest = HUGE_VAL;
        for (int i = 0; i <= 2000; ++i) {
            const Vec2 p = pointAt(e, i / 2000.0);
            for (const Path& contour : contours)
                nearest = std::min(nearest, distance(contour, p));
        }
        const bool clear = obstacles.keepClear({{e}, false, ""}, clearance);
        if (nearest < clearance - 2e-3) RC_ASSERT(!clear);
        if (nearest > clearance + 2e-2) RC_ASSERT(clear);
    }));
}

TEST(PathStart, RunningFromAnotherPointKeepsTheCurve) {
    const Path slot{
        {{{0, 0}, {20, 0}}, {{20, 0}, {20, 8}, 1.0}, {{20, 8}, {0, 8}}, {{0, 8}, {0, 0}, 3.0}},
        true,
        ""};
    EXPECT_TRUE(rc::check([&] {
        const Vec2 p{*rc::gen::inRange(-200, 400) * 0.1, *rc::gen::inRange(-200, 300) * 0.1};
        for (const Path& path : {slot, reversed(slot)}) {
            const PathPlace place = nearestPlace(path, p);
            RC_ASSERT(std::abs(distance(place.point, p) - distance(path, p)) < 1e-9);
            const Path moved = startedAt(path, place);
            RC_ASSERT(distance(moved.elements.front().sp, place.point) < 2e-3);
            RC_ASSERT(moved.elements.back().ep == moved.elements.front().sp);
            RC_ASSERT(std::abs(signedArea(moved) - signedArea(path)) < 1e-8);
            RC_ASSERT(std::abs(length(moved) - length(path)) < 1e-8);
        }
    }));
}

TEST(GcodeWriter, RandomArcsStayConsistentWhenRounded) {
    EXPECT_TRUE(rc::check([] {
        const auto number = [](int low, int high) { return *rc::gen::inRange(low, high) * 1e-7; };
        Path path{{}, false, ""};
        Vec2 at{number(-1000000, 1000000), 1e4 + number(0, 1000000)};
        for (int i = 0; i < 20; ++i) {
            const double scale = std::pow(10.0, *rc::gen::inRange(-6, 4));
            const Vec2 to = at + Vec2{scale, number(-9000000, 9000000) * scale};
            path.elements.push_back({at, to, number(-37000000, 37000000)});
            at = to;
        }
        const Path there{{{{}, path.elements.front().sp}}, false, ""};
        const Toolpath moves = {{MoveKind::kRapid, {}, 5, 0},
                                {MoveKind::kRapid, there, 5, 0},
                                {MoveKind::kPlunge, {}, -1, 0},
                                {MoveKind::kCut, path, -1, 0},
                                {MoveKind::kRapid, {}, 5, 0}};
        const GcodeProgram program = readGcode(gcodeOf(moves, {}), 5.0);
        RC_ASSERT(program.faults == std::vector<std::string>{});
        double farthest = 0.0;
        for (const GcodeMove& move : program.moves) {
            if (!move.cuts()) continue;
            for (const Vec2 p : move.points(0.1 + 0.1 * distance(move.from, move.to)))
                farthest = std::max(farthest, distance(path, p));
        }
        RC_ASSERT(farthest < 1e-3);
    }));
}

TEST(GcodeWriter, CommentsCannotEndEarly) {
    const std::string text =
        gcodeOf({}, {Units::kInches, 1.0, 1.0, {}, 0.25, "a) M3 (b\n\xC3\xA9.dxf"});
    EXPECT_EQ(text.substr(0, text.find('\n')), "(part a] M3 [b???.dxf)");
}

TEST(DrawingUnits, HeaderDecides) {
    const auto unitsOf = [](const std::string& header) {
        return machineUnits(drawingUnits(dxfGroups("0\nSECTION\n2\nHEADER\n" + header +
                                                   "0\nENDSEC\n0\nSECTION\n2\nENTITIES\n"
                                                   "0\nENDSEC\n0\nEOF\n"),
                                         {}));
    };
    EXPECT_EQ(unitsOf(""), Units::kMillimetres);
    EXPECT_EQ(unitsOf("9\n$INSUNITS\n70\n1\n"), Units::kInches);
    EXPECT_EQ(unitsOf("9\n$MEASUREMENT\n70\n0\n9\n$INSUNITS\n70\n4\n"), Units::kMillimetres);
    EXPECT_EQ(unitsOf("9\n$MEASUREMENT\n70\n0\n9\n$INSUNITS\n70\n0\n"), Units::kInches);
    EXPECT_THROW(unitsOf("9\n$INSUNITS\n70\n2\n"), InputError);
    EXPECT_THROW(unitsOf("9\n$INSUNITS\n70\n-7\n"), InputError);
}
