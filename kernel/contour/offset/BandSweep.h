// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmkernel/GmContElement.h"
#include "kernel/contour/offset/ActivePieces.h"
#include "kernel/contour/offset/Insertion.h"
#include "kernel/contour/offset/Removal.h"

namespace gmkernel_detail {

/// Walks along a source contour and turns its bands into the pieces that may bound the results.
///
/// Each element adds its band pieces to the active list, where they cut each other and where those
/// too near to the span are removed; pieces of elements that left the span are retired.
class BandSweep {
public:
    /// @param d the offset distance, positive to the right
    /// @param span how many of the most recent elements cut and test pieces; none for 0 or less
    BandSweep(double d, int span);

    /// Takes the next element of the source, which must stay where it is until the end of the walk.
    void add(GmContElement const& record);
    /// Ends the walk: the pieces of the kept side, in the order in which they were retired. They
    /// live as long as this object.
    std::vector<Piece const*> finish();

private:
    bool advanceSpan(GmCurve const& element);
    void retire();

    double m_d;
    int m_spanSize;
    int m_index = -1;  ///< index of the newest element
    SourceSpan m_span;
    ActivePieces m_active;
    Insertion m_insertion;
    Removal m_removal;
    std::vector<Piece> m_band;  ///< scratch: the band of the newest element
};

}  // namespace gmkernel_detail
