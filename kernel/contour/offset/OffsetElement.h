// SPDX-License-Identifier: MIT
#pragma once

#include <memory>
#include <utility>

#include "gmkernel/GmCurve.h"

namespace gmkernel_detail {

/// The role of a piece in the boundary of its element's band.
enum class PieceRole : char {
    kStartCap,    ///< around the element's start: only cuts other pieces
    kChosenSide,  ///< the offset on the side that is asked for: what results are made of
    kEndCap,      ///< around the element's end: rounds a corner of a result
    kOtherSide    ///< the offset on the opposite side, reversed: only cuts other pieces
};

/// May pieces of this role end up in a result?
inline bool isKept(PieceRole role) {
    return role == PieceRole::kChosenSide || role == PieceRole::kEndCap;
}

/// Are they anything but the offset on the chosen side?
inline bool isAuxiliary(PieceRole role) {
    return role != PieceRole::kChosenSide;
}

}  // namespace gmkernel_detail

/// One piece of the boundary of an element's band, a stretch or an arc.
///
/// Pieces made by splitting keep everything but the curve from the piece they came from.
class GmOffsetElement final {
public:
    /// @param curve the piece
    /// @param source index of the source element whose band the piece belongs to
    /// @param id identifier of the source element, carried to the results
    /// @param role what the piece is in the boundary
    GmOffsetElement(std::unique_ptr<GmCurve> curve, int source, int id,
                    gmkernel_detail::PieceRole role);
    /// Clones the curve.
    GmOffsetElement(GmOffsetElement const& other);
    /// Clones the other's curve and deletes the own one; nothing when assigned to itself.
    GmOffsetElement& operator=(GmOffsetElement const& other);
    GmOffsetElement(GmOffsetElement&& other) noexcept = default;
    GmOffsetElement& operator=(GmOffsetElement&& other) noexcept = default;
    ~GmOffsetElement() = default;

    /// Formats the piece for a debugger; the text goes nowhere.
    virtual void Trace() const;

    GmCurve& curve() { return *m_curve; }
    GmCurve const& curve() const { return *m_curve; }
    /// Hands the curve over and leaves the piece without one.
    std::unique_ptr<GmCurve> takeCurve() { return std::move(m_curve); }
    int source() const { return m_source; }
    int id() const { return m_id; }
    gmkernel_detail::PieceRole role() const { return m_role; }
    /// May the piece end up in a result?
    bool kept() const;
    /// Is it anything but the offset on the chosen side?
    bool auxiliary() const;

private:
    std::unique_ptr<GmCurve> m_curve;
    int m_source;
    int m_id;
    gmkernel_detail::PieceRole m_role;
};
