// SPDX-License-Identifier: MIT
#include "drawing/svg/SvgPage.h"

#include <algorithm>
#include <utility>

#include "part/model/Area.h"

namespace gmdrawing {

using gmpart::Path;
using gmpart::Sense;
using gmregion::Box;
using gmregion::Element;
using gmregion::Vec2;

namespace {

/// Sizes as fractions of the picture's diagonal, and of the extent of the marked path.
constexpr double kMarginFraction = 0.03;
constexpr double kLegendFraction = 0.014;
constexpr double kDotOfDiagonal = 0.0022;
constexpr double kDotOfPath = 0.04;
constexpr double kLargestLabel = 0.011;
constexpr double kSmallestLabel = 0.005;
constexpr double kLabelOfPath = 0.3;

/// Sizes of the legend as multiples of its text size.
constexpr double kEntryWidth = 9.0;
constexpr double kLineHeight = 1.5;

constexpr std::size_t kMostLegendLines = 4;

constexpr const char* kCommonRules =
    "path { fill: none; stroke-linejoin: round; stroke-linecap: round; }\n"
    "text { font-family: sans-serif; }\n";

/// The arrow head, in dot radii: where it starts behind the dot, how long and how wide it is.
constexpr double kArrowStart = 1.6;
constexpr double kArrowLength = 3.6;
constexpr double kArrowHalfWidth = 1.3;

/// The point at a distance along the path; the end of a path that is shorter.
Vec2 pointAlong(const Path& path, double distanceAlong) {
    for (const Element& e : path.elements) {
        const double len = length(e);
        if (distanceAlong <= len) return pointAt(e, len > 0.0 ? distanceAlong / len : 0.0);
        distanceAlong -= len;
    }
    return path.elements.back().ep;
}

}  // namespace

SvgPage::SvgPage(const Box& drawn)
    : m_drawn(drawn),
      m_diagonal(length(drawn.size())),
      m_legendSize(kLegendFraction * m_diagonal) {}

void SvgPage::begin(const std::string& rules, std::vector<SvgLegendEntry> legend) {
    const Box page = m_drawn.grown(kMarginFraction * m_diagonal);
    // A page is no wider than its diagonal, so that there are but a few entries a line.
    const double fitting = m_drawn.size().x / (kEntryWidth * m_legendSize);
    m_perLine = fitting > 1.0 ? static_cast<std::size_t>(fitting) : 1;
    m_legend = std::move(legend);
    m_legend.resize(std::min(m_legend.size(), kMostLegendLines * m_perLine));
    const std::size_t lines = (m_legend.size() + m_perLine - 1) / m_perLine;
    const double legendHeight = (0.5 + kLineHeight * static_cast<double>(lines)) * m_legendSize;
    const double width = std::max(page.size().x, (kEntryWidth + 1.0) * m_legendSize);
    const double height = page.size().y + legendHeight;
    const std::string box = svgNumbers({page.low.x, -page.high.y, width, height});
    m_svg.begin("svg", {{"xmlns", "http://www.w3.org/2000/svg"}, {"viewBox", box}});
    m_svg.style(kCommonRules + rules);
    m_svg.element("rect", {{"id", "background"},
                           {"x", page.low.x},
                           {"y", -page.high.y},
                           {"width", width},
                           {"height", height},
                           {"fill", "#ffffff"}});
}

void SvgPage::draw(const Path& path, const std::string& styleClass) {
    m_svg.element("path", {{"class", styleClass}, {"d", svgPathData(path)}});
}

void SvgPage::circle(Vec2 m, double r, const std::string& styleClass) {
    m_svg.element("circle", {{"class", styleClass}, {"cx", m.x}, {"cy", -m.y}, {"r", r}});
}

void SvgPage::text(Vec2 at, double size, SvgAttributes style, const std::string& text) {
    constexpr double kFontSize = 10.0;
    const std::string place = "translate(" + svgNumbers({at.x, -at.y}) + ")";
    const std::string scale = "scale(" + svgNumbers({size / kFontSize}) + ")";
    style.insert(style.begin(), {{"transform", place + " " + scale}, {"font-size", kFontSize}});
    m_svg.element("text", style, text);
}

void SvgPage::startMark(const Path& path, const std::string& styleClass) {
    if (path.elements.empty()) return;
    const Vec2 extent = boundingBox(path).size();
    const double r =
        std::min(kDotOfDiagonal * m_diagonal, kDotOfPath * std::max(extent.x, extent.y));
    const Vec2 back = pointAlong(path, kArrowStart * r);
    const Vec2 tip = pointAlong(path, (kArrowStart + kArrowLength) * r);
    const Vec2 side = kArrowHalfWidth * r * rightNormal(unit(tip - back));
    circle(path.elements.front().sp, r, styleClass);
    draw({{{back + side, tip}, {tip, back - side}}, true, {}}, styleClass);
}

void SvgPage::numberLabel(const Path& path, const std::string& number, bool inside) {
    if (path.elements.empty()) return;
    const Vec2 extent = boundingBox(path).size();
    const double room = path.closed ? std::min(extent.x, extent.y) : std::max(extent.x, extent.y);
    const double size =
        std::clamp(kLabelOfPath * room, kSmallestLabel * m_diagonal, kLargestLabel * m_diagonal);
    const Element& first = path.elements.front();
    const bool leftIsInside = sense(path) == Sense::kCounterClockwise;
    const double toTheRight = sense(path) == Sense::kNone || leftIsInside != inside ? 1.0 : -1.0;
    // A little ahead of the start as well, so that no other element of a corner crosses the text.
    const Vec2 along = tangentStart(first);
    const Vec2 at = first.sp + size * along + toTheRight * size * rightNormal(along);
    constexpr double kHalfCapital = 0.35;  // lowers the text so that it centres on the point
    text({at.x, at.y - kHalfCapital * size}, size,
         {{"class", "source-mark"}, {"text-anchor", "middle"}}, number);
}

std::string SvgPage::finish() {
    const double size = m_legendSize;
    const double top = m_drawn.low.y - kMarginFraction * m_diagonal - size;
    m_svg.begin("g", {{"id", "legend"}});
    for (std::size_t i = 0; i < m_legend.size(); ++i) {
        const std::size_t line = i / m_perLine;
        const std::size_t column = i % m_perLine;
        const Vec2 at{m_drawn.low.x + static_cast<double>(column) * kEntryWidth * size,
                      top - static_cast<double>(line) * kLineHeight * size};
        text(at, size, {{"fill", m_legend[i].colour}}, m_legend[i].text);
    }
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n" + m_svg.finish();
}

std::string svgPathData(const Path& path) {
    std::vector<SvgStep> steps;
    for (const Element& e : path.elements) {
        if (steps.empty()) steps.push_back({e.sp.x, -e.sp.y});
        steps.push_back({e.ep.x, -e.ep.y, radius(e), -sweep(e)});
    }
    return gmdrawing::svgPathData(steps, path.closed);
}

}  // namespace gmdrawing
