#include "machining/picture/ToolpathPicture.h"

#include <algorithm>

#include "drawing/Text.h"
#include "drawing/svg/SvgPage.h"
#include "drawing/svg/SvgSymbols.h"

namespace gmmachining {

using gmdrawing::formatReal;
using gmdrawing::startMark;
using gmdrawing::SvgLegendEntry;
using gmdrawing::SvgPage;
using gmdrawing::svgPathTag;
using gmregion::Box;
using gmregion::Path;
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
    for (const ContourCut& cut : result.contours) {
        for (const Path& path : cut.doubtful)
            box.include(boundingBox(path));
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
    ToolpathSvg(const std::vector<Path>& contours, const ToolpathResult& result)
        : m_contours(contours),
          m_result(result),
          m_lowest(lowestLevel(result.moves)),
          m_page(boxOf(contours, result)) {}

    std::string run() {
        for (const Path& contour : m_contours)
            m_svg += svgPathTag(contour, "source");
        for (const Move& move : m_result.moves)
            draw(move);
        std::vector<SvgLegendEntry> legend = {{"part", kSourceColour},
                                              {"cuts", kCutColour},
                                              {"leads", kLeadColour},
                                              {"rapid moves", kRapidColour}};
        if (drawDoubtful()) legend.insert(legend.begin() + 1, {"dashed: faulty", kSourceColour});
        return m_page.picture(styleRules(), m_svg, legend);
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
               strokeRule("doubtful", kSourceColour, kThinStroke) +
               ".doubtful { stroke-dasharray: " + formatReal(kShortDash * m_page.diagonal()) +
               "; }\n" + strokeRule("plunge", kLeadColour, kThinStroke) +
               ".plunge { fill: none; }\n"
               "@supports (vector-effect: non-scaling-stroke) {\n"
               "path, circle { vector-effect: non-scaling-stroke; }\n"
               ".source, .cut, .lead { stroke-width: 1.5px; }\n"
               ".rapid { stroke-width: 0.8px; stroke-dasharray: 6px; }\n"
               ".doubtful { stroke-width: 1.2px; stroke-dasharray: 5px; }\n"
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

    /// Offsets that are not cut because they have a fault; false when there is none.
    bool drawDoubtful() {
        bool any = false;
        for (const ContourCut& cut : m_result.contours) {
            for (const Path& path : cut.doubtful) {
                m_svg += svgPathTag(path, "doubtful");
                any = true;
            }
        }
        return any;
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
    const ToolpathResult& m_result;
    double m_lowest;
    SvgPage m_page;
    Vec2 m_place;
    std::string m_svg;
};

}  // namespace

std::string svgOf(const std::vector<Path>& contours, const ToolpathResult& result) {
    return ToolpathSvg(contours, result).run();
}

}  // namespace gmmachining
