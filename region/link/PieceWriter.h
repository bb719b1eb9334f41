// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/link/PieceJoin.h"
#include "region/nodes/Strands.h"

namespace gmregion {

/// Writes pieces one after the other; those of one element that follow each other become one again.
class PieceWriter {
public:
    PieceWriter(std::vector<Element>& elements, double tolerance)
        : m_elements(elements), m_tolerance(tolerance) {}

    /// Begins a curve: the next piece is a new element.
    void begin() { m_lastTag = kNone; }
    /// Appends a piece, or lengthens the element before by it; whether it is a new element.
    bool append(const Element& piece, Index tag) {
        if (m_lastTag == tag && makeOne(m_elements.back(), piece, m_tolerance)) {
            Element& before = m_elements.back();
            before = {before.sp, piece.ep, joinedBulge(before.bulge, piece.bulge)};
            return false;
        }
        m_lastTag = tag;
        m_elements.push_back(piece);
        return true;
    }

private:
    std::vector<Element>& m_elements;
    double m_tolerance;
    Index m_lastTag = kNone;
};

}  // namespace gmregion
