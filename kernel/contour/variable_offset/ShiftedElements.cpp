// SPDX-License-Identifier: MIT
/// @file
/// Moving elements by a vector each, and closing the gaps that this leaves.
///
/// Which signs the vector has follows from the quadrant of an element's direction, so that
/// neighbours in one quadrant move together and stay joined. Others are trimmed to their crossing,
/// or bridged by a segment where they do not cross. Shapes do not change: arcs keep their radius.
/// Linear in the elements.
#include "kernel/contour/variable_offset/ShiftedElements.h"

#include <array>
#include <memory>

namespace gmkernel_detail {

namespace {

/// The direction that decides where an element moves; undefined for other curves than segments and
/// arcs.
GmDir shiftingDirection(GmCurve const& element) {
    if (element.IsArc()) return GmDir(element.SP(), element.EP());
    return element.IsStretch() ? element.TangEP() : GmDir();
}

/// Quadrants count from 0. Directions along an axis go with the second and the fourth.
int quadrantOf(GmDir const& dir) {
    const int quadrant = dir.Quadrant();
    return quadrant == -1 ? dir.Quadrant24() : quadrant;
}

}  // namespace

void shiftElements(GmContour const& contour, GmVec const& v, CurveList& curves) {
    const double x = v.X();
    const double y = v.Y();
    const std::array<GmVec, 4> shifts = {GmVec(x, -y, 0.0), v, GmVec(-x, y, 0.0),
                                         GmVec(-x, -y, 0.0)};
    for (int i = 0; i < contour.ElementCount(); ++i) {
        GmCurve const& element = *contour.GetElement(i);
        const GmDir dir = shiftingDirection(element);
        if (!dir.CreationOK()) continue;
        std::unique_ptr<GmCurve> shifted(element.Clone());
        shifted->Translation(shifts.at(static_cast<std::size_t>(quadrantOf(dir))));
        curves.Add(std::move(shifted));
    }
}

void closeGaps(CurveList& curves, bool closed) {
    for (int i = 0; i < curves.Count(); ++i) {
        const bool last = i + 1 == curves.Count();
        if (last && !closed) return;
        const int j = last ? 0 : i + 1;
        GmCurve& curve = curves[i];
        GmCurve& next = curves[j];
        if (next.SP() == curve.EP() || curve.Trim(&next)) continue;
        std::unique_ptr<GmCurve> bridge(curve.Concat(next, 0));
        if (bridge && bridge->CreationOK()) {
            curves.Insert(std::move(bridge), j);
            ++i;
        } else {
            curve.Concat(next);
        }
    }
}

void removeCollapsed(CurveList& curves) {
    for (int i = curves.Count() - 1; i >= 0; --i) {
        if (curves[i].EP() == curves[i].SP()) curves.RemoveAt(i);
    }
}

}  // namespace gmkernel_detail
