// SPDX-License-Identifier: MIT
/// @file
/// From a base reference to the class that a type tag promises, with the object itself as witness.
///
/// The tag alone is no proof: assigning one curve to another through references to GmCurve copies
/// the tag and leaves the object what it is. A cast by the tag would then read outside the object.
/// So the class of the object is compared too, which is exact for the library's own classes and
/// costs as little as comparing two pointers; only when it differs, dynamic_cast looks for a class
/// derived from the promised one. An object of another class gives null.
#pragma once

#include <typeinfo>

#include "gmkernel/GmCurve.h"

class GmArc;
class GmBeam;
class GmCircle;
class GmLine;
class GmStretch;

namespace gmkernel_detail {

/// The object as a `T`, null when it is none. For callers that have looked at the tag already.
template <class T>
T const* verifiedCast(GmBase const& object) {
    if (typeid(object) == typeid(T)) return static_cast<T const*>(&object);
    return dynamic_cast<T const*>(&object);
}

/// The tag that promises a class.
template <class T>
constexpr GmBase::eGmTypes kTagOf = GmBase::eGmNoType;
template <>
inline constexpr GmBase::eGmTypes kTagOf<GmLine> = GmBase::eGmLine;
template <>
inline constexpr GmBase::eGmTypes kTagOf<GmBeam> = GmBase::eGmBeam;
template <>
inline constexpr GmBase::eGmTypes kTagOf<GmStretch> = GmBase::eGmStretch;
template <>
inline constexpr GmBase::eGmTypes kTagOf<GmCircle> = GmBase::eGmCircle;
template <>
inline constexpr GmBase::eGmTypes kTagOf<GmArc> = GmBase::eGmArc;

/// The curve as a `T` when its tag says that it is one, and it is; else null. A stretch is no
/// GmLine here, and an arc no GmCircle.
template <class T>
T const* curveAs(GmCurve const& curve) {
    static_assert(kTagOf<T> != GmBase::eGmNoType, "a class without a tag of its own");
    return curve.GetType() == kTagOf<T> ? verifiedCast<T>(curve) : nullptr;
}

/// The supporting line of a curve with the tag of a line, a beam or a stretch; else null.
GmLine const* straightPart(GmCurve const& curve);

/// The supporting circle of a curve with the tag of a circle or an arc; else null.
GmCircle const* roundPart(GmCurve const& curve);

/// Is the curve one of the two kinds that contours are made of?
bool isSegmentOrArc(GmCurve const& curve);

}  // namespace gmkernel_detail
