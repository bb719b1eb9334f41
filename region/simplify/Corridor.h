// SPDX-License-Identifier: MIT
#pragma once

#include "region/plane/Carrier.h"
#include "region/simplify/Chain.h"

namespace gmregion {

/// The points within a distance of a circle or line, told for whole elements.
class Ring {
public:
    explicit Ring(const Element& e) : m_carrier(carrierOf(e)) {}

    /// Whether no point of a piece is farther than t from the carrier. False where t is more than
    /// half the radius. Cost: constant.
    bool holds(const Piece& piece, double t) const;
    /// The same, and the piece runs along the carrier in its sense, a segment nowhere faster.
    bool holdsAlong(const Piece& piece, double t) const;

    const Carrier& carrier() const { return m_carrier; }

private:
    bool holdsPart(const Piece& piece, double t, bool wantAlong) const;
    Carrier m_carrier;
};

/// The ring about an element, between the normals at its ends.
class Corridor {
public:
    explicit Corridor(const Piece& arc) : m_ring(arc.e), m_arc(arc) {}

    /// Whether all of a piece is within t of the element, and opposite to it.
    bool holds(const Piece& piece, double t) const;

private:
    Ring m_ring;
    Piece m_arc;
};

}  // namespace gmregion
