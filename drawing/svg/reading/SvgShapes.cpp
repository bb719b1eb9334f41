// SPDX-License-Identifier: MIT
#include "drawing/svg/reading/SvgShapes.h"

#include <algorithm>
#include <map>
#include <string>
#include <utility>

#include "drawing/curves/EllipseArcs.h"
#include "drawing/svg/reading/SvgGrammar.h"
#include "drawing/svg/reading/SvgLength.h"

namespace gmdrawing {

using gmregion::Element;
using gmregion::kPi;
using gmregion::Vec2;

namespace {

using Shapes = std::vector<Shape>;

/// The lengths of an element's attributes; one that is broken breaks the element.
class Attributes {
public:
    explicit Attributes(const pugi::xml_node& element) : m_element(element) {}

    double length(const char* name) { return lengthOr(name, 0.0); }

    double lengthOr(const char* name, double otherwise) {
        const pugi::xml_attribute attribute = m_element.attribute(name);
        if (!attribute || attribute.value() == std::string_view("auto")) return otherwise;
        const std::optional<double> value = svgLength(attribute.value());
        m_sound = m_sound && value.has_value();
        return value.value_or(0.0);
    }

    bool isSound() const { return m_sound; }

private:
    const pugi::xml_node& m_element;
    bool m_sound = true;
};

/// Strokes that follow each other from a start point.
class Outline {
public:
    explicit Outline(Vec2 start) : m_place(start) {}

    void lineTo(Vec2 to) {
        if (!(to == m_place)) m_strokes.emplace_back(Element{m_place, to});
        m_place = to;
    }

    /// A quarter of an ellipse with its axes along those of the plane; it leaves along `leaving`, a
    /// half axis, and ends along `reaching`.
    void cornerTo(Vec2 to, Vec2 leaving, Vec2 reaching) {
        const double quarter = 0.5 * kPi;
        if (length(leaving) == length(reaching)) {
            m_strokes.emplace_back(Element{m_place, to, std::tan(0.25 * quarter)});
        } else {
            const Vec2 m = m_place + reaching;
            const Vec2 spoke = m_place - m;
            std::vector<Bezier> curve = ellipseArc({m, spoke, leaving}, 0.0, quarter);
            curve.front().front().p = m_place;
            curve.back().back().p = to;
            m_strokes.emplace_back(std::move(curve.front()));
        }
        m_place = to;
    }

    Shape closed() { return {"", "", true, std::move(m_strokes)}; }

private:
    Vec2 m_place;
    std::vector<Stroke> m_strokes;
};

Shapes ellipse(Vec2 m, double rx, double ry) {
    if (!(rx > 0.0 && ry > 0.0)) return {};
    Shape shape{"", "", true};
    if (rx == ry) {
        std::vector<Element> halves;
        gmpart::appendArc(halves, m, rx, 0.0, 2.0 * kPi);
        shape.strokes.assign(halves.begin(), halves.end());
    } else {
        const std::vector<Bezier> curves = ellipseArc({m, {rx, 0.0}, {0.0, ry}}, 0.0, 2.0 * kPi);
        shape.strokes.assign(curves.begin(), curves.end());
    }
    return {shape};
}

/// A rectangle, with its corners rounded by a radius at the most of half its sides.
Shapes rectangle(Vec2 low, Vec2 size, Vec2 radii) {
    if (!(size.x > 0.0 && size.y > 0.0)) return {};
    const Vec2 high = low + size;
    const double rx = std::clamp(radii.x, 0.0, 0.5 * size.x);
    const double ry = std::clamp(radii.y, 0.0, 0.5 * size.y);
    const bool round = rx > 0.0 && ry > 0.0;
    if (!round) {
        Outline outline(low);
        for (const Vec2 corner : {Vec2{high.x, low.y}, high, Vec2{low.x, high.y}, low})
            outline.lineTo(corner);
        return {outline.closed()};
    }
    Outline outline({low.x + rx, low.y});
    outline.lineTo({high.x - rx, low.y});
    outline.cornerTo({high.x, low.y + ry}, {rx, 0.0}, {0.0, ry});
    outline.lineTo({high.x, high.y - ry});
    outline.cornerTo({high.x - rx, high.y}, {0.0, ry}, {-rx, 0.0});
    outline.lineTo({low.x + rx, high.y});
    outline.cornerTo({low.x, high.y - ry}, {-rx, 0.0}, {0.0, -ry});
    outline.lineTo({low.x, low.y + ry});
    outline.cornerTo({low.x + rx, low.y}, {0.0, -ry}, {rx, 0.0});
    return {outline.closed()};
}

std::optional<Shapes> polyline(const pugi::xml_node& element, bool closed) {
    const auto corners = cornersOf(element.attribute("points").value());
    if (!corners) return std::nullopt;
    Shape shape{"", "", closed};
    for (std::size_t i = 1; i < corners->size(); ++i)
        shape.strokes.emplace_back(Element{(*corners)[i - 1], (*corners)[i]});
    if (shape.strokes.empty()) return Shapes{};
    if (closed) shape.strokes.emplace_back(Element{corners->back(), corners->front()});
    return Shapes{shape};
}

std::optional<Shapes> rectangleOf(const pugi::xml_node& element) {
    Attributes a(element);
    const Vec2 low{a.length("x"), a.length("y")};
    const Vec2 size{a.length("width"), a.length("height")};
    const double rx = a.lengthOr("rx", a.length("ry"));
    const double ry = a.lengthOr("ry", rx);
    if (!a.isSound()) return std::nullopt;
    return rectangle(low, size, {rx, ry});
}

std::optional<Shapes> circleOf(const pugi::xml_node& element) {
    Attributes a(element);
    const Vec2 m{a.length("cx"), a.length("cy")};
    const double r = a.length("r");
    return a.isSound() ? std::optional(ellipse(m, r, r)) : std::nullopt;
}

std::optional<Shapes> ellipseOf(const pugi::xml_node& element) {
    Attributes a(element);
    const Vec2 m{a.length("cx"), a.length("cy")};
    const double rx = a.lengthOr("rx", a.length("ry"));
    const double ry = a.lengthOr("ry", rx);
    return a.isSound() ? std::optional(ellipse(m, rx, ry)) : std::nullopt;
}

std::optional<Shapes> lineOf(const pugi::xml_node& element) {
    Attributes a(element);
    const Element line{{a.length("x1"), a.length("y1")}, {a.length("x2"), a.length("y2")}};
    if (!a.isSound()) return std::nullopt;
    return Shapes{{"", "", false, {line}}};
}

using Maker = std::optional<Shapes> (*)(const pugi::xml_node&);

const std::map<std::string_view, Maker>& makers() {
    static const std::map<std::string_view, Maker> all = {
        {"path", [](const pugi::xml_node& e) { return pathShapes(e.attribute("d").value()); }},
        {"polyline", [](const pugi::xml_node& e) { return polyline(e, false); }},
        {"polygon", [](const pugi::xml_node& e) { return polyline(e, true); }},
        {"rect", rectangleOf},
        {"circle", circleOf},
        {"ellipse", ellipseOf},
        {"line", lineOf}};
    return all;
}

}  // namespace

bool isSvgShape(std::string_view name) {
    return makers().count(name) > 0;
}

std::optional<Shapes> svgShapes(const pugi::xml_node& element, std::string_view name) {
    std::optional<Shapes> shapes = makers().at(name)(element);
    if (!shapes) return std::nullopt;
    for (Shape& shape : *shapes)
        shape.kind = name;
    return shapes;
}

}  // namespace gmdrawing
