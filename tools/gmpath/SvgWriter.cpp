#include "SvgWriter.h"

#include <algorithm>
#include <array>

#include "Measure.h"
#include "Nesting.h"
#include "SvgSymbols.h"
#include "Text.h"

namespace gmpath {

namespace {

constexpr double kPi = 3.14159265358979323846;

/// Strokes of the passes; further passes start again at the first.
constexpr std::array<const char*, 8> kPassColours = {"#d9480f", "#1c7ed6", "#2b8a3e", "#9c36b5",
                                                     "#e0a100", "#0c8599", "#c2255c", "#6741d9"};
constexpr const char* kSourceColour = "#212529";

/// Sizes as fractions of the picture's diagonal.
constexpr double kMarginFraction = 0.03;
constexpr double kLegendFraction = 0.014;
constexpr double kSourceStrokeFraction = 0.0014;
constexpr double kOffsetStrokeFraction = 0.0009;
constexpr double kDashFraction = 0.004;

const char* passColour(std::size_t pass) {
    return kPassColours[pass % kPassColours.size()];
}

std::string flipped(Vec2 p) {
    return formatReal(p.x) + " " + formatReal(-p.y);
}

bool hasDoubtful(const OffsetDrawing& drawing) {
    return std::any_of(drawing.offsets.begin(), drawing.offsets.end(),
                       [](const ContourOffsets& offsets) { return !offsets.faults.empty(); });
}

std::string pathTag(const Path& path, const std::string& styleClass) {
    return "<path class=\"" + styleClass + "\" d=\"" + svgPathData(path) + "\"/>\n";
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
        : m_drawing(drawing),
          m_depths(nestingDepths(drawing.contours)),
          m_box(boxOf(drawing)),
          m_diagonal(length(m_box.size())) {}

    std::string run() {
        writeHead();
        for (std::size_t i = 0; i < m_drawing.contours.size(); ++i)
            writeContour(i);
        writeLegend();
        return m_svg + "</svg>\n";
    }

private:
    double legendSize() const { return kLegendFraction * m_diagonal; }

    void writeHead() {
        const Box page = m_box.grown(kMarginFraction * m_diagonal);
        const double legendHeight = 2.0 * legendSize();
        const std::string width = formatReal(page.size().x);
        const std::string height = formatReal(page.size().y + legendHeight);
        const std::string corner = formatReal(page.low.x) + " " + formatReal(-page.high.y);
        m_svg =
            "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
            "<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"" +
            corner + " " + width + " " + height + "\">\n";
        writeStyle();
        m_svg += "<rect id=\"background\" x=\"" + formatReal(page.low.x) + "\" y=\"" +
                 formatReal(-page.high.y) + "\" width=\"" + width + "\" height=\"" + height +
                 "\" fill=\"#ffffff\"/>\n";
    }

    /// Where strokes can keep their width they do; elsewhere it follows the size of the drawing.
    void writeStyle() {
        const std::string sourceWidth = formatReal(kSourceStrokeFraction * m_diagonal);
        const std::string offsetWidth = formatReal(kOffsetStrokeFraction * m_diagonal);
        m_svg +=
            "<style>\n"
            "path { fill: none; stroke-linejoin: round; stroke-linecap: round; }\n"
            "text { font-family: sans-serif; }\n";
        m_svg += std::string(".source { stroke: ") + kSourceColour +
                 "; stroke-width: " + sourceWidth + "; }\n.offset { stroke-width: " + offsetWidth +
                 "; }\n";
        m_svg +=
            ".doubtful { stroke-dasharray: " + formatReal(kDashFraction * m_diagonal) + "; }\n";
        m_svg += std::string(".source-mark { fill: ") + kSourceColour + "; }\n";
        for (std::size_t pass = 0; pass < m_drawing.distances.size(); ++pass) {
            const std::string name = passClass(pass);
            const std::string colour = passColour(pass);
            m_svg += "." + name + " { stroke: " + colour + "; }\n";
            m_svg += "." + name + "-mark { fill: " + colour + "; }\n";
        }
        m_svg +=
            "@supports (vector-effect: non-scaling-stroke) {\n"
            "path { vector-effect: non-scaling-stroke; }\n"
            ".source { stroke-width: 1.8px; }\n.offset { stroke-width: 1.2px; }\n"
            ".doubtful { stroke-dasharray: 5px; }\n}\n"
            "</style>\n";
    }

    static std::string passClass(std::size_t pass) { return "pass-" + std::to_string(pass + 1); }

    void writeContour(std::size_t index) {
        const Path& contour = m_drawing.contours[index];
        const std::string number = std::to_string(index + 1);
        m_svg += "<g id=\"contour-" + number + "\">\n<title>contour " + number + ", layer " +
                 xmlEscaped(printable(contour.layer)) + ", " + senseName(contour) + "</title>\n";
        for (const OffsetPath& offset : m_drawing.offsets[index].paths) {
            const std::string style = "offset " + passClass(offset.pass);
            m_svg += pathTag(offset.path, offset.doubtful ? style + " doubtful" : style);
            m_svg += startMark(offset.path, passClass(offset.pass) + "-mark", m_diagonal);
        }
        m_svg += pathTag(contour, "source");
        m_svg += startMark(contour, "source-mark", m_diagonal);
        m_svg += numberLabel(contour, number, isOutline(index), m_diagonal);
        m_svg += "</g>\n";
    }

    /// Numbers stand in the material: inside of outlines, outside of holes.
    bool isOutline(std::size_t index) const { return m_depths[index].value_or(0) % 2 == 0; }

    struct LegendEntry {
        std::string colour;
        std::string text;
    };

    std::vector<LegendEntry> legendEntries() const {
        std::vector<LegendEntry> entries = {{kSourceColour, "source"}};
        if (hasDoubtful(m_drawing)) entries.push_back({kSourceColour, "dashed: faulty"});
        for (std::size_t pass = 0; pass < m_drawing.distances.size(); ++pass) {
            entries.push_back(
                {passColour(pass), "offset " + formatReal(m_drawing.distances[pass], 6)});
        }
        return entries;
    }

    /// A line of text under the picture: what each colour stands for. Ends where the page does.
    void writeLegend() {
        const double size = legendSize();
        constexpr double kEntryWidth = 9.0;  // in text sizes
        Vec2 at{m_box.low.x, m_box.low.y - kMarginFraction * m_diagonal - size};
        m_svg += "<g id=\"legend\">\n";
        for (const LegendEntry& entry : legendEntries()) {
            m_svg += textTag(at, size, "fill=\"" + entry.colour + "\"", entry.text);
            at.x += kEntryWidth * size;
            if (!(at.x <= m_box.high.x)) break;
        }
        m_svg += "</g>\n";
    }

    const OffsetDrawing& m_drawing;
    std::vector<std::optional<int>> m_depths;
    Box m_box;
    double m_diagonal;
    std::string m_svg;
};

}  // namespace

std::string svgPathData(const Path& path) {
    if (path.elements.empty()) return {};
    std::string data = "M " + flipped(path.elements.front().sp);
    for (const Element& e : path.elements) {
        if (isArc(e)) {
            const std::string r = formatReal(radius(e));
            const bool large = std::abs(sweep(e)) > kPi;
            // Turned downwards, a counter-clockwise arc runs against SVG's positive angles.
            const bool positive = e.bulge < 0.0;
            data += " A " + r + " " + r + " 0 " + (large ? "1" : "0") + (positive ? " 1 " : " 0 ");
        } else {
            data += " L ";
        }
        data += flipped(e.ep);
    }
    return path.closed ? data + " Z" : data;
}

std::string svgOf(const OffsetDrawing& drawing) {
    return SvgWriter(drawing).run();
}

}  // namespace gmpath
