// SPDX-License-Identifier: MIT
#ifndef GMKERNEL_GMANGLE_H
#define GMKERNEL_GMANGLE_H

#include <boost/operators.hpp>

#include "gmkernel/GmBase.h"
#include "gmkernel/export.h"

/// An angle in degrees, always in (-180, 180].
///
/// Free operators: `+` and `-` between angles, `*` with a double on either side, `/` by a double,
/// each brought back into the range; `!=`, `>`, `<=`, `>=`. Equality has a tolerance, the order has
/// none, and neither wraps around the seam at 180 degrees.
class GMKERNEL_EXPORT GmAngle
    : public GmBase,
      public boost::totally_ordered<
          GmAngle, boost::additive<GmAngle, boost::multiplicative<GmAngle, double>>> {
public:
    /// The undefined angle 0.
    GmAngle();
    /// Copies value and creation flag.
    GmAngle(GmAngle const& a);
    /// A defined angle from degrees, or from radians when bRadiant is set. An infinite or NaN
    /// value gives NaN.
    GmAngle(double value, bool bRadiant);
    ~GmAngle() override;

    GmAngle* Clone() const override;
    /// Undefined: an angle has no place in the plane.
    GmRect BoundingRect() const override;

    /// Copies type tag, value and creation flag.
    GmAngle& operator=(GmAngle const& a);

    /// The value in degrees, in (-180, 180].
    double Degree() const;
    /// The value in radians, in (-pi, pi].
    double Radiant() const;

    /// The result is brought into the range; the creation flag does not change.
    GmAngle const& operator+=(GmAngle const& a);
    GmAngle const& operator-=(GmAngle const& a);
    GmAngle const& operator*=(double f);
    /// A zero divisor gives NaN.
    GmAngle const& operator/=(double f);
    const GmAngle SkalarMult(double f) const;
    /// The negated value as a new, defined angle; 180 stays 180.
    GmAngle operator-() const;

    /// True for the very same object, or for values that differ by strictly less than
    /// m_scdPrecAng.
    bool operator==(GmAngle const& a) const;
    /// Compares the values exactly.
    bool operator<(GmAngle const& a) const;

    /// The sense in which the shorter turn from this angle to other goes: eRotNone for equal
    /// angles; for opposite ones the rounding of the sines decides.
    GmBase::eRotDir Rotation(GmAngle const& other) const;
    /// The quadrant of the angle taken in [0, 360) degrees, 0 to 3; each quadrant starts at its
    /// lower limit. 3 for NaN.
    int QuadrantInt() const;
    /// The same quadrant, eQuadrant1 to eQuadrant4.
    GmBase::eQuadrant Quadrant() const;

protected:
    double ToRadiant(double degrees) const;
    double ToDegree(double radians) const;
    /// Brings the value into (-180, 180] by whole turns. NaN stays, an infinite value becomes NaN.
    void Standardize();

private:
    double m_dAngle;
};

#endif  // GMKERNEL_GMANGLE_H
