// SPDX-License-Identifier: MIT
#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

void AskPlace(Dice& dice, Answer& answer, GmCurve& curve) {
    const GmPoint p = dice.AnyPoint();
    const double eps = dice.Once(2) ? 0.01 : dice.SoundLength();
    const bool bPreferSP = dice.Once(2);
    answer.Add("p", p);
    answer.Ask("place of a point", [&] {
        answer.Add("element", curve.Element(p));
        answer.Add("element within", curve.Element(p, eps));
        answer.Add("distance", curve.Dist(p));
        answer.Add("distance from the start", curve.DistSP(p));
        double d = 0.0;
        answer.Add("nearest", curve.MinDist(d, p, bPreferSP));
        answer.Add("its distance", d);
        answer.Add("nearest by itself", curve.MinDist(p, bPreferSP));
        answer.Add("in", curve.In(p));
        answer.Add("out", curve.Out(p));
        const GmPoint np = curve.NP(p);
        answer.Add("foot", np);
        answer.Add("tangent", static_cast<GmCurve const&>(curve.Tangent(np)));
        answer.Add("foot is element", curve.Element(np));
        answer.Add("found by the filter", point_is_element(&curve)(np));
        answer.Add("before", less_than_curve(&curve)(np, p));
    });
}

void AskItself(Answer& answer, GmCurve const& curve) {
    answer.Ask("curve itself", [&] {
        answer.Add("box", static_cast<GmCurve const&>(curve.BoundingRect()));
        answer.Add("start", curve.SP());
        answer.Add("end", curve.EP());
        answer.Add("tangent at start", curve.TangSP());
        answer.Add("tangent at end", curve.TangEP());
        answer.Add("length", curve.Length());
        answer.Add("trace", curve.GetTraceString());
        answer.Add("no solution", curve.GetSolution(100));
    });
}

void AskMoved(Dice& dice, Answer& answer, GmCurve const& curve) {
    const double d = dice.Length() * 0.3;
    const GmVec v = dice.Vector();
    const double scale = dice.SoundLength();
    GmMatrix m = GmMatrix::matrixRotate(GmVec(0, 0, -1), dice.Degrees());
    if (dice.Once(3)) m.Scale(GmVec(-scale, scale, 1));
    const GmPoint p = dice.AnyPoint();
    answer.Ask("curve moved", [&] {
        answer.AddOwned("parallel", curve.GetParallel(d));
        const std::unique_ptr<GmCurve> moved(curve.Clone());
        moved->Translation(v);
        answer.Add("moved", *moved);
        moved->Transform(m);
        answer.Add("transformed", *moved);
        moved->Invert();
        answer.Add("inverted", *moved);
        moved->SetSP(p);
        answer.Add("other start", *moved);
        moved->SetEP(GmPoint(p + v));
        answer.Add("other end", *moved);
    });
}

}  // namespace

void AskCurve(Dice& dice, Answer& answer, GmCurve& curve) {
    answer.Add("curve", curve);
    AskItself(answer, curve);
    AskPlace(dice, answer, curve);
    AskMoved(dice, answer, curve);
}

}  // namespace net
