// SPDX-License-Identifier: MIT
#include "Shapes.h"

#include <cmath>
#include <limits>

namespace net {

namespace {

constexpr double kPi = 3.14159265358979323846;
/// The bulge of a quarter circle: the tangent of an eighth of a turn.
constexpr double kQuarter = 0.41421356237309503;

GmPoint Polar(double r, double radians) {
    return GmPoint(r * std::cos(radians), r * std::sin(radians));
}

/// The arc over a chord by its height, or the segment where that is 0 or the arc cannot be.
std::unique_ptr<GmCurve> Side(Dice& dice, Corner const& from, GmPoint const& ep) {
    const GmVec chord = ep - from.p;
    const GmVec rise = GmVec(chord.Y(), -chord.X(), 0) * (from.bulge / 2.0);
    if (from.bulge == 0.0) return std::make_unique<GmStretch>(from.p, ep);
    const GmPoint top(from.p.Mean(ep) + rise);
    if (dice.Once(2)) return std::make_unique<GmArc>(from.p, top, ep);
    const GmCircle circle(from.p, top, ep);
    return std::make_unique<GmArc>(from.p, ep, circle.M(),
                                   from.bulge > 0.0 ? GmBase::eRotCCW : GmBase::eRotCW);
}

/// Turns, moves and rounds corners: what a drawing of a turned part holds.
void Place(Dice& dice, Corners& corners) {
    const double turn = dice.Once(3) ? 0.0 : dice.In(-kPi, kPi);
    const double x = dice.Once(3) ? 0.0 : dice.In(-500.0, 500.0);
    const double y = dice.Once(3) ? 0.0 : dice.In(-500.0, 500.0);
    const int decimals = 2 + dice.Below(11);
    for (Corner& corner : corners) {
        const GmPoint p = corner.p;
        corner.p = GmPoint(Rounded(p.X() * std::cos(turn) - p.Y() * std::sin(turn) + x, decimals),
                           Rounded(p.X() * std::sin(turn) + p.Y() * std::cos(turn) + y, decimals));
    }
}

}  // namespace

GmContour Chain(Dice& dice, Corners const& corners, bool bClosed) {
    GmContour contour;
    const std::size_t sides = bClosed ? corners.size() : corners.size() - 1;
    for (std::size_t i = 0; i < sides; ++i) {
        const std::unique_ptr<GmCurve> side =
            Side(dice, corners[i], corners[(i + 1) % corners.size()].p);
        const long id = dice.Once(8) ? dice.Below(5) - 1 : static_cast<long>(i) + 1;
        contour.AddElement(side.get(), false, id);
    }
    return contour;
}

Corners Star(Dice& dice, int count, bool bArcs) {
    Corners corners(static_cast<std::size_t>(count));
    const double sense = dice.Once(3) ? -1.0 : 1.0;
    const double low = dice.In(2.0, 9.5);
    for (int i = 0; i < count; ++i) {
        Corner& corner = corners[static_cast<std::size_t>(i)];
        corner.p = Polar(dice.In(low, 10.0), sense * 2.0 * kPi * i / count);
        if (bArcs && dice.Once(2)) corner.bulge = dice.In(-0.4, 0.4);
    }
    Place(dice, corners);
    return corners;
}

Corners Tangle(Dice& dice, int count) {
    Corners corners(static_cast<std::size_t>(count));
    for (Corner& corner : corners) {
        corner.p = GmPoint(dice.SoundLength(), dice.SoundLength());
        if (dice.Once(3)) corner.bulge = dice.In(-1.5, 1.5);
    }
    for (int i = dice.Below(3); i > 0; --i)
        Spoil(dice, corners);
    return corners;
}

Corners Walk(Dice& dice, int count) {
    Corners corners(static_cast<std::size_t>(count));
    double heading = dice.In(-kPi, kPi);
    GmPoint p = dice.Once(2) ? GmPoint(0, 0) : GmPoint(dice.SoundLength(), dice.SoundLength());
    for (Corner& corner : corners) {
        corner.p = p;
        if (dice.Once(3)) corner.bulge = dice.In(-0.8, 0.8);
        p = GmPoint(p + GmVec(Polar(dice.In(0.5, 6.0), heading)));
        heading += dice.Once(4) ? 0.0 : dice.In(-1.2, 1.2);
    }
    return corners;
}

Corners Plate(Dice& dice) {
    const double w = dice.In(8.0, 60.0);
    const double h = dice.In(8.0, 60.0);
    const double r = dice.Once(2) ? 1.0 + dice.Below(3) : dice.In(0.2, 3.9);
    const bool bHollow = dice.Once(5);  // corners cut out by quarter circles
    const double bulge = bHollow ? -kQuarter : kQuarter;
    Corners corners{{GmPoint(r, 0)},     {GmPoint(w - r, 0), bulge},
                    {GmPoint(w, r)},     {GmPoint(w, h - r), bulge},
                    {GmPoint(w - r, h)}, {GmPoint(r, h), bulge},
                    {GmPoint(0, h - r)}, {GmPoint(0, r), bulge}};
    Place(dice, corners);
    return corners;
}

Corners Hourglass(Dice& dice) {
    const double neck = dice.In(0.5, 3.0);
    const double h = dice.In(4.0, 9.0);
    const double w = dice.In(4.0, 12.0);
    const double bulge = dice.Once(2) ? 0.0 : dice.In(-0.3, 0.3);
    Corners corners{{GmPoint(-w, -h), bulge}, {GmPoint(-1, -h)},       {GmPoint(-1, -neck)},
                    {GmPoint(1, -neck)},      {GmPoint(1, -h), bulge}, {GmPoint(w, -h)},
                    {GmPoint(w, h), bulge},   {GmPoint(1, h)},         {GmPoint(1, neck)},
                    {GmPoint(-1, neck)},      {GmPoint(-1, h), bulge}, {GmPoint(-w, h)}};
    Place(dice, corners);
    return corners;
}

void Spoil(Dice& dice, Corners& corners) {
    const int n = static_cast<int>(corners.size());
    GmPoint& p = corners[static_cast<std::size_t>(dice.Below(n))].p;
    GmPoint const& other = corners[static_cast<std::size_t>(dice.Below(n))].p;
    switch (dice.Below(8)) {
        case 0:
            p = GmPoint(1e7 * dice.In(-1.0, 1.0), p.Y());
            break;
        case 1:
            p = GmPoint(p.X(), std::numeric_limits<double>::quiet_NaN());
            break;
        case 2:
            p = GmPoint(1e200, -1e200);
            break;
        case 3:
            p = GmPoint(std::numeric_limits<double>::infinity(), 0.0);
            break;
        case 4:
            p = GmPoint(other.X() + dice.In(-2e-4, 2e-4), other.Y() + dice.In(-2e-4, 2e-4));
            break;
        case 5:
            p = GmPoint(p.X() * 1e-9, p.Y() * 1e-9);
            break;
        default:
            p = other;
    }
}

GmContour SoundContour(Dice& dice) {
    switch (dice.Below(5)) {
        case 0:
            return Chain(dice, Plate(dice), true);
        case 1:
            return Chain(dice, Hourglass(dice), true);
        case 2:
            return Chain(dice, Star(dice, 3 + dice.Below(6), false), true);
        default:
            return Chain(dice, Star(dice, 3 + dice.Below(14), true), true);
    }
}

GmContour AnyContour(Dice& dice) {
    switch (dice.Below(6)) {
        case 0:
            return Chain(dice, Walk(dice, 2 + dice.Below(12)), false);
        case 1:
            return Chain(dice, Tangle(dice, 2 + dice.Below(8)), !dice.Once(4));
        case 2: {
            Corners corners = Star(dice, 3 + dice.Below(8), true);
            Spoil(dice, corners);
            return Chain(dice, corners, true);
        }
        default:
            return SoundContour(dice);
    }
}

GmPoint PointNear(Dice& dice, GmContour const& contour) {
    const long count = contour.ElementCount();
    if (count == 0 || dice.Once(6)) return dice.AnyPoint();
    GmCurve const* element = contour.GetElement(dice.Below(static_cast<int>(count)));
    const GmPoint p = element->SP();
    if (dice.Once(5)) return p;
    if (dice.Once(4)) return element->NP(GmPoint(p + dice.Vector() * 0.1));
    const double reach = std::pow(10.0, dice.Below(7) - 5);
    return GmPoint(p + GmVec(dice.In(-reach, reach), dice.In(-reach, reach), 0));
}

}  // namespace net
