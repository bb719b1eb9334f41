// SPDX-License-Identifier: MIT
#include <cmath>

#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

GmCurve const& AsCurve(GmCurve const& curve) {
    return curve;
}

void AskLinesMade(Dice& dice, Answer& answer, GmLine const& a, GmLine const& b, GmPoint const& p) {
    const GmPoint q = dice.Once(10) ? p : dice.AnyPoint();
    answer.Ask("lines from lines and points", [&] {
        for (int type = ePLParallel; type <= ePLCopy; ++type)
            answer.Add("by a line",
                       AsCurve(GmLine(a, p, static_cast<eLineCustructionTypePL>(type))));
        for (int type = ePPMidNormal; type <= ePPThrough; ++type)
            answer.Add("by points",
                       AsCurve(GmLine(p, q, static_cast<eLineCustructionTypePP>(type))));
        answer.Add("parallel", AsCurve(GmLine(a, q.X())));
        answer.Add("bisector", AsCurve(GmLine(a, b)));
        answer.Add("beam", AsCurve(GmBeam(GmBeam(p, q), q.Y())));
        answer.Add("beam inverted", AsCurve(GmBeam(p, q).Inverted()));
    });
}

void AskTangentLines(Answer& answer, GmPoint const& p, GmCircle const& c1, GmCircle const& c2) {
    answer.Ask("tangents of a circle", [&] {
        answer.Add("right", AsCurve(GmLine(p, c1, true)));
        answer.Add("left", AsCurve(GmLine(p, c1, false)));
    });
    answer.Ask("common tangents", [&] {
        for (int sides = 0; sides < 4; ++sides)
            answer.Add("tangent", AsCurve(GmLine(c1, (sides & 1) != 0, c2, (sides & 2) != 0)));
    });
}

void AskCirclesInLines(Dice& dice, Answer& answer, GmLine const& a, GmLine const& b, double r) {
    const GmLine c = AnyLine(dice);
    answer.Ask("circle of three lines", [&] {
        answer.Add("circle", AsCurve(GmCircle(a, b, c)));
        answer.Add("another", AsCurve(GmCircle(a.Inverted(), b, c)));
    });
    answer.Ask("circle of two lines", [&] { answer.Add("circle", AsCurve(GmCircle(a, b, r))); });
}

void AskTouchingCircles(Answer& answer, GmCircle const& c1, GmCircle const& c2, GmLine const& line,
                        double r) {
    const auto chosen = [](int choice, int bit) { return (choice >> bit) % 2 != 0; };
    answer.Ask("circle of a circle and a line", [&] {
        for (int k = 0; k < 8; ++k)
            answer.Add("circle",
                       AsCurve(GmCircle(c1, line, r, chosen(k, 0), chosen(k, 1), chosen(k, 2))));
    });
    answer.Ask("circle of two circles", [&] {
        for (int k = 0; k < 16; ++k)
            answer.Add("circle", AsCurve(GmCircle(c1, c2, r, chosen(k, 0), chosen(k, 1),
                                                  chosen(k, 2), chosen(k, 3))));
        answer.Add("enlarged", AsCurve(GmCircle(c1, r)));
    });
}

/// Fillets between elements that meet, as in a contour, in most cases.
void AskFillets(Dice& dice, Answer& answer, double r) {
    const GmPoint joint = dice.Point();
    const bool bMeet = !dice.Once(5);
    const GmArc a1(dice.Point(), dice.Point(), bMeet ? joint : dice.Point());
    const GmArc a2(joint, dice.Point(), dice.Point());
    const GmStretch out(joint, dice.Point());
    const GmStretch in(dice.Point(), joint);
    answer.Add("first arc", AsCurve(a1));
    answer.Add("second arc", AsCurve(a2));
    answer.Ask("fillet of two arcs", [&] {
        answer.Add("fillet", AsCurve(GmCircle(a1, a2, r, false)));
        answer.Add("other", AsCurve(GmCircle(a1, a2, r, true)));
    });
    answer.Ask("fillet of an arc and a segment", [&] {
        for (const bool bOther : {false, true}) {
            answer.Add("arc first", AsCurve(GmCircle(a1, out, r, true, bOther)));
            answer.Add("segment first", AsCurve(GmCircle(a2, in, r, false, bOther)));
        }
    });
}

void AskArcsMade(Dice& dice, Answer& answer, GmCircle const& circle, double r) {
    const GmPoint p = circle.MinDist(dice.AnyPoint(), false);
    const GmPoint q = dice.Once(8) ? p : circle.MinDist(dice.AnyPoint(), false);
    const GmPoint far = dice.AnyPoint();
    answer.Ask("arcs made", [&] {
        answer.Add("on a circle", AsCurve(GmArc(circle, p, q, dice.Sense())));
        answer.Add("shorter", AsCurve(GmArc(circle, p, q, true)));
        answer.Add("longer", AsCurve(GmArc(circle, p, q, false)));
        answer.Add("off the circle", AsCurve(GmArc(circle, p, far, GmBase::eRotCW)));
        answer.Add("of a radius", AsCurve(GmArc(p, q, r, dice.Once(2), dice.Sense())));
        answer.Add("about a centre", AsCurve(GmArc(p, far, circle.M(), dice.Sense())));
        answer.Add("parallel", AsCurve(GmArc(GmArc(p, q, far), r)));
        answer.Add("helix", AsCurve(GmHelix(GmArc(p, q, far))));
    });
}

}  // namespace

void AskTangents(Dice& dice, Answer& answer) {
    const GmLine a = AnyLine(dice);
    const GmLine b = AnyLine(dice);
    const GmPoint p = dice.AnyPoint();
    const GmCircle c1 = AnyCircle(dice);
    const GmCircle c2 = AnyCircle(dice);
    const double r = std::fabs(dice.Length()) * 0.4;
    answer.Add("a", AsCurve(a));
    answer.Add("b", AsCurve(b));
    answer.Add("p", p);
    answer.Add("first circle", AsCurve(c1));
    answer.Add("second circle", AsCurve(c2));
    answer.Add("radius", r);
    AskLinesMade(dice, answer, a, b, p);
    AskTangentLines(answer, p, c1, c2);
    AskCirclesInLines(dice, answer, a, b, r);
    AskTouchingCircles(answer, c1, c2, a, r);
    AskFillets(dice, answer, r);
    AskArcsMade(dice, answer, c1, r);
}

}  // namespace net
