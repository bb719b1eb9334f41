#include "drawing/svg/SvgSymbols.h"

#include <algorithm>

#include "drawing/Text.h"
#include "region/model/Area.h"
#include "region/model/Box.h"

namespace gmdrawing {

using gmregion::Element;
using gmregion::Path;
using gmregion::Sense;
using gmregion::Vec2;

namespace {

/// Sizes as fractions of the picture's diagonal, and of the extent of the marked path.
constexpr double kDotOfDiagonal = 0.0022;
constexpr double kDotOfPath = 0.04;
constexpr double kLargestLabel = 0.011;
constexpr double kSmallestLabel = 0.005;
constexpr double kLabelOfPath = 0.3;

/// The arrow head, in dot radii: where it starts behind the dot, how long and how wide it is.
constexpr double kArrowStart = 1.6;
constexpr double kArrowLength = 3.6;
constexpr double kArrowHalfWidth = 1.3;

double dotRadius(const Path& path, double diagonal) {
    const Vec2 size = boundingBox(path).size();
    return std::min(kDotOfDiagonal * diagonal, kDotOfPath * std::max(size.x, size.y));
}

/// The point at a distance along the path; the end of a path that is shorter.
Vec2 pointAlong(const Path& path, double distanceAlong) {
    for (const Element& e : path.elements) {
        const double len = length(e);
        if (distanceAlong <= len) return pointAt(e, len > 0.0 ? distanceAlong / len : 0.0);
        distanceAlong -= len;
    }
    return path.elements.back().ep;
}

std::string coordinates(Vec2 p) {
    return formatReal(p.x) + " " + formatReal(-p.y);
}

}  // namespace

std::string textTag(Vec2 at, double size, const std::string& attributes, const std::string& text) {
    constexpr double kFontSize = 10.0;
    return "<text transform=\"translate(" + coordinates(at) + ") scale(" +
           formatReal(size / kFontSize) + ")\" font-size=\"" + formatReal(kFontSize) + "\" " +
           attributes + ">" + text + "</text>\n";
}

std::string startMark(const Path& path, const std::string& styleClass, double diagonal) {
    if (path.elements.empty()) return {};
    const Element& first = path.elements.front();
    const double r = dotRadius(path, diagonal);
    const Vec2 back = pointAlong(path, kArrowStart * r);
    const Vec2 tip = pointAlong(path, (kArrowStart + kArrowLength) * r);
    const Vec2 side = kArrowHalfWidth * r * rightNormal(unit(tip - back));
    return "<circle class=\"" + styleClass + "\" cx=\"" + formatReal(first.sp.x) + "\" cy=\"" +
           formatReal(-first.sp.y) + "\" r=\"" + formatReal(r) + "\"/>\n<path class=\"" +
           styleClass + "\" d=\"M " + coordinates(back + side) + " L " + coordinates(tip) + " L " +
           coordinates(back - side) + " Z\"/>\n";
}

std::string numberLabel(const Path& path, const std::string& number, bool inside, double diagonal) {
    if (path.elements.empty()) return {};
    const Vec2 extent = boundingBox(path).size();
    const double room = path.closed ? std::min(extent.x, extent.y) : std::max(extent.x, extent.y);
    const double size =
        std::clamp(kLabelOfPath * room, kSmallestLabel * diagonal, kLargestLabel * diagonal);
    const Element& first = path.elements.front();
    const bool leftIsInside = sense(path) == Sense::kCounterClockwise;
    const double toTheRight = sense(path) == Sense::kNone || leftIsInside != inside ? 1.0 : -1.0;
    // A little ahead of the start as well, so that no other element of a corner crosses the text.
    const Vec2 along = tangentStart(first);
    const Vec2 at = first.sp + size * along + toTheRight * size * rightNormal(along);
    constexpr double kHalfCapital = 0.35;  // lowers the text so that it centres on the point
    return textTag({at.x, at.y - kHalfCapital * size}, size,
                   "class=\"source-mark\" text-anchor=\"middle\"", number);
}

}  // namespace gmdrawing
