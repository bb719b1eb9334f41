// SPDX-License-Identifier: MIT
#include "gmkernel/GmPoint.h"

#include <gtest/gtest.h>

#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmDir.h"
#include "gmkernel/GmMatrix.h"
#include "gmkernel/GmRect.h"
#include "tests/kernel/values/Generators.h"

TEST(GmPoint, BuildsMeansOfDefinedPointsOnly) {
    GmPoint const a(0, 0, 0);
    GmPoint const b(2, 4, 6);
    GmPoint const c(4, 2, 0);
    EXPECT_EQ(a.Mean(b), GmPoint(1, 2, 3));
    EXPECT_EQ(a.Mean(b, c), GmPoint(2, 2, 2));
    EXPECT_TRUE(a.Mean(b, c).IsPoint());
    GmPoint const none;
    for (GmPoint const& p : {GmPoint(b, none), GmPoint(none, b), GmPoint(none, b, c),
                             GmPoint(b, none, c), GmPoint(b, c, none)}) {
        EXPECT_FALSE(p.CreationOK());
        EXPECT_EQ(p, GmPoint(0, 0));
    }
}

TEST(GmPoint, MeasuresDistances) {
    GmPoint const a(1, 2, 3);
    GmPoint const b(3, 5, 9);
    EXPECT_DOUBLE_EQ(a.Dist(b), 7);
    EXPECT_DOUBLE_EQ(a.Dist2(b), 49);
    EXPECT_DOUBLE_EQ(GmPoint().Dist(GmPoint(3, 4)), 5) << "undefined points are measured too";
    EXPECT_EQ(a.Dir(b), GmDir(2, 3, 6));
    EXPECT_TRUE(a.Dir(a).CreationOK());
    EXPECT_EQ(a.Dir(a), GmDir(0, 0, 0));
    EXPECT_FALSE(a.Dir(GmPoint()).CreationOK());

    EXPECT_DOUBLE_EQ(a.DirDist(b, GmDir(2, 3, 6)), 7);
    EXPECT_DOUBLE_EQ(a.DirDist(b, GmDir(-2, -3, -6)), -7);
    EXPECT_TRUE(std::signbit(a.DirDist(a, GmDir(1, 0))));
}

TEST(GmPoint, MeasuresSweptAngles) {
    GmPoint const o(5, -3);
    GmPoint const east(6, -3);
    GmPoint const north(5, -2);
    EXPECT_DOUBLE_EQ(east.AngDist(north, o, GmBase::eRotCCW), 90);
    EXPECT_DOUBLE_EQ(east.AngDist(north, o, GmBase::eRotCW), 270);
    EXPECT_DOUBLE_EQ(north.AngDist(east, o), 90);
    EXPECT_TRUE(rc::check("both senses make a full turn", [=] {
        GmPoint const a = anyPoint();
        GmPoint const b = anyPoint();
        double const ccw = a.AngDist(b, o, GmBase::eRotCCW);
        double const cw = a.AngDist(b, o, GmBase::eRotCW);
        RC_ASSERT(ccw >= 0 && ccw < 360 && cw >= 0 && cw < 360);
        RC_ASSERT((ccw == 0 ? cw == 0 : std::fabs(ccw + cw - 360) < 1e-9));
        RC_ASSERT(std::fabs(a.AngDist(b, o) - std::fmin(ccw, cw)) < 1e-9);
    }));
}
