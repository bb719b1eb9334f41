#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <initializer_list>
#include <limits>
#include <memory>
#include <utility>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "support/Contours.h"

namespace {

struct OpenContour : GmContour {
    using GmContour::AddRealElem;
    using GmContour::CheckContour;
    using GmContour::CreateContElement;
    using GmContour::GetHP;
    using GmContour::InsertElem;
    using GmContour::operator=;
};

GmStretch Segment(double x1, double y1, double x2, double y2) {
    return GmStretch(GmPoint(x1, y1), GmPoint(x2, y2));
}

GmArc FullCircle() {
    return GmArc(GmPoint(1, 0), GmPoint(1, 0), GmPoint(0, 0), GmBase::eRotCCW);
}

// (0,0) to (10,0) to (10,10), identifiers 1 and 2.
OpenContour Angle() {
    OpenContour contour;
    contour.AddElement(Segment(0, 0, 10, 0), false, 1);
    contour.AddElement(Segment(10, 0, 10, 10), false, 2);
    return contour;
}

}  // namespace

TEST(ContourBuilding, TheJointMustMeetWithinTheTolerance) {
    for (const bool bValidate : {false, true}) {
        GmContour contour;
        EXPECT_TRUE(contour.AddElement(Segment(0, 0, 10, 0), bValidate, 0));
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
        GmContour square = Angle();
        EXPECT_TRUE(square.AddElement(Segment(10, 10, 0, 10), bValidate, 0));
        EXPECT_FALSE(square.IsClosed());
        EXPECT_TRUE(square.AddElement(Segment(0, 10, 0, 0), bValidate, 0));
        EXPECT_TRUE(square.IsClosed());
        EXPECT_EQ(square.AddElement(Segment(0, 0, -5, -5), bValidate, 0), !bValidate);
        EXPECT_EQ(square.AddElement(Segment(1, 0, -5, -5), false, 0), false);
    }
}

TEST(ContourBuilding, ValidationAllowsContactOnlyAtTheJointAndTheClosingEnd) {
    struct Row {
        const char* what;
        GmPoint end;
        bool bAccepted;
    };
    const Row rows[] = {{"away from the chain", GmPoint(20, 20), true},
                        {"through the first element", GmPoint(5, -5), false},
                        {"up to the first element", GmPoint(5, 0), false},
                        {"to the start of the chain", GmPoint(0, 0), true}};
    for (Row const& row : rows) {
        GmContour contour = Angle();
        const GmStretch next(GmPoint(10, 10), row.end);
        EXPECT_EQ(contour.AddElement(&next, true, 0), row.bAccepted) << row.what;
        EXPECT_EQ(contour.ElementCount(), row.bAccepted ? 3 : 2);
        EXPECT_FALSE(contour.GetPtSol().empty());
        EXPECT_EQ(contour.IsClosed(), row.end == GmPoint(0, 0));
        GmContour unguarded = Angle();
        EXPECT_TRUE(unguarded.AddElement(&next, false, 0)) << row.what;
    }
}

TEST(ContourBuilding, AClosingElementMustNotCrossTheChain) {
    GmContour zigzag = shapes::Polyline(
        {GmPoint(0, 0), GmPoint(4, 4), GmPoint(6, -4), GmPoint(8, 4), GmPoint(10, 0)});
    const GmStretch closing(GmPoint(10, 0), GmPoint(0, 0));
    EXPECT_FALSE(zigzag.AddElement(closing, true, 0));
    EXPECT_FALSE(zigzag.IsClosed());
    EXPECT_TRUE(zigzag.AddElement(closing, false, 0));
    EXPECT_TRUE(zigzag.IsClosed());
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
    EXPECT_FALSE(contour.InsertElem(7, &lead, false, 0));
    EXPECT_FALSE(contour.InsertElem(-1, &lead, false, 0));
    EXPECT_FALSE(contour.InsertElem(0, nullptr, false, 0));
    EXPECT_EQ(contour.ElementCount(), 6);
}

TEST(ContourBuilding, RemovesInsertedElementsFromTheBackOnly) {
    const std::vector<std::pair<std::vector<bool>, long>> rows = {
        {{}, 0}, {{true, true}, 1}, {{false, true, false, true, true}, 3}, {{true, false}, 2}};
    for (auto const& row : rows) {
        GmContour contour;
        for (size_t i = 0; i < row.first.size(); ++i) {
            contour.AddElement(Segment(double(i), 0, double(i) + 1, 0), false, 0);
            contour.GetContElement(int(i))->bInserted = row.first[i];
        }
        contour.RemoveInsertedElementsAtBack();
        EXPECT_EQ(contour.ElementCount(), row.second);
        contour.RemoveElement(static_cast<int>(row.second));
        contour.RemoveElement(-1);
        EXPECT_EQ(contour.ElementCount(), row.second);
    }
}

TEST(ContourBuilding, InvertingReversesCurvesAndRecordsAndTwiceRestores) {
    OpenContour contour = Angle();
    contour.AddElement(Segment(10, 10, 0, 10), false, 3);
    GmContour original;
    original = contour;
    contour.GetContElement(0)->lId = 1;
    contour.Invert();
    EXPECT_EQ(contour,
              shapes::Polyline({GmPoint(0, 10), GmPoint(10, 10), GmPoint(10, 0), GmPoint(0, 0)}));
    EXPECT_EQ(contour.GetContElement(0)->lIndex, 2);
    EXPECT_TRUE(rc::check([](unsigned seed) {
        GmContour star = shapes::RandomStar(seed, true);
        RC_ASSERT(star.Inverted() != star);
        RC_ASSERT(star.Inverted().Inverted() == star);
        RC_ASSERT(star.Inverted().IsClosed());
    }));
}

TEST(ContourBuilding, CloseJoinsTheEndsUnlessTheyMeet) {
    OpenContour contour = Angle();
    contour.Close(false);
    EXPECT_TRUE(contour.IsClosed());
    EXPECT_EQ(contour, shapes::Polygon({GmPoint(0, 0), GmPoint(10, 0), GmPoint(10, 10)}));
    EXPECT_EQ(contour.GetContElement(2)->lId, 0);
    contour.Close(false);
    EXPECT_EQ(contour.ElementCount(), 3);
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
