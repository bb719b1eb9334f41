// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "gmbridge/Refusal.h"
#include "gmbridge/export.h"
#include "gmkernel/GmContour.h"
#include "gmregion/Paths.h"
#include "gmregion/RegionSet.h"

namespace gmbridge {

/// An element of a contour that was made a path.
struct ContourElement {
    std::size_t contour = 0;  ///< number of the contour, in the order in which they were added
    long index = 0;           ///< index of the element in its contour
    long id = 0;              ///< its identifier
};

/// Contours of the kernel as paths, and what element of which contour each element of a path is, so
/// that elements of results find their identifiers again.
///
/// The identifier of a path is the number of its contour. A value: copies are independent.
class GMBRIDGE_EXPORT ContourPaths {
public:
    /// Appends a contour as a path, closed where the contour is; one full circle is closed, too,
    /// although a contour of one element never says so.
    ///
    /// Elements become what appendElements() makes of them. A joint of the kernel may miss by its
    /// length tolerance; the later element then starts where the one before ends, and a closed
    /// chain ends where it starts, bulges staying what they are. Heights are left out. Elements
    /// that cross are taken as they are. Cost: the number of elements.
    /// @param contour it is only read
    /// @return why it was refused, then without any change, as one that is undefined or empty, has
    ///         other elements than segments and arcs, or is no chain any more
    Refusal add(const GmContour& contour);

    /// The contours, one path each.
    const gmregion::Paths& paths() const { return m_paths; }

    /// The contour's element that an element of a result stands for: by its first origin; for what
    /// joins parallels at a corner, the element that ends in the corner in the direction of the
    /// contour, as offsets of the kernel have it. Beside crossings of contours, which are no
    /// corners of one, that is the element which the origin names. Nothing where the origin is none
    /// of these paths. Constant cost.
    /// @param set the result
    /// @param element number of its element
    std::optional<ContourElement> sourceOf(const gmregion::RegionSet& set,
                                           std::size_t element) const;
    /// The same for an element with its first origin.
    std::optional<ContourElement> sourceOf(const gmregion::Element& element,
                                           const gmregion::Origin& origin) const;

private:
    gmregion::Paths m_paths;
    std::vector<ContourElement> m_sources;  ///< of all elements of the paths
};

}  // namespace gmbridge
