// SPDX-License-Identifier: MIT
/// @file
/// The untrimmed offset: every parallel, and every arc about a corner that opens to the side.
///
/// The true offset is a part of it: each of its points has a nearest point on the source, and lies
/// square to the element there or on the circle about the corner there. What of it comes too near
/// to other elements is not cut away here.

#include "region/offset/RawOffset.h"

#include <cmath>
#include <optional>

namespace gmregion {

namespace {

/// A corner that turns back this nearly, in radians, opens to both sides.
constexpr double kTurnsBack = 1e-6;

Vec2 normal(Vec2 tangent, double d) {
    return d * rightNormal(tangent);
}

std::optional<Element> parallel(const Element& e, double d) {
    const double wider = e.bulge > 0.0 ? d : -d;
    if (isArc(e) && radius(e) + wider <= 0.0) return std::nullopt;
    return Element{e.sp + normal(tangentStart(e), d), e.ep + normal(tangentEnd(e), d), e.bulge};
}

/// The arc about the corner between two elements, where it opens to the side of d.
std::optional<Element> cornerArc(const Element& before, const Element& after, double d) {
    const Vec2 in = tangentEnd(before);
    const Vec2 out = tangentStart(after);
    const double turn = std::atan2(cross(in, out), dot(in, out));
    const double side = d > 0.0 ? 1.0 : -1.0;
    if (side * turn <= 0.0 && std::abs(turn) < kPi - kTurnsBack) return std::nullopt;
    return Element{before.ep + normal(in, d), before.ep + normal(out, d),
                   side * std::tan(0.25 * std::abs(turn))};
}

}  // namespace

std::vector<Element> rawOffset(const Path& path, double d) {
    const std::size_t count = path.elements.size();
    std::vector<Element> raw;
    for (std::size_t i = 0; i < count; ++i) {
        const Element& e = path.elements[i];
        if (const auto beside = parallel(e, d)) raw.push_back(*beside);
        if (i + 1 == count && !path.closed) continue;
        if (const auto arc = cornerArc(e, path.elements[(i + 1) % count], d)) raw.push_back(*arc);
    }
    return raw;
}

}  // namespace gmregion
