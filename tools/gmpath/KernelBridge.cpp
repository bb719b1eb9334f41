#include "KernelBridge.h"

#include <algorithm>
#include <memory>

#include "ShortElements.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"

namespace gmpath {

namespace {

constexpr double kPi = 3.14159265358979323846;

/// Every element of the source stays in view, whatever its length.
constexpr int kWholeContour = 1'000'000;

/// Elements below this length are passed over at first, and when the first result is torn.
constexpr double kShortestAtFirst = 3.0 * kKernelTolerance;
constexpr double kShortestOfTorn = 10.0 * kKernelTolerance;

/// The path without its shortest elements; a path that small altogether stays as it is.
Path simplified(const Path& path, double shortest) {
    Path result = path;
    dropShortElements(result, shortest);
    return result.elements.empty() ? path : result;
}

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

bool fill(GmContour& contour, const Path& path) {
    for (const Element& e : path.elements) {
        const std::unique_ptr<GmCurve> curve = kernelCurve(e);
        const long id = contour.ElementCount();
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

Path pathFrom(const GmContour& contour, const std::string& layer) {
    Path path{{}, contour.IsClosed(), layer};
    for (int i = 0; i < contour.ElementCount(); ++i) {
        const GmCurve* curve = contour.GetElement(i);
        if (curve->IsArc()) {
            appendKernelArc(path.elements, static_cast<const GmArc&>(*curve));
        } else {
            path.elements.push_back({fromKernel(curve->SP()), fromKernel(curve->EP())});
        }
    }
    meetEnds(path);
    return path;
}

KernelOffset offsetAsGiven(const Path& path, double d) {
    GmContour contour;
    if (!fill(contour, path)) return {{}, false};
    const bool keepOpen = !path.closed;
    contour.Offsetting(d, kWholeContour, keepOpen);
    KernelOffset offset;
    for (int i = 0; const GmContour* result = contour.GetSubContour(i); ++i) {
        if (result->ElementCount() == 0) continue;
        offset.results.push_back(pathFrom(*result, path.layer));
    }
    return offset;
}

/// True when closed results, at least one, came out.
bool isWhole(const KernelOffset& offset) {
    const auto isClosed = [](const Path& path) { return path.closed; };
    return !offset.results.empty() &&
           std::all_of(offset.results.begin(), offset.results.end(), isClosed);
}

}  // namespace

KernelOffset offsetByKernel(const Path& path, double d) {
    const Path first = simplified(path, kShortestAtFirst);
    KernelOffset offset = offsetAsGiven(first, d);
    if (!path.closed || isWhole(offset)) return offset;
    const Path second = simplified(path, kShortestOfTorn);
    if (second.elements.size() == first.elements.size()) return offset;
    KernelOffset again = offsetAsGiven(second, d);
    return isWhole(again) ? again : offset;
}

}  // namespace gmpath
