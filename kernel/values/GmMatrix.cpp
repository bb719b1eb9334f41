// SPDX-License-Identifier: MIT
/// @file
/// Homogeneous transformations.
///
/// The inverse comes from cofactors over the determinant: for affine matrices those of the 3x3
/// part, with the translation carried through it; for others from the 2x2 minors of the two pairs
/// of rows (Laplace expansion). There is no pivoting: digits are lost where the determinant is
/// small against the values. Only an exact zero counts as singular.
#include "gmkernel/GmMatrix.h"

#include <algorithm>
#include <cmath>
#include <cstring>

#include "gmkernel/GmVec.h"
#include "kernel/values/Constants.h"

const double GmMatrix::_identity[16] = {1.0, 0.0, 0.0, 0.0, 0.0, 1.0, 0.0, 0.0,
                                        0.0, 0.0, 1.0, 0.0, 0.0, 0.0, 0.0, 1.0};

namespace {

/// An element of 16 values stored column by column.
double at(double const* m, int r, int c) {
    return m[r + 4 * c];
}

double toRadians(double degrees) {
    return degrees * gmkernel_detail::kPi / 180.0;
}

/// The 2x2 minors of two rows, named by their columns.
struct RowPairMinors {
    RowPairMinors(double const* m, int upper, int lower)
        : m01(minor(m, upper, lower, 0, 1)),
          m02(minor(m, upper, lower, 0, 2)),
          m03(minor(m, upper, lower, 0, 3)),
          m12(minor(m, upper, lower, 1, 2)),
          m13(minor(m, upper, lower, 1, 3)),
          m23(minor(m, upper, lower, 2, 3)) {}

    static double minor(double const* m, int upper, int lower, int left, int right) {
        return at(m, upper, left) * at(m, lower, right) - at(m, upper, right) * at(m, lower, left);
    }

    double m01, m02, m03, m12, m13, m23;
};

/// The four cofactors of one row, from the other row of its pair and the minors of the opposite
/// pair of rows. The sign is that of the row's first cofactor.
void rowCofactors(double const* m, int otherRow, RowPairMinors const& opposite, double sign,
                  double cofactors[4]) {
    const double a = at(m, otherRow, 0);
    const double b = at(m, otherRow, 1);
    const double c = at(m, otherRow, 2);
    const double d = at(m, otherRow, 3);
    cofactors[0] = sign * (b * opposite.m23 - c * opposite.m13 + d * opposite.m12);
    cofactors[1] = -sign * (a * opposite.m23 - c * opposite.m03 + d * opposite.m02);
    cofactors[2] = sign * (a * opposite.m13 - b * opposite.m03 + d * opposite.m01);
    cofactors[3] = -sign * (a * opposite.m12 - b * opposite.m02 + c * opposite.m01);
}

}  // namespace

GmMatrix::GmMatrix() {
    reset();
}

GmMatrix::GmMatrix(double const* values) {
    std::copy(values, values + 16, m_adValues);
}

void GmMatrix::reset() {
    std::copy(_identity, _identity + 16, m_adValues);
}

void GmMatrix::identity() {
    reset();
}

bool GmMatrix::isIdentity() const {
    return std::memcmp(m_adValues, _identity, sizeof(m_adValues)) == 0;
}

bool GmMatrix::operator==(GmMatrix const& m) const {
    return std::memcmp(m_adValues, m.m_adValues, sizeof(m_adValues)) == 0;
}

bool GmMatrix::operator!=(GmMatrix const& m) const {
    return !(*this == m);
}

GmMatrix GmMatrix::operator*(GmMatrix const& b) const {
    GmMatrix product;
    for (int r = 0; r < 4; ++r) {
        for (int c = 0; c < 4; ++c) {
            product.set(r, c,
                        get(r, 0) * b.get(0, c) + get(r, 1) * b.get(1, c) +
                            get(r, 2) * b.get(2, c) + get(r, 3) * b.get(3, c));
        }
    }
    return product;
}

GmMatrix& GmMatrix::operator*=(GmMatrix const& b) {
    *this = *this * b;
    return *this;
}

GmVec GmMatrix::operator*(GmVec const& v) const {
    const double x = v[0];
    const double y = v[1];
    const double z = v[2];
    double image[4];
    for (int r = 0; r < 4; ++r) {
        image[r] = get(r, 0) * x + get(r, 1) * y + get(r, 2) * z + get(r, 3);
    }
    const double reciprocal = 1.0 / image[3];
    return GmVec(image[0] * reciprocal, image[1] * reciprocal, image[2] * reciprocal);
}

GmMatrix GmMatrix::matrixScale(double s) {
    return matrixScale(GmVec(s, s, s));
}

GmMatrix GmMatrix::matrixScale(GmVec const& v) {
    GmMatrix m;
    for (int i = 0; i < 3; ++i) {
        m.set(i, i, v[i]);
    }
    return m;
}

GmMatrix GmMatrix::matrixTranslate(GmVec const& v) {
    return matrixTranslate(v[0], v[1], v[2]);
}

GmMatrix GmMatrix::matrixTranslate(double x, double y, double z) {
    GmMatrix m;
    m.set(0, 3, x);
    m.set(1, 3, y);
    m.set(2, 3, z);
    return m;
}

// Rodrigues' rotation formula for the negated angle.
GmMatrix GmMatrix::matrixRotate(GmVec const& axis, double angle) {
    const double t = toRadians(angle);
    const double s = std::sin(t);
    const double c = std::cos(t);
    const double C = 1.0 - c;

    GmMatrix m;
    const double length = std::sqrt(axis.Norm());
    if (length == 0.0) return m;
    const GmVec u = axis / length;
    const double ux = u[0];
    const double uy = u[1];
    const double uz = u[2];

    m.set(0, 0, ux * ux * C + c);
    m.set(0, 1, ux * uy * C + uz * s);
    m.set(0, 2, ux * uz * C - uy * s);
    m.set(1, 0, ux * uy * C - uz * s);
    m.set(1, 1, uy * uy * C + c);
    m.set(1, 2, uy * uz * C + ux * s);
    m.set(2, 0, ux * uz * C + uy * s);
    m.set(2, 1, uy * uz * C - ux * s);
    m.set(2, 2, uz * uz * C + c);
    return m;
}

GmMatrix GmMatrix::matrixRotate(double a, double b) {
    const double sinA = std::sin(toRadians(a));
    const double cosA = std::cos(toRadians(a));
    const double sinB = std::sin(toRadians(b));
    const double cosB = std::cos(toRadians(b));

    GmMatrix m;
    m.set(0, 0, cosB);
    m.set(0, 2, -sinB);
    m.set(1, 0, -sinA * sinB);
    m.set(1, 1, cosA);
    m.set(1, 2, -sinA * cosB);
    m.set(2, 0, cosA * sinB);
    m.set(2, 1, sinA);
    m.set(2, 2, cosA * cosB);
    return m;
}

GmMatrix GmMatrix::matrixOrient(GmVec const& a, GmVec const& b, GmVec const& c) {
    GmMatrix m;
    GmVec const* const columns[3] = {&a, &b, &c};
    for (int i = 0; i < 3; ++i) {
        m.set(0, i, columns[i]->X());
        m.set(1, i, columns[i]->Y());
        m.set(2, i, columns[i]->Z());
    }
    return m;
}

GmMatrix GmMatrix::matrixOrient(GmVec const& a, GmVec const& b) {
    const GmVec aTurned = a.Normalized(GmBase::eRotCW);
    const GmVec bTurned = b.Normalized(GmBase::eRotCW);
    return matrixOrient(bTurned % aTurned, bTurned, aTurned);
}

GmMatrix& GmMatrix::Scale(double s) {
    return *this *= matrixScale(s);
}

GmMatrix& GmMatrix::Scale(GmVec const& v) {
    return *this *= matrixScale(v);
}

GmMatrix& GmMatrix::Translate(GmVec const& v) {
    return *this *= matrixTranslate(v);
}

GmMatrix& GmMatrix::Translate(double x, double y, double z) {
    return *this *= matrixTranslate(x, y, z);
}

GmMatrix& GmMatrix::Rotate(GmVec const& axis, double angle) {
    return *this *= matrixRotate(axis, angle);
}

GmMatrix& GmMatrix::Rotate(double a, double b) {
    return *this *= matrixRotate(a, b);
}

GmMatrix& GmMatrix::Orient(GmVec const& a, GmVec const& b, GmVec const& c) {
    return *this *= matrixOrient(a, b, c);
}

GmMatrix& GmMatrix::Orient(GmVec const& a, GmVec const& b) {
    return *this *= matrixOrient(a, b);
}

GmMatrix GmMatrix::inverse() const {
    GmMatrix result;
    invertMatrix(m_adValues, result.m_adValues);
    return result;
}

GmMatrix GmMatrix::transpose() const {
    GmMatrix result;
    for (int r = 0; r < 4; ++r) {
        for (int c = 0; c < 4; ++c) {
            result.set(r, c, get(c, r));
        }
    }
    return result;
}

// An affine matrix x -> A x + t has the inverse x -> A^-1 x - A^-1 t.
void GmMatrix::invertMatrix(double const* src, double* dst) {
    const bool affine = at(src, 3, 0) == 0.0 && at(src, 3, 1) == 0.0 && at(src, 3, 2) == 0.0 &&
                        at(src, 3, 3) == 1.0;
    if (!affine) {
        invertMatrixGeneral(src, dst);
        return;
    }

    std::copy(_identity, _identity + 16, dst);
    const auto minor = [src](int r1, int r2, int c1, int c2) {
        return at(src, r1, c1) * at(src, r2, c2) - at(src, r1, c2) * at(src, r2, c1);
    };
    const double cofactor00 = minor(1, 2, 1, 2);
    const double cofactor10 = minor(2, 0, 1, 2);
    const double cofactor20 = minor(0, 1, 1, 2);
    const double determinant =
        at(src, 0, 0) * cofactor00 + at(src, 1, 0) * cofactor10 + at(src, 2, 0) * cofactor20;
    if (determinant == 0.0) return;

    const double reciprocal = 1.0 / determinant;
    const double adjugate[3][3] = {{cofactor00, cofactor10, cofactor20},
                                   {minor(1, 2, 2, 0), minor(0, 2, 0, 2), minor(1, 0, 0, 2)},
                                   {minor(1, 2, 0, 1), minor(2, 0, 0, 1), minor(0, 1, 0, 1)}};
    for (int r = 0; r < 3; ++r) {
        for (int c = 0; c < 3; ++c) {
            dst[r + 4 * c] = adjugate[r][c] * reciprocal;
        }
        dst[r + 12] = -(at(dst, r, 0) * at(src, 0, 3) + at(dst, r, 1) * at(src, 1, 3) +
                        at(dst, r, 2) * at(src, 2, 3));
    }
}

void GmMatrix::invertMatrixGeneral(double const* src, double* dst) {
    const RowPairMinors upper(src, 0, 1);
    const RowPairMinors lower(src, 2, 3);
    double cofactors[4][4];
    rowCofactors(src, 1, lower, 1.0, cofactors[0]);
    rowCofactors(src, 0, lower, -1.0, cofactors[1]);
    rowCofactors(src, 3, upper, 1.0, cofactors[2]);
    rowCofactors(src, 2, upper, -1.0, cofactors[3]);

    const double determinant = at(src, 0, 0) * cofactors[0][0] + at(src, 1, 0) * cofactors[1][0] +
                               at(src, 2, 0) * cofactors[2][0] + at(src, 3, 0) * cofactors[3][0];
    if (determinant == 0.0) {
        std::copy(_identity, _identity + 16, dst);
        return;
    }
    const double reciprocal = 1.0 / determinant;
    for (int r = 0; r < 4; ++r) {
        for (int c = 0; c < 4; ++c) {
            dst[c + 4 * r] = cofactors[r][c] * reciprocal;
        }
    }
}

double& GmMatrix::operator()(int r, int c) {
    return element(r, c);
}

double GmMatrix::operator()(int r, int c) const {
    return get(r, c);
}

double& GmMatrix::operator[](int i) {
    return m_adValues[i];
}

double GmMatrix::operator[](int i) const {
    return m_adValues[i];
}

GmMatrix::operator double*() {
    return m_adValues;
}

GmMatrix::operator double const*() const {
    return m_adValues;
}

double& GmMatrix::element(int r, int c) {
    return m_adValues[r + 4 * c];
}

double GmMatrix::get(int r, int c) const {
    return m_adValues[r + 4 * c];
}

void GmMatrix::set(int r, int c, double value) {
    m_adValues[r + 4 * c] = value;
}
