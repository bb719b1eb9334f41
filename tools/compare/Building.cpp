// SPDX-License-Identifier: MIT
#include "Families.h"
#include "Shapes.h"

namespace net {

namespace {

/// A curve that goes on from the contour's end, in most cases.
std::unique_ptr<GmCurve> Next(Dice& dice, GmContour const& contour) {
    const int last = static_cast<int>(contour.ElementCount()) - 1;
    const GmPoint sp = last < 0 || dice.Once(8) ? dice.Point() : contour.GetElement(last)->EP();
    const GmPoint ep = last > 0 && dice.Once(6) ? contour.GetElement(0)->SP() : dice.Point();
    if (dice.Once(40)) return AnyCurve(dice, static_cast<Kind>(dice.Below(kKinds)));
    if (dice.Once(3)) return std::make_unique<GmArc>(sp, dice.Point(), ep);
    return std::make_unique<GmStretch>(sp, ep);
}

/// Hands a record over to the contour; the caller keeps it where that refuses it or throws.
bool AddRecord(GmContour& contour, GmCurve const& curve, bool bValidate, long id) {
    std::unique_ptr<GmCurve> copy(curve.Clone());
    auto record = std::make_unique<GmContElement>();
    record->pCurve = copy.get();
    record->lId = id;
    record->lIndex = -id;
    record->bInserted = id % 2 != 0;
    if (!contour.AddElement(record.get(), bValidate)) return false;
    static_cast<void>(copy.release());
    static_cast<void>(record.release());
    return true;
}

void AskAdded(Dice& dice, Answer& answer, GmContour& contour, GmCurve const* next) {
    const bool bValidate = !dice.Once(4);
    const long id = dice.Below(100);
    const double value = dice.In(0.01, 2.0);
    const int way = dice.Below(6);
    answer.Add("next", *next);
    answer.Ask("added", [&] {
        if (way == 0) {
            answer.Add("record taken", AddRecord(contour, *next, bValidate, id));
        } else if (way == 1) {
            const auto type = static_cast<GmContour::eTransType>(1 + dice.Below(3));
            answer.Add("with transition",
                       contour.AddElementAndTrans(next, bValidate, id, type, value, id > 50));
        } else {
            answer.Add("taken", contour.AddElement(*next, bValidate, id));
        }
        answer.AddSolutions(contour);
    });
}

}  // namespace

void AskBuilding(Dice& dice, Answer& answer) {
    constexpr int kMost = 10;
    const GmContour source = dice.Once(2) ? AnyContour(dice) : GmContour();
    GmContour contour;
    for (int i = 0; i < source.ElementCount(); ++i)
        AskAdded(dice, answer, contour, source.GetElement(i));
    for (int i = 2 + dice.Below(kMost); i > 0; --i)
        AskAdded(dice, answer, contour, Next(dice, contour).get());
    const bool bValidate = dice.Once(2);
    answer.Ask("built", [&] { answer.Add("contour", static_cast<GmCurve const&>(contour)); });
    answer.Ask("closed", [&] {
        contour.Close(bValidate);
        answer.Add("contour", static_cast<GmCurve const&>(contour));
    });
    answer.Ask("inserted", [&] {
        DerivedContour derived(contour);
        const std::unique_ptr<GmCurve> next = Next(dice, contour);
        answer.Add("done", derived.InsertElem(dice.Below(4), next.get(), bValidate, 7));
        answer.Add("added", derived.AddRealElem(next.get(), 8));
        answer.Add("contour", static_cast<GmCurve const&>(derived));
    });
    answer.Ask("removed", [&] {
        contour.RemoveInsertedElementsAtBack();
        answer.Add("at the back", contour.ElementCount());
        contour.RemoveElement(dice.Below(4));
        answer.Add("chain", DerivedContour(contour).CheckContour());
        const GmContour copy(contour);
        answer.Add("copy", static_cast<GmCurve const&>(copy));
    });
}

}  // namespace net
