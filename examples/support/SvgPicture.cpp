// SPDX-License-Identifier: MIT
#include "SvgPicture.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <fstream>

#include "drawing/Text.h"
#include "drawing/svg/SvgWriter.h"
#include "gmkernel/gmkernel.h"

namespace examples {

using gmdrawing::svgNumbers;
using gmdrawing::svgPathData;
using gmdrawing::SvgStep;
using gmdrawing::SvgWriter;

namespace {

/// Lengths of the page in pixels.
constexpr double kPageWidth = 480.0;
constexpr double kLargestHeight = 320.0;
constexpr double kMargin = 28.0;  // room for strokes and marks at the edge
constexpr double kLegendLine = 20.0;
constexpr double kLegendSample = 28.0;
constexpr double kHalfCapital = 4.5;  // lowers a text so that it centres on a point
constexpr double kLegendGap = 8.0;

constexpr const char* kStyleSheet =
    "path { fill: none; stroke-linejoin: round; stroke-linecap: round; }\n"
    "text { font: 13px sans-serif; fill: #212529; }\n"
    ".given { stroke: #343a40; stroke-width: 1.6px; }\n"
    ".result { stroke: #d9480f; stroke-width: 2.4px; }\n"
    ".other { stroke: #1c7ed6; stroke-width: 2.4px; }\n"
    ".help { stroke: #868e96; stroke-width: 1.2px; stroke-dasharray: 5 4; }\n"
    ".given-mark { fill: #343a40; }\n"
    ".result-mark { fill: #d9480f; }\n"
    ".other-mark { fill: #1c7ed6; }\n"
    ".help-mark { fill: #868e96; }\n";

/// In the order of the styles.
constexpr std::array<const char*, 4> kStyleNames = {"given", "result", "other", "help"};

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

/// Carries drawing units, y up, to pixels of the page, y down, and curves to path data.
class Page {
public:
    explicit Page(const GmRect& box) : m_box(box) {
        const double room = kPageWidth - 2.0 * kMargin;
        m_scale = std::min(room / std::max(box.Width(), GmBase::m_scdPrec),
                           kLargestHeight / std::max(box.Height(), GmBase::m_scdPrec));
        m_left = 0.5 * (kPageWidth - m_scale * box.Width());
    }

    double height() const { return m_scale * m_box.Height() + 2.0 * kMargin; }
    SvgStep at(const GmPoint& p) const {
        return {rounded(m_left + m_scale * (p.X() - m_box.Left())),
                rounded(kMargin + m_scale * (m_box.Top() - p.Y()))};
    }

    /// Empty for kinds of curves that are not drawn.
    std::string pathData(const GmCurve& curve) const {
        std::vector<SvgStep> steps;
        if (curve.IsLine()) {
            steps = wholeLine(static_cast<const GmLine&>(curve));
        } else if (curve.IsCircle()) {
            const auto& circle = static_cast<const GmCircle&>(curve);
            const GmPoint sp(circle.M() + GmVec(circle.R(), 0.0, 0.0));
            addElement(steps, GmArc(circle, sp, sp, GmBase::eRotCCW));
        } else if (curve.IsStretch() || curve.IsArc()) {
            addElement(steps, curve);
        } else if (curve.IsContour()) {
            const auto& contour = static_cast<const GmContour&>(curve);
            for (int i = 0; i < contour.ElementCount(); ++i)
                addElement(steps, *contour.GetElement(i));
            return svgPathData(steps, contour.IsClosed());
        }
        return svgPathData(steps, curve.IsCircle());
    }

private:
    /// From edge to edge of the page and beyond.
    std::vector<SvgStep> wholeLine(const GmLine& line) const {
        const GmVec reach =
            GmVec(line.Dir()) * (line.SP().Dist(m_box.Center()) + 2.0 * kPageWidth / m_scale);
        return {at(GmPoint(line.SP() - reach)), at(GmPoint(line.SP() + reach))};
    }

    /// Continues a path from the start of a segment or arc to its end.
    void addElement(std::vector<SvgStep>& steps, const GmCurve& element) const {
        if (steps.empty()) steps.push_back(at(element.SP()));
        if (!element.IsArc()) return steps.push_back(at(element.EP()));
        const auto& arc = static_cast<const GmArc&>(element);
        SvgStep to = at(arc.EP());
        to.r = rounded(m_scale * arc.R());
        to.sweep = arc.Dir() == GmBase::eRotCW ? arc.Ang2Pi() : -arc.Ang2Pi();  // y points down
        if (arc.IsFullCircle()) {
            // SVG leaves out an arc that ends where it starts, so a full circle has two halves.
            const SvgStep half = at(GmPoint(arc.M() + (arc.M() - arc.SP())));
            to.sweep *= 0.5;
            steps.push_back({half.x, half.y, to.r, to.sweep});
        }
        steps.push_back(to);
    }

    GmRect m_box;
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

}  // namespace

void SvgPicture::add(const GmCurve& curve, Style style) {
    m_box = m_box.Or(curve.BoundingRect());
    m_curves.emplace_back(curve.Clone(), style);
}

void SvgPicture::legend(Style style, const std::string& text) {
    m_legend.emplace_back(text, style);
}

void SvgPicture::mark(const GmPoint& p, Style style) {
    m_box.Include(p);
    m_marks.emplace_back(p, style);
}

void SvgPicture::arrow(const GmCurve& element, Style style) {
    m_box.Include(element.EP());
    m_arrows.emplace_back(element.Clone(), style);
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
    for (const auto& [curve, style] : m_curves)
        svg.element("path", {{"class", styleName(style)}, {"d", page.pathData(*curve)}});
    for (const auto& [curve, style] : m_arrows) {
        const long angle = std::lround(-curve->TangEP().DAngle());
        const std::string turn = " rotate(" + std::to_string(angle) + ")";
        svg.element("polygon", {{"class", styleName(style) + "-mark"},
                                {"points", "0,0 -12,4.5 -12,-4.5"},
                                {"transform", translation(page.at(curve->EP())) + turn}});
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
