// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/locate/BoundaryIndex.h"

namespace gmregion {

/// Cuts elements where their distance from pieces of a boundary passes given values.
class Cuts {
public:
    /// Begins with an element that turns by half a turn at the most.
    void begin(const Element& e);
    /// Cuts where the distance from a piece, or from its start, is `reach`.
    void cut(const BoundaryPiece& piece, double reach);
    /// Calls visit(from, middle, to) for the parts between cuts that are longer than a length.
    template <class Visit>
    void visitParts(double longerThan, const Visit& visit);

private:
    struct Cut {
        double place;
        Vec2 at;
    };
    void cutAt(const Carrier& c);
    void sortCuts();
    Vec2 between(Vec2 a, Vec2 b) const;

    Element m_element;
    Carrier m_carrier;
    Vec2 m_middle;
    double m_reach = 0.0;  ///< from the middle to the ends
    std::vector<Cut> m_cuts;
};

template <class Visit>
void Cuts::visitParts(double longerThan, const Visit& visit) {
    sortCuts();
    for (std::size_t i = 1; i < m_cuts.size(); ++i) {
        const Vec2 from = m_cuts[i - 1].at;
        const Vec2 to = m_cuts[i].at;
        const Vec2 chord = to - from;
        if (dot(chord, chord) > longerThan * longerThan) visit(from, between(from, to), to);
    }
}

}  // namespace gmregion
