// SPDX-License-Identifier: MIT
#include "gmkernel/GmDir.h"

#include <gtest/gtest.h>

#include <cmath>

#include "gmkernel/GmAngle.h"
#include "tests/kernel/values/Generators.h"

namespace {

double lengthOf(GmDir const& d) {
    return GmVec(d).Length();
}

bool isZero(GmDir const& d) {
    return d.X() == 0 && d.Y() == 0 && d.Z() == 0;
}

}  // namespace

TEST(GmDir, StandardisesWhatItIsBuiltFrom) {
    GmDir const d(3, 4);
    EXPECT_EQ(d.GetTraceString(), "dir (0.60000, 0.80000, 0.00000)");
    EXPECT_EQ(d, GmDir(GmPoint(1, 1), GmPoint(31, 41)));
    EXPECT_EQ(GmDir(GmAngle(90, false)), GmDir(0, 7));

    for (GmDir const& undefined :
         {GmDir(GmVec()), GmDir(GmAngle()), GmDir(GmPoint(), GmPoint(1, 1)),
          GmDir(GmPoint(1, 1), GmPoint())}) {
        EXPECT_FALSE(undefined.CreationOK());
        EXPECT_TRUE(isZero(undefined));
    }
}

TEST(GmDir, KeepsTheZeroDirectionDefined) {
    GmDir const x(1, 0, 0);
    for (GmDir const& zero : {GmDir(0, 0, 0), GmDir(GmPoint(1, 1), GmPoint(1, 1)),
                              GmDir(x % x.Inverted()), x + -x, x.Sym(GmDir(-5, 0))}) {
        EXPECT_TRUE(zero.CreationOK());
        EXPECT_TRUE(isZero(zero));
        EXPECT_EQ(zero.DAngle(), 0);
        EXPECT_EQ(zero.Angle(x).Degree(), 0);
    }
}

TEST(GmDir, ComparesAHundredTimesFinerThanPoints) {
    GmDir const x(1, 0);
    EXPECT_EQ(x, GmDir(1, 5e-7));
    EXPECT_NE(x, GmDir(1, 2e-6));
    GmVec const v(7, 0, 0);
    EXPECT_TRUE(x == v && v == x) << "a vector is standardised first";
    GmVec const w(7, 1, 0);
    EXPECT_TRUE(x != w && w != x);
    EXPECT_TRUE(GmParallelDir(x, GmDir(-1, 0)));
    EXPECT_TRUE(GmParallelDir(x, x));
    EXPECT_FALSE(GmParallelDir(x, GmDir(0, 1)));
}

TEST(GmDir, FollowsTheLawsOfDirections) {
    EXPECT_EQ(GmDir(1, 0, 0) % GmDir(0, 1, 0), GmDir(0, 0, 1));
    EXPECT_TRUE(rc::check("turns and products have length 1", [] {
        GmDir const a(anyVec());
        GmDir const b(anyVec());
        RC_PRE(!isZero(a) && !isZero(b));
        GmAngle const turn(*anyDegrees(), false);
        for (GmDir const& d : {a, -a, a.Normalized(GmBase::eRotCW), a.Rotated(turn)}) {
            RC_ASSERT(std::fabs(lengthOf(d) - 1) < 1e-12);
        }
        GmDir normal = a;
        normal.Normalize(GmBase::eRotCCW);
        RC_ASSERT(normal == a.Rotated(GmAngle(90, false)));
        RC_ASSERT(GmParallelDir(a % b, b % a) || lengthOf(a % b) == 0);
        RC_ASSERT(a.Sym(b) == a + b);
        RC_ASSERT(a.DAngle(b) == GmVec(a).DAngle(GmVec(b)));
        RC_ASSERT(a.Quadrant() == GmVec(a).Quadrant());
    }));
}
