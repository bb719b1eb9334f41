#pragma once

#include <memory>

#include "gmkernel/GmCurve.h"

/// One piece of the boundary of an element's band, a stretch or an arc.
///
/// Pieces made by splitting keep everything but the curve from the piece they came from.
class GmOffsetElement final {
public:
    /// @param curve the piece
    /// @param source index of the source element whose band the piece belongs to
    /// @param id identifier of the source element, carried to the results
    /// @param kept true for the offset on the chosen side and for the end cap, which may end up
    ///        in a result; the other pieces only serve to cut
    /// @param auxiliary false only for the offset on the chosen side
    GmOffsetElement(std::unique_ptr<GmCurve> curve, int source, int id, bool kept, bool auxiliary);
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
    int source() const { return m_source; }
    int id() const { return m_id; }
    bool kept() const { return m_kept; }
    bool auxiliary() const { return m_auxiliary; }

private:
    std::unique_ptr<GmCurve> m_curve;
    int m_source;
    int m_id;
    bool m_kept;
    bool m_auxiliary;
};
