// SPDX-License-Identifier: MIT
#pragma once

#include "kernel/contour/offset/ActivePieces.h"
#include "kernel/contour/offset/SourceSpan.h"

namespace gmkernel_detail {

/// Removes the pieces that come too near to the source.
class Removal {
public:
    /// @param active the pieces
    /// @param span the most recent source elements
    /// @param d the offset distance
    Removal(ActivePieces& active, SourceSpan const& span, double d);

    /// Removes every piece whose halving point lies nearer to an element of the span than |d| less
    /// the calculation tolerance.
    ///
    /// A piece that passed before and was not split since is tested against the newest element
    /// alone: the others can only have left the span. Elements out of whose boxes the point lies,
    /// and runs of such pieces that the newest element's box does not reach, are passed over.
    /// @param spanGrew the last element of the span is new since the last removal
    void removeNearPieces(bool spanGrew);

private:
    void removeFromRun(std::size_t index);
    bool isNear(Piece& piece) const;
    bool hasUntested() const { return m_untested < m_span.end(); }

    ActivePieces& m_active;
    SourceSpan const& m_span;
    double m_threshold;
    std::size_t m_untested = 0;  ///< the element that was not there at the last removal, if any
};

}  // namespace gmkernel_detail
