// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "gmregion/RegionSet.h"
#include "region/nodes/Strands.h"
#include "region/offset/MadeOf.h"
#include "region/offset/OffsetSource.h"

namespace gmregion {

/// The parallels of all elements of a source and the arcs about its convex corners, in strands.
///
/// Neighbours that are nearly tangent end in a common point. At concave corners neighbours are
/// trimmed to where they cross; where they do not cross, a strand ends and another one begins.
class RawParallels {
public:
    /// @param distance to the right of the elements when positive, in length units
    /// @param trims whether neighbours at concave corners are trimmed to their crossing
    void make(const OffsetSource& source, double distance, double tolerance, bool trims,
              Strands& strands);

    /// What the tags of the strands' elements are.
    const MadeOf& madeOf() const { return m_madeOf; }
    /// The distance of a point from what the element with a tag is the parallel or the corner of.
    double ownDistance(const OffsetSource& source, Index tag, Vec2 p) const;
    /// An upper bound of the area between the source and its offset: the sum of the areas that the
    /// elements and the corners sweep.
    double sweptArea() const { return m_sweptArea; }

private:
    /// How the parallel of an element goes on to that of the next one.
    enum class Joint : std::uint8_t {
        kGap,     ///< not at all
        kJoined,  ///< they end in a common point
        kCorner   ///< by an arc about the corner
    };
    /// The parallel of an element of the loop in hand.
    struct Parallel : Element {
        Carrier carrier;
        bool exists;
        Joint joint;
    };

    void makeLoop(const SourceElement* first, std::size_t count, Strands& strands);
    Parallel parallelOf(const SourceElement& e) const;
    Joint join(const SourceElement& before, const SourceElement& after, Parallel& a,
               Parallel& b) const;
    bool meetInMiddle(Parallel& a, Parallel& b) const;
    bool trimToCrossing(Parallel& a, Parallel& b) const;
    void emit(const SourceElement* first, std::size_t count, Strands& strands);
    void makeRoom(Strands& strands) const;
    void emitElement(const Element& e, const SourceElement& of, OriginKind kind, bool goesOn,
                     Strands& strands);
    Element cornerArc(const SourceElement& before, const SourceElement& after) const;
    void endStrands(Index begin, Strands& strands);

    double m_distance = 0.0;
    double m_tolerance = 0.0;
    bool m_trims = true;
    double m_sweptArea = 0.0;
    std::vector<Parallel> m_parallels;
    const SourceElement* m_source = nullptr;  ///< the first element of the source
    MadeOf m_madeOf;
};

}  // namespace gmregion
