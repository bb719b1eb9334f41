// SPDX-License-Identifier: MIT
#ifndef GMKERNEL_GMDIR_H
#define GMKERNEL_GMDIR_H

#include <boost/operators.hpp>
#include <string>

#include "gmkernel/GmBase.h"
#include "gmkernel/GmVec.h"
#include "gmkernel/export.h"

class GmAngle;
class GmPoint;

/// A direction: a vector of length 1, or exactly the zero vector.
///
/// Every operation that could change the length brings it back to 1. A zero direction is a legal
/// value: it arises from coincident points and from sums or products that cancel, and is defined
/// when its operands were. Angle queries on it give 0. Free operators: `!=` between directions,
/// `==` and `!=` with a vector on either side, `+` of two directions.
class GMKERNEL_EXPORT GmDir
    : public GmBase,
      public boost::equality_comparable<
          GmDir, boost::equality_comparable<GmDir, GmVec, boost::addable<GmDir>>> {
public:
    /// The undefined zero direction.
    GmDir();
    /// The direction of the vector (x, y, 0), of any length.
    GmDir(double x, double y);
    GmDir(double x, double y, double z);
    /// The direction of v, with its creation flag.
    GmDir(GmVec const& v);
    GmDir(GmDir const& d);
    /// The direction from a to b: zero when they coincide, undefined when a or b is undefined.
    GmDir(GmPoint const& a, GmPoint const& b);
    /// The direction (cos a, sin a, 0). Undefined when the angle is.
    GmDir(GmAngle const& a);
    ~GmDir() override;

    GmDir* Clone() const override;
    /// Undefined: a direction has no place in the plane.
    GmRect BoundingRect() const override;

protected:
    /// Also resets the components to 0.
    void Undefine() override;

public:
    /// One component of the unit vector. Setting one brings the length back to 1, which changes
    /// the others too.
    virtual double X() const;
    virtual void X(double x);
    virtual double Y() const;
    virtual void Y(double y);
    virtual double Z() const;
    virtual void Z(double z);
    /// The slope y / x, 0 when x is exactly 0.
    virtual double k() const;

    /// Turns by 90 degrees, counter-clockwise for eRotCCW, clockwise for any other sense.
    virtual void Normalize(GmBase::eRotDir rot);
    /// Reverses the direction.
    virtual void Invert();
    /// Turns counter-clockwise about the z axis.
    virtual void Rotate(GmAngle const& a);

    /// The angles of the unit vector, as for GmVec: from this direction to d, signed or swept in
    /// the sense rot, or the polar angle. DAngle in degrees, RAngle in radians.
    virtual GmAngle Angle(GmDir const& d) const;
    virtual GmAngle Angle() const;
    virtual double DAngle(GmDir const& d, GmBase::eRotDir rot) const;
    virtual double DAngle(GmDir const& d) const;
    virtual double DAngle() const;
    virtual double RAngle(GmDir const& d, GmBase::eRotDir rot) const;
    virtual double RAngle(GmDir const& d) const;
    virtual double RAngle() const;

    /// Copies type tag, components and creation flag.
    GmDir& operator=(GmDir const& d);

    /// True for the very same object, or for components that each differ by strictly less than
    /// a hundredth of m_scdPrec.
    bool operator==(GmDir const& d) const;
    /// Compares with the direction of v.
    bool operator==(GmVec const& v) const;

    /// The direction of the sum.
    GmDir const& operator+=(GmDir const& d);
    /// The direction of the cross product; zero for parallel directions.
    const GmDir operator%(GmDir const& d) const;
    /// The bisector: the direction of the sum.
    GmDir Sym(GmDir const& d) const;
    /// The opposite direction.
    GmDir operator-() const;
    GmDir Inverted() const;
    /// A copy turned by 90 degrees as by Normalize.
    GmDir Normalized(GmBase::eRotDir rot) const;
    /// A copy turned as by Rotate.
    GmDir Rotated(GmAngle const& a) const;

    /// The quadrant of (x, y), 0 to 3, with the three treatments of the axes that GmVec has.
    int Quadrant() const;
    int Quadrant13() const;
    int Quadrant24() const;

    /// "dir (x, y, z)" with five decimals each.
    std::string GetTraceString() const;

private:
    GmVec m_vec;
};

/// True when a equals b or its opposite.
GMKERNEL_EXPORT bool GmParallelDir(GmDir const& a, GmDir const& b);

#endif  // GMKERNEL_GMDIR_H
