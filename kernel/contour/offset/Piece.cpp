// SPDX-License-Identifier: MIT
#include "kernel/contour/offset/Piece.h"

#include <cmath>
#include <optional>

namespace gmkernel_detail {

Piece::Piece(PlainCurve const& curve, int source, int id, PieceRole role)
    : m_curve(curve), m_source(source), m_id(id), m_role(role) {
    if (auto const* arc = std::get_if<PlainArc>(&m_curve)) m_sweep = QuickSweep(*arc);
    measure();
}

void Piece::measure() {
    auto const* const arc = std::get_if<PlainArc>(&m_curve);
    m_reach = arc != nullptr ? reachOf(*arc, m_sweep) : reachOf(std::get<PlainSegment>(m_curve));
    m_quickHalvingKnown = false;
    clearOfSpan = false;
}

void Piece::moveStart(Vec3 const& p) {
    gmkernel_detail::moveStart(m_curve, p);
    if (auto const* arc = std::get_if<PlainArc>(&m_curve)) m_sweep.startMoved(*arc);
    m_startMoved = true;
}

void Piece::moveEnd(Vec3 const& p) {
    gmkernel_detail::moveEnd(m_curve, p);
    if (auto const* arc = std::get_if<PlainArc>(&m_curve)) m_sweep.endMoved(*arc);
    m_endMoved = true;
}

bool Piece::holds(Vec3 const& p) const {
    auto const* const arc = std::get_if<PlainArc>(&m_curve);
    if (arc == nullptr) return isOn(m_curve, p);
    // The ends of the offset of a tiny arc may lie far from its stored angles.
    if (isSamePoint(p, arc->sp) || isSamePoint(p, arc->ep)) return true;
    if (!(std::fabs(distance(arc->m, p) - arc->r) < kArcElementPrec)) return false;
    const Vec3 direction = (p - arc->m) / arc->r;
    const std::optional<bool> passes = m_sweep.passes(planePoint(direction));
    return passes ? *passes : isOn(m_curve, p);
}

QuickPoint const& Piece::quickHalving() {
    if (m_quickHalvingKnown) return m_quickHalving;
    std::optional<QuickPoint> quick;
    if (auto const* arc = std::get_if<PlainArc>(&m_curve)) quick = m_sweep.halvingPoint(*arc);
    m_quickHalving = quick ? *quick : QuickPoint{planePoint(halving()), 0.0};
    m_quickHalvingKnown = true;
    return m_quickHalving;
}

Hits<2> crossings(Piece const& a, Piece const& b) {
    Hits<2> points;
    for (Vec3 const& p : supportHits(a.curve(), b.curve())) {
        if (a.holds(p) && b.holds(p)) points.add(p);
    }
    return points;
}

}  // namespace gmkernel_detail
