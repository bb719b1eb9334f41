// SPDX-License-Identifier: MIT
/// @file
/// Comparing an offset with its source, with geometry of its own. Why the test for missing parts is
/// sound: the offset is where the distance from the source passes |d|. Take a point p of a parallel
/// or corner arc, and n, the unit vector that leads away from the source there. If the source is
/// farther than |d| + tolerance/2 from p + tolerance * n, then the distance passes |d| within the
/// tolerance of p, even where the source was moved by less than tolerance/2 before it was offset.
/// Where parallels coincide, as in a slot exactly two distances wide, or hardly part, the condition
/// fails, and it does not matter whether a result lies there.

#include "region/offset/OffsetCheck.h"

#include <algorithm>
#include <cmath>

#include "region/model/Area.h"
#include "region/model/Box.h"
#include "region/model/Winding.h"
#include "region/offset/RawOffset.h"
#include "region/search/ElementTree.h"

namespace gmregion {

namespace {

/// Tolerance of the check, in length units, and in parts of the source's size.
constexpr double kTolerance = 1e-3;
constexpr double kRelativeTolerance = 1e-6;

/// By how much, in tolerances, a point of a parallel may be too near to the source by rounding.
constexpr double kRounding = 0.01;

/// Samples of a whole offset, and the least of one piece.
constexpr double kSamples = 1000.0;
constexpr double kLeastSamples = 3.0;

/// The kernel leaves pieces below this length out of its results, in length units.
constexpr double kShortestPiece = 1e-3;
/// So much of an offset may be missing for that reason, in length units: the smallest loops.
constexpr double kMayBeLost = 50.0 * kShortestPiece;
/// Reach of the search for the ends of a short piece from its sample.
constexpr double kReach = 0.6 * kShortestPiece;

Path straightened(const Path& source) {
    Path path = source;
    for (Element& e : path.elements)
        e = straightened(e);
    return path;
}

std::vector<Element> allElements(const std::vector<Path>& paths) {
    std::vector<Element> elements;
    for (const Path& path : paths)
        elements.insert(elements.end(), path.elements.begin(), path.elements.end());
    return elements;
}

/// Visits samples of every element until visit(element, t, share) answers false; `share` is the
/// length for which a sample stands. True when all were visited.
template <typename Visit>
bool forSamples(const std::vector<Element>& elements, const Visit& visit) {
    double total = 0.0;
    for (const Element& e : elements)
        total += length(e);
    for (const Element& e : elements) {
        const double len = length(e);
        const double wanted = std::ceil(len / total * kSamples);
        // A length that is not a number has the least samples too. The count is odd, for what is
        // left of a side is often its middle.
        const int count = static_cast<int>(std::min(std::max(kLeastSamples, wanted), kSamples)) | 1;
        for (int k = 0; k < count; ++k) {
            if (!visit(e, (k + 0.5) / count, len / count)) return false;
        }
    }
    return true;
}

class OffsetCheck {
public:
    OffsetCheck(const Path& source, double d)
        : m_path(straightened(source)),
          m_sense(sense(m_path)),
          m_source(m_path.elements),
          m_raw(rawOffset(m_path, d)),
          m_distance(std::abs(d)),
          m_outwards(d > 0.0 ? 1.0 : -1.0),
          m_tolerance(checkTolerance(source)) {}

    bool allKeepDistance(const std::vector<Path>& results) const {
        return forSamples(allElements(results), [&](const Element& e, double t, double /*share*/) {
            const Vec2 p = pointAt(e, t);
            return !m_source.comesNearer(p, m_distance - m_tolerance) &&
                   m_source.comesNearer(p, m_distance + m_tolerance);
        });
    }

    bool isComplete(const std::vector<Path>& results) const {
        const ElementTree found(allElements(results));
        double lost = 0.0;
        return forSamples(m_raw, [&](const Element& raw, double t, double share) {
            if (found.comesNearer(pointAt(raw, t), m_tolerance) || !isRequired(raw, t)) return true;
            if (isOnLongPiece(raw, t)) return false;
            lost += std::min(share, 2.0 * kReach);
            return lost < kMayBeLost;
        });
    }

private:
    bool isRequired(const Element& raw, double t) const {
        const Vec2 outwards = m_outwards * rightNormal(tangentAt(raw, t));
        return keepsDistance(raw, t) &&
               !m_source.comesNearer(pointAt(raw, t) + m_tolerance * outwards,
                                     m_distance + 0.5 * m_tolerance) &&
               isOnSide(pointAt(raw, t));
    }

    /// False when p lies inside of a closed source that is offset to its outside, or the other way
    /// round: beside a loop, perhaps a tiny one, that the source makes in the other sense.
    bool isOnSide(Vec2 p) const {
        if (m_sense == Sense::kNone) return true;
        const bool inside = (m_sense == Sense::kCounterClockwise) != (m_outwards > 0.0);
        return (windingNumber(m_path, p) != 0) == inside;
    }

    bool keepsDistance(const Element& raw, double t) const {
        return !m_source.comesNearer(pointAt(raw, t), m_distance - kRounding * m_tolerance);
    }

    /// True when the piece of the offset round a sample is certainly not too short for the kernel.
    bool isOnLongPiece(const Element& raw, double t) const {
        const double reach = kReach / length(raw);
        return reach < t && t < 1.0 - reach && keepsDistance(raw, t - reach) &&
               keepsDistance(raw, t + reach);
    }

    Path m_path;
    Sense m_sense;
    ElementTree m_source;
    std::vector<Element> m_raw;
    double m_distance;
    double m_outwards;
    double m_tolerance;
};

}  // namespace

std::string_view faultText(OffsetFault fault) {
    switch (fault) {
        case OffsetFault::kMissing:
            return "is not complete";
        case OffsetFault::kDistance:
            return "leaves its distance";
        case OffsetFault::kOpen:
            return "is not closed";
        case OffsetFault::kNone:
            break;
    }
    return "is sound";
}

double checkTolerance(const Path& source) {
    const Vec2 size = boundingBox(source).size();
    return std::max(kTolerance, kRelativeTolerance * std::max(size.x, size.y));
}

OffsetFault checkOffset(const Path& source, double d, const std::vector<Path>& results) {
    if (std::abs(d) < kKernelTolerance) return OffsetFault::kNone;
    const auto isOpen = [](const Path& path) { return !path.closed; };
    if (source.closed && std::any_of(results.begin(), results.end(), isOpen)) {
        return OffsetFault::kOpen;
    }
    const OffsetCheck check(source, d);
    if (!check.allKeepDistance(results)) return OffsetFault::kDistance;
    return check.isComplete(results) ? OffsetFault::kNone : OffsetFault::kMissing;
}

}  // namespace gmregion
