#include "SvgPicture.h"

#include <algorithm>
#include <cmath>
#include <fstream>
#include <locale>
#include <sstream>

#include "gmkernel/gmkernel.h"

namespace examples {

namespace {

/// Lengths of the page in pixels.
constexpr double kPageWidth = 480.0;
constexpr double kLargestHeight = 320.0;
constexpr double kMargin = 28.0;  // room for strokes and marks at the edge
constexpr double kLegendLine = 20.0;
constexpr double kLegendSample = 28.0;
constexpr double kHalfCapital = 4.5;  // lowers a text so that it centres on a point
constexpr double kLegendGap = 8.0;

constexpr double kPi = 3.14159265358979323846;

constexpr const char* kStyleSheet =
    "<style>\n"
    "path { fill: none; stroke-linejoin: round; stroke-linecap: round; }\n"
    "text { font: 13px sans-serif; fill: #212529; }\n"
    ".given { stroke: #343a40; stroke-width: 1.6px; }\n"
    ".result { stroke: #d9480f; stroke-width: 2.4px; }\n"
    ".other { stroke: #1c7ed6; stroke-width: 2.4px; }\n"
    ".help { stroke: #868e96; stroke-width: 1.2px; stroke-dasharray: 5 4; }\n"
    ".given-mark { fill: #343a40; }\n"
    ".result-mark { fill: #d9480f; }\n"
    ".other-mark { fill: #1c7ed6; }\n"
    ".help-mark { fill: #868e96; }\n"
    "</style>\n";

constexpr const char* kBackground = "<rect width=\"100%\" height=\"100%\" fill=\"#fff\"/>\n";

std::string styleName(Style style) {
    switch (style) {
        case Style::kGiven:
            return "given";
        case Style::kResult:
            return "result";
        case Style::kOther:
            return "other";
        case Style::kHelp:
            break;
    }
    return "help";
}

/// Two numbers with a space between; a hundredth of a pixel is enough, and there is no -0.
std::string pixels(double x, double y) {
    std::ostringstream text;
    text.imbue(std::locale::classic());
    text << std::round(x * 100.0) / 100.0 + 0.0 << ' ' << std::round(y * 100.0) / 100.0 + 0.0;
    return text.str();
}

std::string pathTag(const std::string& data, Style style) {
    return "<path class=\"" + styleName(style) + "\" d=\"" + data + "\"/>\n";
}

std::string dotTag(double x, double y, Style style) {
    return "<circle class=\"" + styleName(style) + "-mark\" r=\"4\" transform=\"translate(" +
           pixels(x, y) + ")\"/>\n";
}

/// A triangle whose tip points along the direction of travel.
std::string arrowTag(double x, double y, const GmDir& along, Style style) {
    return "<polygon class=\"" + styleName(style) +
           "-mark\" points=\"0,0 -12,4.5 -12,-4.5\" transform=\"translate(" + pixels(x, y) +
           ") rotate(" + std::to_string(std::lround(-along.DAngle())) + ")\"/>\n";
}

std::string textTag(double x, double y, const std::string& text) {
    return "<text transform=\"translate(" + pixels(x, y) + ")\">" + text + "</text>\n";
}

/// A sample of the style's stroke and the text beside it; `y` is the middle of the line.
std::string legendTag(double y, Style style, const std::string& text) {
    const double end = kMargin + kLegendSample;
    return pathTag("M " + pixels(kMargin, y) + " L " + pixels(end, y), style) +
           textTag(end + kLegendGap, y + kHalfCapital, text);
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
    double x(const GmPoint& p) const { return m_left + m_scale * (p.X() - m_box.Left()); }
    double y(const GmPoint& p) const { return kMargin + m_scale * (m_box.Top() - p.Y()); }
    std::string at(const GmPoint& p) const { return pixels(x(p), y(p)); }

    /// Empty for kinds of curves that are not drawn.
    std::string pathData(const GmCurve& curve) const {
        switch (curve.GetType()) {
            case GmBase::eGmContour:
                return contourData(static_cast<const GmContour&>(curve));
            case GmBase::eGmCircle:
                return circleData(static_cast<const GmCircle&>(curve));
            case GmBase::eGmLine:
            case GmBase::eGmBeam:
                return carrierData(static_cast<const GmLine&>(curve));
            case GmBase::eGmStretch:
            case GmBase::eGmArc:
                return "M " + at(curve.SP()) + elementData(curve);
            default:
                return {};
        }
    }

private:
    std::string contourData(const GmContour& contour) const {
        if (contour.ElementCount() == 0) return {};
        std::string data = "M " + at(contour.GetElement(0)->SP());
        for (int i = 0; i < contour.ElementCount(); ++i)
            data += elementData(*contour.GetElement(i));
        return contour.IsClosed() ? data + " Z" : data;
    }

    std::string circleData(const GmCircle& circle) const {
        const GmPoint sp(circle.M() + GmVec(circle.R(), 0.0, 0.0));
        return "M " + at(sp) + elementData(GmArc(circle, sp, sp, GmBase::eRotCCW)) + " Z";
    }

    /// From edge to edge of the page and beyond; a beam begins at its start.
    std::string carrierData(const GmLine& line) const {
        const GmVec reach =
            GmVec(line.Dir()) * (line.SP().Dist(m_box.Center()) + 2.0 * kPageWidth / m_scale);
        const GmPoint sp = line.IsBeam() ? line.SP() : GmPoint(line.SP() - reach);
        return "M " + at(sp) + " L " + at(GmPoint(line.SP() + reach));
    }

    /// Continues a path from the start of a segment or arc to its end.
    std::string elementData(const GmCurve& element) const {
        if (!element.IsArc()) return " L " + at(element.EP());
        const GmArc& arc = static_cast<const GmArc&>(element);
        if (!arc.IsFullCircle()) return arcData(arc, arc.Ang() > kPi, arc.EP());
        // SVG leaves out an arc that ends where it starts, so a full circle has two halves.
        const GmPoint opposite(arc.M() + (arc.M() - arc.SP()));
        return arcData(arc, false, opposite) + arcData(arc, false, arc.EP());
    }

    /// With y pointing down the clockwise sense is the one that SVG calls positive.
    std::string arcData(const GmArc& arc, bool large, const GmPoint& ep) const {
        return " A " + pixels(m_scale * arc.R(), m_scale * arc.R()) + " 0 " + (large ? "1" : "0") +
               (arc.Dir() == GmBase::eRotCW ? " 1 " : " 0 ") + at(ep);
    }

    GmRect m_box;
    double m_scale;  // pixels in a drawing unit
    double m_left;   // of the box on the page
};

}  // namespace

void SvgPicture::add(const GmCurve& curve, Style style) {
    m_box = m_box.Or(curve.BoundingRect());
    m_curves.push_back({std::unique_ptr<GmCurve>(curve.Clone()), style});
}

void SvgPicture::legend(Style style, const std::string& text) {
    m_legend.push_back({style, text});
}

void SvgPicture::mark(const GmPoint& p, Style style) {
    m_box.Include(p);
    m_marks.push_back({p, style});
}

void SvgPicture::arrow(const GmCurve& element, Style style) {
    m_box.Include(element.EP());
    m_arrows.push_back({element.EP(), element.TangEP(), style});
}

bool SvgPicture::save(const std::string& fileName) const {
    const Page page(m_box);
    const double height = page.height() + kLegendLine * static_cast<double>(m_legend.size());
    std::ofstream svg(fileName);
    svg << "<svg xmlns=\"http://www.w3.org/2000/svg\" viewBox=\"0 0 " << pixels(kPageWidth, height)
        << "\" width=\"" << kPageWidth << "\">\n"
        << kStyleSheet << kBackground;
    for (const DrawnCurve& drawn : m_curves)
        svg << pathTag(page.pathData(*drawn.curve), drawn.style);
    for (const ArrowHead& head : m_arrows)
        svg << arrowTag(page.x(head.tip), page.y(head.tip), head.along, head.style);
    for (const Mark& mark : m_marks)
        svg << dotTag(page.x(mark.p), page.y(mark.p), mark.style);
    // Covers what lines and beams draw beyond the box.
    svg << "<rect y=\"" << page.height() - 0.5 * kMargin
        << "\" width=\"100%\" height=\"100%\" fill=\"#fff\"/>\n";
    double y = page.height();
    for (const LegendEntry& entry : m_legend) {
        svg << legendTag(y, entry.style, entry.text);
        y += kLegendLine;
    }
    svg << "</svg>\n";
    return static_cast<bool>(svg.flush());
}

}  // namespace examples
