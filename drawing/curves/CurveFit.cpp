// SPDX-License-Identifier: MIT
/// @file
/// Curves as arcs.
///
/// The regions fit arcs to points with tangents, if the curve between two of them stays in the lens
/// of the arcs that leave the first and reach the second along its tangent. So curves are halved
/// until every lens is far thinner than the tolerance and three points of the curve inside lie in
/// it: these find the tips of curves, whose lens is thin only because both its ends are alike. What
/// is too small to be halved is a chord with corners at its ends.

#include "drawing/curves/CurveFit.h"

#include <algorithm>
#include <cmath>

#include "gmregion/Simplify.h"

namespace gmdrawing {

using gmregion::Element;
using gmregion::Simplified;
using gmregion::SimplifyOptions;
using gmregion::TangentPoint;
using gmregion::Vec2;

namespace {

/// The part of the tolerance that a lens may take.
constexpr double kLensShare = 1.0 / 16.0;

/// Curves up to this part of the tolerance are chords.
constexpr double kChordShare = 1.0 / 64.0;

constexpr int kFirstPieces = 4;

/// Halvings beyond which a curve is taken for a chord.
constexpr int kDeepest = 24;

/// Halvings of a row, and besides of each of its curves, beyond which there is no fit: at the pace
/// at which lenses grow thinner, that many are never needed.
constexpr std::size_t kMostHalvings = 100'000;
constexpr std::size_t kMostHalvingsOfCurve = 1'000;

/// Directions that turn further than this from the chord are no lens, in cosines: 45 degrees.
constexpr double kLeastCosine = 0.7071;

/// Bulge of the arc over a chord that starts in a direction, both of length 1.
double bulgeFrom(Vec2 direction, Vec2 chord) {
    return cross(direction, chord) / (1.0 + dot(direction, chord));
}

/// How far a point beside a chord lies from an arc over it, measured square to the chord; the arc
/// turns by less than a quarter. Holds for arcs however flat, whose centres are lost in rounding.
double distanceOverChord(Vec2 a, Vec2 chord, double length, double bulge, Vec2 p) {
    const double x = dot(p - a, chord) - 0.5 * length;
    const double curvature = 4.0 * bulge / (length * (1.0 + bulge * bulge));
    const double root = std::sqrt(std::max(0.0, 1.0 - curvature * curvature * x * x));
    const double height = 0.5 * bulge * length - curvature * x * x / (1.0 + root);
    return std::abs(cross(p - a, chord) - height);
}

class Sampling {
public:
    Sampling(const std::vector<Bezier>& curves, double tolerance)
        : m_tolerance(tolerance), m_halvings(kMostHalvings + kMostHalvingsOfCurve * curves.size()) {
        for (const Bezier& curve : curves)
            sample(curve);
    }

    /// Whether every piece was found thin enough, or too small.
    bool isDone() const { return m_halvings > 0; }

    /// The points of the row; of a closed one without the last, which is the first.
    std::vector<TangentPoint> takePoints(bool closed) {
        if (closed && m_points.size() > 2 && isSame(m_points.back(), m_points.front())) {
            m_points.pop_back();
        }
        return std::move(m_points);
    }

private:
    struct Place {
        double t;
        CurvePoint point;
    };

    void sample(const Bezier& curve) {
        if (curve.size() == 2) return addChord(curve.front().p, curve.back().p);
        Place from{0.0, pointAt(curve, 0.0)};
        for (int i = 1; i <= kFirstPieces; ++i) {
            const double t = static_cast<double>(i) / kFirstPieces;
            const Place to{t, pointAt(curve, t)};
            halve(curve, from, to, 0);
            from = to;
        }
    }

    void halve(const Bezier& curve, const Place& from, const Place& to, int depth) {
        if (isSmall(curve, from, to) || depth == kDeepest) {
            return addChord(from.point.at, to.point.at);
        }
        if (isLens(curve, from, to)) {
            add(from.point.at, from.point.direction);
            return add(to.point.at, to.point.direction);
        }
        if (m_halvings == 0) return;
        --m_halvings;
        const double t = 0.5 * (from.t + to.t);
        const Place middle{t, pointAt(curve, t)};
        halve(curve, from, middle, depth + 1);
        halve(curve, middle, to, depth + 1);
    }

    bool isSmall(const Bezier& curve, const Place& from, const Place& to) const {
        const double limit = kChordShare * m_tolerance;
        return distance(from.point.at, to.point.at) < limit &&
               controlLength(piece(curve, from.t, to.t)) < limit;
    }

    bool isLens(const Bezier& curve, const Place& from, const Place& to) const {
        const Vec2 a = from.point.at;
        const Vec2 b = to.point.at;
        const double length = distance(a, b);
        if (!(length > 0.0)) return false;
        const Vec2 chord = (1.0 / length) * (b - a);
        if (!(dot(from.point.direction, chord) > kLeastCosine)) return false;
        if (!(dot(to.point.direction, chord) > kLeastCosine)) return false;
        const double leaving = bulgeFrom(from.point.direction, chord);
        const double reaching = bulgeFrom(chord, to.point.direction);
        const double limit = kLensShare * m_tolerance;
        if (!(0.5 * length * std::abs(leaving - reaching) <= limit)) return false;
        const auto isNear = [&](double share) {
            const double t = from.t + share * (to.t - from.t);
            return distanceOverChord(a, chord, length, leaving, pointAt(curve, t).at) <= limit;
        };
        return isNear(0.25) && isNear(0.5) && isNear(0.75);
    }

    void addChord(Vec2 from, Vec2 to) {
        const double length = distance(from, to);
        if (!(length > 0.0)) return;
        const Vec2 along = (1.0 / length) * (to - from);
        add(from, along);
        add(to, along);
    }

    /// Curves that meet share a point, two where there is a corner.
    void add(Vec2 at, Vec2 direction) {
        const TangentPoint point{at, direction};
        if (m_points.empty() || !isSame(m_points.back(), point)) m_points.push_back(point);
    }

    static bool isSame(const TangentPoint& a, const TangentPoint& b) {
        constexpr double kSmooth = 1e-9;
        return a.at == b.at && length(a.tangent - b.tangent) < kSmooth;
    }

    double m_tolerance;
    std::size_t m_halvings;  ///< that may still be made
    std::vector<TangentPoint> m_points;
};

/// The largest coordinate, HUGE_VAL where there is no number.
double largestNumber(const std::vector<Bezier>& curves) {
    double largest = 0.0;
    for (const Bezier& curve : curves) {
        for (const WeightedPoint& point : curve) {
            const double size = std::max(std::abs(point.p.x), std::abs(point.p.y));
            if (!std::isfinite(size) || !std::isfinite(point.weight)) return HUGE_VAL;
            largest = std::max(largest, size);
        }
    }
    return largest;
}

/// Whether the tolerance stands out from the rounding of the coordinates. Otherwise no halving
/// would ever find a lens thin enough.
bool isAboveRounding(double tolerance, double largest) {
    constexpr double kRounding = 0x1p-40;
    constexpr double kLargest = 1e12;
    return largest <= kLargest && tolerance > kRounding * largest;
}

/// Arcs that leave their chord by rounding are segments.
bool isFlat(const Element& e, double tolerance) {
    constexpr double kFlatShare = 1e-6;
    return 0.5 * std::abs(e.bulge) * distance(e.sp, e.ep) < kFlatShare * tolerance;
}

}  // namespace

std::optional<std::vector<Element>> fitted(const std::vector<Bezier>& curves, bool closed,
                                           double tolerance) {
    if (!isAboveRounding(tolerance, largestNumber(curves))) return std::nullopt;
    Sampling sampling(curves, tolerance);
    if (!sampling.isDone()) return std::nullopt;
    const std::vector<TangentPoint> points = sampling.takePoints(closed);
    if (points.size() < 2) return std::vector<Element>{};
    SimplifyOptions options;
    options.tolerance = tolerance;
    Simplified simplified;
    if (!simplifyCurve(points.data(), points.size(), closed, options, simplified)) {
        return std::nullopt;
    }
    const gmregion::PathView path = simplified.paths[0];
    std::vector<Element> elements(path.begin(), path.end());
    for (Element& e : elements) {
        if (isFlat(e, tolerance)) e.bulge = 0.0;
    }
    return elements;
}

}  // namespace gmdrawing
