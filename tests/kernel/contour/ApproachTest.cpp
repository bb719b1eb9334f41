// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <cmath>

#include "gmkernel/GmApprDepData.h"
#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmStretch.h"
#include "tests/support/Contours.h"

namespace {

using shapes::Path;

GmApprDepData Move(GmCurve& curve, int nEnd, int nType, double dLength) {
    GmApprDepData data;
    data.Point = GmPoint(-5, -5);
    data.pCurve = &curve;
    data.nEnd = nEnd;
    data.nType = nType;
    data.dLength = dLength;
    data.nSide = 1;
    return data;
}

GmPoint StartOf(GmContour const& contour) {
    return contour.GetElement(0)->SP();
}

GmCurve const& LastOf(GmContour const& contour) {
    return *contour.GetElement(static_cast<int>(contour.ElementCount()) - 1);
}

}  // namespace

TEST(ApproachMoves, LeadStraightOntoACurveAndOffIt) {
    GmStretch curve(GmPoint(0, 0), GmPoint(10, 0));
    EXPECT_EQ(GmContour(Move(curve, 0, 0, 2)), Path("-5 -5  0 0"));
    EXPECT_EQ(GmContour(Move(curve, 0, 1, 2)), Path("-5 -5  0 -2  0 0"));
    EXPECT_EQ(GmContour(Move(curve, 0, 2, 2)), Path("-5 -5  -2 0  0 0"));
    EXPECT_EQ(GmContour(Move(curve, 7, 2, 2)), Path("-5 -5  -2 0  0 0"));
    GmStretch ending(GmPoint(-10, 0), GmPoint(0, 0));
    EXPECT_EQ(GmContour(Move(ending, 1, 0, 2)), Path("0 0  -5 -5"));
    EXPECT_EQ(GmContour(Move(ending, 1, 1, 2)), Path("0 0  0 -2  -5 -5"));
    EXPECT_EQ(GmContour(Move(ending, 1, 2, 2)), Path("0 0  2 0  -5 -5"));
    GmApprDepData atOnce = Move(curve, 0, 1, 2);
    atOnce.Point = GmPoint(0, -2);
    EXPECT_EQ(GmContour(atOnce), Path("0 -2  0 0"));
}

TEST(ApproachMoves, LeadAlongArcsSmoothly) {
    EXPECT_TRUE(rc::check([] {
        const double turn = *rc::gen::inRange(-18, 18) * M_PI / 18;
        GmArc curve(GmPoint(3, 4), 6, turn, turn + 2, GmBase::eRotCCW);
        GmApprDepData data = Move(curve, *rc::gen::inRange(0, 2), *rc::gen::inRange(3, 5), 0);
        data.nSide = *rc::gen::arbitrary<bool>() ? 1 : -1;
        data.dRadius = 1.5;
        data.dAngle = 75;
        data.Point = GmPoint(*rc::gen::inRange(-40, 40) + 0.5, *rc::gen::inRange(-40, 40) + 0.5);
        const GmPoint q = data.nEnd == 1 ? curve.EP() : curve.SP();
        RC_PRE(data.Point.Dist(q) > 4.0);
        GmContour move(data);
        RC_ASSERT(move.CreationOK());
        if (data.nEnd == 1) {
            RC_ASSERT(StartOf(move) == q);
            RC_ASSERT(LastOf(move).EP() == data.Point);
            move.Invert();
        } else {
            RC_ASSERT(StartOf(move) == data.Point);
            RC_ASSERT(LastOf(move).EP() == q);
        }
        // Seen towards the curve the move ends along its tangent.
        const GmDir tangent = data.nEnd == 1 ? -curve.TangEP() : curve.TangSP();
        RC_ASSERT(LastOf(move).TangEP() == tangent);
        RC_ASSERT(move.ElementCount() == 2);
        auto const& arc = static_cast<GmArc const&>(LastOf(move));
        RC_ASSERT(std::fabs(arc.R() - 1.5) < 1e-12);
        const int side = data.nEnd == 1 ? -data.nSide : data.nSide;
        if (data.nType == 3) {
            RC_ASSERT(std::fabs(arc.Ang() - 75 * M_PI / 180) < 1e-6);
            RC_ASSERT(arc.Dir() == (side == 1 ? GmBase::eRotCW : GmBase::eRotCCW));
        } else {
            RC_ASSERT(move.GetElement(0)->TangEP() == arc.TangSP());
        }
    }));
}

TEST(ApproachMoves, ChooseBetweenStraightAndRound) {
    GmStretch curve(GmPoint(0, 0), GmPoint(10, 0));
    GmApprDepData data = Move(curve, 0, 5, 0);
    data.dAutoRadius = 1;
    EXPECT_EQ(GmContour(data), Path("-5 -5  0 0"));
    data.Point = GmPoint(-5, 5);
    const GmContour round(data);
    ASSERT_EQ(round.ElementCount(), 2);
    EXPECT_EQ(static_cast<GmArc const&>(*round.GetElement(1)).M(), GmPoint(0, 1));
}

TEST(ApproachMoves, AreUndefinedWhereNothingCanBeBuilt) {
    GmStretch curve(GmPoint(0, 0), GmPoint(10, 0));
    GmApprDepData data = Move(curve, 0, 4, 0);
    data.dRadius = 30;
    EXPECT_FALSE(GmContour(data).CreationOK()) << "the free point lies in the circle";
    data.nType = 6;
    EXPECT_FALSE(GmContour(data).CreationOK());
    data.Point = GmPoint(0, 0);
    EXPECT_TRUE(GmContour(data).CreationOK());
    EXPECT_EQ(GmContour(data).ElementCount(), 0);
    data.Point = GmPoint();
    EXPECT_FALSE(GmContour(data).CreationOK());
    GmCircle endless(GmPoint(0, 0), 3, true);
    EXPECT_FALSE(GmContour(Move(endless, 0, 0, 1)).CreationOK());
    EXPECT_FALSE(GmContour(GmApprDepData()).CreationOK());
}

TEST(OffsetStart, IsTheSmallestIdentifierNearestToTheMovedStart) {
    for (shapes::Variant const& v : shapes::Variants(shapes::RoundedRectangle())) {
        SCOPED_TRACE(v.name);
        for (const double d : {1.0, -1.0}) {
            GmContour contour = v.contour;
            const double offset = v.MapOffset(d);
            const int count = contour.Offsetting(offset, 1000, false);
            int sub = 5;
            int elem = 5;
            ASSERT_TRUE(FindTPCCont(&contour, count, offset, sub, elem));
            GmContour const& path = *contour.GetSubContour(sub);
            GmCurve const& first = *contour.GetElement(0);
            EXPECT_EQ(path.GetContElement(elem)->lId, contour.GetContElement(0)->lId);
            EXPECT_NEAR(path.GetElement(elem)->SP().Dist(first.SP()), std::fabs(offset), 1e-6);
            const GmVec aside = path.GetElement(elem)->SP() - first.SP();
            EXPECT_NEAR(aside * GmVec(first.TangSP()), 0.0, 1e-6);
        }
    }
}

TEST(OffsetStart, OfElementsThatShareTheirIdentifierIsOnTheSideOfTheOffset) {
    // So low that on the wrong side of the start another side's offset begins nearer.
    GmContour flat;
    const GmContour rectangle = Path("0 0  10 0  10 1  0 1  0 0");
    for (int i = 0; i < rectangle.ElementCount(); ++i)
        flat.AddElement(*rectangle.GetElement(i), false, 1);
    for (shapes::Variant const& v : shapes::Variants(flat)) {
        SCOPED_TRACE(v.name);
        GmContour contour = v.contour;
        const double offset = v.MapOffset(2.0);
        const int count = contour.Offsetting(offset, 1000, false);
        int sub = 0;
        int elem = 0;
        ASSERT_TRUE(FindTPCCont(&contour, count, offset, sub, elem));
        GmCurve const& first = *contour.GetElement(0);
        const GmDir right = first.TangSP().Normalized(GmBase::eRotCW);
        EXPECT_EQ(contour.GetSubContour(sub)->GetElement(elem)->SP(),
                  GmPoint(first.SP() + offset * GmVec(right)));
    }
}

TEST(OffsetStart, TakesTheOnlyOpenOffsetOfAnOpenContour) {
    GmContour open = Path("0 0  20 0  20 10");
    int sub = 0;
    int elem = 0;
    EXPECT_FALSE(FindTPCCont(&open, 1, 1, sub, elem)) << "no offsets yet";
    EXPECT_TRUE(sub == -1 && elem == -1);
    open.Offsetting(1, 1000, true);
    EXPECT_TRUE(FindTPCCont(&open, 99, 1, sub, elem));
    EXPECT_EQ(open.GetSubContour(sub)->GetElement(elem)->SP(), GmPoint(0, -1));
    EXPECT_FALSE(FindTPCCont(nullptr, 1, 1, sub, elem));
    GmContour const empty;
    EXPECT_FALSE(FindTPCCont(&empty, 1, 1, sub, elem));
}
