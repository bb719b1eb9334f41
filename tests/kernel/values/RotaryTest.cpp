// SPDX-License-Identifier: MIT
#include <gtest/gtest.h>
#include <rapidcheck.h>

#include <cmath>

#include "gmkernel/GmRotary.h"

TEST(Rotary, LengthsOnACylinderGoRound) {
    EXPECT_TRUE(rc::check([](int s, int r) {
        RC_PRE(r != 0);
        double angle = 0.0;
        double length = 0.0;
        Tracyl(s / 8.0, r / 8.0, angle);
        ITracyl(angle, r / 8.0, length);
        RC_ASSERT(std::fabs(length - s / 8.0) <= 1e-12 * std::fabs(s / 8.0));
    }));
    double angle = 1.0;
    Tracyl(5.0, 5e-8, angle);
    EXPECT_EQ(angle, 0.0);
    Tracyl(M_PI, 1.0, angle);
    EXPECT_DOUBLE_EQ(angle, 180.0);
}

TEST(Rotary, FacePointsGoRound) {
    EXPECT_TRUE(rc::check([] {
        const double x = *rc::gen::inRange(-999, 999) / 16.0;
        const double y = *rc::gen::inRange(-999, 999) / 16.0;
        const double c = *rc::gen::inRange(-99, 99) / 16.0;
        double radius = 0.0;
        double angle = 0.0;
        Transmit(x, y, c, radius, angle);
        RC_ASSERT(std::fabs(radius - c - std::hypot(x, y)) < 1e-10);
        RC_ASSERT(angle >= 0.0);
        RC_ASSERT(angle < 360.0);
        double backX = 0.0;
        double backY = 0.0;
        ITransmit(radius, angle, c, backX, backY);
        RC_ASSERT(std::hypot(backX - x, backY - y) < 1e-10);
    }));
}

TEST(Rotary, FaceAnglesRunClockwiseFromY) {
    struct {
        double x, y, angle;
    } const table[] = {{0, 1, 0},  {1, 0, 90},    {0, -1, 180}, {-1, 0, 270},
                       {1, 1, 45}, {1, 5e-8, 90}, {0, 0, 90}};
    for (auto const& c : table) {
        double radius = 0.0;
        double angle = 0.0;
        Transmit(c.x, c.y, 2.0, radius, angle);
        EXPECT_DOUBLE_EQ(angle, c.angle) << c.x << " " << c.y;
        EXPECT_DOUBLE_EQ(radius, 2.0 + std::hypot(c.x, c.y));
    }
}
