// SPDX-License-Identifier: MIT
#ifndef GMKERNEL_GMVEC_H
#define GMKERNEL_GMVEC_H

#include <boost/operators.hpp>
#include <string>

#include "gmkernel/GmBase.h"
#include "gmkernel/export.h"

class GmAngle;
class GmDir;
class GmMatrix;
class GmPoint;

/// A vector of three components in length units.
///
/// Angles, quadrants, perpendiculars and rotations work in the x-y plane with z carried along;
/// lengths, dot and cross products use all three components. Free operators: `+` and `-` between
/// vectors, `*` with a double on either side, `/` by a double, and `!=`, `>`, `<=`, `>=`. Their
/// results are always vectors with the creation flag of the left operand (of the vector in a
/// product), also when an operand is a point.
class GMKERNEL_EXPORT GmVec
    : public GmBase,
      public boost::totally_ordered<GmVec,
                                    boost::additive<GmVec, boost::multiplicative<GmVec, double>>> {
public:
    /// The undefined zero vector.
    GmVec();
    GmVec(double x, double y, double z);
    /// Copies components and creation flag; the copy of a point is a vector.
    GmVec(GmVec const& v);
    /// From point a to point b. Undefined and zero when a or b is undefined.
    GmVec(GmPoint const& a, GmPoint const& b);
    /// The unit components of a direction, with its creation flag.
    GmVec(GmDir const& d);
    ~GmVec() override;

    GmVec* Clone() const override;
    /// Undefined: a vector has no place in the plane.
    GmRect BoundingRect() const override;

protected:
    /// Also sets all components to 0.
    void Undefine() override;

public:
    /// Turns the vector by 90 degrees into its normal, counter-clockwise for eRotCCW, clockwise
    /// for any other sense. The length does not change.
    virtual void Normalize(GmBase::eRotDir rot);
    /// Negates all components.
    virtual void Invert();

    /// Access to one coordinate: reference, setter, value.
    virtual double& X();
    virtual void X(double x);
    virtual double X() const;
    virtual double& Y();
    virtual void Y(double y);
    virtual double Y() const;
    virtual double& Z();
    virtual void Z(double z);
    virtual double Z() const;

    /// The slope y / x, 0 when x is exactly 0.
    virtual double k() const;
    virtual double Length() const;
    /// The squared length.
    virtual double Norm() const;

    /// The signed angle from this vector to w, in (-180, 180] degrees; 0 when either has length 0.
    /// The magnitude uses all components, the sign that of the cross product's z.
    virtual GmAngle Angle(GmVec const& w) const;
    /// The polar angle of (x, y).
    virtual GmAngle Angle() const;
    /// The angle from this vector to w in degrees, swept in the sense rot: in (-360, 0] for
    /// eRotCW, in [0, 360) for any other sense.
    virtual double DAngle(GmVec const& w, GmBase::eRotDir rot) const;
    /// Angle(w) in degrees.
    virtual double DAngle(GmVec const& w) const;
    /// The polar angle of (x, y) in degrees, in (-180, 180]. A component smaller than m_scdPrec
    /// counts as zero, so that nearly axis-parallel vectors get the angle of the axis; the zero
    /// vector has the angle 0, but with any negative y, however small, -90.
    virtual double DAngle() const;
    /// The three forms of DAngle in radians.
    virtual double RAngle(GmVec const& w, GmBase::eRotDir rot) const;
    virtual double RAngle(GmVec const& w) const;
    virtual double RAngle() const;

    /// Turns (x, y) counter-clockwise about the z axis; the vector becomes defined.
    virtual void Rotate(GmAngle const& a);
    /// "vec " and the raw trace string.
    virtual std::string GetTraceString() const;

    /// Copies components and creation flag and keeps the own type tag.
    GmVec& operator=(GmVec const& v);

    /// The coordinate x, y, z for i = 0, 1, 2, and 0 for any other i.
    double operator[](int i) const;

    /// Dot product.
    double operator*(GmVec const& w) const;
    /// Cross product, always defined.
    GmVec operator%(GmVec const& w) const;

    /// Component by component; the creation flag does not change.
    GmVec const& operator+=(GmVec const& w);
    GmVec const& operator-=(GmVec const& w);
    GmVec const& operator*=(double f);
    /// A zero divisor gives infinite or NaN components.
    GmVec const& operator/=(double f);
    const GmVec SkalarMult(double f) const;
    GmVec operator-() const;

    /// True for the very same object, or for equal type tags and coordinates that each differ by
    /// strictly less than eps. Creation flags are ignored. A vector never equals a point.
    bool equals(GmVec const& w, double eps) const;
    /// equals() within m_scdPrec.
    bool operator==(GmVec const& w) const;
    /// Orders by length: true when this vector is shorter by more than m_scdPrec.
    bool operator<(GmVec const& w) const;

    /// Brings the length to 1; a vector of length exactly 0 stays as it is.
    void Standardize();
    /// The vector of length 1 (or the zero vector), always defined.
    GmVec Standardized() const;
    GmVec Standardized();
    /// A copy after Normalize.
    GmVec Normalized(GmBase::eRotDir rot) const;
    /// A copy after Invert.
    GmVec Inverted() const;
    /// A copy after Rotate.
    GmVec Rotated(GmAngle const& a) const;

    /// The quadrant of (x, y), 0 to 3 counter-clockwise from the positive x axis; -1 when a
    /// component is smaller than m_scdPrec, that is on or near an axis.
    int Quadrant() const;
    /// The quadrant with points on an axis counted to 0 or 2.
    int Quadrant13() const;
    /// The quadrant with points on an axis counted to 1 or 3.
    int Quadrant24() const;

    /// Replaces the vector by m * (x, y, z, 1), divided by the fourth component; it becomes
    /// defined.
    void Transform(GmMatrix const& m);

    /// "(x, y, z)" with five decimals each.
    std::string GetRawTraceString() const;

protected:
    double m_dX;
    double m_dY;
    double m_dZ;
};

/// Sets coordinate x, y, z for i = 0, 1, 2; does nothing for any other i.
GMKERNEL_EXPORT void SetCoordByIndex(GmVec& v, int i, double value);

#endif  // GMKERNEL_GMVEC_H
