// SPDX-License-Identifier: MIT
#include "machining/picture/ToolpathPicture.h"

#include <algorithm>

#include "drawing/svg/SvgPage.h"

namespace gmmachining {

using gmdrawing::SvgLegendEntry;
using gmdrawing::SvgPage;
using gmdrawing::svgRule;
using gmpart::OffsetPath;
using gmpart::Path;
using gmregion::Box;
using gmregion::Vec2;

namespace {

constexpr const char* kSourceColour = "#212529";
constexpr const char* kCutColour = "#1c7ed6";
constexpr const char* kLeadColour = "#d9480f";
constexpr const char* kRapidColour = "#868e96";

/// Sizes as fractions of the picture's diagonal.
constexpr double kStroke = 0.0012;
constexpr double kThinStroke = 0.0006;
constexpr double kDash = 0.006;
constexpr double kShortDash = 0.004;
constexpr double kPlungeRadius = 0.002;

/// What the picture shows as a whole; the way from the origin may come in from outside.
Box boxOf(const std::vector<Path>& contours, const ToolpathResult& result) {
    Box box;
    for (const Path& contour : contours)
        box.include(boundingBox(contour));
    for (const Move& move : result.moves) {
        if (move.kind != MoveKind::kRapid) box.include(boundingBox(move.path));
    }
    for (const OffsetPath& faulty : result.offsets.paths)
        box.include(boundingBox(faulty.path));
    return box;
}

std::vector<SvgLegendEntry> legendOf(const ToolpathResult& result) {
    std::vector<SvgLegendEntry> legend = {{"part", kSourceColour},
                                          {"cuts", kCutColour},
                                          {"leads", kLeadColour},
                                          {"rapid moves", kRapidColour}};
    if (!result.offsets.paths.empty())
        legend.insert(legend.begin() + 1, {"dashed: faulty", kSourceColour});
    return legend;
}

/// Where strokes can keep their width they do; elsewhere it follows the size of the drawing.
std::string styleRules(double diagonal) {
    const auto stroke = [&](const char* name, const char* colour, double width) {
        return svgRule(name, {{"stroke", colour}, {"stroke-width", width * diagonal}});
    };
    return stroke(".source", kSourceColour, kStroke) + stroke(".cut", kCutColour, kStroke) +
           stroke(".lead", kLeadColour, kStroke) + stroke(".rapid", kRapidColour, kThinStroke) +
           svgRule(".rapid", {{"stroke-dasharray", kDash * diagonal}}) +
           svgRule(".cut-mark", {{"fill", kCutColour}}) +
           stroke(".doubtful", kSourceColour, kThinStroke) +
           svgRule(".doubtful", {{"stroke-dasharray", kShortDash * diagonal}}) +
           stroke(".plunge", kLeadColour, kThinStroke) +
           ".plunge { fill: none; }\n"
           "@supports (vector-effect: non-scaling-stroke) {\n"
           "path, circle { vector-effect: non-scaling-stroke; }\n"
           ".source, .cut, .lead { stroke-width: 1.5px; }\n"
           ".rapid { stroke-width: 0.8px; stroke-dasharray: 6px; }\n"
           ".doubtful { stroke-width: 1.2px; stroke-dasharray: 5px; }\n"
           ".plunge { stroke-width: 0.8px; }\n}\n";
}

/// A move in the material, which begins where the tool is.
void drawInMaterial(SvgPage& page, const Move& move, Vec2 place) {
    if (move.kind == MoveKind::kPlunge) {
        page.circle(place, kPlungeRadius * page.diagonal(), "plunge");
    } else if (move.kind == MoveKind::kLead) {
        page.draw(move.path, "lead");
    } else {
        page.draw(move.path, "cut");
        page.startMark(move.path, "cut-mark");
    }
}

void drawMoves(SvgPage& page, const Toolpath& moves) {
    double lowest = 0.0;
    for (const Move& move : moves)
        lowest = std::min(lowest, move.z);
    Vec2 place;
    for (const Move& move : moves) {
        const bool goesOn = !move.path.elements.empty();
        if (move.kind != MoveKind::kRapid) {
            if (move.z == lowest) drawInMaterial(page, move, place);
        } else if (goesOn) {
            page.draw(move.path, "rapid");
        }
        if (goesOn) place = move.path.elements.back().ep;
    }
}

}  // namespace

std::string svgOf(const std::vector<Path>& contours, const ToolpathResult& result) {
    SvgPage page(boxOf(contours, result));
    page.begin(styleRules(page.diagonal()), legendOf(result));
    for (const Path& contour : contours)
        page.draw(contour, "source");
    drawMoves(page, result.moves);
    for (const OffsetPath& faulty : result.offsets.paths)
        page.draw(faulty.path, "doubtful");
    return page.finish();
}

}  // namespace gmmachining
