// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>
#include <memory>
#include <vector>

#include "gmkernel/GmApprDepData.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"

/// Who deletes what. The sanitizer build turns a leak, a double delete or a read of what is gone
/// into a failure.
namespace {

std::unique_ptr<GmContElement> HeapRecord(GmPoint const& sp, GmPoint const& ep) {
    auto curve = std::make_unique<GmStretch>(sp, ep);
    return std::unique_ptr<GmContElement>(new GmContElement{curve.release(), 7, 3, true});
}

/// What operations have answered, for comparing one round with the next.
using Answers = std::vector<double>;

Answers AnswersOfOneRound(GmContour& contour) {
    GmContour other = shapes::Moved(shapes::Square(7), 5, -3);
    Answers answers;
    const auto take = [&](double answer) {
        answers.push_back(answer);
        for (int i = 0; GmContour* sub = contour.GetSubContour(i); ++i)
            answers.push_back(shapes::ChainLength(*sub));
    };
    take(contour.Offsetting(-0.5, 1000, false));
    take(contour.MeltContours(&other, true));
    take(contour.SplitContours(&other));
    take(contour.SimpleOffsetting(0.5));
    take(contour.VarParallelContours(GmVec(0.5, 0.25, 0)));
    take(contour.ParallelContours(0.75, false, false, false));
    return answers;
}

}  // namespace

TEST(Ownership, OfARecordPassesOnlyWhenItIsTakenUp) {
    GmContour contour = shapes::Path("0 0  10 0");
    std::unique_ptr<GmContElement> record = HeapRecord(GmPoint(11, 0), GmPoint(20, 0));
    const std::unique_ptr<GmCurve> curve(record->pCurve);
    EXPECT_FALSE(contour.AddElement(record.get(), true));
    EXPECT_EQ(record->pCurve->SP(), GmPoint(11, 0)) << "still the caller's";
    std::unique_ptr<GmContElement> fitting = HeapRecord(GmPoint(10, 0), GmPoint(20, 0));
    ASSERT_TRUE(contour.AddElement(fitting.get(), true));
    GmContElement const* const taken = fitting.release();
    EXPECT_EQ(contour.GetContElement(1), taken);
    EXPECT_TRUE(taken->lId == 7 && taken->lIndex == 3 && taken->bInserted);
}

TEST(Ownership, ResultsOutliveTheirSource) {
    auto source = std::make_unique<GmContour>(shapes::Slot());
    source->Offsetting(1, 1000, false);
    const std::unique_ptr<GmContour> copy(source->GetSubContour(0)->Clone());
    const std::unique_ptr<GmCurve> element(source->GetNewElement(1));
    const std::unique_ptr<GmCurve> parallel(source->GetElement(0)->GetParallel(1));
    const std::unique_ptr<GmCurve> bridge(source->GetElement(0)->Concat(*source->GetElement(2), 0));
    GmApprDepData data;
    data.Point = GmPoint(-5, -5);
    data.pCurve = source->GetElement(0);
    const GmContour approach(data);
    source.reset();
    EXPECT_NEAR(shapes::ChainLength(*copy), 16 + 8 * std::acos(-1.0), 1e-9);
    EXPECT_EQ(element->SP(), GmPoint(8, 0));
    EXPECT_EQ(parallel->SP(), GmPoint(0, -1));
    EXPECT_EQ(bridge->EP(), GmPoint(8, 6));
    EXPECT_EQ(approach.GetElement(0)->EP(), GmPoint(0, 0));
}

TEST(Ownership, RepeatedOperationsReplaceTheirResults) {
    GmContour contour = shapes::RoundedRectangle();
    const Answers first = AnswersOfOneRound(contour);
    EXPECT_EQ(AnswersOfOneRound(contour), first);
    for (int round = 0; round < 3; ++round) {
        contour.SplitAt(GmPoint(6, 0));
        contour.RoundCorners(0.5, 0);
        contour.AddTrans(GmContour::eTransChamferDist, round, 0.25, true);
    }
    contour = *contour.GetSubContour(0);
    EXPECT_TRUE(contour.IsClosed());
    EXPECT_EQ(contour.GetSubContour(0), nullptr);
}
