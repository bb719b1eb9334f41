// SPDX-License-Identifier: MIT
#pragma once

#include <initializer_list>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

#include "region/model/Element.h"

/// Pieces of DXF text for tests.
namespace drawing_text {

using Groups = std::initializer_list<std::pair<int, std::string>>;

inline std::string entity(const std::string& kind, Groups groups) {
    std::string text = "0\n" + kind + "\n";
    for (const auto& [code, value] : groups)
        text += std::to_string(code) + "\n" + value + "\n";
    return text;
}

inline std::string number(double value) {
    std::ostringstream stream;
    stream.precision(17);
    stream << value;
    return stream.str();
}

inline std::string line(gmregion::Vec2 a, gmregion::Vec2 b, const std::string& layer = "0") {
    return entity(
        "LINE",
        {{8, layer}, {10, number(a.x)}, {20, number(a.y)}, {11, number(b.x)}, {21, number(b.y)}});
}

inline std::string arc(gmregion::Vec2 m, double r, double from, double to, double normal = 1.0) {
    return entity("ARC", {{8, "0"},
                          {10, number(m.x)},
                          {20, number(m.y)},
                          {40, number(r)},
                          {50, number(from)},
                          {51, number(to)},
                          {230, number(normal)}});
}

inline std::string circle(gmregion::Vec2 m, double r, const std::string& layer = "0") {
    return entity("CIRCLE", {{8, layer}, {10, number(m.x)}, {20, number(m.y)}, {40, number(r)}});
}

/// Vertices with the bulge of the element behind each: start point and bulge of an Element.
inline std::string lightPolyline(const std::vector<gmregion::Element>& vertices, bool closed,
                                 int announced = -1) {
    const int count = announced < 0 ? static_cast<int>(vertices.size()) : announced;
    std::string text =
        entity("LWPOLYLINE", {{8, "0"}, {90, std::to_string(count)}, {70, closed ? "1" : "0"}});
    for (const gmregion::Element& v : vertices) {
        text +=
            "10\n" + number(v.sp.x) + "\n20\n" + number(v.sp.y) + "\n42\n" + number(v.bulge) + "\n";
    }
    return text;
}

inline std::string oldPolyline(const std::vector<gmregion::Element>& vertices, bool closed) {
    std::string text = entity("POLYLINE", {{8, "0"}, {66, "1"}, {70, closed ? "1" : "0"}});
    for (const gmregion::Element& v : vertices) {
        text +=
            entity("VERTEX",
                   {{8, "0"}, {10, number(v.sp.x)}, {20, number(v.sp.y)}, {42, number(v.bulge)}});
    }
    return text + entity("SEQEND", {});
}

inline std::string block(const std::string& name, gmregion::Vec2 base, const std::string& content) {
    return entity("BLOCK", {{8, "0"}, {2, name}, {10, number(base.x)}, {20, number(base.y)}}) +
           content + entity("ENDBLK", {});
}

/// A whole drawing.
inline std::string drawing(const std::string& entities, const std::string& blocks = "") {
    return "0\nSECTION\n2\nBLOCKS\n" + blocks + "0\nENDSEC\n0\nSECTION\n2\nENTITIES\n" + entities +
           "0\nENDSEC\n0\nEOF\n";
}

}  // namespace drawing_text
