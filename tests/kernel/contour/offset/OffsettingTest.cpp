// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>

#include <cmath>
#include <limits>
#include <string>
#include <vector>

#include "gmkernel/GmContElement.h"
#include "gmkernel/GmCurve.h"
#include "tests/support/Contours.h"
#include "tests/support/OffsetLaws.h"

namespace {

using offset_laws::Area;
using offset_laws::DistanceFrom;
using offset_laws::Results;
using shapes::Identifiers;
using shapes::Path;
using Ids = std::vector<long>;

constexpr double kPi = 3.14159265358979323846;
constexpr int kWholeContour = 1000000;
constexpr char const* kSquare = "0 0  10 0  10 10  0 10  0 0";
constexpr char const* kWave = "-5 0  0 0  ccw 0 3 3 3  cw 6 3 6 6";

}  // namespace

TEST(Offsetting, ASquareGrowsWithRoundedCornersAndShrinksWithSharpOnes) {
    GmContour square = Path(kSquare);
    ASSERT_EQ(square.Offsetting(1, kWholeContour, false), 1);
    GmContour const& outer = *square.GetSubContour(0);
    EXPECT_TRUE(outer.IsClosed());
    EXPECT_EQ(Identifiers(outer), (Ids{1, 1, 2, 2, 3, 3, 4, 4}))
        << "corners go with what ends there";
    for (int i = 0; i < outer.ElementCount(); ++i) {
        GmContElement const& record = *outer.GetContElement(i);
        EXPECT_EQ(record.lIndex, i);
        EXPECT_EQ(record.bInserted, record.pCurve->IsArc()) << "corners are made, sides are not";
        EXPECT_NEAR(record.pCurve->Length(), record.pCurve->IsArc() ? kPi / 2 : 10.0, 1e-9);
    }
    ASSERT_EQ(square.Offsetting(-1, kWholeContour, false), 1);
    EXPECT_EQ(Identifiers(*square.GetSubContour(0)), (Ids{1, 2, 3, 4}));
    EXPECT_NEAR(Area(*square.GetSubContour(0)), 64, 1e-9);
    EXPECT_NEAR(Area(square), 100, 1e-9) << "the source stays";

    for (int i = 0; i < 4; ++i)
        square.GetContElement(i)->lId = 4 - i;
    ASSERT_EQ(square.Offsetting(-1, kWholeContour, false), 1);
    EXPECT_EQ(Identifiers(*square.GetSubContour(0)), (Ids{1, 4, 3, 2}));
}

TEST(Offsetting, ConvexShapesGrowByTheSteinerFormula) {
    int checked = 0;
    for (GmContour const& shape :
         {shapes::Square(10), shapes::RoundedRectangle(), shapes::Slot(),
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
    GmContour neck = Path("0 0  8 0  8 3  12 3  12 0  20 0  20 8  12 8  12 5  8 5  8 8  0 8  0 0");
    EXPECT_EQ(neck.Offsetting(-0.7, kWholeContour, false), 1);
    ASSERT_EQ(neck.Offsetting(-1.5, kWholeContour, false), 2);
    for (GmContour const* half : Results(neck))
        EXPECT_NEAR(Area(*half), 25, 0.5);
    EXPECT_EQ(neck.Offsetting(-4.1, kWholeContour, false), 0);
    EXPECT_EQ(neck.GetSubContour(0), nullptr) << "earlier results are gone";
}

TEST(Offsetting, AnArcSharperThanTheDistanceLeavesNoOffset) {
    GmContour arc = Path("2 0  ccw 0 0 0 2");
    EXPECT_EQ(arc.Offsetting(-3, kWholeContour, false), 0) << "caps alone are not stored";
    EXPECT_EQ(arc.Offsetting(3, kWholeContour, false), 1);
    GmContour bend = Path("-9 2  0 2  cw 0 0 2 0  2 -9");
    ASSERT_EQ(bend.Offsetting(3, kWholeContour, false), 1);
    EXPECT_EQ(Identifiers(*bend.GetSubContour(0)), (Ids{1, 3, 3})) << "two sides and the cap";
}

TEST(Offsetting, TinyDistancesCopyAndOthersThatAreNoNumbersGiveNothing) {
    GmContour wave = Path(kWave);
    for (const double d : {0.0, 0.00009, -0.00009}) {
        EXPECT_EQ(wave.Offsetting(d, 3, false), 1);
        EXPECT_EQ(Identifiers(*wave.GetSubContour(0)), (Ids{1, 2, 3}));
        EXPECT_EQ(wave.ParallelContours(d, true, true, true), 1);
        EXPECT_EQ(wave.SimpleOffsetting(d), 1);
        EXPECT_EQ(Identifiers(*wave.GetSubContour(0)), (Ids{1, 2, 3}));
    }
    const double huge = std::numeric_limits<double>::infinity();
    for (const double d : {std::nan(""), huge, -huge}) {
        wave.SimpleOffsetting(1);
        EXPECT_EQ(wave.Offsetting(d, kWholeContour, true), 0);
        EXPECT_EQ(wave.GetSubContour(0), nullptr);
        EXPECT_EQ(Path("0 0  9 0").SimpleOffsetting(d), 0);
    }
    GmContour empty;
    EXPECT_EQ(empty.Offsetting(1, kWholeContour, false), 0);
    EXPECT_EQ(empty.Offsetting(0, kWholeContour, false), 1);
}

TEST(Offsetting, AShortSpanGivesTheSameForALocallySimpleContour) {
    std::string corners = "0 0";
    for (int i = 1; i <= 20; ++i)
        corners += " " + std::to_string(3 * i) + " " + std::to_string(2 * (i % 2) + 0.1 * i);
    for (const int span : {3, 5, 12}) {
        for (const double d : {0.5, -0.5, 0.9, -0.9}) {
            GmContour whole = Path(corners);
            GmContour limited = Path(corners);
            ASSERT_EQ(whole.Offsetting(d, kWholeContour, false), 1);
            ASSERT_EQ(limited.ParallelContours(d, d > 0, true, false), 1) << "flags are ignored";
            EXPECT_EQ(*limited.GetSubContour(0), *whole.GetSubContour(0));
            ASSERT_EQ(limited.Offsetting(d, span, false), 1);
            EXPECT_EQ(*limited.GetSubContour(0), *whole.GetSubContour(0)) << span << ", " << d;
        }
    }
}

TEST(Offsetting, WithoutASpanNothingIsCutAway) {
    GmContour square = Path(kSquare);
    for (const int span : {0, -1}) {
        ASSERT_GT(square.Offsetting(-1, span, true), 0);
        double length = 0;
        for (GmContour const* result : Results(square)) {
            for (int i = 0; i < result->ElementCount(); ++i)
                length +=
                    result->GetContElement(i)->bInserted ? 0 : result->GetElement(i)->Length();
        }
        EXPECT_NEAR(length, 40, 1e-9) << "the sides at their full length";
    }
    ASSERT_EQ(square.Offsetting(-1, 0, false), 1) << "closed results know no span";
    EXPECT_NEAR(Area(*square.GetSubContour(0)), 64, 1e-9);
}

TEST(Offsetting, OpenChainsKeepTheCapAtTheirEnd) {
    GmContour wave = Path(kWave);
    for (const double d : {1.0, -1.0}) {
        ASSERT_EQ(wave.Offsetting(d, kWholeContour, false), 1);
        GmContour const& result = *wave.GetSubContour(0);
        EXPECT_FALSE(result.IsClosed());
        ASSERT_EQ(Identifiers(result), (Ids{1, 2, 3, 3}));
        EXPECT_EQ(result.GetElement(0)->SP(), GmPoint(-5, -d));
        EXPECT_EQ(result.GetElement(3)->EP(), GmPoint(6, 6 + d)) << "around the end";
    }
}

TEST(Offsetting, ResultsBelongToTheContour) {
    GmContour square = Path(kSquare);
    for (int i = 0; i < 3; ++i) {
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
    GmContour wave = Path(kWave);
    for (const double d : {1.0, -1.0, 2.5}) {
        ASSERT_EQ(wave.SimpleOffsetting(d), 1) << "tangent joints need no trimming";
        EXPECT_EQ(Identifiers(*wave.GetSubContour(0)), (Ids{1, 2, 3}));
        for (GmPoint const& p : shapes::Samples(*wave.GetSubContour(0), 7))
            EXPECT_NEAR(DistanceFrom(wave, p), std::fabs(d), 1e-6);
    }
    GmContour square = Path(kSquare);
    ASSERT_EQ(square.SimpleOffsetting(-1), 1);
    EXPECT_EQ(*square.GetSubContour(0), Path("0 1  9 1  9 9  1 9  1 0")) << "but the last joint";
    EXPECT_FALSE(square.GetSubContour(0)->IsClosed());
    EXPECT_EQ(square.SimpleOffsetting(1), 0) << "the sides part at outer corners";
    EXPECT_EQ(square.GetSubContour(0), nullptr);

    GmContour arc = Path("2 0  ccw 0 0 0 2");
    EXPECT_EQ(arc.SimpleOffsetting(-2), 1) << "what vanishes is left out";
    EXPECT_EQ(arc.GetSubContour(0)->ElementCount(), 0);
}
