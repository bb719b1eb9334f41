// SPDX-License-Identifier: MIT
#include "drawing/svg/ResultPicture.h"

#include <array>
#include <optional>

#include "drawing/svg/SvgPage.h"
#include "part/model/Area.h"
#include "part/regions/Nesting.h"

namespace gmdrawing {

using gmpart::Path;
using gmpart::Sense;
using gmregion::Box;

namespace {

/// Strokes of the passes; further passes start again at the first.
constexpr std::array<const char*, 8> kPassColours = {"#d9480f", "#1c7ed6", "#2b8a3e", "#9c36b5",
                                                     "#e0a100", "#0c8599", "#c2255c", "#6741d9"};
constexpr const char* kSourceColour = "#212529";
constexpr const char* kSourceBelowColour = "#868e96";

/// Sizes as fractions of the picture's diagonal.
constexpr double kSourceStrokeFraction = 0.0014;
constexpr double kSourceBelowStrokeFraction = 0.0005;
constexpr double kOffsetStrokeFraction = 0.0009;
constexpr double kDashFraction = 0.004;

const char* passColour(std::size_t pass) {
    return kPassColours[pass % kPassColours.size()];
}

Box boxOf(const ResultDrawing& drawing) {
    Box box;
    for (const Path& contour : drawing.contours)
        box.include(boundingBox(contour));
    for (const std::vector<ResultPath>& results : drawing.results) {
        for (const ResultPath& result : results)
            box.include(boundingBox(result.path));
    }
    return box;
}

const char* sourceColour(const ResultDrawing& drawing) {
    return drawing.replacesSources ? kSourceBelowColour : kSourceColour;
}

std::vector<SvgLegendEntry> legendOf(const ResultDrawing& drawing) {
    bool doubtful = false;
    for (const std::vector<ResultPath>& results : drawing.results) {
        for (const ResultPath& result : results)
            doubtful = doubtful || result.doubtful;
    }
    std::vector<SvgLegendEntry> entries = {{"source", sourceColour(drawing)}};
    if (doubtful) entries.push_back({"dashed: faulty", kSourceColour});
    for (std::size_t pass = 0; pass < drawing.passes.size(); ++pass)
        entries.push_back({drawing.passes[pass].legend, passColour(pass)});
    return entries;
}

std::string passClass(std::size_t pass) {
    return "pass-" + std::to_string(pass + 1);
}

/// Where strokes can keep their width they do; elsewhere it follows the size of the drawing.
std::string styleRules(const ResultDrawing& drawing, double diagonal) {
    const bool below = drawing.replacesSources;
    const double sourceFraction = below ? kSourceBelowStrokeFraction : kSourceStrokeFraction;
    const std::string colour = sourceColour(drawing);
    std::string rules =
        svgRule(".source", {{"stroke", colour}, {"stroke-width", sourceFraction * diagonal}}) +
        svgRule(".result", {{"stroke-width", kOffsetStrokeFraction * diagonal}}) +
        svgRule(".doubtful", {{"stroke-dasharray", kDashFraction * diagonal}}) +
        svgRule(".source-mark", {{"fill", colour}});
    for (std::size_t pass = 0; pass < drawing.passes.size(); ++pass) {
        rules += svgRule("." + passClass(pass), {{"stroke", passColour(pass)}});
        rules += svgRule("." + passClass(pass) + "-mark", {{"fill", passColour(pass)}});
    }
    return rules +
           "@supports (vector-effect: non-scaling-stroke) {\n"
           "path { vector-effect: non-scaling-stroke; }\n" +
           svgRule(".source", {{"stroke-width", below ? "0.7px" : "1.8px"}}) +
           ".result { stroke-width: 1.2px; }\n"
           ".doubtful { stroke-dasharray: 5px; }\n}\n";
}

const char* senseName(const Path& path) {
    if (!path.closed) return "open";
    const Sense side = sense(path);
    if (side == Sense::kNone) return "closed";
    return side == Sense::kClockwise ? "closed, clockwise" : "closed, counter-clockwise";
}

void drawResults(SvgPage& page, const std::vector<ResultPath>& results) {
    for (const ResultPath& result : results) {
        const std::string name = passClass(result.pass);
        page.draw(result.path, "result " + name + (result.doubtful ? " doubtful" : ""));
        page.startMark(result.path, name + "-mark");
    }
}

/// Numbers stand in the material: inside of outlines, outside of holes.
void drawContour(SvgPage& page, const ResultDrawing& drawing, std::size_t index, bool outline) {
    const Path& contour = drawing.contours[index];
    const std::string number =
        drawing.labels.empty() ? std::to_string(index + 1) : drawing.labels[index];
    page.svg().begin("g", {{"id", "contour-" + number}});
    page.svg().element(
        "title", {}, "contour " + number + ", layer " + contour.layer + ", " + senseName(contour));
    if (!drawing.replacesSources) drawResults(page, drawing.results[index]);
    page.draw(contour, "source");
    page.startMark(contour, "source-mark");
    page.numberLabel(contour, number, outline);
    page.svg().end();
}

}  // namespace

std::string svgOf(const ResultDrawing& drawing) {
    SvgPage page(boxOf(drawing));
    page.begin(styleRules(drawing, page.diagonal()), legendOf(drawing));
    const std::vector<std::size_t> depths = gmpart::nestingOf(drawing.contours).depths;
    for (std::size_t i = 0; i < drawing.contours.size(); ++i) {
        const bool outline = !drawing.contours[i].closed || depths[i] % 2 == 0;
        drawContour(page, drawing, i, outline);
    }
    for (std::size_t i = 0; drawing.replacesSources && i < drawing.contours.size(); ++i)
        drawResults(page, drawing.results[i]);
    return page.finish();
}

}  // namespace gmdrawing
