// SPDX-License-Identifier: MIT
#include "SvgPicture.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <fstream>

#include "drawing/Text.h"
#include "drawing/svg/SvgWriter.h"

namespace examples {

using gmdrawing::svgNumbers;
using gmdrawing::svgPathData;
using gmdrawing::SvgStep;
using gmdrawing::SvgWriter;
using gmregion::Bounds;
using gmregion::Element;
using gmregion::Point;

namespace {

constexpr double kPi = 3.14159265358979323846;

/// Lengths of the page in pixels.
constexpr double kPageWidth = 480.0;
constexpr double kLargestHeight = 320.0;
constexpr double kMargin = 28.0;  // room for strokes and marks at the edge
constexpr double kLegendLine = 20.0;
constexpr double kLegendSample = 28.0;
constexpr double kHalfCapital = 4.5;  // lowers a text so that it centres on a point
constexpr double kLegendGap = 8.0;

/// A picture without extent in a direction is shown as one of this extent, in drawing units.
constexpr double kSmallestExtent = 1e-4;

constexpr const char* kStyleSheet =
    "path { fill: none; stroke-linejoin: round; stroke-linecap: round; }\n"
    "text { font: 13px sans-serif; fill: #212529; }\n"
    ".given { stroke: #343a40; stroke-width: 1.6px; }\n"
    ".result { stroke: #d9480f; stroke-width: 2.4px; }\n"
    ".other { stroke: #1c7ed6; stroke-width: 2.4px; }\n"
    ".third { stroke: #2f9e44; stroke-width: 2.4px; }\n"
    ".help { stroke: #868e96; stroke-width: 1.2px; stroke-dasharray: 5 4; }\n"
    ".given-area { fill: #e9ecef; }\n"
    ".result-area { fill: #ffe8cc; }\n"
    ".other-area { fill: #d0ebff; }\n"
    ".third-area { fill: #d3f9d8; }\n"
    ".help-area { fill: #f8f9fa; }\n"
    ".given-mark { fill: #343a40; }\n"
    ".result-mark { fill: #d9480f; }\n"
    ".other-mark { fill: #1c7ed6; }\n"
    ".third-mark { fill: #2f9e44; }\n"
    ".help-mark { fill: #868e96; }\n";

/// In the order of the styles.
constexpr std::array<const char*, 5> kStyleNames = {"given", "result", "other", "third", "help"};

std::string styleName(Style style) {
    return kStyleNames[static_cast<std::size_t>(style)];
}

/// A hundredth of a pixel is enough.
double rounded(double pixels) {
    return std::round(pixels * 100.0) / 100.0;
}

std::string translation(const SvgStep& to) {
    return "translate(" + svgNumbers({to.x, to.y}) + ")";
}

/// The sweep in radians, cut off, so that half circles count as no more than half everywhere.
double sweepOf(const Element& e) {
    return std::trunc(4.0 * std::atan(e.bulge) * 1e9) / 1e9;
}

double radiusOf(const Element& e) {
    const double chord = std::hypot(e.ep.x - e.sp.x, e.ep.y - e.sp.y);
    return e.bulge == 0.0 ? 0.0 : chord * (1.0 + e.bulge * e.bulge) / (4.0 * std::fabs(e.bulge));
}

/// Carries drawing units, y up, to pixels of the page, y down, and chains to path data.
class Page {
public:
    explicit Page(const Bounds& box) : m_box(box) {
        m_scale = std::min((kPageWidth - 2.0 * kMargin) / std::max(width(), kSmallestExtent),
                           kLargestHeight / std::max(boxHeight(), kSmallestExtent));
        m_left = 0.5 * (kPageWidth - m_scale * width());
    }

    double height() const { return m_scale * boxHeight() + 2.0 * kMargin; }
    SvgStep at(Point p) const {
        return {rounded(m_left + m_scale * (p.x - m_box.low.x)),
                rounded(kMargin + m_scale * (m_box.high.y - p.y))};
    }

    std::string pathData(const std::vector<Element>& chain, bool closed) const {
        std::vector<SvgStep> steps{at(chain.front().sp)};
        for (const Element& e : chain) {
            SvgStep to = at(e.ep);
            to.r = rounded(m_scale * radiusOf(e));
            to.sweep = -sweepOf(e);  // y points down
            steps.push_back(to);
        }
        return svgPathData(steps, closed);
    }

    /// From edge to edge of the page and beyond.
    std::string endlessLine(const Element& e) const {
        const Point centre{0.5 * (m_box.low.x + m_box.high.x), 0.5 * (m_box.low.y + m_box.high.y)};
        const double length = std::hypot(e.ep.x - e.sp.x, e.ep.y - e.sp.y);
        const double reach =
            std::hypot(centre.x - e.sp.x, centre.y - e.sp.y) + 2.0 * kPageWidth / m_scale;
        const Point along{(e.ep.x - e.sp.x) / length * reach, (e.ep.y - e.sp.y) / length * reach};
        return svgPathData(
            {at({e.sp.x - along.x, e.sp.y - along.y}), at({e.sp.x + along.x, e.sp.y + along.y})},
            false);
    }

private:
    double width() const { return m_box.high.x - m_box.low.x; }
    double boxHeight() const { return m_box.high.y - m_box.low.y; }

    Bounds m_box;
    double m_scale;  // pixels in a drawing unit
    double m_left;   // of the box on the page
};

/// A sample of the style's stroke and the text beside it.
void writeLegend(SvgWriter& svg, double middle, const std::string& name, const std::string& text) {
    constexpr double kEnd = kMargin + kLegendSample;
    const std::string place = translation({kEnd + kLegendGap, middle + kHalfCapital});
    const std::string sample = svgPathData({{kMargin, middle}, {kEnd, middle}}, false);
    svg.element("path", {{"class", name}, {"d", sample}});
    svg.element("text", {{"transform", place}}, text);
}

/// The direction of travel at the end, in whole degrees, counter-clockwise.
long directionAtEnd(const Element& e) {
    const double angle = std::atan2(e.ep.y - e.sp.y, e.ep.x - e.sp.x) + 2.0 * std::atan(e.bulge);
    return std::lround(std::remainder(angle, 2.0 * kPi) * 180.0 / kPi);
}

}  // namespace

Element SvgPicture::placed(const Element& e) const {
    return {{e.sp.x + m_shift.x, e.sp.y + m_shift.y},
            {e.ep.x + m_shift.x, e.ep.y + m_shift.y},
            e.bulge};
}

void SvgPicture::include(Point p) {
    if (!m_hasBox) m_box = {p, p};
    m_hasBox = true;
    m_box.low = {std::min(m_box.low.x, p.x), std::min(m_box.low.y, p.y)};
    m_box.high = {std::max(m_box.high.x, p.x), std::max(m_box.high.y, p.y)};
}

/// Besides its ends an arc reaches to the points right, above, left and below of its centre, as far
/// as it runs through them: those on the right of its chord, or on the left for clockwise ones.
void SvgPicture::include(const Element& e) {
    include(e.sp);
    include(e.ep);
    if (e.bulge == 0.0) return;
    const Point chord{e.ep.x - e.sp.x, e.ep.y - e.sp.y};
    const double beside = (e.bulge * e.bulge - 1.0) / (4.0 * e.bulge);
    const Point m{0.5 * (e.sp.x + e.ep.x) + beside * chord.y,
                  0.5 * (e.sp.y + e.ep.y) - beside * chord.x};
    const double r = radiusOf(e);
    for (const Point out : {Point{r, 0}, Point{0, r}, Point{-r, 0}, Point{0, -r}}) {
        const Point p{m.x + out.x, m.y + out.y};
        const double side = chord.x * (p.y - e.sp.y) - chord.y * (p.x - e.sp.x);
        if (side * e.bulge < 0.0) include(p);
    }
}

SvgPicture::Elements SvgPicture::taken(const Element* first, const Element* last) {
    Elements chain;
    for (const Element* e = first; e != last; ++e) {
        chain.push_back(placed(*e));
        include(chain.back());
    }
    return chain;
}

std::vector<SvgPicture::Elements> SvgPicture::taken(const gmregion::RegionSet& set) {
    std::vector<Elements> chains;
    const Element* const elements = set.elements().data();
    for (const gmregion::Loop& loop : set.loops())
        chains.push_back(taken(elements + loop.first, elements + loop.last));
    return chains;
}

void SvgPicture::add(const Elements& path, bool closed, Style style) {
    if (path.empty()) return;
    m_strokes.push_back({{taken(path.data(), path.data() + path.size())},
                         closed ? Drawn::kClosed : Drawn::kOpen,
                         styleName(style)});
}

void SvgPicture::add(const gmregion::Paths& paths, Style style) {
    for (std::size_t i = 0; i < paths.size(); ++i)
        add(Elements(paths[i].begin(), paths[i].end()), paths[i].closed, style);
}

void SvgPicture::add(const gmregion::RegionSet& set, Style style) {
    m_strokes.push_back({taken(set), Drawn::kClosed, styleName(style)});
}

void SvgPicture::fill(const gmregion::RegionSet& set, Style style) {
    m_strokes.push_back({taken(set), Drawn::kClosed, styleName(style) + "-area"});
}

void SvgPicture::addEndless(const Element& line, Style style) {
    const Element e = placed(line);
    include(e.sp);
    m_strokes.push_back({{{e}}, Drawn::kEndless, styleName(style)});
}

void SvgPicture::legend(Style style, const std::string& text) {
    m_legend.emplace_back(text, style);
}

void SvgPicture::mark(Point p, Style style) {
    m_marks.emplace_back(Point{p.x + m_shift.x, p.y + m_shift.y}, style);
    include(m_marks.back().first);
}

void SvgPicture::arrow(const Element& element, Style style) {
    m_arrows.emplace_back(placed(element), style);
    include(m_arrows.back().first.ep);
}

bool SvgPicture::save(const std::string& fileName) const {
    const Page page(m_box);
    const double height = page.height() + kLegendLine * static_cast<double>(m_legend.size());
    SvgWriter svg;
    svg.begin("svg", {{"xmlns", "http://www.w3.org/2000/svg"},
                      {"viewBox", svgNumbers({0.0, 0.0, kPageWidth, rounded(height)})},
                      {"width", kPageWidth}});
    svg.style(kStyleSheet);
    svg.element("rect", {{"width", "100%"}, {"height", "100%"}, {"fill", "#fff"}});
    for (const Stroke& stroke : m_strokes) {
        std::string data;
        for (const Elements& chain : stroke.chains) {
            if (!data.empty()) data += ' ';
            data += stroke.drawn == Drawn::kEndless
                        ? page.endlessLine(chain.front())
                        : page.pathData(chain, stroke.drawn == Drawn::kClosed);
        }
        svg.element("path", {{"class", stroke.name}, {"d", data}});
    }
    for (const auto& [element, style] : m_arrows) {
        const std::string turn = " rotate(" + std::to_string(-directionAtEnd(element)) + ")";
        svg.element("polygon", {{"class", styleName(style) + "-mark"},
                                {"points", "0,0 -12,4.5 -12,-4.5"},
                                {"transform", translation(page.at(element.ep)) + turn}});
    }
    for (const auto& [p, style] : m_marks) {
        const std::string place = translation(page.at(p));
        svg.element("circle",
                    {{"class", styleName(style) + "-mark"}, {"r", 4.0}, {"transform", place}});
    }
    // Covers what lines draw beyond the box.
    const std::string top = gmdrawing::formatReal(page.height() - 0.5 * kMargin, 6);
    svg.element("rect", {{"y", top}, {"width", "100%"}, {"height", "100%"}, {"fill", "#fff"}});
    double middle = rounded(page.height());
    for (const auto& [text, style] : m_legend) {
        writeLegend(svg, middle, styleName(style), text);
        middle += kLegendLine;
    }
    std::ofstream file(fileName);
    file << svg.finish();
    return static_cast<bool>(file.flush());
}

}  // namespace examples
