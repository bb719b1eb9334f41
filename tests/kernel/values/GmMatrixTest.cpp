// SPDX-License-Identifier: MIT
#include "gmkernel/GmMatrix.h"

#include <gtest/gtest.h>

#include <cmath>

#include "tests/kernel/values/Generators.h"

namespace {

GmMatrix anyAffine() {
    GmMatrix m;
    m.Translate(anyVec()).Rotate(GmVec(1, 2, 3) + anyVec() / 1000.0, *anyDegrees());
    return m.Scale(2).Rotate(*anyDegrees(), *anyDegrees());
}

double largestDifference(GmMatrix const& a, GmMatrix const& b) {
    double largest = 0;
    for (int i = 0; i < 16; ++i) {
        largest = std::fmax(largest, std::fabs(a[i] - b[i]));
    }
    return largest;
}

}  // namespace

TEST(GmMatrix, ComparesBitwise) {
    GmMatrix m;
    EXPECT_TRUE(m.isIdentity());
    m(0, 1) = -0.0;
    EXPECT_FALSE(m.isIdentity());
    EXPECT_NE(m, GmMatrix());
    m.reset();
    EXPECT_TRUE(m.isIdentity());
}

TEST(GmMatrix, ChainsFromTheRight) {
    GmVec const x(1, 0, 0);
    EXPECT_EQ(GmMatrix().Translate(x).Scale(2) * x, GmVec(3, 0, 0)) << "the scale acts first";
    EXPECT_EQ(GmMatrix().Scale(GmVec(2, 3, 4)) * GmVec(1, 1, 1), GmVec(2, 3, 4));
    EXPECT_TRUE(rc::check("the product applies its right factor first", [] {
        GmMatrix const a = anyAffine();
        GmMatrix const b = anyAffine();
        GmVec const v = anyVec();
        RC_ASSERT((a * b) * v == a * (b * v));
    }));
}

TEST(GmMatrix, RotatesAboutAnAxis) {
    GmVec const x(1, 0, 0);
    GmVec const y(0, 1, 0);
    GmVec const z(0, 0, 1);
    EXPECT_EQ(GmMatrix::matrixRotate(z, 90) * x, -y);
    EXPECT_EQ(GmMatrix::matrixRotate(-z, 90) * x, y);
    EXPECT_EQ(GmMatrix::matrixRotate(x, 90) * y, -z);
    EXPECT_EQ(GmMatrix::matrixRotate(y, 90) * z, -x);
    EXPECT_EQ(GmMatrix::matrixRotate(2 * z, 90), GmMatrix::matrixRotate(z, 90));
    EXPECT_TRUE(GmMatrix::matrixRotate(GmVec(0, 0, 0), 90).isIdentity());

    // Two angles: about y by -b, then about x by a; matrixRotate of an axis turns the other way.
    GmMatrix const twoAxes = GmMatrix::matrixRotate(x, -30) * GmMatrix::matrixRotate(y, 50);
    EXPECT_LT(largestDifference(GmMatrix::matrixRotate(30, 50), twoAxes), 1e-15);

    EXPECT_TRUE(rc::check("the axis stays and lengths stay", [] {
        GmVec const axis = anyVec();
        GmVec const v = anyVec();
        GmMatrix const m = GmMatrix::matrixRotate(axis, *anyDegrees());
        RC_ASSERT(m * axis == axis);
        RC_ASSERT(std::fabs((m * v).Length() - v.Length()) < 1e-9);
    }));
}

TEST(GmMatrix, InvertsAffineAndGeneralMatrices) {
    EXPECT_EQ(GmMatrix::matrixTranslate(1, 2, 3).inverse(), GmMatrix::matrixTranslate(-1, -2, -3));
    double const zeros[16] = {};
    EXPECT_TRUE(GmMatrix(zeros).inverse().isIdentity());
    EXPECT_TRUE(GmMatrix::matrixScale(0).inverse().isIdentity());

    EXPECT_TRUE(rc::check("the product with the inverse is the identity", [] {
        GmMatrix m = anyAffine();
        GmMatrix const affine = m.inverse();
        RC_ASSERT(largestDifference(m * affine, GmMatrix()) < 1e-9);

        // A fourth row takes the general path; the determinant stays away from 0.
        m(3, 0) = 1e-4;
        m(3, 2) = -2e-4;
        m(3, 3) = 5;
        GmMatrix const projective = m.inverse();
        RC_ASSERT(largestDifference(m * projective, GmMatrix()) < 1e-9);
        RC_ASSERT(largestDifference(projective * m, GmMatrix()) < 1e-9);
    }));
}
