#pragma once

#include "region/model/Path.h"

namespace gmpath {

/// Axis-parallel box. Starts empty: `low` above `high`.
struct Box {
    Vec2 low{HUGE_VAL, HUGE_VAL};
    Vec2 high{-HUGE_VAL, -HUGE_VAL};

    bool isEmpty() const { return low.x > high.x; }
    Vec2 size() const { return isEmpty() ? Vec2{} : high - low; }
    void include(Vec2 p);
    void include(const Box& other);
    /// True when the other box lies in this one, borders included. An empty box lies in every box.
    bool holds(const Box& other) const;
    /// True when the boxes have a point in common. An empty box has none.
    bool overlaps(const Box& other) const {
        return low.x <= other.high.x && other.low.x <= high.x && low.y <= other.high.y &&
               other.low.y <= high.y;
    }
    /// The box grown by `margin` on every side.
    Box grown(double margin) const;
};

/// Exact bounding box, arcs included up to their extreme points.
Box boundingBox(const Element& e);
Box boundingBox(const Path& path);

/// Area enclosed by a closed path, exact for arcs: positive when it runs counter-clockwise. Regions
/// that the path runs round twice count twice. An open path is taken as closed by its chord.
double signedArea(const Path& path);

/// Sense in which a closed path runs round what it encloses.
enum class Sense {
    kNone,              ///< open, or encloses nothing beyond rounding
    kCounterClockwise,  ///< the inside lies on the left
    kClockwise          ///< the inside lies on the right
};

/// Sense by the sign of the exact area; kNone for open paths and where the area vanishes in
/// comparison with the length.
Sense sense(const Path& path);

/// How often a closed path runs round p, counter-clockwise positive. 0 means outside. Points on
/// the path itself count to one of the sides that meet there.
int windingNumber(const Path& path, Vec2 p);

}  // namespace gmpath
