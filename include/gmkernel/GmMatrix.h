// SPDX-License-Identifier: MIT
#ifndef GMKERNEL_GMMATRIX_H
#define GMKERNEL_GMMATRIX_H

#include "gmkernel/export.h"

class GmVec;

/// A 4x4 homogeneous transformation.
///
/// Points are column vectors multiplied from the right: the image of (x, y, z) is M * (x, y, z, 1).
/// The values are stored column by column, the element in row r and column c at index r + 4 * c, so
/// that a translation lies at the indices 12, 13 and 14. Indices are not tested. Builders and
/// chaining members take angles in degrees.
class GMKERNEL_EXPORT GmMatrix {
public:
    /// The identity.
    GmMatrix();
    /// Copies 16 values, stored column by column.
    GmMatrix(double const* values);
    GmMatrix(GmMatrix const& m) = default;
    GmMatrix& operator=(GmMatrix const& m) = default;

    /// Both overwrite the matrix with the identity.
    void reset();
    void identity();

    /// Comparisons of the bits of all 16 values: no tolerance, and -0.0 differs from 0.0.
    bool isIdentity() const;
    bool operator==(GmMatrix const& m) const;
    bool operator!=(GmMatrix const& m) const;

    /// The element in row r and column c, both 0 to 3.
    double& operator()(int r, int c);
    double operator()(int r, int c) const;
    /// The value at index i, 0 to 15.
    double& operator[](int i);
    double operator[](int i) const;
    /// The first of the 16 values; the matrix keeps the ownership.
    operator double*();
    operator double const*() const;

    /// The matrix product; applied to a point, b acts first.
    GmMatrix operator*(GmMatrix const& b) const;
    GmMatrix& operator*=(GmMatrix const& b);
    /// The image of v as a defined vector, divided by the fourth coordinate without a test for 0.
    GmVec operator*(GmVec const& v) const;

    /// Scaling by one factor, or by one for each axis.
    static GmMatrix matrixScale(double s);
    static GmMatrix matrixScale(GmVec const& v);
    /// Moving by a vector.
    static GmMatrix matrixTranslate(GmVec const& v);
    static GmMatrix matrixTranslate(double x, double y, double z);
    /// Rotation about an axis of any length, positive angles clockwise when looking from the tip
    /// of the axis to the origin: the axis (0, 0, -1) turns the x-y plane counter-clockwise. An
    /// axis of length 0 gives the identity.
    static GmMatrix matrixRotate(GmVec const& axis, double angle);
    /// Rotation about the y axis by -b, followed by one about the x axis by a.
    static GmMatrix matrixRotate(double a, double b);
    /// Carries the unit vectors of the x, y and z axis to a, b and c.
    static GmMatrix matrixOrient(GmVec const& a, GmVec const& b, GmVec const& c);
    /// With a' and b' the arguments turned by 90 degrees clockwise: carries the unit vectors to
    /// b' % a', b' and a'.
    static GmMatrix matrixOrient(GmVec const& a, GmVec const& b);

    /// Multiply from the right by the builder's matrix, which therefore acts first on a point:
    /// m.Translate(t).Rotate(axis, w) rotates, then moves, then does what m did before.
    GmMatrix& Scale(double s);
    GmMatrix& Scale(GmVec const& v);
    GmMatrix& Translate(GmVec const& v);
    GmMatrix& Translate(double x, double y, double z);
    GmMatrix& Rotate(GmVec const& axis, double angle);
    GmMatrix& Rotate(double a, double b);
    GmMatrix& Orient(GmVec const& a, GmVec const& b, GmVec const& c);
    GmMatrix& Orient(GmVec const& a, GmVec const& b);

    /// The inverse, without pivoting or tolerance: a nearly singular matrix has a large one, an
    /// exactly singular matrix gives the identity.
    GmMatrix inverse() const;
    GmMatrix transpose() const;

private:
    double& element(int r, int c);
    double get(int r, int c) const;
    void set(int r, int c, double value);

    static void invertMatrix(double const* src, double* dst);
    static void invertMatrixGeneral(double const* src, double* dst);

    static const double _identity[16];

    double m_adValues[16];
};

#endif  // GMKERNEL_GMMATRIX_H
