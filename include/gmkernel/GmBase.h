// SPDX-License-Identifier: MIT
#ifndef GMKERNEL_GMBASE_H
#define GMKERNEL_GMBASE_H

#include <boost/operators.hpp>

#include "gmkernel/export.h"

class GmRect;

/// Root of every geometric object: a type tag and a creation flag.
///
/// The tag says of which class an object is and steers the dispatch of pairs of curves. Assignment
/// through a reference to a base class copies it, see GmCurve::operator=. The flag says whether the
/// object was built from valid input: constructors never throw, they leave the flag false when they
/// cannot build their object. Operations run on undefined operands as well, with whatever values
/// these hold.
class GMKERNEL_EXPORT GmBase : public boost::equality_comparable<GmBase> {
public:
    /// The class of an object.
    enum eGmTypes : int {
        eGmNoType = -1,
        eGmVec = 1,
        eGmDir = 2,
        eGmAngle = 3,
        eGmPoint = 10,
        eGmRect = 20,
        eGmCurve = 100,  ///< this tag and all above it belong to curves
        eGmLine = 101,
        eGmCircle = 102,
        eGmStretch = 103,
        eGmBeam = 104,
        eGmArc = 200,
        eGmHelix = 201,
        eGmContour = 300
    };

    /// A sense of rotation in the x-y plane, y pointing up.
    enum eRotDir : int {
        eRotCW = -1,   ///< clockwise, mathematically negative
        eRotNone = 0,  ///< no sense: collinear, or no decision
        eRotCCW = 1    ///< counter-clockwise, mathematically positive
    };

    /// The quadrant of an angle taken in [0, 360) degrees; each starts at its lower limit.
    enum eQuadrant : int { eQuadrant1 = 1, eQuadrant2 = 2, eQuadrant3 = 3, eQuadrant4 = 4 };

    /// Tolerances, all absolute. A difference is within a tolerance only when strictly smaller.
    static const double m_scdPrec;        ///< lengths and coordinates: 1e-4 length units
    static const double m_scdPrecAng;     ///< angles: 0.01 degree
    static const double m_scdPrecAngRad;  ///< angles: 0.01 degree in radians
    static const double m_scdPrecCalc;    ///< numerical calculation: 1e-7
    static const double m_scdPrecSqr;     ///< squared lengths: 1e-8, the square of m_scdPrec

    /// Undefined, of no type.
    GmBase();
    /// Copies the creation flag and the type tag.
    GmBase(GmBase const& other);
    virtual ~GmBase();

    /// A new heap copy of the object's own class; the caller owns it.
    virtual GmBase* Clone() const = 0;
    /// The smallest axis-parallel rectangle around the object. Undefined for vectors, directions
    /// and angles, which have no place in the plane.
    virtual GmRect BoundingRect() const = 0;

protected:
    /// Back to the undefined state. Classes that hold values reset them as well.
    virtual void Undefine();

public:
    /// Copies type tag and creation flag.
    GmBase& operator=(GmBase const& other);
    /// True when both objects are of the same class; values and flags are ignored.
    bool operator==(GmBase const& other) const;

    eGmTypes GetType() const;
    /// True when the object was built from valid input.
    bool CreationOK() const;

    /// Tests of the type tag for exactly one class: a stretch is not a line here, nor an arc a
    /// circle.
    bool IsVec() const;
    bool IsDir() const;
    bool IsAngle() const;
    bool IsPoint() const;
    bool IsRect() const;
    bool IsLine() const;
    bool IsCircle() const;
    bool IsStretch() const;
    bool IsBeam() const;
    bool IsArc() const;
    bool IsHelix() const;
    bool IsContour() const;
    /// True for every curve tag, 100 or more. A rectangle is no curve by its tag.
    bool IsCurve() const;

protected:
    bool m_bCreationOK;
    eGmTypes m_eType;
};

#endif  // GMKERNEL_GMBASE_H
