#include "drawing/svg/ResultPicture.h"

#include <algorithm>
#include <array>

#include "drawing/Text.h"
#include "drawing/contours/Nesting.h"
#include "drawing/svg/SvgPage.h"
#include "drawing/svg/SvgSymbols.h"
#include "region/model/Area.h"
#include "region/model/Box.h"

namespace gmdrawing {

using gmregion::Box;
using gmregion::Path;
using gmregion::Sense;

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

bool hasDoubtful(const ResultDrawing& drawing) {
    for (const std::vector<ResultPath>& results : drawing.results) {
        const auto isDoubtful = [](const ResultPath& result) { return result.doubtful; };
        if (std::any_of(results.begin(), results.end(), isDoubtful)) return true;
    }
    return false;
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

std::string senseName(const Path& path) {
    if (!path.closed) return "open";
    switch (sense(path)) {
        case Sense::kCounterClockwise:
            return "closed, counter-clockwise";
        case Sense::kClockwise:
            return "closed, clockwise";
        case Sense::kNone:
            break;
    }
    return "closed";
}

class SvgWriter {
public:
    explicit SvgWriter(const ResultDrawing& drawing)
        : m_drawing(drawing), m_depths(nestingDepths(drawing.contours)), m_page(boxOf(drawing)) {}

    std::string run() {
        for (std::size_t i = 0; i < m_drawing.contours.size(); ++i)
            writeContour(i);
        for (std::size_t i = 0; m_drawing.replacesSources && i < m_drawing.contours.size(); ++i)
            writeResults(i);
        return m_page.picture(styleRules(), m_svg, legendEntries());
    }

private:
    /// Where strokes can keep their width they do; elsewhere it follows the size of the drawing.
    std::string styleRules() const {
        const bool below = m_drawing.replacesSources;
        const double sourceFraction = below ? kSourceBelowStrokeFraction : kSourceStrokeFraction;
        const std::string sourceWidth = formatReal(sourceFraction * m_page.diagonal());
        const std::string offsetWidth = formatReal(kOffsetStrokeFraction * m_page.diagonal());
        const std::string dash = formatReal(kDashFraction * m_page.diagonal());
        std::string rules = ".source { stroke: " + sourceColour() +
                            "; stroke-width: " + sourceWidth +
                            "; }\n.result { stroke-width: " + offsetWidth +
                            "; }\n.doubtful { stroke-dasharray: " + dash + "; }\n";
        rules += ".source-mark { fill: " + sourceColour() + "; }\n";
        for (std::size_t pass = 0; pass < m_drawing.passes.size(); ++pass) {
            const std::string name = passClass(pass);
            const std::string colour = passColour(pass);
            rules += "." + name + " { stroke: " + colour + "; }\n";
            rules += "." + name + "-mark { fill: " + colour + "; }\n";
        }
        return rules +
               "@supports (vector-effect: non-scaling-stroke) {\n"
               "path { vector-effect: non-scaling-stroke; }\n"
               ".source { stroke-width: " +
               std::string(below ? "0.7" : "1.8") +
               "px; }\n.result { stroke-width: 1.2px; }\n"
               ".doubtful { stroke-dasharray: 5px; }\n}\n";
    }

    std::string sourceColour() const {
        return m_drawing.replacesSources ? kSourceBelowColour : kSourceColour;
    }

    static std::string passClass(std::size_t pass) { return "pass-" + std::to_string(pass + 1); }

    std::string label(std::size_t index) const {
        return m_drawing.labels.empty() ? std::to_string(index + 1) : m_drawing.labels[index];
    }

    void writeContour(std::size_t index) {
        const Path& contour = m_drawing.contours[index];
        const std::string number = label(index);
        m_svg += "<g id=\"contour-" + number + "\">\n<title>contour " + number + ", layer " +
                 xmlEscaped(printable(contour.layer)) + ", " + senseName(contour) + "</title>\n";
        if (!m_drawing.replacesSources) writeResults(index);
        m_svg += svgPathTag(contour, "source");
        m_svg += startMark(contour, "source-mark", m_page.diagonal());
        m_svg += numberLabel(contour, number, isOutline(index), m_page.diagonal());
        m_svg += "</g>\n";
    }

    void writeResults(std::size_t index) {
        for (const ResultPath& result : m_drawing.results[index]) {
            const std::string style = "result " + passClass(result.pass);
            m_svg += svgPathTag(result.path, result.doubtful ? style + " doubtful" : style);
            m_svg += startMark(result.path, passClass(result.pass) + "-mark", m_page.diagonal());
        }
    }

    /// Numbers stand in the material: inside of outlines, outside of holes.
    bool isOutline(std::size_t index) const { return m_depths[index].value_or(0) % 2 == 0; }

    std::vector<SvgLegendEntry> legendEntries() const {
        std::vector<SvgLegendEntry> entries = {{"source", sourceColour()}};
        if (hasDoubtful(m_drawing)) entries.push_back({"dashed: faulty", kSourceColour});
        for (std::size_t pass = 0; pass < m_drawing.passes.size(); ++pass) {
            entries.push_back({m_drawing.passes[pass].legend, passColour(pass)});
        }
        return entries;
    }

    const ResultDrawing& m_drawing;
    std::vector<std::optional<int>> m_depths;
    SvgPage m_page;
    std::string m_svg;
};

}  // namespace

std::string svgOf(const ResultDrawing& drawing) {
    return SvgWriter(drawing).run();
}

}  // namespace gmdrawing
