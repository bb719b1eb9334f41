// SPDX-License-Identifier: MIT
/// @file
/// The grammars of SVG attributes, by the parsers of SVG++; all of its headers are seen here alone.
///
/// An elliptical arc between two points is a circular one after its plane is turned and squeezed by
/// its radii: there the centre lies on the bisector of the chord.

#include "drawing/svg/reading/SvgGrammar.h"

#include <boost/array.hpp>
#include <cmath>
#include <exception>
#include <svgpp/parser/list_of_points.hpp>
#include <svgpp/parser/misc.hpp>
#include <svgpp/parser/path_data.hpp>
#include <svgpp/parser/transform_list.hpp>
#include <svgpp/policy/error.hpp>
#include <svgpp/policy/path.hpp>
#include <svgpp/policy/path_events.hpp>
#include <svgpp/policy/transform_events.hpp>
#include <utility>

#include "drawing/curves/EllipseArcs.h"

namespace gmdrawing {

using gmregion::Element;
using gmregion::kPi;
using gmregion::Vec2;

namespace {

using Absolute = svgpp::tag::coordinate::absolute;

/// Parses a text into a sink by the parser of a kind of value; the parsers throw what is broken.
template <typename Kind, typename Attribute, typename Sink>
bool parse(const std::string& text, Sink& sink) {
    try {
        return svgpp::value_parser<Kind>::parse(Attribute(), sink, text,
                                                svgpp::tag::source::attribute());
    } catch (const std::exception&) {
        return false;
    }
}

/// An arc as path data have it, with the radii grown to reach over the chord.
class EndpointArc {
public:
    EndpointArc(Vec2 from, Vec2 to, Vec2 radii, double turnDegrees)
        : m_radii{std::abs(radii.x), std::abs(radii.y)}, m_turn(turnDegrees * kPi / 180.0) {
        m_from = squeezed(from);
        m_to = squeezed(to);
        const double half = 0.5 * distance(m_from, m_to);
        if (half > 1.0) {
            m_radii = half * m_radii;
            m_from = (1.0 / half) * m_from;
            m_to = (1.0 / half) * m_to;
        }
    }

    std::vector<Stroke> strokes(Vec2 from, Vec2 to, bool large, bool counterClockwise) const {
        const double half = std::min(1.0, 0.5 * distance(m_from, m_to));
        const double shortSweep = 2.0 * std::asin(half);
        const double sweep =
            (counterClockwise ? 1.0 : -1.0) * (large ? 2.0 * kPi - shortSweep : shortSweep);
        if (m_radii.x == m_radii.y) return circular(from, to, sweep);
        const Vec2 along = unit(m_to - m_from);
        const double height = std::sqrt(std::max(0.0, 1.0 - half * half));
        const double side = large == counterClockwise ? 1.0 : -1.0;
        const Vec2 m = middle(m_from, m_to) + (side * height) * rightNormal(along);
        const Vec2 spoke = m_from - m;
        const Ellipse ellipse{stretched(m), turned({m_radii.x, 0.0}), turned({0.0, m_radii.y})};
        std::vector<Bezier> curves = ellipseArc(ellipse, std::atan2(spoke.y, spoke.x), sweep);
        curves.front().front().p = from;
        curves.back().back().p = to;
        return {curves.begin(), curves.end()};
    }

private:
    static std::vector<Stroke> circular(Vec2 from, Vec2 to, double sweep) {
        std::vector<Element> elements;
        gmpart::appendBulge(elements, {from, to, std::tan(0.25 * sweep)});
        return {elements.begin(), elements.end()};
    }

    Vec2 turned(Vec2 v) const {
        return {std::cos(m_turn) * v.x - std::sin(m_turn) * v.y,
                std::sin(m_turn) * v.x + std::cos(m_turn) * v.y};
    }
    Vec2 squeezed(Vec2 p) const {
        return {(std::cos(m_turn) * p.x + std::sin(m_turn) * p.y) / m_radii.x,
                (std::cos(m_turn) * p.y - std::sin(m_turn) * p.x) / m_radii.y};
    }
    Vec2 stretched(Vec2 p) const { return turned({m_radii.x * p.x, m_radii.y * p.y}); }

    Vec2 m_radii;
    double m_turn;
    Vec2 m_from;  ///< in the plane where the arc is of radius 1
    Vec2 m_to;
};

/// Takes up the events of path data; their names are those that the parsers call.
class PathSink {
public:
    void path_move_to(double x, double y, Absolute) {
        finish();
        m_start = m_place = {x, y};
    }
    void path_line_to(double x, double y, Absolute) { lineTo({x, y}); }
    void path_cubic_bezier_to(double x1, double y1, double x2, double y2, double x, double y,
                              Absolute) {
        add(Bezier{{m_place}, {{x1, y1}}, {{x2, y2}}, {{x, y}}}, {x, y});
    }
    void path_quadratic_bezier_to(double x1, double y1, double x, double y, Absolute) {
        add(Bezier{{m_place}, {{x1, y1}}, {{x, y}}}, {x, y});
    }
    void path_elliptical_arc_to(double rx, double ry, double turn, bool large, bool sweep, double x,
                                double y, Absolute) {
        const Vec2 to{x, y};
        if (to == m_place) return;
        if (rx == 0.0 || ry == 0.0) return lineTo(to);
        const EndpointArc arc(m_place, to, {rx, ry}, turn);
        for (Stroke& stroke : arc.strokes(m_place, to, large, sweep))
            m_strokes.push_back(std::move(stroke));
        m_place = to;
    }
    void path_close_subpath() {
        if (!(m_place == m_start)) lineTo(m_start);
        m_closed = true;
        finish();
    }
    void path_exit() { finish(); }

    std::vector<Shape> takeShapes() { return std::move(m_shapes); }

private:
    void lineTo(Vec2 to) { add(Element{m_place, to}, to); }

    void add(Stroke stroke, Vec2 to) {
        m_strokes.push_back(std::move(stroke));
        m_place = to;
    }

    /// What follows a closed subpath without a move starts where that one started.
    void finish() {
        if (!m_strokes.empty()) m_shapes.push_back({"", "", m_closed, std::move(m_strokes)});
        m_strokes.clear();
        m_closed = false;
        m_place = m_start;
    }

    std::vector<Shape> m_shapes;
    std::vector<Stroke> m_strokes;
    bool m_closed = false;
    Vec2 m_start;
    Vec2 m_place;
};

struct MatrixSink {
    boost::array<double, 6> matrix{{1.0, 0.0, 0.0, 1.0, 0.0, 0.0}};

    void transform_matrix(const boost::array<double, 6>& given) { matrix = given; }
};

struct PointSink {
    std::vector<Vec2> points;

    template <typename Tag, typename Range>
    void set(Tag, const Range& range) {
        for (const auto& point : range)
            points.push_back({point.first, point.second});
    }
};

}  // namespace

std::optional<std::vector<Shape>> pathShapes(const std::string& data) {
    PathSink sink;
    if (!parse<svgpp::tag::type::path_data, svgpp::tag::attribute::d>(data, sink)) {
        return std::nullopt;
    }
    return sink.takeShapes();
}

std::optional<Placement> placementOf(const std::string& transformations) {
    if (transformations.empty()) return Placement();
    MatrixSink sink;
    if (!parse<svgpp::tag::type::transform_list, svgpp::tag::attribute::transform>(transformations,
                                                                                   sink)) {
        return std::nullopt;
    }
    const auto& m = sink.matrix;
    const Vec2 xAxis{m[0], m[1]};
    const Vec2 yAxis{m[2], m[3]};
    if (cross(xAxis, yAxis) == 0.0) return std::nullopt;
    return Placement::toAxes({m[4], m[5]}, xAxis, yAxis);
}

std::optional<std::vector<Vec2>> cornersOf(const std::string& points) {
    PointSink sink;
    if (!parse<svgpp::tag::attribute::points, svgpp::tag::attribute::points>(points, sink)) {
        return std::nullopt;
    }
    return std::move(sink.points);
}

}  // namespace gmdrawing
