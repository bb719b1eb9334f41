// SPDX-License-Identifier: MIT
#include <cmath>

#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

constexpr int kUnboundedSpan = 1000000;

GmCurve const& AsCurve(GmCurve const& curve) {
    return curve;
}

/// A distance as it is asked for: from a thousandth to a quarter of the size, and rarely none.
double Distance(Dice& dice) {
    switch (dice.Below(6)) {
        case 0:
            return dice.SoundLength();
        case 1:
            return dice.In(-0.01, 0.01);
        default:
            return dice.In(-4.0, 4.0);
    }
}

void AskOffset(Answer& answer, GmContour& contour, double d, int span, bool bKeepOpen) {
    answer.Add("distance", d);
    answer.Add("span", span);
    answer.Ask(d > 0 ? "offset to the right" : "offset to the left", [&] {
        answer.Add("count", contour.Offsetting(d, span, bKeepOpen));
        answer.AddSubContours(contour);
    });
}

void AskStart(Dice& dice, Answer& answer, GmContour& contour, double d) {
    answer.Ask("choice of an offset", [&] {
        int sub = -1;
        int elem = -1;
        answer.Add("found", FindTPCCont(&contour, 1 + dice.Below(4), d, sub, elem));
        answer.Add("sub", sub);
        answer.Add("element", elem);
        answer.Add("largest", static_cast<GmCurve const*>(contour.GetMaxSubContour()));
        answer.Add("nearest",
                   static_cast<GmCurve const*>(contour.GetNearSubContour(dice.AnyPoint())));
    });
}

/// The offset of the first result, as passes beside each other are made.
void AskNextPass(Answer& answer, GmContour const& contour, double d) {
    GmContour const* sub = contour.GetSubContour(0);
    if (!sub) return;
    GmContour next(*sub);
    answer.Ask("offset of an offset", [&] {
        answer.Add("count", next.ParallelContours(d, false, false, false));
        answer.AddSubContours(next);
    });
}

void AskAllOffsets(Dice& dice, Answer& answer, GmContour& contour) {
    answer.Add("contour", AsCurve(contour));
    const double d = Distance(dice);
    AskOffset(answer, contour, d, dice.Once(4) ? 1 + dice.Below(40) : kUnboundedSpan, dice.Once(4));
    AskStart(dice, answer, contour, d);
    AskNextPass(answer, contour, d);
    AskOffset(answer, contour, -d, kUnboundedSpan, false);
    answer.Ask("simple offset", [&] {
        answer.Add("done", contour.SimpleOffsetting(d * 0.3));
        answer.AddSubContours(contour);
    });
}

}  // namespace

void AskOffsets(Dice& dice, Answer& answer) {
    GmContour contour =
        dice.Once(4) ? Chain(dice, Walk(dice, 2 + dice.Below(16)), false) : SoundContour(dice);
    AskAllOffsets(dice, answer, contour);
}

void AskPlates(Dice& dice, Answer& answer) {
    GmContour contour = Chain(dice, Plate(dice), true);
    if (dice.Once(3)) contour.Invert();
    AskAllOffsets(dice, answer, contour);
}

void AskFaulty(Dice& dice, Answer& answer) {
    Corners corners = dice.Once(2) ? Tangle(dice, 2 + dice.Below(14)) : Plate(dice);
    for (int i = dice.Below(3); i > 0; --i)
        Spoil(dice, corners);
    GmContour contour = Chain(dice, corners, !dice.Once(4));
    AskAllOffsets(dice, answer, contour);
}

/// Joints moved off the circles of their arcs, by up to more than the arcs are wide.
void AskTorn(Dice& dice, Answer& answer) {
    GmContour contour = dice.Once(2) ? Chain(dice, Plate(dice), true) : SoundContour(dice);
    for (int i = 1; i < contour.ElementCount(); ++i) {
        if (dice.Once(2)) continue;
        const double far = std::pow(10.0, dice.In(-4.0, 0.5));
        const GmPoint p(contour.GetElement(i)->SP() +
                        GmVec(dice.In(-far, far), dice.In(-far, far), 0));
        contour.GetElement(i - 1)->SetEP(p);
        contour.GetElement(i)->SetSP(p);
    }
    AskAllOffsets(dice, answer, contour);
}

/// Segments to and fro along an axis, on it or beside it by as little as 1e-9, where angles and
/// lines are taken for those of the axis.
void AskAlongAxes(Dice& dice, Answer& answer) {
    const double axis = dice.Below(4) * std::acos(0.0);
    GmContour contour;
    GmPoint at = dice.Once(4) ? dice.AnyPoint() : GmPoint(0, 0);
    for (int i = 3 + dice.Below(6); i > 0; --i) {
        const double beside = dice.Once(2) ? 0.0 : std::pow(10.0, dice.In(-9.0, -4.0));
        const double turn = i > 1 ? beside : 1.0;
        const double back = dice.Once(3) ? std::acos(-1.0) : 0.0;
        const GmAngle angle(axis + back + (dice.Once(2) ? turn : -turn), true);
        const double length = 6.0 * std::pow(10.0, dice.In(-2.0, 0.0));
        const GmPoint to(at + length * GmVec(GmDir(angle)));
        contour.AddElement(GmStretch(at, to), false, i);
        at = to;
    }
    answer.Add("contour", AsCurve(contour));
    const double d = std::pow(10.0, dice.In(-1.5, 1.5));
    AskOffset(answer, contour, d, kUnboundedSpan, true);
    AskOffset(answer, contour, -d, kUnboundedSpan, true);
}

void AskLarge(Dice& dice, Answer& answer) {
    const int count = 100 + dice.Below(400);
    GmContour contour = dice.Once(3) ? Chain(dice, Walk(dice, count / 4), false)
                                     : Chain(dice, Star(dice, count, true), true);
    answer.Add("contour", AsCurve(contour));
    AskOffset(answer, contour, dice.In(-2.0, 2.0), kUnboundedSpan, false);
}

void AskVarParallels(Dice& dice, Answer& answer) {
    GmContour contour = dice.Once(8) ? AnyContour(dice) : SoundContour(dice);
    const GmVec v(dice.In(-3.0, 3.0), dice.Once(3) ? 0.0 : dice.In(-3.0, 3.0), 0);
    answer.Add("contour", AsCurve(contour));
    answer.Add("v", v);
    answer.Ask("variable parallel", [&] {
        answer.Add("count", contour.VarParallelContours(v));
        answer.AddSubContours(contour);
    });
    answer.Ask("variable parallel of equal distances", [&] {
        answer.Add("count", contour.VarParallelContours(GmVec(v.X(), v.X(), 0)));
        answer.AddSubContours(contour);
    });
}

void AskMelts(Dice& dice, Answer& answer) {
    GmContour contour = SoundContour(dice);
    GmContour other = dice.Once(8) ? AnyContour(dice) : SoundContour(dice);
    if (contour.ElementCount() > 0 && other.ElementCount() > 0) {
        other.Translation(GmVec(other.GetElement(0)->SP(), contour.GetElement(0)->SP()));
        other.Translation(GmVec(dice.In(-9.0, 9.0), dice.In(-9.0, 9.0), 0));
    }
    const bool bSameSense = dice.Once(2);
    answer.Add("contour", AsCurve(contour));
    answer.Add("other", AsCurve(other));
    answer.Ask("melted", [&] {
        answer.Add("count", contour.MeltContours(&other, bSameSense));
        answer.AddSubContours(contour);
    });
    answer.Ask("split into loops", [&] {
        answer.Add("count", other.SplitContours(&contour));
        answer.AddSubContours(other);
    });
}

}  // namespace net
