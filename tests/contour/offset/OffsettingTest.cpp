#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <vector>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContElement.h"
#include "gmkernel/GmStretch.h"
#include "support/Contours.h"
#include "support/OffsetLaws.h"

namespace {

using offset_laws::Area;
using offset_laws::DistanceFrom;
using offset_laws::Results;

constexpr double kPi = 3.14159265358979323846;
constexpr int kWholeContour = 1000000;

/// The contour with the identifiers 10, 20, 30 ... in order.
GmContour Numbered(GmContour const& contour) {
    GmContour numbered;
    for (int i = 0; i < contour.ElementCount(); ++i)
        numbered.AddElement(contour.GetElement(i), false, 10 * (i + 1));
    return numbered;
}

std::vector<long> Identifiers(GmContour const& contour) {
    std::vector<long> ids;
    for (int i = 0; i < contour.ElementCount(); ++i)
        ids.push_back(contour.GetContElement(i)->lId);
    return ids;
}

GmContour Wave() {
    GmContour wave;
    wave.AddElement(GmStretch(GmPoint(-5, 0), GmPoint(0, 0)), false, 1);
    wave.AddElement(GmArc(GmPoint(0, 0), GmPoint(3, 3), GmPoint(0, 3), GmBase::eRotCCW), false, 2);
    wave.AddElement(GmArc(GmPoint(3, 3), GmPoint(6, 6), GmPoint(6, 3), GmBase::eRotCW), false, 3);
    return wave;
}

void ExpectSameChains(GmContour const& a, GmContour const& b) {
    const auto ofA = Results(a);
    const auto ofB = Results(b);
    ASSERT_EQ(ofA.size(), ofB.size());
    for (size_t i = 0; i < ofA.size(); ++i) {
        EXPECT_EQ(ofA[i]->ElementCount(), ofB[i]->ElementCount());
        EXPECT_NEAR(shapes::ChainLength(*ofA[i]), shapes::ChainLength(*ofB[i]), 1e-9);
        for (GmPoint const& p : shapes::Samples(*ofA[i], 5))
            EXPECT_LT(DistanceFrom(*ofB[i], p), 1e-9);
    }
}

}  // namespace

TEST(Offsetting, ASquareGrowsWithRoundedCornersAndShrinksWithSharpOnes) {
    GmContour square = Numbered(shapes::Square(10));
    ASSERT_EQ(square.Offsetting(1, kWholeContour, false), 1);
    GmContour const& outer = *square.GetSubContour(0);
    EXPECT_TRUE(outer.IsClosed());
    ASSERT_EQ(outer.ElementCount(), 8);
    for (int i = 0; i < 8; ++i) {
        GmContElement const& record = *outer.GetContElement(i);
        EXPECT_EQ(record.lIndex, i);
        EXPECT_EQ(record.bInserted, record.pCurve->IsArc()) << "corners are made, sides are not";
        EXPECT_NEAR(record.pCurve->Length(), record.pCurve->IsArc() ? kPi / 2 : 10.0, 1e-9);
    }
    ASSERT_EQ(square.Offsetting(-1, kWholeContour, false), 1);
    GmContour const& inner = *square.GetSubContour(0);
    EXPECT_EQ(inner.ElementCount(), 4);
    EXPECT_NEAR(Area(inner), 64, 1e-9);
    EXPECT_NEAR(Area(square), 100, 1e-9) << "the source stays";
}

TEST(Offsetting, ElementsOfResultsCarryTheIdentifierOfTheirSource) {
    GmContour square = Numbered(shapes::Square(10));
    ASSERT_EQ(square.Offsetting(1, kWholeContour, false), 1);
    // A corner belongs to the element that ends there.
    EXPECT_EQ(Identifiers(*square.GetSubContour(0)),
              (std::vector<long>{10, 10, 20, 20, 30, 30, 40, 40}));
    ASSERT_EQ(square.Offsetting(-1, kWholeContour, false), 1);
    EXPECT_EQ(Identifiers(*square.GetSubContour(0)), (std::vector<long>{10, 20, 30, 40}));

    GmContour descending;
    for (int i = 0; i < 4; ++i)
        descending.AddElement(square.GetElement(i), false, 4 - i);
    ASSERT_EQ(descending.Offsetting(-1, kWholeContour, false), 1);
    EXPECT_EQ(Identifiers(*descending.GetSubContour(0)), (std::vector<long>{1, 4, 3, 2}));
}

TEST(Offsetting, ConvexShapesGrowByTheSteinerFormula) {
    int checked = 0;
    for (GmContour const& shape :
         {shapes::Square(10), shapes::RoundedRectangle(12, 9, 2), shapes::Slot(8, 3),
          shapes::Star(std::vector<shapes::StarCorner>(7, shapes::StarCorner{5, 0.1}))}) {
        for (auto& v : shapes::Variants(shape)) {
            for (const double d : {0.2, 1.0, 6.0}) {
                const double offset = std::fabs(v.MapOffset(d));
                const double signedOffset = Area(v.contour) > 0 ? offset : -offset;
                ASSERT_EQ(v.contour.Offsetting(signedOffset, kWholeContour, false), 1) << v.name;
                const double grown = std::fabs(Area(v.contour)) +
                                     shapes::ChainLength(v.contour) * offset +
                                     kPi * offset * offset;
                const double area = std::fabs(Area(*v.contour.GetSubContour(0)));
                EXPECT_NEAR(area / grown, 1, 1e-6) << v.name << ", d " << d;
                ++checked;
            }
        }
    }
    EXPECT_GE(checked, 96);
}

TEST(Offsetting, ANeckSplitsTheResultAndAWidthBeyondHalfLeavesNone) {
    GmContour neck =
        shapes::Polygon({GmPoint(0, 0), GmPoint(8, 0), GmPoint(8, 3), GmPoint(12, 3),
                         GmPoint(12, 0), GmPoint(20, 0), GmPoint(20, 8), GmPoint(12, 8),
                         GmPoint(12, 5), GmPoint(8, 5), GmPoint(8, 8), GmPoint(0, 8)});
    EXPECT_EQ(neck.Offsetting(-0.7, kWholeContour, false), 1);
    ASSERT_EQ(neck.Offsetting(-1.5, kWholeContour, false), 2);
    for (GmContour const* half : Results(neck)) {
        EXPECT_TRUE(half->IsClosed());
        EXPECT_NEAR(Area(*half), 25, 0.5);
    }
    EXPECT_EQ(neck.Offsetting(-4.1, kWholeContour, false), 0);
    EXPECT_EQ(neck.GetSubContour(0), nullptr) << "earlier results are gone";
}

TEST(Offsetting, TinyDistancesCopyAndOthersThatAreNoNumbersGiveNothing) {
    GmContour wave = Wave();
    for (const double d : {0.0, 0.00009, -0.00009}) {
        EXPECT_EQ(wave.Offsetting(d, 3, false), 1);
        EXPECT_EQ(Identifiers(*wave.GetSubContour(0)), Identifiers(wave));
        EXPECT_EQ(wave.ParallelContours(d, true, true, true), 1);
        EXPECT_EQ(wave.SimpleOffsetting(d), 1);
        EXPECT_EQ(wave.GetSubContour(0)->ElementCount(), 3);
    }
    const double huge = std::numeric_limits<double>::infinity();
    for (const double d : {std::nan(""), huge, -huge}) {
        wave.SimpleOffsetting(1);
        EXPECT_EQ(wave.Offsetting(d, kWholeContour, true), 0);
        EXPECT_EQ(wave.GetSubContour(0), nullptr);
        EXPECT_EQ(shapes::Polyline({GmPoint(0, 0), GmPoint(9, 0)}).SimpleOffsetting(d), 0);
    }
    GmContour empty;
    EXPECT_EQ(empty.Offsetting(1, kWholeContour, false), 0);
    EXPECT_EQ(empty.Offsetting(0, kWholeContour, false), 1);
}

TEST(Offsetting, AShortSpanGivesTheSameForALocallySimpleContour) {
    int checked = 0;
    std::vector<GmPoint> corners;
    for (int i = 0; i <= 20; ++i)
        corners.emplace_back(3.0 * i, 2.0 * (i % 2) + 0.1 * i);
    for (const int span : {3, 5, 12}) {
        for (const double d : {0.5, -0.5, 0.9, -0.9}) {
            GmContour whole = shapes::Polyline(corners);
            GmContour limited = shapes::Polyline(corners);
            EXPECT_EQ(whole.Offsetting(d, kWholeContour, false), 1);
            EXPECT_EQ(limited.Offsetting(d, span, false), 1);
            ExpectSameChains(whole, limited);
            ++checked;
        }
    }
    EXPECT_EQ(checked, 12);
}

TEST(Offsetting, WithoutASpanNothingIsCutAway) {
    GmContour square = Numbered(shapes::Square(10));
    for (const int span : {0, -1}) {
        ASSERT_GT(square.Offsetting(-1, span, true), 0);
        double length = 0;
        for (GmContour const* result : Results(square)) {
            for (int i = 0; i < result->ElementCount(); ++i) {
                if (!result->GetContElement(i)->bInserted)
                    length += result->GetElement(i)->Length();
            }
        }
        EXPECT_NEAR(length, 40, 1e-9) << "the sides at their full length";
    }
    ASSERT_EQ(square.Offsetting(-1, 0, false), 1) << "closed results know no span";
    EXPECT_NEAR(Area(*square.GetSubContour(0)), 64, 1e-9);
}

TEST(Offsetting, OpenChainsKeepTheCapAtTheirEnd) {
    GmContour wave = Wave();
    for (const double d : {1.0, -1.0}) {
        ASSERT_EQ(wave.Offsetting(d, kWholeContour, false), 1);
        GmContour const& result = *wave.GetSubContour(0);
        ASSERT_EQ(result.ElementCount(), 4);
        EXPECT_FALSE(result.IsClosed());
        EXPECT_EQ(Identifiers(result), (std::vector<long>{1, 2, 3, 3}));
        EXPECT_EQ(result.GetElement(0)->SP(), GmPoint(-5, -d));
        EXPECT_EQ(result.GetElement(3)->EP(), GmPoint(6, 6 + d)) << "around the end";
    }
}

TEST(Offsetting, ResultsBelongToTheContour) {
    GmContour square = shapes::Square(10);
    for (int i = 0; i < 3; ++i) {
        square.Offsetting(1, kWholeContour, false);
        square.SimpleOffsetting(-1);
        square.Offsetting(0, kWholeContour, false);
        // An offset may be offset in turn, and so may a copy that outlives its source.
        ASSERT_EQ(square.Offsetting(2, kWholeContour, false), 1);
        GmContour grown(*square.GetSubContour(0));
        EXPECT_EQ(square.GetSubContour(0)->Offsetting(-1, kWholeContour, false), 1);
        square.Offsetting(-20, kWholeContour, false);
        ASSERT_EQ(grown.Offsetting(-3, kWholeContour, false), 1);
        EXPECT_NEAR(Area(*grown.GetSubContour(0)), 64, 1e-6);
    }
}

TEST(SimpleOffsetting, TrimsNeighboursAndKeepsIdentifiers) {
    GmContour wave = Wave();
    for (const double d : {1.0, -1.0, 2.5}) {
        ASSERT_EQ(wave.SimpleOffsetting(d), 1) << "tangent joints need no trimming";
        EXPECT_EQ(Identifiers(*wave.GetSubContour(0)), (std::vector<long>{1, 2, 3}));
        for (GmPoint const& p : shapes::Samples(*wave.GetSubContour(0), 7))
            EXPECT_NEAR(DistanceFrom(wave, p), std::fabs(d), 1e-6);
    }
    GmContour square = Numbered(shapes::Square(10));
    ASSERT_EQ(square.SimpleOffsetting(-1), 1);
    GmContour const& inner = *square.GetSubContour(0);
    EXPECT_EQ(inner.GetElement(0)->SP(), GmPoint(0, 1)) << "the last joint is not trimmed";
    EXPECT_EQ(inner.GetElement(1)->SP(), GmPoint(9, 1));
    EXPECT_EQ(inner.GetElement(3)->EP(), GmPoint(1, 0));
    EXPECT_FALSE(inner.IsClosed());
}

TEST(SimpleOffsetting, FailsWhereNeighboursDoNotCross) {
    GmContour square = shapes::Square(10);
    EXPECT_EQ(square.SimpleOffsetting(-1), 1);
    EXPECT_EQ(square.SimpleOffsetting(1), 0) << "the sides part at outer corners";
    EXPECT_EQ(square.GetSubContour(0), nullptr);

    GmContour arc;
    arc.AddElement(GmArc(GmPoint(2, 0), GmPoint(0, 2), GmPoint(0, 0), GmBase::eRotCCW), false, 1);
    EXPECT_EQ(arc.SimpleOffsetting(-2), 1) << "what vanishes is left out";
    EXPECT_EQ(arc.GetSubContour(0)->ElementCount(), 0);
}
