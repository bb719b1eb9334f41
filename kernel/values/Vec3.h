// SPDX-License-Identifier: MIT
/// @file
/// Vectors and points in plain numbers, for work on many of them.
///
/// Here stand the sums of the value classes: products, lengths and unit vectors are added up in one
/// order, so that a plain vector and an object give the same digits.
#pragma once

#include <cmath>

#include "gmkernel/GmDir.h"
#include "gmkernel/GmPoint.h"

namespace gmkernel_detail {

struct Vec3 {
    double x;
    double y;
    double z;
};

/// The coordinates of a vector or point, whether it is defined or not.
inline Vec3 plain(GmVec const& v) {
    return {v.GmVec::X(), v.GmVec::Y(), v.GmVec::Z()};
}
inline Vec3 plain(GmDir const& d) {
    return {d.GmDir::X(), d.GmDir::Y(), d.GmDir::Z()};
}
inline GmPoint pointOf(Vec3 const& p) {
    return GmPoint(p.x, p.y, p.z);
}

inline Vec3 operator+(Vec3 const& a, Vec3 const& b) {
    return {a.x + b.x, a.y + b.y, a.z + b.z};
}
inline Vec3 operator-(Vec3 const& a, Vec3 const& b) {
    return {a.x - b.x, a.y - b.y, a.z - b.z};
}
inline Vec3 operator-(Vec3 const& a) {
    return {-a.x, -a.y, -a.z};
}
inline Vec3 operator*(double f, Vec3 const& a) {
    return {a.x * f, a.y * f, a.z * f};
}
inline Vec3 operator/(Vec3 const& a, double f) {
    return {a.x / f, a.y / f, a.z / f};
}

inline double dot(Vec3 const& a, Vec3 const& b) {
    return (a.y * b.y + a.x * b.x) + a.z * b.z;
}
inline double length(Vec3 const& a) {
    return std::sqrt(dot(a, a));
}
inline double squaredDistance(Vec3 const& a, Vec3 const& b) {
    const Vec3 d = b - a;
    return dot(d, d);
}
inline double distance(Vec3 const& a, Vec3 const& b) {
    return std::sqrt(squaredDistance(a, b));
}
/// The unit vector; the zero vector stays what it is.
inline Vec3 standardized(Vec3 const& a) {
    const double norm = length(a);
    return norm != 0.0 ? a / norm : a;
}

/// Are all coordinates equal within a tolerance?
inline bool isEqual(Vec3 const& a, Vec3 const& b, double eps) {
    return std::fabs(a.x - b.x) < eps && std::fabs(a.y - b.y) < eps && std::fabs(a.z - b.z) < eps;
}
/// Equal as points, within the length tolerance.
inline bool isSamePoint(Vec3 const& a, Vec3 const& b) {
    return isEqual(a, b, GmBase::m_scdPrec);
}

}  // namespace gmkernel_detail
