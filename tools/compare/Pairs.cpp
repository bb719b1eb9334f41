// SPDX-License-Identifier: MIT
#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

/// The kinds one after another, so that every pair of them is asked.
char const* const kNames[kKinds] = {"line", "beam",  "segment",   "circle",
                                    "arc",  "helix", "rectangle", "contour"};

void AskCrossings(Answer& answer, GmCurve const& a, GmCurve const& b) {
    answer.Ask("intersection", [&] {
        const int count = a.Intersection(&b);
        answer.Add("count", count);
        answer.AddSolutions(a);
        answer.Add("first", a.GetSolution(0));
        answer.Answered(count > 0);
    });
    answer.Ask("intersection of objects", [&] {
        std::vector<GmPoint> points;
        Intersection(b, a, points);
        answer.AddPoints("point", points);
    });
}

void AskNearest(Answer& answer, GmCurve const& a, GmCurve const& b, bool bPreferSP) {
    answer.Ask("nearest of two curves", [&] {
        double d = 1.0;
        answer.Add("point", a.MinDist(d, &b, bPreferSP));
        answer.Add("distance", d);
    });
    answer.Ask("equal", [&] {
        answer.Add("by solutions", a == b);
        answer.Add("with itself", a == a);
        answer.Add("by type", static_cast<GmBase const&>(a) == static_cast<GmBase const&>(b));
    });
}

void AddBoth(Answer& answer, bool bDone, GmCurve const& first, GmCurve const& next) {
    answer.Add("done", bDone);
    answer.Add("first", first);
    answer.Add("next", next);
    answer.Answered(bDone);
}

void AskJoined(Answer& answer, GmCurve const& a, GmCurve const& b) {
    answer.Ask("trimmed", [&] {
        const std::unique_ptr<GmCurve> first(a.Clone());
        const std::unique_ptr<GmCurve> next(b.Clone());
        AddBoth(answer, first->Trim(next.get()), *first, *next);
    });
    answer.Ask("extended", [&] {
        const std::unique_ptr<GmCurve> first(a.Clone());
        const std::unique_ptr<GmCurve> next(b.Clone());
        AddBoth(answer, first->Concat(*next), *first, *next);
    });
    answer.Ask("connected", [&] {
        const std::unique_ptr<GmCurve> first(a.Clone());
        for (int mode = 0; mode < 3; ++mode)
            answer.AddOwned("connection", first->Concat(b, mode));
    });
}

}  // namespace

void AskPairs(Dice& dice, Answer& answer) {
    const int first = dice.Below(kKinds);
    const int second = dice.Below(kKinds);
    const std::unique_ptr<GmCurve> a = AnyCurve(dice, static_cast<Kind>(first));
    const std::unique_ptr<GmCurve> b = AnyCurve(dice, static_cast<Kind>(second));
    for (GmCurve* curve : {a.get(), b.get()}) {
        if (!curve->IsContour()) continue;
        GmContour const& contour = static_cast<GmContour const&>(*curve);
        if (GmCurve const* element = contour.GetElement(0))
            curve->Translation(-GmVec(element->SP()));
    }
    if (dice.Once(4) && b->SP().CreationOK()) a->SetEP(b->SP());  // they meet
    answer.Add(kNames[first], *a);
    answer.Add(kNames[second], *b);
    AskCrossings(answer, *a, *b);
    AskNearest(answer, *a, *b, dice.Once(2));
    AskJoined(answer, *a, *b);
}

}  // namespace net
