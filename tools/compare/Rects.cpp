// SPDX-License-Identifier: MIT
#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

void AskMeasures(Answer& answer, GmRect const& rect) {
    answer.Ask("rectangle", [&] {
        answer.Add("left", rect.Left());
        answer.Add("right", rect.Right());
        answer.Add("top", rect.Top());
        answer.Add("bottom", rect.Bottom());
        answer.Add("width", rect.Width());
        answer.Add("height", rect.Height());
        answer.Add("smaller", rect.MinDim());
        answer.Add("larger", rect.MaxDim());
        answer.Add("diagonal", rect.Diagonal());
        answer.Add("centre", rect.Center());
        answer.Add("least", rect.PMin());
        answer.Add("largest", rect.PMax());
    });
}

void AskSets(Answer& answer, GmRect const& rect, GmRect const& other, GmPoint const& p) {
    answer.Ask("rectangles together", [&] {
        answer.Add("common", static_cast<GmCurve const&>(rect.And(other)));
        answer.Add("around both", static_cast<GmCurve const&>(rect.Or(other)));
        answer.Add("equal", rect == other);
        answer.Add("smaller", rect < other);
        GmRect around = rect;
        around.Include(p);
        answer.Add("around a point", static_cast<GmCurve const&>(around));
    });
}

void AskStretched(Dice& dice, Answer& answer, GmRect rect) {
    const eGmRefPoint ref = static_cast<eGmRefPoint>(dice.Below(10));
    const double f = dice.Length();
    answer.Ask("rectangle stretched", [&] {
        rect.Stretch(dice.AnyPoint(), f);
        answer.Add("about a point", static_cast<GmCurve const&>(rect));
        rect.Shrink(dice.AnyPoint(), f);
        rect.Stretch(ref, 1.5);
        answer.Add("about a reference point", static_cast<GmCurve const&>(rect));
        rect.Shrink(ref, dice.SoundLength());
        rect.StretchX(ref, f);
        rect.StretchY(ref, dice.SoundLength());
        answer.Add("in x and y", static_cast<GmCurve const&>(rect));
        rect.Move(dice.Vector());
        rect.Left(dice.Length());
        rect.Top(f);
        rect.Right(dice.Length());
        rect.Bottom(dice.Length());
        answer.Add("with other edges", static_cast<GmCurve const&>(rect));
    });
}

}  // namespace

void AskRects(Dice& dice, Answer& answer) {
    GmRect rect = AnyRect(dice);
    AskCurve(dice, answer, rect);
    AskMeasures(answer, rect);
    AskSets(answer, rect, AnyRect(dice), dice.AnyPoint());
    AskStretched(dice, answer, rect);
}

}  // namespace net
