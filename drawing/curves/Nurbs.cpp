// SPDX-License-Identifier: MIT
/// @file
/// Splines as rows of Bézier curves.
///
/// A piece of degree p over a span of knots is a polynomial; its polar form takes p parameters in
/// any order and gives the piece itself where all are equal. The control points over [a, b] are its
/// values at p - j times a and j times b, and each is found by de Boor's scheme with another
/// parameter in every step. Weights ride along as a third coordinate.

#include "drawing/curves/Nurbs.h"

#include <algorithm>

namespace gmdrawing {

using gmregion::Vec2;

namespace {

constexpr std::size_t kHighestDegree = 15;

/// A point in space, of which the drawing sees p / w.
struct SpacePoint {
    Vec2 p;
    double w;
};

/// The polar form of the piece over the knots `span` and `span + 1`, at `ahead` times the end of
/// the span and else its start.
SpacePoint polar(const Nurbs& spline, std::size_t span, std::size_t ahead) {
    const std::size_t degree = spline.degree;
    std::vector<SpacePoint> points;
    for (std::size_t i = span - degree; i <= span; ++i) {
        const WeightedPoint& c = spline.points[i];
        points.push_back({c.weight * c.p, c.weight});
    }
    for (std::size_t step = 1; step <= degree; ++step) {
        const double u = spline.knots[step <= ahead ? span + 1 : span];
        for (std::size_t j = degree; j >= step; --j) {
            const double low = spline.knots[span - degree + j];
            const double high = spline.knots[span + 1 + j - step];
            const double t = (u - low) / (high - low);
            points[j] = {(1.0 - t) * points[j - 1].p + t * points[j].p,
                         (1.0 - t) * points[j - 1].w + t * points[j].w};
        }
    }
    return points.back();
}

Bezier pieceOver(const Nurbs& spline, std::size_t span) {
    Bezier curve;
    for (std::size_t j = 0; j <= spline.degree; ++j) {
        const SpacePoint s = polar(spline, span, j);
        curve.push_back({(1.0 / s.w) * s.p, s.w});
    }
    return curve;
}

bool hasGap(const Nurbs& spline) {
    for (std::size_t i = 1; i + spline.degree + 1 < spline.knots.size(); ++i) {
        if (spline.knots[i] == spline.knots[i + spline.degree]) return true;
    }
    return false;
}

}  // namespace

const char* faultOf(const Nurbs& spline) {
    const std::vector<double>& knots = spline.knots;
    const std::size_t count = spline.points.size();
    if (spline.degree < 1 || spline.degree > kHighestDegree) return "its degree cannot be used";
    if (count <= spline.degree) return "too few control points";
    if (knots.size() != count + spline.degree + 1) return "not as many knots as needed";
    const bool rising = std::is_sorted(knots.begin(), knots.end());
    if (!rising || knots[spline.degree] == knots[count]) return "its knots do not rise";
    if (hasGap(spline)) return "its knots leave a gap";
    const auto isBad = [](const WeightedPoint& point) { return !(point.weight > 0.0); };
    if (std::any_of(spline.points.begin(), spline.points.end(), isBad)) {
        return "a weight is not above 0";
    }
    return "";
}

std::vector<Bezier> bezierPieces(const Nurbs& spline) {
    std::vector<Bezier> pieces;
    for (std::size_t span = spline.degree; span < spline.points.size(); ++span) {
        if (spline.knots[span] == spline.knots[span + 1]) continue;
        pieces.push_back(pieceOver(spline, span));
        if (pieces.size() > 1) pieces.back().front() = pieces[pieces.size() - 2].back();
    }
    return pieces;
}

}  // namespace gmdrawing
