// SPDX-License-Identifier: MIT
/// @file
/// Shapes as paths.
///
/// Curves that follow each other are fitted as one row, so that arcs may run over their joints.

#include "drawing/curves/Shape.h"

#include "drawing/curves/CurveFit.h"
#include "drawing/curves/EllipseArcs.h"

namespace gmdrawing {

using gmpart::Path;
using gmregion::Element;

namespace {

class PathBuilder {
public:
    PathBuilder(const Placement& placement, double tolerance)
        : m_placement(placement), m_tolerance(tolerance), m_keepsArcs(placement.isSimilarity()) {}

    std::optional<Path> run(const Shape& shape) {
        m_path = {{}, shape.closed, shape.layer};
        for (const Stroke& stroke : shape.strokes)
            std::visit([&](const auto& what) { add(what); }, stroke);
        const bool closedRow = shape.closed && m_path.elements.empty();
        if (!finishRow(closedRow)) return std::nullopt;
        return std::move(m_path);
    }

private:
    void add(const Element& e) {
        if (isArc(e) && !m_keepsArcs) {
            for (const Bezier& curve : ellipseArc(e))
                add(curve);
            return;
        }
        finishRow(false);
        m_path.elements.push_back(m_placement.apply(e));
    }

    void add(const Bezier& curve) { m_row.push_back(mapped(curve, m_placement)); }

    bool finishRow(bool closed) {
        if (!m_row.empty() && !m_failed) {
            const auto elements = fitted(m_row, closed, m_tolerance);
            m_failed = !elements;
            if (elements) {
                m_path.elements.insert(m_path.elements.end(), elements->begin(), elements->end());
            }
        }
        m_row.clear();
        return !m_failed;
    }

    const Placement& m_placement;
    double m_tolerance;
    bool m_keepsArcs;
    std::vector<Bezier> m_row;  ///< curves that wait for those that follow
    Path m_path;
    bool m_failed = false;
};

}  // namespace

std::optional<Path> placedPath(const Shape& shape, const Placement& placement, double tolerance) {
    return PathBuilder(placement, tolerance).run(shape);
}

}  // namespace gmdrawing
