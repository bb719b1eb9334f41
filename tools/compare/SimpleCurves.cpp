// SPDX-License-Identifier: MIT
#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

void AskLine(Dice& dice, Answer& answer, GmLine const& line) {
    const GmLine other = dice.Once(4) ? GmLine(line, dice.Length()) : AnyLine(dice);
    const GmPoint p = dice.Once(3) ? line.SP() : dice.AnyPoint();
    answer.Ask("straight curves", [&] {
        answer.Add("slope", line.k());
        answer.Add("intercept", line.d());
        answer.Add("normal", line.Normal());
        answer.Add("gap", line.Dist(other));
        answer.Add("side", line.PointPos(p));
        answer.Add("crossings", line.IntersectionWithLine(other));
        answer.AddSolutions(line);
        answer.Add("inverted", static_cast<GmCurve const&>(line.Inverted()));
        answer.Add("equal", line == other);
    });
}

void AskStretch(Answer& answer, GmStretch const& stretch, GmStretch const& other, double d) {
    answer.Ask("segments", [&] {
        answer.Add("parallel", static_cast<GmCurve const&>(GmStretch(stretch, d)));
        answer.Add("middle", stretch.HP());
        answer.Add("tangent there", stretch.TangHP());
        answer.Add("inverted", static_cast<GmCurve const&>(stretch.Inverted()));
        answer.Add("equal", stretch == other);
    });
}

void AskArc(Dice& dice, Answer& answer, GmArc const& arc, GmArc const& other) {
    const int n = 1 + dice.Below(5);
    const int i = dice.Below(n + 1);
    answer.Ask("arcs", [&] {
        answer.Add("box", static_cast<GmCurve const&>(arc.BoundingRect(true)));
        answer.Add("start in degrees", arc.SAngDeg());
        answer.Add("end in degrees", arc.EAngDeg());
        answer.Add("sweep", arc.Ang());
        answer.Add("sweep of a circle", arc.Ang2Pi());
        answer.Add("full", arc.IsFullCircle());
        answer.Add("section", arc.SectionPoint(i, n));
        answer.Add("middle", arc.HP());
        answer.Add("tangent there", arc.TangHP());
        answer.Add("inverted", static_cast<GmCurve const&>(arc.Inverted()));
        answer.Add("equal", arc == other);
    });
}

/// Lines that touch circles, and others: the first kinds come out of the circles' own tangents.
GmLine LineAt(Dice& dice, GmCircle const& circle) {
    if (dice.Once(2)) return AnyLine(dice);
    return circle.Tangent(circle.MinDist(dice.Point(), false));
}

void AskCircle(Dice& dice, Answer& answer, GmCircle& circle) {
    const GmCircle other = AnyCircle(dice);
    const GmLine line = LineAt(dice, circle);
    const GmPoint p = circle.MinDist(dice.Point(), false);
    answer.Add("line", static_cast<GmCurve const&>(line));
    answer.Ask("circles", [&] {
        answer.Add("radius", circle.R());
        answer.Add("touching a line", circle.GetTangPoint(line));
        answer.Add("facing a line", circle.NP(&line));
        answer.Add("tangent", circle.TangDir(p));
        answer.Add("gap to a line", circle.Dist(line));
        answer.Add("gap to a circle", circle.Dist(other));
        answer.Add("crossings with a line", circle.IntersectionWithLine(line));
        answer.AddSolutions(circle);
        answer.Add("crossings with a circle", circle.IntersectionWithCircle(other));
        answer.AddSolutions(circle);
        answer.Add("facing a circle", circle.NP(&other));
        answer.Add("equal", circle == other);
    });
    answer.Ask("touching circles", [&] {
        const GmPoint m(other.M() + GmVec(dice.Direction()) * (other.R() + circle.R()));
        GmCircle touching(m, circle.R(), false);
        answer.Add("point", touching.GetTangPoint(other));
        answer.Add("gap", touching.Dist(other));
        answer.Add("crossings", touching.IntersectionWithCircle(other));
        answer.AddSolutions(touching);
    });
}

void AskHelix(Dice& dice, Answer& answer, GmHelix const& helix) {
    const GmHelix parallel(helix, dice.Length() * 0.3);
    answer.Ask("helices", [&] {
        answer.Add("centre", helix.M());
        answer.Add("radius", helix.R());
        answer.Add("sense", static_cast<int>(helix.Dir()));
        answer.Add("parallel", static_cast<GmCurve const&>(parallel));
        answer.Add("end on it", helix.Element(helix.EP()));
    });
}

}  // namespace

void AskLines(Dice& dice, Answer& answer) {
    const Kind kinds[] = {Kind::kLine, Kind::kBeam, Kind::kStretch};
    const std::unique_ptr<GmCurve> curve = AnyCurve(dice, kinds[dice.Below(3)]);
    AskCurve(dice, answer, *curve);
    AskLine(dice, answer, static_cast<GmLine&>(*curve));
    if (curve->IsStretch()) {
        const GmStretch other = AnyStretch(dice);
        AskStretch(answer, static_cast<GmStretch&>(*curve), other, dice.Length());
    }
}

void AskCircles(Dice& dice, Answer& answer) {
    const Kind kinds[] = {Kind::kArc, Kind::kCircle, Kind::kArc, Kind::kHelix};
    const std::unique_ptr<GmCurve> curve = AnyCurve(dice, kinds[dice.Below(4)]);
    AskCurve(dice, answer, *curve);
    if (curve->IsHelix()) {
        AskHelix(dice, answer, static_cast<GmHelix&>(*curve));
        return;
    }
    AskCircle(dice, answer, static_cast<GmCircle&>(*curve));
    if (curve->IsArc()) AskArc(dice, answer, static_cast<GmArc&>(*curve), AnyArc(dice));
}

}  // namespace net
