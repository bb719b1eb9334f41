// SPDX-License-Identifier: MIT
/// @file
/// The sense of rotation of a contour.
///
/// It is the sign of the area of a polygon through the joints and through points of the arcs, by
/// the sum of cross products of neighbouring radius vectors (the shoelace formula), which is right
/// for any point of reference. Some chords an arc are enough, as the sign alone counts. A contour
/// that crosses itself answers with the sense that encloses more; the area between arcs and their
/// chords is left out.
#include <cmath>

#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "kernel/contour/ContourElements.h"
#include "kernel/curves/PlainCurve.h"
#include "kernel/curves/VerifiedCast.h"
#include "kernel/values/Constants.h"

namespace {

/// Twice the area swept by the radius vector from `reference` along the points given to moveTo().
class SweptArea {
public:
    SweptArea(GmPoint const& reference, GmPoint const& start)
        : m_reference(reference), m_radius(start - reference) {}

    void moveTo(GmPoint const& p) {
        const GmVec radius = p - m_reference;
        m_doubled += (m_radius % radius).Z();
        m_radius = radius;
    }

    double doubled() const { return m_doubled; }

private:
    GmPoint m_reference;
    GmVec m_radius;
    double m_doubled = 0.0;
};

/// Four chords a half-turn, at least two. A sweep that is no number gives two.
int chordCount(double sweep) {
    const double chords = std::fabs(sweep) * 4.0 / gmkernel_detail::kPi;
    return chords >= 2.0 && chords <= 8.0 ? static_cast<int>(chords) : 2;
}

/// Moves along the chords of an arc, to the start of the last one: to its section points, for which
/// the sweep is computed once.
void moveAlong(SweptArea& area, GmArc const& arc) {
    const double sweep = arc.Ang();
    const int chords = chordCount(sweep);
    const gmkernel_detail::PlainArc numbers = gmkernel_detail::plainOf(arc);
    const double turn = arc.Dir() == GmBase::eRotCW ? -sweep : sweep;
    for (int k = 1; k < chords; ++k) {
        area.moveTo(arc.CreationOK() ? pointOf(pointAfter(numbers, turn / chords * k))
                                     : arc.SectionPoint(k, chords));
    }
}

/// Twice the signed area, positive for a counter-clockwise sense.
double doubledArea(GmContour const& contour, GmPoint const& reference) {
    const GmPoint start = gmkernel_detail::chainStart(contour);
    SweptArea area(reference, start);
    for (int i = 0; i < contour.ElementCount(); ++i) {
        GmCurve const& element = *contour.GetElement(i);
        if (auto const* arc = gmkernel_detail::curveAs<GmArc>(element)) moveAlong(area, *arc);
        area.moveTo(element.EP());
    }
    if (!contour.IsClosed()) area.moveTo(start);
    return area.doubled();
}

}  // namespace

GmBase::eRotDir GmContour::Dir(GmPoint const& r) {
    if (ElementCount() == 0) return eRotNone;
    const GmPoint start = gmkernel_detail::chainStart(*this);
    double area = doubledArea(*this, r);
    if (area == 0.0 && !(r == start)) area = doubledArea(*this, start);
    if (area < 0.0) return eRotCW;
    return area > 0.0 ? eRotCCW : eRotNone;
}
