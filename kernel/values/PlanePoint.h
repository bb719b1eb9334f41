// SPDX-License-Identifier: MIT
/// @file
/// Points of the x-y plane in plain numbers, for decisions that need no more digits than they have.
#pragma once

#include <cmath>

#include "kernel/values/Vec3.h"

namespace gmkernel_detail {

struct PlanePoint {
    double x;
    double y;
};

inline PlanePoint planePoint(Vec3 const& p) {
    return {p.x, p.y};
}
inline PlanePoint operator-(PlanePoint a, PlanePoint b) {
    return {a.x - b.x, a.y - b.y};
}
inline double dot(PlanePoint a, PlanePoint b) {
    return a.x * b.x + a.y * b.y;
}
inline double cross(PlanePoint a, PlanePoint b) {
    return a.x * b.y - a.y * b.x;
}
inline double length(PlanePoint v) {
    return std::sqrt(dot(v, v));
}

}  // namespace gmkernel_detail
