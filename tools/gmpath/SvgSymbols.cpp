#include "SvgSymbols.h"

#include <algorithm>

#include "Measure.h"
#include "Text.h"

namespace gmpath {

namespace {

/// Sizes as fractions of the picture's diagonal, and of the extent of the marked path.
constexpr double kDotOfDiagonal = 0.0022;
constexpr double kDotOfPath = 0.04;
constexpr double kLabelOfDiagonal = 0.012;
constexpr double kLabelOfPath = 0.3;

/// The arrow head, in dot radii: where it starts behind the dot, how long and how wide it is.
constexpr double kArrowStart = 1.6;
constexpr double kArrowLength = 3.6;
constexpr double kArrowHalfWidth = 1.3;

double dotRadius(const Path& path, double diagonal) {
    const Vec2 size = boundingBox(path).size();
    return std::min(kDotOfDiagonal * diagonal, kDotOfPath * std::max(size.x, size.y));
}

std::string coordinates(Vec2 p) {
    return formatReal(p.x) + " " + formatReal(-p.y);
}

}  // namespace

std::string startMark(const Path& path, const std::string& styleClass, double diagonal) {
    if (path.elements.empty()) return {};
    const Element& first = path.elements.front();
    const double r = dotRadius(path, diagonal);
    const Vec2 along = tangentStart(first);
    const Vec2 side = kArrowHalfWidth * r * rightNormal(along);
    const Vec2 back = first.sp + kArrowStart * r * along;
    const Vec2 tip = back + kArrowLength * r * along;
    return "<circle class=\"" + styleClass + "\" cx=\"" + formatReal(first.sp.x) + "\" cy=\"" +
           formatReal(-first.sp.y) + "\" r=\"" + formatReal(r) + "\"/>\n<path class=\"" +
           styleClass + "\" d=\"M " + coordinates(back + side) + " L " + coordinates(tip) + " L " +
           coordinates(back - side) + " Z\"/>\n";
}

std::string numberLabel(const Path& path, const std::string& number, double diagonal) {
    if (path.elements.empty()) return {};
    const Vec2 extent = boundingBox(path).size();
    const double size =
        std::min(kLabelOfDiagonal * diagonal, kLabelOfPath * std::max(extent.x, extent.y));
    const Element& first = path.elements.front();
    const double inside = signedArea(path) < 0.0 ? 1.0 : -1.0;
    const Vec2 at = first.sp + inside * size * rightNormal(tangentStart(first));
    constexpr double kHalfCapital = 0.35;  // lowers the text so that it centres on the point
    return "<text class=\"source-mark\" text-anchor=\"middle\" font-size=\"" + formatReal(size) +
           "\" x=\"" + formatReal(at.x) + "\" y=\"" + formatReal(-at.y + kHalfCapital * size) +
           "\">" + number + "</text>\n";
}

}  // namespace gmpath
