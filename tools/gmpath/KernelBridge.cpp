#include "KernelBridge.h"

#include <memory>
#include <numeric>

#include "ShortElements.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"

namespace gmpath {

namespace {

constexpr double kPi = 3.14159265358979323846;

/// Every element of the source stays in view, whatever its length.
constexpr int kWholeContour = 1'000'000;

GmPoint kernelPoint(Vec2 p) {
    return {p.x, p.y};
}

Vec2 fromKernel(const GmPoint& p) {
    return {p.X(), p.Y()};
}

std::unique_ptr<GmCurve> kernelCurve(const Element& e) {
    const GmPoint sp = kernelPoint(e.sp);
    const GmPoint ep = kernelPoint(e.ep);
    if (!isArc(e)) return std::make_unique<GmStretch>(sp, ep);
    const auto rot = e.bulge > 0.0 ? GmBase::eRotCCW : GmBase::eRotCW;
    return std::make_unique<GmArc>(sp, ep, kernelPoint(centre(e)), rot);
}

/// The contour of a path, each element with its number as the identifier; false when it cannot be
/// built.
bool fill(GmContour& contour, const Path& path, const std::vector<std::size_t>& numbers) {
    for (std::size_t i = 0; i < path.elements.size(); ++i) {
        const std::unique_ptr<GmCurve> curve = kernelCurve(path.elements[i]);
        const auto id = static_cast<long>(numbers[i]);
        if (!curve->CreationOK() || !contour.AddElement(curve.get(), false, id)) return false;
    }
    return contour.IsClosed() == path.closed;
}

/// The arc as elements that start and end exactly at the kernel's end points.
void appendKernelArc(std::vector<Element>& elements, const GmArc& arc) {
    const Vec2 m = fromKernel(arc.M());
    const Vec2 toStart = fromKernel(arc.SP()) - m;
    const Vec2 toEnd = fromKernel(arc.EP()) - m;
    const double startAngle = std::atan2(toStart.y, toStart.x);
    const double turn = arc.Dir() == GmBase::eRotCW ? -1.0 : 1.0;
    double angle = turn * std::atan2(cross(toStart, toEnd), dot(toStart, toEnd));
    if (arc.IsFullCircle()) {
        angle = 2.0 * kPi;
    } else if (angle < 0.0) {
        angle += 2.0 * kPi;
    }
    const std::size_t first = elements.size();
    appendArc(elements, m, arc.R(), startAngle, turn * angle);
    elements[first] = withEnds(elements[first], fromKernel(arc.SP()), elements[first].ep);
    elements.back() = withEnds(elements.back(), elements.back().sp, fromKernel(arc.EP()));
}

void appendResult(KernelOffset& offset, const GmContour& contour, const std::string& layer) {
    Path path{{}, contour.IsClosed(), layer};
    std::vector<std::size_t> origins;
    for (int i = 0; i < contour.ElementCount(); ++i) {
        const GmContElement& element = *contour.GetContElement(i);
        const auto origin = static_cast<std::size_t>(element.lId);
        const GmCurve& curve = *element.pCurve;
        if (curve.IsArc()) {
            appendKernelArc(path.elements, static_cast<const GmArc&>(curve));
        } else {
            path.elements.push_back({fromKernel(curve.SP()), fromKernel(curve.EP())});
        }
        origins.resize(path.elements.size(), origin);
    }
    meetEnds(path);
    offset.results.push_back(std::move(path));
    offset.origins.push_back(std::move(origins));
}

}  // namespace

KernelOffset offsetByKernel(const Path& path, double d, double shortest) {
    Path simplified = path;
    std::vector<std::size_t> numbers = dropShortElements(simplified, shortest);
    if (simplified.elements.empty()) {
        simplified = path;
        numbers.resize(path.elements.size());
        std::iota(numbers.begin(), numbers.end(), std::size_t{0});
    }
    GmContour contour;
    KernelOffset offset;
    offset.accepted = fill(contour, simplified, numbers);
    if (!offset.accepted) return offset;
    const bool keepOpen = !path.closed;
    contour.Offsetting(d, kWholeContour, keepOpen);
    for (int i = 0; const GmContour* result = contour.GetSubContour(i); ++i) {
        if (result->ElementCount() > 0) appendResult(offset, *result, path.layer);
    }
    return offset;
}

}  // namespace gmpath
