// SPDX-License-Identifier: MIT
#pragma once

#include <cmath>
#include <cstddef>
#include <random>
#include <vector>

#include "gmregion/Paths.h"
#include "gmregion/RegionSet.h"
#include "region/plane/ElementWinding.h"
#include "region/plane/Measures.h"

namespace gmregion::shapes {

using Elements = std::vector<Element>;

inline Elements polygon(const std::vector<Vec2>& corners, double bulge = 0.0) {
    Elements loop;
    for (std::size_t i = 0; i < corners.size(); ++i)
        loop.push_back({corners[i], corners[(i + 1) % corners.size()], bulge});
    return loop;
}

inline Elements rectangle(double x, double y, double width, double height) {
    return polygon({{x, y}, {x + width, y}, {x + width, y + height}, {x, y + height}});
}

inline Elements circle(Vec2 m, double r) {
    return polygon({{m.x - r, m.y}, {m.x + r, m.y}}, 1.0);
}

inline double uniform(std::mt19937& engine, double low, double high) {
    return low + (high - low) * (double(engine()) / 4294967296.0);
}

/// A loop of lines and arcs through random points, which crosses itself.
inline Elements tangle(std::mt19937& engine, std::size_t count, double size) {
    std::vector<Vec2> corners;
    for (std::size_t i = 0; i < count; ++i)
        corners.push_back({uniform(engine, 0, size), uniform(engine, 0, size)});
    Elements loop = polygon(corners);
    for (Element& e : loop) {
        if (engine() % 2 == 0) e.bulge = uniform(engine, -1.4, 1.4);
    }
    return loop;
}

/// A loop round a centre, star-shaped: it does not cross itself.
inline Elements star(std::mt19937& engine, std::size_t count, Vec2 m, double r) {
    std::vector<Vec2> corners;
    for (std::size_t i = 0; i < count; ++i) {
        const double angle = 6.283185307179586 * double(i) / double(count);
        const double rho = r * uniform(engine, 0.6, 1.0);
        corners.push_back({m.x + rho * std::cos(angle), m.y + rho * std::sin(angle)});
    }
    Elements loop = polygon(corners);
    for (Element& e : loop) {
        if (engine() % 2 == 0) e.bulge = uniform(engine, -0.15, 0.15);
    }
    return loop;
}

/// A path turned about the origin, by radians, then moved.
inline Elements placed(Elements path, Vec2 by, double angle) {
    const double c = std::cos(angle);
    const double s = std::sin(angle);
    const auto place = [&](Vec2 p) {
        return Vec2{c * p.x - s * p.y + by.x, s * p.x + c * p.y + by.y};
    };
    for (Element& e : path)
        e = {place(e.sp), place(e.ep), e.bulge};
    return path;
}

inline double area(const RegionSet& set) {
    double sum = 0.0;
    const Vec2 about = set.empty() ? Vec2{} : set.elements().front().sp;
    for (const Element& e : set.elements())
        sum += 0.5 * sweptTwice(e, about);
    return sum;
}

inline double perimeter(const RegionSet& set) {
    double sum = 0.0;
    for (const Element& e : set.elements())
        sum += lengthAlong(e);
    return sum;
}

inline int winding(const Element& e, Vec2 p) {
    if (std::fabs(e.bulge) <= 1.0) return windingOf(e, p);
    const Vec2 m = middleOf(e);
    const double half = e.bulge / (1.0 + std::sqrt(1.0 + e.bulge * e.bulge));
    return windingOf({e.sp, m, half}, p) + windingOf({m, e.ep, half}, p);
}

inline int winding(const RegionSet& set, Vec2 p) {
    int sum = 0;
    for (const Element& e : set.elements())
        sum += winding(e, p);
    return sum;
}

inline int winding(const Paths& paths, Vec2 p) {
    int sum = 0;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        for (const Element& e : paths[i])
            sum += winding(e, p);
    }
    return sum;
}

}  // namespace gmregion::shapes
