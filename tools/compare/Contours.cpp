// SPDX-License-Identifier: MIT
#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

void AskPlaces(Dice& dice, Answer& answer, GmContour& contour) {
    const GmPoint p = PointNear(dice, contour);
    const GmPoint q = PointNear(dice, contour);
    answer.Add("p", p);
    answer.Add("q", q);
    answer.Ask("in and out", [&] {
        answer.Add("in", contour.In(p));
        answer.AddSolutions(contour);
        answer.Add("out", contour.Out(p));
        answer.Add("element", contour.Element(p));
        answer.Add("element within", contour.Element(p, 0.02));
        answer.Add("last element", contour.LastPointElem(p));
        answer.Add("tangent", static_cast<GmCurve const&>(contour.Tangent(p)));
    });
    answer.Ask("near a contour", [&] {
        answer.Add("distance", contour.Dist(p));
        double d = 0.0;
        answer.Add("nearest", contour.MinDist(d, p, dice.Once(2)));
        answer.Add("its distance", d);
        answer.Add("nearest of two", contour.MinDist(d, p, q, false));
        answer.Add("its distance", d);
        answer.Add("near start", contour.NearPoint(p));
        answer.Add("its element", contour.NearPointElem(p));
        answer.Add("element by q", contour.NearPointElem(p, q));
        answer.Add("far end", contour.FarPoint(p));
    });
}

void AskSelf(Dice& dice, Answer& answer, GmContour& contour) {
    answer.Ask("contour itself", [&] {
        answer.Add("box", static_cast<GmCurve const&>(contour.BoundingRect()));
        answer.Add("sense", static_cast<int>(contour.Dir(dice.AnyPoint())));
        answer.Add("chain", DerivedContour(contour).CheckContour());
        answer.Add("convex", contour.Convex());
        answer.Add("concave", contour.Concave());
        answer.Add("last insert point", contour.GetLastInsertPoint());
        DerivedContour derived(contour);
        for (int i = -1; i <= contour.ElementCount(); ++i) {
            answer.Add("middle", derived.GetHP(i));
            if (GmCurve const* element = contour.GetElement(i))
                answer.Add("length", element->Length());
        }
        answer.Add("outside", static_cast<GmCurve const*>(contour.GetElement(-1)));
        answer.AddOwned("new element", contour.GetNewElement(dice.Below(4)));
    });
    answer.Ask("contour changed", [&] {
        GmContour copy(contour.Inverted());
        answer.Add("inverted", static_cast<GmCurve const&>(copy));
        copy.Translation(dice.Vector());
        copy.Transform(GmMatrix::matrixRotate(GmVec(0, 0, -1), dice.Degrees()));
        answer.Add("transformed", static_cast<GmCurve const&>(copy));
        answer.Add("equal", copy == contour);
        contour.Invert();
        answer.Add("records inverted", static_cast<GmCurve const&>(contour));
        copy = contour;
        answer.Add("assigned", copy == contour);
    });
}

void AskCrossed(Dice& dice, Answer& answer, GmContour const& contour) {
    const std::unique_ptr<GmCurve> curve = AnyCurve(dice, static_cast<Kind>(dice.Below(kKinds)));
    const GmContour other = AnyContour(dice);
    if (contour.ElementCount() > 0) curve->Translation(GmVec(contour.GetElement(0)->SP()));
    answer.Add("curve", *curve);
    answer.Add("other", static_cast<GmCurve const&>(other));
    answer.Ask("contour crossed by a curve", [&] {
        contour.IntersectionWithCurve(curve.get());
        answer.AddSolutions(contour);
    });
    for (const bool bAtEnds : {false, true}) {
        answer.Ask("contours crossing", [&] {
            answer.Add("count", contour.Intersection(&other, bAtEnds));
            answer.AddSolutions(contour);
            answer.Add("with itself", contour.Intersection(&contour, bAtEnds));
            answer.AddSolutions(contour);
        });
    }
    answer.Ask("nearest of two contours", [&] {
        double d = 0.0;
        answer.Add("point", contour.MinDist(d, &other, true));
        answer.Add("distance", d);
        answer.Add("point to a curve", contour.MinDist(d, curve.get(), false));
        answer.Add("distance to a curve", d);
    });
}

}  // namespace

void AskContours(Dice& dice, Answer& answer) {
    GmContour contour = AnyContour(dice);
    answer.Add("contour", static_cast<GmCurve const&>(contour));
    AskPlaces(dice, answer, contour);
    AskCrossed(dice, answer, contour);
    AskSelf(dice, answer, contour);
}

}  // namespace net
