// SPDX-License-Identifier: MIT
#include "gmkernel/GmAngle.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

#include "tests/kernel/values/Generators.h"

namespace {

GmAngle degrees(double value) {
    return GmAngle(value, false);
}

}  // namespace

TEST(GmAngle, StaysInTheHalfOpenRange) {
    EXPECT_EQ(degrees(-180).Degree(), 180);
    EXPECT_EQ(degrees(3600.0 * 3 + 30).Degree(), 30);
    EXPECT_EQ(degrees(-3600.0 * 3 - 180).Degree(), 180);
    EXPECT_DOUBLE_EQ(GmAngle(M_PI, true).Degree(), 180);
    EXPECT_DOUBLE_EQ(degrees(-90).Radiant(), -M_PI / 2);
    EXPECT_EQ((-degrees(180)).Degree(), 180);
    EXPECT_TRUE((-GmAngle()).CreationOK());

    double const huge = degrees(1e300).Degree();
    EXPECT_TRUE(huge > -180 && huge <= 180);
    EXPECT_TRUE(std::isnan(degrees(std::numeric_limits<double>::infinity()).Degree()));
    EXPECT_TRUE(std::isnan((degrees(10) / 0.0).Degree()));

    EXPECT_TRUE(rc::check("whole turns and the operators", [] {
        double const v = *anyDegrees();
        double const w = *anyDegrees();
        GmAngle const a = degrees(v);
        GmAngle const b = degrees(w);
        RC_ASSERT(a.Degree() > -180 && a.Degree() <= 180);
        RC_ASSERT(std::fabs(std::remainder(a.Degree() - v, 360)) < 1e-9);
        RC_ASSERT(std::fabs(std::remainder((a + b).Degree() - v - w, 360)) < 1e-9);
        RC_ASSERT(std::fabs(std::remainder((a - b).Degree() - v + w, 360)) < 1e-9);
        RC_ASSERT((a * 3.0).Degree() == (3.0 * a).Degree());
        RC_ASSERT(a.SkalarMult(0.5).Degree() == (a / 2.0).Degree());
    }));
}

TEST(GmAngle, ComparesWithToleranceAndOrdersWithout) {
    EXPECT_EQ(degrees(10), degrees(10.009));
    EXPECT_NE(degrees(10), degrees(10.02));
    EXPECT_LT(degrees(10), degrees(10.009));
    EXPECT_NE(degrees(180), degrees(-179.995)) << "no wrapping around the seam";
    EXPECT_EQ(GmAngle(), degrees(0)) << "flags take no part";
    GmAngle copy;
    copy = degrees(7);
    EXPECT_TRUE(copy.CreationOK());
    EXPECT_EQ(copy.Degree(), 7);
}

TEST(GmAngle, DecidesTheSenseOfRotation) {
    EXPECT_EQ(degrees(10).Rotation(degrees(100)), GmBase::eRotCCW);
    EXPECT_EQ(degrees(10).Rotation(degrees(-80)), GmBase::eRotCW);
    EXPECT_EQ(degrees(10).Rotation(degrees(10)), GmBase::eRotNone);
    EXPECT_EQ(degrees(10).Rotation(GmAngle()), GmBase::eRotNone) << "undefined: zero direction";
}
