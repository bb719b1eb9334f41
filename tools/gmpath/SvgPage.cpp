#include "SvgPage.h"

#include "SvgSymbols.h"
#include "Text.h"

namespace gmpath {

namespace {

constexpr double kPi = 3.14159265358979323846;

/// Sizes as fractions of the picture's diagonal.
constexpr double kMarginFraction = 0.03;
constexpr double kLegendFraction = 0.014;

std::string flipped(Vec2 p) {
    return formatReal(p.x) + " " + formatReal(-p.y);
}

}  // namespace

SvgPage::SvgPage(const Box& drawn) : m_drawn(drawn), m_diagonal(length(drawn.size())) {}

double SvgPage::legendSize() const {
    return kLegendFraction * m_diagonal;
}

std::string SvgPage::head(const std::string& rules) const {
    const Box page = m_drawn.grown(kMarginFraction * m_diagonal);
    const double legendHeight = 2.0 * legendSize();
    const std::string width = formatReal(page.size().x);
    const std::string height = formatReal(page.size().y + legendHeight);
    const std::string left = formatReal(page.low.x);
    const std::string top = formatReal(-page.high.y);
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
           "<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"" +
           left + " " + top + " " + width + " " + height +
           "\">\n<style>\n"
           "path { fill: none; stroke-linejoin: round; stroke-linecap: round; }\n"
           "text { font-family: sans-serif; }\n" +
           rules + "</style>\n<rect id=\"background\" x=\"" + left + "\" y=\"" + top +
           "\" width=\"" + width + "\" height=\"" + height + "\" fill=\"#ffffff\"/>\n";
}

std::string SvgPage::legend(const std::vector<SvgLegendEntry>& entries) const {
    constexpr double kEntryWidth = 9.0;  // in text sizes
    const double size = legendSize();
    const double perLine = m_drawn.size().x / (kEntryWidth * size);
    const double y = m_drawn.low.y - kMarginFraction * m_diagonal - size;
    std::string svg = "<g id=\"legend\">\n";
    for (std::size_t i = 0; i < entries.size() && static_cast<double>(i) <= perLine; ++i) {
        const Vec2 at{m_drawn.low.x + static_cast<double>(i) * kEntryWidth * size, y};
        svg += textTag(at, size, "fill=\"" + entries[i].colour + "\"", entries[i].text);
    }
    return svg + "</g>\n";
}

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

std::string svgPathTag(const Path& path, const std::string& styleClass) {
    return "<path class=\"" + styleClass + "\" d=\"" + svgPathData(path) + "\"/>\n";
}

}  // namespace gmpath
