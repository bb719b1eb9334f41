// SPDX-License-Identifier: MIT
/// @file
/// Crossings of lines and circles in one form.
///
/// With G as in Carrier.cpp, written from a point of the flatter carrier, the combination
/// G_flat - (k_flat / k_bent) G_bent has no square in it: it is a line through both crossings, the
/// flatter carrier itself when that is a line. That line meets the more bent carrier where a square
/// equation says; its roots are taken without cancellation, so that one crossing may be near and
/// the other as far away as it likes. Two lines have a linear equation.
///
/// The same line is square to the line of centres, and passes between carriers that miss each
/// other: where it crosses the line of centres they come nearest.
///
/// The common origin is a point of the more bent carrier. Far from a small circle its form is large
/// there, and would take digits with it; that of the flatter one grows no more than the distance.
///
/// Each crossing is then improved by a step of Newton's method on both forms, each written from the
/// point by which its own carrier is given: it takes out what the common origin cost in digits.
#include "region/plane/Crossing.h"

#include <algorithm>
#include <cmath>
#include <optional>

namespace gmregion {

namespace {

/// Arcs of a larger bulge leave their chord far enough to be told by its sides.
constexpr double kBent = 0.5;

/// The form of a carrier written from another origin: value + gradient x - k/2 x x.
struct Form {
    double value;
    Vec2 gradient;
    double curvature;
};

Form formFrom(const Carrier& c, Vec2 origin) {
    const Side side = sideOf(c, origin);
    return {side.value, side.gradient, c.curvature};
}

/// Above this sine a step of Newton's method is taken as it is.
constexpr double kSteep = 1e-3;

/// One step towards the common zero of both sides; the point itself where they run alongside. Where
/// carriers touch, a step is the quotient of two roundings and may lead far away: there it is taken
/// only when it comes nearer to both.
Vec2 improved(const Carrier& a, const Carrier& b, Vec2 p) {
    const Side sideA = sideOf(a, p);
    const Side sideB = sideOf(b, p);
    const double determinant = cross(sideA.gradient, sideB.gradient);
    const Vec2 step{sideA.value * sideB.gradient.y - sideB.value * sideA.gradient.y,
                    sideB.value * sideA.gradient.x - sideA.value * sideB.gradient.x};
    const Vec2 better = p - (1.0 / determinant) * step;
    if (!std::isfinite(better.x) || !std::isfinite(better.y)) return p;
    if (std::fabs(determinant) > kSteep) return better;
    const auto away = [](double atA, double atB) {
        return std::max(std::fabs(atA), std::fabs(atB));
    };
    const double before = away(sideA.value, sideB.value);
    return away(sideOf(a, better).value, sideOf(b, better).value) <= before ? better : p;
}

/// The line through both crossings of two carriers, and where along it the more bent one is: in the
/// roots of c + b t - k/2 t t.
struct CommonLine {
    Vec2 foot;
    Vec2 along;
    double c;
    double b;
    double k;
};

std::optional<CommonLine> commonLine(const Form& flat, const Form& bent) {
    const double share = flat.curvature / bent.curvature;
    const Vec2 normal = flat.gradient - share * bent.gradient;
    const double squared = dot(normal, normal);
    if (!(squared > 0.0)) return std::nullopt;
    const Vec2 foot = ((share * bent.value - flat.value) / squared) * normal;
    const Vec2 along = (1.0 / std::sqrt(squared)) * Vec2{-normal.y, normal.x};
    const double k = bent.curvature;
    return CommonLine{foot, along,
                      bent.value + dot(bent.gradient, foot) - 0.5 * k * dot(foot, foot),
                      dot(bent.gradient - k * foot, along), k};
}

CrossingPoints onCommonLine(const Form& flat, const Form& bent) {
    CrossingPoints points;
    const std::optional<CommonLine> line = commonLine(flat, bent);
    if (!line) return points;
    const double discriminant = line->b * line->b + 2.0 * line->k * line->c;
    if (!(discriminant > 0.0)) return points;
    const double root = std::sqrt(discriminant);
    const double q = line->b < 0.0 ? line->b - root : line->b + root;
    points.add(line->foot + (-2.0 * line->c / q) * line->along);
    points.add(line->foot + (q / line->k) * line->along);
    return points;
}

CrossingPoints ofLines(const Form& a, const Form& b) {
    CrossingPoints points;
    const double determinant = cross(a.gradient, b.gradient);
    if (determinant == 0.0) return points;
    points.add((1.0 / determinant) * Vec2{b.value * a.gradient.y - a.value * b.gradient.y,
                                          a.value * b.gradient.x - b.value * a.gradient.x});
    return points;
}

bool isFlatter(const Carrier& a, const Carrier& b) {
    return std::fabs(a.curvature) <= std::fabs(b.curvature);
}

}  // namespace

std::optional<Vec2> nearestApproach(const Carrier& a, const Carrier& b) {
    const Carrier& flat = isFlatter(a, b) ? a : b;
    const Carrier& bent = isFlatter(a, b) ? b : a;
    if (bent.curvature == 0.0) return std::nullopt;
    const auto line = commonLine(formFrom(flat, bent.at), formFrom(bent, bent.at));
    if (!line) return std::nullopt;
    return bent.at + line->foot + (line->b / line->k) * line->along;
}

CrossingPoints crossings(const Carrier& a, const Carrier& b) {
    const Carrier& flat = isFlatter(a, b) ? a : b;
    const Carrier& bent = isFlatter(a, b) ? b : a;
    const Vec2 origin = bent.at;
    const Form flatForm = formFrom(flat, origin);
    const Form bentForm = formFrom(bent, origin);
    CrossingPoints points;
    const CrossingPoints rough =
        bent.curvature == 0.0 ? ofLines(flatForm, bentForm) : onCommonLine(flatForm, bentForm);
    for (const Vec2 p : rough) {
        const Vec2 point = improved(flat, bent, origin + p);
        if (std::isfinite(point.x) && std::isfinite(point.y)) points.add(point);
    }
    return points;
}

namespace {

/// Where a point of a carrier lies beside the element: before its start, behind its end, or on the
/// far side of the circle.
struct Beside {
    bool before;
    bool behind;
    bool across;
};

Beside besideOf(const Element& e, Vec2 p) {
    const Vec2 chord = e.ep - e.sp;
    const Vec2 fromStart = p - e.sp;
    const double aside = cross(chord, fromStart);
    // Of a circle, the arc is what lies on its own side of the chord.
    if (std::fabs(e.bulge) > kBent) return {false, false, aside * e.bulge > 0.0};
    // Of the circle's points beside the chord, those beyond the centre are not on the arc. The
    // centre lies at the height L (1 - b^2) / (4 b).
    const double heights = 4.0 * e.bulge * aside;
    const bool beyond = heights > dot(chord, chord) * (1.0 - e.bulge) * (1.0 + e.bulge);
    return {dot(chord, fromStart) < 0.0, dot(chord, e.ep - p) < 0.0, beyond};
}

}  // namespace

double placeOn(const Element& e, Vec2 p) {
    const Vec2 fromStart = p - e.sp;
    const Vec2 toEnd = e.ep - p;
    const double a = std::sqrt(dot(fromStart, fromStart));
    const double b = std::sqrt(dot(toEnd, toEnd));
    const double place = a + b > 0.0 ? a / (a + b) : 0.0;
    const Beside beside = besideOf(e, p);
    if (beside.before || (beside.across && a < b)) return -place;
    if (beside.behind || beside.across) return 2.0 - place;
    return place;
}

bool spans(const Element& e, Vec2 p) {
    const Beside beside = besideOf(e, p);
    return !(beside.before || beside.behind || beside.across);
}

CrossingPoints crossings(const Element& a, const Element& b) {
    CrossingPoints points;
    for (const Vec2 p : crossings(carrierOf(a), carrierOf(b))) {
        if (spans(a, p) && spans(b, p)) points.add(p);
    }
    return points;
}

}  // namespace gmregion
