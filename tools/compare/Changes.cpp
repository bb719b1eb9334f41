// SPDX-License-Identifier: MIT
#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

GmCurve const& AsCurve(GmCurve const& curve) {
    return curve;
}

/// A contour that was changed, or was to be changed.
void AddChanged(Answer& answer, GmContour const& contour, bool bDone) {
    answer.Add("done", bDone);
    answer.Add("contour", AsCurve(contour));
    answer.Answered(bDone);
}

/// A contour beside or across another one.
GmContour Neighbour(Dice& dice, GmContour const& contour) {
    GmContour other = AnyContour(dice);
    if (contour.ElementCount() == 0 || other.ElementCount() == 0) return other;
    other.Translation(GmVec(other.GetElement(0)->SP(), contour.GetElement(0)->SP()));
    other.Translation(GmVec(dice.In(-8.0, 8.0), dice.In(-8.0, 8.0), 0));
    return other;
}

void AskSplitAtPoints(Dice& dice, Answer& answer, GmContour const& source) {
    const GmPoint p = PointNear(dice, source);
    const GmPoint q = PointNear(dice, source);
    answer.Add("p", p);
    answer.Add("q", q);
    answer.Ask("split at a point", [&] {
        GmContour contour(source);
        const bool bDone = contour.SplitAt(p);
        answer.Add("insert point", contour.GetLastInsertPoint());
        AddChanged(answer, contour, bDone);
    });
    answer.Ask("split at the nearest point", [&] {
        GmContour contour(source);
        answer.Add("done", contour.SplitAtMinDist(p));
        answer.Add("insert point", contour.GetLastInsertPoint());
        answer.Add("done by q", contour.SplitAtMinDist(p, q));
        answer.Add("contour", AsCurve(contour));
    });
}

void AskSplitByCurves(Dice& dice, Answer& answer, GmContour const& source) {
    const GmContour other = Neighbour(dice, source);
    const std::unique_ptr<GmCurve> curve = AnyCurve(dice, static_cast<Kind>(dice.Below(kKinds)));
    if (source.ElementCount() > 0) curve->Translation(GmVec(source.GetElement(0)->SP()));
    answer.Add("other", AsCurve(other));
    answer.Add("curve", AsCurve(*curve));
    answer.Ask("split by a curve", [&] {
        GmContour contour(source);
        const bool bDone = contour.SplitAt(curve.get());
        AddChanged(answer, contour, bDone);
    });
    answer.Ask("split near a contour", [&] {
        GmContour contour(source);
        GmContour second(other);
        answer.Add("done", contour.SplitAtMinDist(&second));
        answer.Add("contour", AsCurve(contour));
        answer.Add("both done", contour.SplitBothAtMinDist(&second));
        answer.Add("contour of both", AsCurve(contour));
        answer.Add("second", AsCurve(second));
    });
}

}  // namespace

void AskSplitting(Dice& dice, Answer& answer) {
    const GmContour source = AnyContour(dice);
    answer.Add("source", AsCurve(source));
    AskSplitAtPoints(dice, answer, source);
    AskSplitByCurves(dice, answer, source);
    const GmDir direction = dice.Direction();
    answer.Ask("arcs split", [&] {
        DerivedContour contour(source);
        answer.Add("done", contour.SplitArcs(direction, dice.Once(2)));
        answer.Add("contour", AsCurve(contour));
        answer.Add("quadrants done", contour.SplitArcsQuadrant());
        AddChanged(answer, contour, contour.ElementCount() > source.ElementCount());
    });
}

void AskCorners(Dice& dice, Answer& answer) {
    const GmContour source = AnyContour(dice);
    const double value = dice.Once(20) ? dice.Length() : dice.In(0.001, 2.5);
    const int count = static_cast<int>(source.ElementCount());
    answer.Add("source", AsCurve(source));
    answer.Add("value", value);
    answer.Ask("rounded", [&] {
        GmContour contour(source);
        contour.RoundCorners(value, dice.Below(3) - 1);
        AddChanged(answer, contour, contour.ElementCount() > source.ElementCount());
    });
    const int index = dice.Below(count + 2) - 1;
    for (int type = GmContour::eTransRadius; type <= GmContour::eTransChamferLength; ++type) {
        answer.Ask("transition", [&] {
            GmContour contour(source);
            const bool bDone = contour.AddTrans(static_cast<GmContour::eTransType>(type), index,
                                                value, dice.Once(2));
            AddChanged(answer, contour, bDone);
        });
    }
    answer.Ask("arc between elements", [&] {
        DerivedContour contour(source);
        GmCurve* first = contour.GetElement(index);
        GmCurve* next = contour.GetElement(index + 1);
        const std::unique_ptr<GmCurve> arc(contour.GetArc(first, next, value, dice.Sense()));
        answer.Add("arc", static_cast<GmCurve const*>(arc.get()));
        answer.Add("first", static_cast<GmCurve const*>(first));
        answer.Add("next", static_cast<GmCurve const*>(next));
        answer.Answered(arc && arc->CreationOK());
    });
}

void AskLeads(Dice& dice, Answer& answer) {
    constexpr int kTypes = 6;
    const std::unique_ptr<GmCurve> curve =
        AnyCurve(dice, dice.Once(12) ? static_cast<Kind>(dice.Below(kKinds))
                                     : (dice.Once(2) ? Kind::kArc : Kind::kStretch));
    GmApprDepData data;
    data.Point = dice.Once(20) ? curve->SP() : dice.AnyPoint();
    data.pCurve = curve.get();
    data.nEnd = dice.Below(2);
    data.dLength = dice.Length() * 0.3;
    data.dRadius = dice.Length() * 0.3;
    data.dAngle = dice.Degrees();
    data.dAutoRadius = dice.Length() * 0.3;
    data.nSide = dice.Below(3) - 1;
    answer.Add("curve", AsCurve(*curve));
    answer.Add("point", data.Point);
    answer.Add("end", data.nEnd);
    answer.Add("length", data.dLength);
    answer.Add("radius", data.dRadius);
    answer.Add("angle", data.dAngle);
    answer.Add("automatic radius", data.dAutoRadius);
    answer.Add("side", data.nSide);
    char const* const names[kTypes] = {"straight lead",  "perpendicular lead", "tangential lead",
                                       "lead in an arc", "tangent and arc",    "automatic lead"};
    for (data.nType = 0; data.nType < kTypes; ++data.nType)
        answer.Ask(names[data.nType], [&] { answer.Add("lead", AsCurve(GmContour(data))); });
}

}  // namespace net
