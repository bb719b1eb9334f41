#include "ToolpathSvg.h"

#include <algorithm>

#include "SvgPage.h"
#include "SvgSymbols.h"
#include "Text.h"

namespace gmpath {

namespace {

constexpr const char* kSourceColour = "#212529";
constexpr const char* kCutColour = "#1c7ed6";
constexpr const char* kLeadColour = "#d9480f";
constexpr const char* kRapidColour = "#868e96";

/// Sizes as fractions of the picture's diagonal.
constexpr double kStroke = 0.0012;
constexpr double kThinStroke = 0.0006;
constexpr double kDash = 0.006;
constexpr double kPlungeRadius = 0.002;

/// What the picture shows as a whole; the way from the origin may come in from outside.
Box boxOf(const std::vector<Path>& contours, const Toolpath& moves) {
    Box box;
    for (const Path& contour : contours)
        box.include(boundingBox(contour));
    for (const Move& move : moves) {
        if (move.kind != MoveKind::kRapid) box.include(boundingBox(move.path));
    }
    return box;
}

double lowestLevel(const Toolpath& moves) {
    double lowest = 0.0;
    for (const Move& move : moves)
        lowest = std::min(lowest, move.z);
    return lowest;
}

class ToolpathSvg {
public:
    ToolpathSvg(const std::vector<Path>& contours, const Toolpath& moves)
        : m_contours(contours),
          m_moves(moves),
          m_lowest(lowestLevel(moves)),
          m_page(boxOf(contours, moves)) {}

    std::string run() {
        m_svg = m_page.head(styleRules());
        for (const Path& contour : m_contours)
            m_svg += svgPathTag(contour, "source");
        for (const Move& move : m_moves)
            draw(move);
        const std::vector<SvgLegendEntry> legend = {{"part", kSourceColour},
                                                    {"cuts", kCutColour},
                                                    {"leads", kLeadColour},
                                                    {"rapid moves", kRapidColour}};
        return m_svg + m_page.legend(legend) + "</svg>\n";
    }

private:
    std::string strokeRule(const std::string& name, const std::string& colour, double width) const {
        return "." + name + " { stroke: " + colour +
               "; stroke-width: " + formatReal(width * m_page.diagonal()) + "; }\n";
    }

    /// Where strokes can keep their width they do; elsewhere it follows the size of the drawing.
    std::string styleRules() const {
        return strokeRule("source", kSourceColour, kStroke) +
               strokeRule("cut", kCutColour, kStroke) + strokeRule("lead", kLeadColour, kStroke) +
               strokeRule("rapid", kRapidColour, kThinStroke) +
               ".rapid { stroke-dasharray: " + formatReal(kDash * m_page.diagonal()) +
               "; }\n.cut-mark { fill: " + kCutColour + "; }\n" +
               strokeRule("plunge", kLeadColour, kThinStroke) +
               ".plunge { fill: none; }\n"
               "@supports (vector-effect: non-scaling-stroke) {\n"
               "path, circle { vector-effect: non-scaling-stroke; }\n"
               ".source, .cut, .lead { stroke-width: 1.5px; }\n"
               ".rapid { stroke-width: 0.8px; stroke-dasharray: 6px; }\n"
               ".plunge { stroke-width: 0.8px; }\n}\n";
    }

    void draw(const Move& move) {
        switch (move.kind) {
            case MoveKind::kRapid:
                if (!move.path.elements.empty()) m_svg += svgPathTag(move.path, "rapid");
                break;
            case MoveKind::kPlunge:
                if (move.z == m_lowest) drawPlunge();
                break;
            case MoveKind::kLead:
                if (move.z == m_lowest) m_svg += svgPathTag(move.path, "lead");
                break;
            case MoveKind::kCut:
                if (move.z == m_lowest) drawCut(move.path);
                break;
        }
        if (!move.path.elements.empty()) m_place = move.path.elements.back().ep;
    }

    void drawPlunge() {
        m_svg += "<circle class=\"plunge\" cx=\"" + formatReal(m_place.x) + "\" cy=\"" +
                 formatReal(-m_place.y) + "\" r=\"" +
                 formatReal(kPlungeRadius * m_page.diagonal()) + "\"/>\n";
    }

    void drawCut(const Path& path) {
        m_svg += svgPathTag(path, "cut");
        m_svg += startMark(path, "cut-mark", m_page.diagonal());
    }

    const std::vector<Path>& m_contours;
    const Toolpath& m_moves;
    double m_lowest;
    SvgPage m_page;
    Vec2 m_place;
    std::string m_svg;
};

}  // namespace

std::string svgOf(const std::vector<Path>& contours, const Toolpath& moves) {
    return ToolpathSvg(contours, moves).run();
}

}  // namespace gmpath
