// SPDX-License-Identifier: MIT
#include <cmath>

#include "Shapes.h"

namespace net {

namespace {

constexpr double kPi = 3.14159265358979323846;
constexpr int kUndefinedOnceIn = 60;

/// An arc by each of its constructors.
GmArc ArcOf(Dice& dice, int way) {
    const GmPoint sp = dice.Point();
    const GmPoint ep = dice.Point();
    const GmPoint m = dice.Point();
    const GmBase::eRotDir rot = dice.Sense();
    const double r = std::fabs(dice.Length());
    const double from = dice.Degrees() * kPi / 180.0;
    const double to = dice.Degrees() * kPi / 180.0;
    const GmCircle circle(m, r, dice.Once(2));
    switch (way) {
        case 0:
            return GmArc(sp, m, ep);
        case 1:
            return GmArc(sp, ep, m, rot);
        case 2:
            return GmArc(m, r, from, to, rot);
        case 3:
            return GmArc(circle, from, to, rot);
        case 4:
            return GmArc(circle, circle.MinDist(sp, false), circle.MinDist(ep, false), rot);
        case 5:
            return GmArc(circle, circle.MinDist(sp, false), circle.MinDist(ep, false),
                         rot == GmBase::eRotCW);
        case 6:
            return GmArc(sp, ep, r * 2.0, dice.Once(2), rot);
        default:
            return GmArc(GmArc(sp, m, ep), dice.Length() * 0.2);
    }
}

}  // namespace

GmLine AnyLine(Dice& dice) {
    if (dice.Once(kUndefinedOnceIn)) return GmLine();
    const GmPoint p = dice.AnyPoint();
    return dice.Once(3) ? GmLine(p, dice.Direction()) : GmLine(p, dice.Point());
}

GmStretch AnyStretch(Dice& dice) {
    if (dice.Once(kUndefinedOnceIn)) return GmStretch();
    const GmPoint p = dice.AnyPoint();
    if (dice.Once(4)) return GmStretch(p, dice.Direction(), dice.Length());
    return GmStretch(p, dice.Point());
}

GmCircle AnyCircle(Dice& dice) {
    if (dice.Once(kUndefinedOnceIn)) return GmCircle();
    const GmPoint p = dice.AnyPoint();
    switch (dice.Below(4)) {
        case 0:
            return GmCircle(p, dice.Point(), dice.Point());
        case 1:
            return GmCircle(p, GmDir(0, 0, dice.Once(2) ? 1 : -1), dice.Length());
        default:
            return GmCircle(p, dice.Length(), dice.Once(2));
    }
}

GmArc AnyArc(Dice& dice) {
    constexpr int kWays = 8;
    if (dice.Once(kUndefinedOnceIn)) return GmArc();
    GmArc arc = ArcOf(dice, dice.Below(kWays));
    if (dice.Once(20)) arc.SetEP(arc.SP());  // a full circle
    return arc;
}

GmRect AnyRect(Dice& dice) {
    if (dice.Once(kUndefinedOnceIn)) return GmRect();
    const GmPoint a = dice.AnyPoint();
    switch (dice.Below(4)) {
        case 0:
            return GmRect(a, dice.Length(), dice.Length());
        case 1:
            return GmRect(GmRect(a, dice.Point()), dice.Length() * 0.2);
        case 2:
            return GmRect(a.X(), a.Y(), dice.Length(), dice.Length());
        default:
            return GmRect(a, dice.AnyPoint());
    }
}

std::unique_ptr<GmCurve> AnyCurve(Dice& dice, Kind kind) {
    switch (kind) {
        case Kind::kLine:
            return std::make_unique<GmLine>(AnyLine(dice));
        case Kind::kBeam:
            if (dice.Once(3)) return std::make_unique<GmBeam>(dice.AnyPoint(), dice.Direction());
            return std::make_unique<GmBeam>(dice.AnyPoint(), dice.Point());
        case Kind::kStretch:
            return std::make_unique<GmStretch>(AnyStretch(dice));
        case Kind::kCircle:
            return std::make_unique<GmCircle>(AnyCircle(dice));
        case Kind::kArc:
            return std::make_unique<GmArc>(AnyArc(dice));
        case Kind::kHelix:
            return std::make_unique<GmHelix>(dice.AnyPoint(), dice.AnyPoint(), dice.Point(),
                                             dice.Sense());
        case Kind::kRect:
            return std::make_unique<GmRect>(AnyRect(dice));
        default:
            return std::make_unique<GmContour>(AnyContour(dice));
    }
}

}  // namespace net
