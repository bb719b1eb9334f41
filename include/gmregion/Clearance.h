// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <memory>
#include <optional>

#include "gmregion/Element.h"
#include "gmregion/Paths.h"
#include "gmregion/Point.h"
#include "gmregion/export.h"

namespace gmregion {

/// The shortest way from something to paths.
struct Clearance {
    Point from;               ///< a point of what was asked about
    Point to;                 ///< the nearest point of a path
    double distance = 0.0;    ///< between both, in length units; 0 up to rounding where they cross
    std::size_t path = 0;     ///< number of the path in its heap
    std::size_t element = 0;  ///< number of the element in its path
};

/// Answers how far points and elements are from paths, open and closed ones alike.
///
/// Holds what it needs of the paths. Any number of threads may ask at the same time. To be made:
/// linear in the number of elements. Elements without length are passed over; elements with
/// coordinates that are not finite or above 1e100 are, too.
class GMREGION_EXPORT ClearanceIndex {
public:
    explicit ClearanceIndex(const Paths& paths);
    ~ClearanceIndex();
    ClearanceIndex(ClearanceIndex&& other) noexcept;
    ClearanceIndex& operator=(ClearanceIndex&& other) noexcept;
    ClearanceIndex(const ClearanceIndex&) = delete;
    ClearanceIndex& operator=(const ClearanceIndex&) = delete;

    /// The shortest way from an element, of any sweep, to the paths: exact, not by samples. Nothing
    /// when none is as short as the limit, for a heap without elements, for an element that would
    /// be passed over, and for a limit below 0 or NaN. Cost: logarithmic, and the elements within
    /// the limit.
    /// @param e the element
    /// @param limit in length units, 0 or more; HUGE_VAL for none
    std::optional<Clearance> of(const Element& e, double limit) const;
    /// The same from a point.
    std::optional<Clearance> of(Point p, double limit) const;

private:
    struct GMREGION_NO_EXPORT Store;
    std::unique_ptr<Store> m_store;
};

}  // namespace gmregion
