// SPDX-License-Identifier: MIT
#include <cmath>

#include "gmkernel/GmHelix.h"
#include "gmkernel/GmMatrix.h"
#include "tests/kernel/curves/CurveCases.h"

using namespace cases;

namespace {

GmHelix quarterRise(GmBase::eRotDir rot) {
    return GmHelix(GmPoint(2, 0, 1), GmPoint(-2, 0, 5), GmPoint(0, 0, 9), rot);
}

}  // namespace

TEST(GmHelix, RisesLinearlyAlongItsSweep) {
    EXPECT_TRUE(rc::check([] {
        const GmArc arc = AnyArc();
        const GmPoint sp(arc.SP().X(), arc.SP().Y(), -1.5);
        const GmPoint ep(arc.EP().X(), arc.EP().Y(), 2.5);
        const GmHelix helix(sp, ep, arc.M(), arc.Dir());
        RC_ASSERT(helix.SP() == sp && helix.EP() == ep);
        const int share = *rc::gen::inRange(1, 8);
        const GmPoint below = helix.GetArc().SectionPoint(share, 8);
        const GmPoint on(below.X(), below.Y(), -1.5 + 4.0 * share / 8.0);
        RC_ASSERT(helix.Element(on));
        RC_ASSERT(!helix.Element(GmPoint(on + GmVec(0, 0, 2e-4))));
        RC_ASSERT(helix.MinDist(GmPoint(on + GmVec(0, 0, 3)), false) == on);
        RC_ASSERT(std::fabs(helix.Length() - std::hypot(arc.Length(), 4.0)) < 1e-9);
    }));
    EXPECT_FALSE(quarterRise(CW).Element(GmPoint(2, 0, 1), 1.0));
}

TEST(GmHelix, AFullTurnAnswersTheNearerEndAboveItsStart) {
    const GmHelix turn(GmPoint(10, 0, 0), GmPoint(10, 0, 4), GmPoint(0, 0), CCW);
    EXPECT_NEAR(turn.Length(), std::hypot(2 * M_PI * 10, 4), 1e-12);
    EXPECT_EQ(Text(turn.MinDist(GmPoint(12, 0, 1.9), false)), "10,0");
    EXPECT_EQ(Text(turn.MinDist(GmPoint(12, 0, 2), false)), "10,0,4");
    EXPECT_EQ(Text(turn.MinDist(GmPoint(12, 0, 3), true)), "10,0");
}

TEST(GmHelix, FollowsItsArcInThePlaneOnly) {
    GmHelix helix = quarterRise(CW);
    const std::unique_ptr<GmCurve> inner(helix.GetParallel(-0.5));
    EXPECT_EQ(Text(inner->SP()) + " " + Text(inner->EP()), "2.5,0,1 -2.5,0,5");
    const std::unique_ptr<GmCurve> none(helix.GetParallel(2));
    EXPECT_FALSE(none->CreationOK());
    helix.Translation(GmVec(1, 1, 1));
    GmArc other = Arc(0, 0, 1, 0, 90, CCW);
    helix.SetArc(other);
    EXPECT_EQ(helix.GetTraceString(),
              "helix2 (2.00000, 0.00000) - (-2.00000, 0.00000) mp (0.00000, 0.00000)");
    helix.Transform(GmMatrix::matrixTranslate(GmVec(1, 2, 3)));
    EXPECT_EQ(Text(helix.SP()) + " " + Text(helix.EP()), "3,2,1 -1,2,5");
    EXPECT_THROW(helix.Intersection(inner.get()), std::runtime_error);
    GmHelix copy(GmArc(Arc(0, 0, 1, 0, 90, CCW)));
    EXPECT_EQ(copy.GetTraceString().substr(0, 6), "helix3");
    copy = helix;
    EXPECT_TRUE(copy.IsHelix() && copy.GetTraceString() == helix.GetTraceString());
    EXPECT_FALSE(GmHelix(GmArc()).CreationOK());
}
