#include "drawing/svg/SvgPage.h"

#include <algorithm>

#include "drawing/Text.h"
#include "drawing/svg/SvgSymbols.h"

namespace gmdrawing {

using gmregion::Box;
using gmregion::Element;
using gmregion::kPi;
using gmregion::Path;
using gmregion::Vec2;

namespace {

/// Sizes as fractions of the picture's diagonal.
constexpr double kMarginFraction = 0.03;
constexpr double kLegendFraction = 0.014;

/// Sizes of the legend as multiples of its text size.
constexpr double kEntryWidth = 9.0;
constexpr double kLineHeight = 1.5;

constexpr std::size_t kMostLegendLines = 4;

std::string flipped(Vec2 p) {
    return formatReal(p.x) + " " + formatReal(-p.y);
}

}  // namespace

SvgPage::SvgPage(const Box& drawn) : m_drawn(drawn), m_diagonal(length(drawn.size())) {}

double SvgPage::legendSize() const {
    return kLegendFraction * m_diagonal;
}

std::size_t SvgPage::entriesPerLine() const {
    const double fitting = m_drawn.size().x / (kEntryWidth * legendSize());
    constexpr double kMost = 100.0;
    return fitting > 1.0 ? static_cast<std::size_t>(std::min(fitting, kMost)) : 1;
}

std::string SvgPage::picture(const std::string& rules, const std::string& body,
                             const std::vector<SvgLegendEntry>& legend) const {
    const std::size_t perLine = entriesPerLine();
    const std::size_t lines = (legend.size() + perLine - 1) / perLine;
    const std::size_t shown = std::min(lines, kMostLegendLines);
    return head(rules, shown) + body + legendText(legend) + "</svg>\n";
}

std::string SvgPage::head(const std::string& rules, std::size_t legendLines) const {
    const Box page = m_drawn.grown(kMarginFraction * m_diagonal);
    const double size = legendSize();
    const double legendHeight = (0.5 + kLineHeight * static_cast<double>(legendLines)) * size;
    const std::string width = formatReal(std::max(page.size().x, (kEntryWidth + 1.0) * size));
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

std::string SvgPage::legendText(const std::vector<SvgLegendEntry>& entries) const {
    const double size = legendSize();
    const double top = m_drawn.low.y - kMarginFraction * m_diagonal - size;
    const std::size_t perLine = entriesPerLine();
    const std::size_t shown = std::min(entries.size(), kMostLegendLines * perLine);
    std::string svg = "<g id=\"legend\">\n";
    for (std::size_t i = 0; i < shown; ++i) {
        const std::size_t above = i / perLine;
        const auto line = static_cast<double>(above);
        const auto column = static_cast<double>(i - above * perLine);
        const Vec2 at{m_drawn.low.x + column * kEntryWidth * size, top - line * kLineHeight * size};
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

}  // namespace gmdrawing
