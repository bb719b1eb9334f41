// SPDX-License-Identifier: MIT
#pragma once

namespace gmregion {

/// A point or a vector of the drawing plane, in drawing units.
struct Point {
    double x = 0.0;
    double y = 0.0;
};

inline bool operator==(Point a, Point b) {
    return a.x == b.x && a.y == b.y;
}
inline bool operator!=(Point a, Point b) {
    return !(a == b);
}

}  // namespace gmregion
