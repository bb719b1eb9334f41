// SPDX-License-Identifier: MIT
#include "apps/gmpath/Phrases.h"

#include <cmath>

#include "drawing/Text.h"

namespace gmpath {

using gmdrawing::formatReal;
using gmpart::KernelRefusal;
using gmregion::Fault;
using gmregion::kKernelTolerance;
using gmregion::Point;

namespace {

constexpr int kPlaceDigits = 7;

/// Contours named in a remark, at most.
constexpr std::size_t kMostNamed = 10;

/// A coordinate without what is below a millionth.
std::string coordinateText(double value) {
    constexpr double kMillion = 1e6;
    const double rounded = std::round(value * kMillion) / kMillion;
    return formatReal(std::isfinite(rounded) ? rounded + 0.0 : value, kPlaceDigits);
}

}  // namespace

std::string placeText(Point p) {
    return " near (" + coordinateText(p.x) + ", " + coordinateText(p.y) + ")";
}

std::string contourText(std::size_t contour, const std::vector<gmpart::Path>& contours) {
    std::string number = "contour " + std::to_string(contour + 1);
    if (contour >= contours.size() || contours[contour].elements.empty()) return number;
    const gmpart::Path& path = contours[contour];
    return number + " on layer " + gmdrawing::printable(path.layer) +
           placeText(path.elements.front().sp);
}

std::string faultText(const Fault& fault, std::size_t count) {
    std::string text = textOf(fault.kind) + placeText(fault.at);
    if (fault.by > 0.0) text += " by " + formatReal(fault.by, kDistanceDigits);
    if (count > 1) text += ", and " + std::to_string(count - 1) + " more";
    return text;
}

std::string numbersText(const std::vector<std::size_t>& contours) {
    std::string text;
    for (std::size_t i = 0; i < contours.size() && i < kMostNamed; ++i) {
        const bool isLast = i + 1 == contours.size();
        text += (i == 0 ? "" : isLast ? " and " : ", ") + std::to_string(contours[i] + 1);
    }
    if (contours.size() <= kMostNamed) return text;
    return text + " and " + std::to_string(contours.size() - kMostNamed) + " more";
}

std::string refusalText(KernelRefusal refusal) {
    const std::string tolerance = formatReal(kKernelTolerance);
    switch (refusal) {
        case KernelRefusal::kTooSmall:
            return "an element is shorter than " + tolerance + ": scale the drawing up (--scale)";
        case KernelRefusal::kJoint:
            return "an arc, very flat or far from the origin, misses its neighbour by " +
                   tolerance + " or more: draw a line in its place, or move the part to the origin";
        case KernelRefusal::kEndsAtStart:
            return "it is open, but its end comes within " + tolerance +
                   " of its start: close it (--join), or draw its ends farther apart";
        case KernelRefusal::kPassesStart:
            return "it is open, but passes within " + tolerance +
                   " of its start: begin it elsewhere, or split it there";
        case KernelRefusal::kNone:
            break;
    }
    return {};
}

}  // namespace gmpath
