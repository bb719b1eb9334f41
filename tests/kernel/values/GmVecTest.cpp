// SPDX-License-Identifier: MIT
#include "gmkernel/GmVec.h"

#include <gtest/gtest.h>

#include <cmath>

#include "gmkernel/GmAngle.h"
#include "gmkernel/GmDir.h"
#include "gmkernel/GmMatrix.h"
#include "tests/kernel/values/Generators.h"

namespace {

constexpr double kDegree = M_PI / 180.0;

}  // namespace

TEST(GmVec, ComparesPerCoordinateWithinTheTolerance) {
    GmVec const v(1, 2, 3);
    EXPECT_EQ(v, GmVec(1, 2, 2.99991));
    EXPECT_NE(v, GmVec(1, 1.9998, 3));
    EXPECT_NE(GmVec(0, 0, 0), GmVec(0, 0, GmBase::m_scdPrec)) << "the tolerance itself is outside";
    EXPECT_FALSE(v == GmPoint(1, 2, 3)) << "a vector never equals a point";
    EXPECT_EQ(GmVec(), GmVec(0, 0, 0)) << "flags take no part";

    GmVec const nan(std::nan(""), 0, 0);
    EXPECT_EQ(nan, nan) << "the very same object";
    EXPECT_NE(nan, GmVec(nan));
}

TEST(GmVec, OrdersByLengthWithinTheTolerance) {
    GmVec const v(3, 4, 0);
    EXPECT_FALSE(v < GmVec(5.00005, 0, 0));
    EXPECT_TRUE(v < GmVec(0, 0, 5.0002));
    EXPECT_TRUE(v >= GmVec(0, 5.00005, 0));
    EXPECT_TRUE(GmVec(0, 0, 5.0002) > v);
}

TEST(GmVec, SnapsPolarAnglesToTheAxes) {
    struct {
        double x, y, degrees;
    } const rows[] = {{-1, 0, 180},   {0, -1e-9, -90}, {0, 1e-9, 0},        {0, 0, 0},
                      {-1, -1, -135}, {1, 0.00005, 0}, {0.00005, 1, 90},    {-1, -0.00005, 180},
                      {1, 1, 45},     {-1, 1, 135},    {-0.00005, -1, -90}, {1, -1, -45}};
    for (auto const& row : rows) {
        GmVec const v(row.x, row.y, 7);
        EXPECT_EQ(v.DAngle(), row.degrees) << v.GetTraceString();
        EXPECT_DOUBLE_EQ(v.RAngle(), row.degrees * kDegree) << v.GetTraceString();
        EXPECT_DOUBLE_EQ(v.Angle().Degree(), row.degrees) << v.GetTraceString();
    }
}

TEST(GmVec, MeasuresAnglesBetweenVectors) {
    GmVec const x(1, 0, 0);
    GmVec const y(0, 1, 0);
    EXPECT_DOUBLE_EQ(x.DAngle(y), 90);
    EXPECT_DOUBLE_EQ(x.DAngle(y, GmBase::eRotCW), -270);
    EXPECT_DOUBLE_EQ(x.RAngle(y, GmBase::eRotCW), -1.5 * M_PI);
    EXPECT_DOUBLE_EQ(y.RAngle(x), -M_PI / 2);
    EXPECT_EQ(x.DAngle(GmVec(-3, 0, 0)), 180);
    EXPECT_EQ(x.DAngle(GmVec(5, 0, 0), GmBase::eRotCCW), 0);
    EXPECT_EQ(x.DAngle(GmVec(0, 0, 0)), 0);
    EXPECT_DOUBLE_EQ(x.DAngle(GmVec(0, 0, -2)), 90) << "z counts in the magnitude, not in the sign";
}

TEST(GmVec, CountsQuadrantsWithThreeTreatmentsOfTheAxes) {
    struct {
        double x, y;
        int strict, to13, to24;
    } const rows[] = {{1, 1, 0, 0, 0},        {-1, 1, 1, 1, 1},        {-1, -1, 2, 2, 2},
                      {1, -1, 3, 3, 3},       {1, 0, -1, 0, 3},        {0, 1, -1, 0, 1},
                      {-1, 0, -1, 2, 1},      {0, -1, -1, 2, 3},       {0, 0, -1, 0, 1},
                      {1, 0.00005, -1, 0, 0}, {-0.00005, 1, -1, 0, 1}, {-0.00005, -1, -1, 2, 3},
                      {1e-9, -1, -1, 3, 3},   {-0.0001, 1, 1, 1, 1}};
    for (auto const& row : rows) {
        GmVec const v(row.x, row.y, 0);
        EXPECT_EQ(v.Quadrant(), row.strict) << v.GetTraceString();
        EXPECT_EQ(v.Quadrant13(), row.to13) << v.GetTraceString();
        EXPECT_EQ(v.Quadrant24(), row.to24) << v.GetTraceString();
    }
}

TEST(GmVec, FollowsTheLawsOfVectorAlgebra) {
    EXPECT_TRUE(rc::check("algebra", [] {
        GmVec const a = anyVec();
        GmVec const b = anyVec();
        double const f = *anyCoordinate();
        RC_ASSERT(a + b - b == a);
        RC_ASSERT(a * f == f * a);
        RC_ASSERT(-a == a * -1.0);
        RC_ASSERT(a * b == b * a);
        RC_ASSERT(a % b == -(b % a));
        RC_ASSERT(std::fabs((a % b) * a) <= 1e-6 * (1 + a.Norm() * b.Length()));
        if (a.Length() > 0) RC_ASSERT(std::fabs(a.Standardized().Length() - 1) < 1e-12);
    }));
    EXPECT_TRUE(rc::check("swapping the arguments negates an angle", [] {
        GmVec const a = anyVec();
        GmVec const b = anyVec();
        double const d = a.DAngle(b);
        RC_ASSERT(d > -180 && d <= 180);
        RC_ASSERT(
            (a[0] * b[1] == a[1] * b[0] || std::fabs(std::remainder(b.DAngle(a) + d, 360)) < 1e-5));
        double const ccw = a.DAngle(b, GmBase::eRotCCW);
        double const cw = a.DAngle(b, GmBase::eRotCW);
        RC_ASSERT(cw > -360 && cw <= 0 && ccw >= 0 && ccw < 360);
        RC_ASSERT((d == 0 ? ccw == cw : std::fabs(ccw - cw - 360) < 1e-9));
    }));
    EXPECT_TRUE(rc::check("a rotation adds to the polar angle", [] {
        GmVec const v = anyVec();
        RC_PRE(std::hypot(v[0], v[1]) > 0.01);
        GmAngle const turn(*anyDegrees(), false);
        GmVec const r = v.Rotated(turn);
        RC_ASSERT(std::fabs(r.Length() - v.Length()) < 1e-9);
        RC_ASSERT(std::fabs(r[2] - v[2]) < 1e-9);
        double const off = (r.Angle() - v.Angle() - turn).Degree();
        double const snap = GmBase::m_scdPrec / std::hypot(v[0], v[1]) / kDegree;
        RC_ASSERT(std::fabs(off) < 2 * snap + 1e-9 || std::fabs(off) > 360 - 2 * snap - 1e-9);
    }));
}
