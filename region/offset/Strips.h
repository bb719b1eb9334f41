// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/Offset.h"
#include "region/nodes/Strands.h"
#include "region/offset/MadeOf.h"
#include "region/offset/OffsetSource.h"

namespace gmregion {

/// What the elements and the corners of a source sweep when they move aside: small loops whose
/// union, with or without the source, is the offset. Slower than raw parallels and right for all
/// kinds of joins and ends.
class Strips {
public:
    /// Fills strands with loops, all counter-clockwise.
    /// @param distance to the right of the elements when positive, in length units
    /// @param weight of each loop
    void make(const OffsetSource& source, double distance, const OffsetOptions& options,
              Weight weight, Strands& strands);
    /// Appends the loops of the source itself, each of a weight.
    void addSource(const OffsetSource& source, Weight weight, Strands& strands);

    /// What the tags of the strands' elements are.
    const MadeOf& madeOf() const { return m_madeOf; }

private:
    void addStrip(const SourceElement& e);
    void addCorner(const SourceElement& before, const SourceElement& after, bool isEnd);
    void begin(const SourceElement& of) { m_of = &of; }
    void edge(Vec2 from, Vec2 to, double bulge, OriginKind kind);
    void endLoop();

    double m_distance = 0.0;
    OffsetOptions m_options;
    Weight m_weight;
    Strands* m_strands = nullptr;
    const SourceElement* m_of = nullptr;
    const SourceElement* m_source = nullptr;  ///< the first element of the source
    MadeOf m_madeOf;
};

}  // namespace gmregion
