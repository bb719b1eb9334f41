// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Point.h"

#include <cmath>

namespace gmregion {

constexpr double kPi = 3.14159265358979323846;

using Vec2 = Point;

inline Vec2 operator+(Vec2 a, Vec2 b) {
    return {a.x + b.x, a.y + b.y};
}
inline Vec2 operator-(Vec2 a, Vec2 b) {
    return {a.x - b.x, a.y - b.y};
}
inline Vec2 operator*(double f, Vec2 v) {
    return {f * v.x, f * v.y};
}

/// Order by x, then by y.
inline bool operator<(Vec2 a, Vec2 b) {
    return a.x < b.x || (a.x == b.x && a.y < b.y);
}

inline double dot(Vec2 a, Vec2 b) {
    return a.x * b.x + a.y * b.y;
}

/// Positive when b points to the left of a.
inline double cross(Vec2 a, Vec2 b) {
    return a.x * b.y - a.y * b.x;
}

inline double length(Vec2 v) {
    return std::hypot(v.x, v.y);
}
inline double distance(Vec2 a, Vec2 b) {
    return length(b - a);
}
inline Vec2 middle(Vec2 a, Vec2 b) {
    return {0.5 * (a.x + b.x), 0.5 * (a.y + b.y)};
}

/// v turned a quarter-turn to the right (clockwise).
inline Vec2 rightNormal(Vec2 v) {
    return {v.y, -v.x};
}

/// v with length 1; the zero vector stays the zero vector.
inline Vec2 unit(Vec2 v) {
    const double len = length(v);
    return len > 0.0 ? (1.0 / len) * v : Vec2{};
}

}  // namespace gmregion
