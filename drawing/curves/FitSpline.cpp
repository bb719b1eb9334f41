// SPDX-License-Identifier: MIT
/// @file
/// Cubic splines through points.
///
/// Unknown are the velocities v at the points. That the second derivative does not jump at point i
/// between chords of the lengths h and k says
/// `k v[i-1] + 2 (h + k) v[i] + h v[i+1] = 3 (k (p[i] - p[i-1]) / h + h (p[i+1] - p[i]) / k)`: a
/// row of three coefficients. A closed curve has two more in the corners of the system, which are
/// split off as a product of two vectors (Sherman and Morrison), so that the same elimination
/// serves.

#include "drawing/curves/FitSpline.h"

namespace gmdrawing {

using gmregion::Vec2;

namespace {

struct Row {
    double before = 0.0;
    double own = 0.0;
    double after = 0.0;
    Vec2 right;
};

/// Elimination without pivots; the rows are dominated by their own coefficients. Without rows
/// there is nothing to solve.
std::vector<Vec2> solved(std::vector<Row> rows) {
    const std::size_t n = rows.size();
    for (std::size_t i = 1; i < n; ++i) {
        const double factor = rows[i].before / rows[i - 1].own;
        rows[i].own -= factor * rows[i - 1].after;
        rows[i].right = rows[i].right - factor * rows[i - 1].right;
    }
    std::vector<Vec2> values(n);
    for (std::size_t i = n; i-- > 0;) {
        const Vec2 next = i + 1 < n ? rows[i].after * values[i + 1] : Vec2{};
        values[i] = (1.0 / rows[i].own) * (rows[i].right - next);
    }
    return values;
}

/// The same for rows that form a ring: the first takes the last value before it, the last the
/// first one behind it.
std::vector<Vec2> solvedRing(std::vector<Row> rows) {
    const double low = rows.back().after;
    const double high = rows.front().before;
    const double gamma = -rows.front().own;
    rows.front().own -= gamma;
    rows.back().own -= low * high / gamma;
    std::vector<Row> corner = rows;
    for (Row& row : corner)
        row.right = {};
    corner.front().right = {gamma, 0.0};
    corner.back().right = {low, 0.0};
    std::vector<Vec2> values = solved(rows);
    const std::vector<Vec2> ofCorner = solved(corner);
    const double share = high / gamma;
    const double whole = 1.0 + ofCorner.front().x + share * ofCorner.back().x;
    const Vec2 factor = (1.0 / whole) * (values.front() + share * values.back());
    for (std::size_t i = 0; i < values.size(); ++i)
        values[i] = values[i] - ofCorner[i].x * factor;
    return values;
}

class Spline {
public:
    explicit Spline(const FitPoints& fit) : m_fit(fit) {
        for (const Vec2 p : fit.points) {
            if (m_points.empty() || !(p == m_points.back())) m_points.push_back(p);
        }
        m_closed = fit.closed && m_points.size() > 2;
        if (m_closed && m_points.front() == m_points.back()) m_points.pop_back();
        m_closed = m_closed && m_points.size() > 2;
    }

    std::vector<Bezier> pieces() const {
        if (m_points.size() < 2) return {};
        const std::vector<Vec2> v = m_closed ? solvedRing(rows()) : solved(rows());
        std::vector<Bezier> result;
        for (std::size_t i = 0; i < chords(); ++i) {
            const double third = chord(i) / 3.0;
            result.push_back({{at(i)},
                              {at(i) + third * v[i]},
                              {at(i + 1) - third * v[(i + 1) % v.size()]},
                              {at(i + 1)}});
        }
        return result;
    }

private:
    Vec2 at(std::size_t i) const { return m_points[i % m_points.size()]; }
    std::size_t chords() const { return m_points.size() - (m_closed ? 0 : 1); }
    double chord(std::size_t i) const { return distance(at(i), at(i + 1)); }
    Vec2 slope(std::size_t i) const { return (1.0 / chord(i)) * (at(i + 1) - at(i)); }

    std::vector<Row> rows() const {
        std::vector<Row> result;
        const std::size_t n = m_points.size();
        for (std::size_t i = 0; i < n; ++i) {
            const bool atEnd = !m_closed && (i == 0 || i + 1 == n);
            result.push_back(atEnd ? endRow(i) : innerRow((i + n - 1) % n, i));
        }
        return result;
    }

    Row innerRow(std::size_t before, std::size_t after) const {
        const double h = chord(before);
        const double k = chord(after);
        return {k, 2.0 * (h + k), h, 3.0 * (k * slope(before) + h * slope(after))};
    }

    /// At an end the direction is known, or the curve does not bend there.
    Row endRow(std::size_t i) const {
        const bool atStart = i == 0;
        const std::optional<Vec2>& direction = atStart ? m_fit.startDirection : m_fit.endDirection;
        if (direction && length(*direction) > 0.0) return {0.0, 1.0, 0.0, unit(*direction)};
        if (atStart) return {0.0, 2.0, 1.0, 3.0 * slope(0)};
        return {1.0, 2.0, 0.0, 3.0 * slope(i - 1)};
    }

    const FitPoints& m_fit;
    std::vector<Vec2> m_points;
    bool m_closed = false;
};

}  // namespace

std::vector<Bezier> splineThrough(const FitPoints& fit) {
    return Spline(fit).pieces();
}

}  // namespace gmdrawing
