// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <limits>
#include <utility>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"

namespace {

using shapes::Path;

struct OpenContour : GmContour {
    using GmContour::InsertElem;
    using GmContour::operator=;
};

GmStretch Segment(double x1, double y1, double x2, double y2) {
    return GmStretch(GmPoint(x1, y1), GmPoint(x2, y2));
}

GmArc FullCircle() {
    return GmArc(GmPoint(1, 0), GmPoint(1, 0), GmPoint(0, 0), GmBase::eRotCCW);
}

}  // namespace

TEST(ContourBuilding, TheJointMustMeetWithinTheTolerance) {
    for (const bool bValidate : {false, true}) {
        GmContour contour = Path("0 0  10 0");
        EXPECT_FALSE(contour.AddElement(Segment(10.0002, 0, 10, 10), bValidate, 0));
        EXPECT_FALSE(contour.AddElement(nullptr, bValidate, 0));
        EXPECT_FALSE(contour.AddElement(static_cast<GmContElement*>(nullptr), bValidate));
        EXPECT_EQ(contour.ElementCount(), 1);
        EXPECT_TRUE(contour.AddElement(Segment(10.00005, 0, 10, 10), bValidate, 0));
    }
}

TEST(ContourBuilding, OnlyAnAppendedElementClosesTheContour) {
    for (const bool bValidate : {false, true}) {
        GmContour circle;
        EXPECT_TRUE(circle.AddElement(FullCircle(), bValidate, 0));
        EXPECT_FALSE(circle.IsClosed());
        GmContour square = Path("0 0  10 0  10 10  0 10");
        EXPECT_FALSE(square.IsClosed());
        EXPECT_TRUE(square.AddElement(Segment(0, 10, 0, 0), bValidate, 0));
        EXPECT_TRUE(square.IsClosed());
        EXPECT_EQ(square.AddElement(Segment(0, 0, -5, -5), bValidate, 0), !bValidate);
    }
}

TEST(ContourBuilding, ValidationAllowsContactOnlyAtTheJointAndTheClosingEnd) {
    struct {
        char const* chain;
        GmPoint sp, ep;
        bool bAccepted;
    } const rows[] = {
        {"0 0  10 0  10 10", {10, 10}, {20, 20}, true},
        {"0 0  10 0  10 10", {10, 10}, {5, -5}, false},
        {"0 0  10 0  10 10", {10, 10}, {5, 0}, false},
        {"0 0  10 0  10 10", {10, 10}, {0, 0}, true},
        // Straight on into the first element: the collinear joint gives no point, the end does.
        {"0 0  0 10  10 5  5 5", {5, 5}, {0, 5}, false},
        {"0 0  0 10  10 5  5 5", {5, 5}, {1, 5}, true},
        // The joint itself lies on the first element and is found twice.
        {"0 0  10 0  10 5  5 0", {5, 0}, {5, -5}, false},
        // A closing element crosses the chain.
        {"0 0  4 4  6 -4  8 4  10 0", {10, 0}, {0, 0}, false},
    };
    for (auto const& row : rows) {
        GmContour contour = Path(row.chain);
        const long before = contour.ElementCount();
        const bool bCloses = row.ep == GmPoint(0, 0);
        const GmStretch next(row.sp, row.ep);
        EXPECT_EQ(contour.AddElement(&next, true, 0), row.bAccepted) << row.chain;
        EXPECT_EQ(contour.ElementCount(), before + row.bAccepted) << row.chain;
        EXPECT_EQ(contour.IsClosed(), row.bAccepted && bCloses) << row.chain;
        GmContour unguarded = Path(row.chain);
        EXPECT_TRUE(unguarded.AddElement(&next, false, 0)) << row.chain;
        EXPECT_EQ(unguarded.IsClosed(), bCloses) << row.chain;
    }
}

TEST(ContourBuilding, SimpleContoursPassTheValidation) {
    EXPECT_TRUE(rc::check([](unsigned seed, bool bWithArcs) {
        for (auto const& variant : shapes::Variants(shapes::RandomStar(seed, bWithArcs))) {
            GmContour rebuilt;
            for (int i = 0; i < variant.contour.ElementCount(); ++i) {
                RC_ASSERT(!rebuilt.IsClosed());
                RC_ASSERT(rebuilt.AddElement(variant.contour.GetElement(i), true, 0));
            }
            RC_ASSERT(rebuilt.IsClosed());
            RC_ASSERT(rebuilt == variant.contour);
        }
    }));
}

TEST(ContourBuilding, InsertingMarksTheElementAndReevaluatesTheClosedFlag) {
    OpenContour contour;
    contour = shapes::Square(10);
    const GmStretch lead = Segment(-5, 0, 0, 0);
    EXPECT_TRUE(contour.InsertElem(0, &lead, false, 9));
    EXPECT_FALSE(contour.IsClosed());
    GmContElement const& record = *contour.GetContElement(0);
    EXPECT_TRUE(record.bInserted && record.lId == 9 && record.lIndex == 0);
    const GmStretch back = Segment(0, 0, -5, 0);
    EXPECT_TRUE(contour.InsertElem(5, &back, false, 0));
    EXPECT_TRUE(contour.IsClosed());
    EXPECT_FALSE(contour.InsertElem(6, &lead, true, 0)) << "validation refuses a closed contour";
    for (const int outside : {-1, 7})
        EXPECT_FALSE(contour.InsertElem(outside, &lead, false, 0));
    EXPECT_FALSE(contour.InsertElem(0, nullptr, false, 0));
    EXPECT_EQ(contour.ElementCount(), 6);
}

TEST(ContourBuilding, RemovesInsertedElementsFromTheBackOnly) {
    const std::vector<std::pair<std::vector<bool>, int>> rows = {
        {{}, 0}, {{true, true}, 1}, {{false, true, false, true, true}, 3}, {{true, false}, 2}};
    for (auto const& row : rows) {
        GmContour contour;
        for (size_t i = 0; i < row.first.size(); ++i) {
            contour.AddElement(Segment(double(i), 0, double(i) + 1, 0), false, 0);
            contour.GetContElement(int(i))->bInserted = row.first[i];
        }
        contour.RemoveInsertedElementsAtBack();
        for (const int outside : {row.second, -1})
            contour.RemoveElement(outside);
        EXPECT_EQ(contour.ElementCount(), row.second);
    }
}

TEST(ContourBuilding, InvertingReversesCurvesAndRecordsAndTwiceRestores) {
    GmContour contour = Path("0 0  10 0  10 10  0 10");
    contour.Invert();
    EXPECT_EQ(contour, Path("0 10  10 10  10 0  0 0"));
    EXPECT_EQ(contour.GetContElement(0)->lIndex, 2);
    EXPECT_TRUE(rc::check([](unsigned seed) {
        GmContour star = shapes::RandomStar(seed, true);
        RC_ASSERT(star.Inverted() != star);
        RC_ASSERT(star.Inverted().Inverted() == star);
        RC_ASSERT(star.Inverted().IsClosed());
    }));
}

TEST(ContourBuilding, CloseJoinsTheEndsUnlessTheyMeet) {
    GmContour contour = Path("0 0  10 0  10 10");
    for (int i = 0; i < 2; ++i) {
        contour.Close(false);
        EXPECT_TRUE(contour.IsClosed());
        EXPECT_EQ(contour, Path("0 0  10 0  10 10  0 0"));
        EXPECT_EQ(shapes::Identifiers(contour), (std::vector<long>{1, 2, 0}));
    }
    GmContour empty;
    empty.Close(true);
    EXPECT_EQ(empty.ElementCount(), 0);
}

TEST(ContourBuilding, SurvivesCurvesWithoutGeometry) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double inf = std::numeric_limits<double>::infinity();
    for (const double bad : {nan, inf, -inf, 1e308}) {
        GmContour contour;
        contour.AddElement(Segment(bad, 0, 1, bad), true, 0);
        contour.AddElement(GmArc(GmPoint(1, bad), GmPoint(bad, 2), GmPoint(0, 0), GmBase::eRotCW),
                           true, 0);
        contour.AddElement(GmStretch(), true, 0);
        contour.Close(true);
        contour.Invert();
        contour.In(GmPoint(0, bad));
        contour.Dir(GmPoint(bad, 0));
        contour.FarPoint(GmPoint(bad, 0));
        EXPECT_GE(contour.ElementCount(), 1);
    }
}
