#include "SvgWriter.h"

#include <algorithm>
#include <array>

#include "Measure.h"
#include "Nesting.h"
#include "SvgPage.h"
#include "SvgSymbols.h"
#include "Text.h"

namespace gmpath {

namespace {

/// Strokes of the passes; further passes start again at the first.
constexpr std::array<const char*, 8> kPassColours = {"#d9480f", "#1c7ed6", "#2b8a3e", "#9c36b5",
                                                     "#e0a100", "#0c8599", "#c2255c", "#6741d9"};
constexpr const char* kSourceColour = "#212529";

/// Sizes as fractions of the picture's diagonal.
constexpr double kSourceStrokeFraction = 0.0014;
constexpr double kOffsetStrokeFraction = 0.0009;
constexpr double kDashFraction = 0.004;

const char* passColour(std::size_t pass) {
    return kPassColours[pass % kPassColours.size()];
}

bool hasDoubtful(const OffsetDrawing& drawing) {
    return std::any_of(drawing.offsets.begin(), drawing.offsets.end(),
                       [](const ContourOffsets& offsets) { return !offsets.faults.empty(); });
}

Box boxOf(const OffsetDrawing& drawing) {
    Box box;
    for (const Path& contour : drawing.contours)
        box.include(boundingBox(contour));
    for (const ContourOffsets& offsets : drawing.offsets) {
        for (const OffsetPath& offset : offsets.paths)
            box.include(boundingBox(offset.path));
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
    explicit SvgWriter(const OffsetDrawing& drawing)
        : m_drawing(drawing), m_depths(nestingDepths(drawing.contours)), m_page(boxOf(drawing)) {}

    std::string run() {
        m_svg = m_page.head(styleRules());
        for (std::size_t i = 0; i < m_drawing.contours.size(); ++i)
            writeContour(i);
        return m_svg + m_page.legend(legendEntries()) + "</svg>\n";
    }

private:
    /// Where strokes can keep their width they do; elsewhere it follows the size of the drawing.
    std::string styleRules() const {
        const std::string sourceWidth = formatReal(kSourceStrokeFraction * m_page.diagonal());
        const std::string offsetWidth = formatReal(kOffsetStrokeFraction * m_page.diagonal());
        const std::string dash = formatReal(kDashFraction * m_page.diagonal());
        std::string rules = std::string(".source { stroke: ") + kSourceColour +
                            "; stroke-width: " + sourceWidth +
                            "; }\n.offset { stroke-width: " + offsetWidth +
                            "; }\n.doubtful { stroke-dasharray: " + dash + "; }\n";
        rules += std::string(".source-mark { fill: ") + kSourceColour + "; }\n";
        for (std::size_t pass = 0; pass < m_drawing.distances.size(); ++pass) {
            const std::string name = passClass(pass);
            const std::string colour = passColour(pass);
            rules += "." + name + " { stroke: " + colour + "; }\n";
            rules += "." + name + "-mark { fill: " + colour + "; }\n";
        }
        return rules +
               "@supports (vector-effect: non-scaling-stroke) {\n"
               "path { vector-effect: non-scaling-stroke; }\n"
               ".source { stroke-width: 1.8px; }\n.offset { stroke-width: 1.2px; }\n"
               ".doubtful { stroke-dasharray: 5px; }\n}\n";
    }

    static std::string passClass(std::size_t pass) { return "pass-" + std::to_string(pass + 1); }

    void writeContour(std::size_t index) {
        const Path& contour = m_drawing.contours[index];
        const std::string number = std::to_string(index + 1);
        m_svg += "<g id=\"contour-" + number + "\">\n<title>contour " + number + ", layer " +
                 xmlEscaped(printable(contour.layer)) + ", " + senseName(contour) + "</title>\n";
        for (const OffsetPath& offset : m_drawing.offsets[index].paths) {
            const std::string style = "offset " + passClass(offset.pass);
            m_svg += svgPathTag(offset.path, offset.doubtful ? style + " doubtful" : style);
            m_svg += startMark(offset.path, passClass(offset.pass) + "-mark", m_page.diagonal());
        }
        m_svg += svgPathTag(contour, "source");
        m_svg += startMark(contour, "source-mark", m_page.diagonal());
        m_svg += numberLabel(contour, number, isOutline(index), m_page.diagonal());
        m_svg += "</g>\n";
    }

    /// Numbers stand in the material: inside of outlines, outside of holes.
    bool isOutline(std::size_t index) const { return m_depths[index].value_or(0) % 2 == 0; }

    std::vector<SvgLegendEntry> legendEntries() const {
        std::vector<SvgLegendEntry> entries = {{"source", kSourceColour}};
        if (hasDoubtful(m_drawing)) entries.push_back({"dashed: faulty", kSourceColour});
        for (std::size_t pass = 0; pass < m_drawing.distances.size(); ++pass) {
            entries.push_back(
                {"offset " + formatReal(m_drawing.distances[pass], 6), passColour(pass)});
        }
        return entries;
    }

    const OffsetDrawing& m_drawing;
    std::vector<std::optional<int>> m_depths;
    SvgPage m_page;
    std::string m_svg;
};

}  // namespace

std::string svgOf(const OffsetDrawing& drawing) {
    return SvgWriter(drawing).run();
}

}  // namespace gmpath
