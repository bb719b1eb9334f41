// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/link/Loops.h"
#include "region/link/Nesting.h"
#include "region/link/OriginSource.h"

namespace gmregion {

/// Makes a set out of loops of runs, the only way in which sets come about.
class SetWriter {
public:
    /// Writes the loops into a set, whatever it was before. Pieces of one element that follow each
    /// other become one again. False, and an empty set, when loops do not nest; `conflict()` is a
    /// point near the cause then.
    bool write(const Arrangement& arrangement, const Fans& fans, const Loops& loops,
               const OriginSource& source, RegionSet& set);
    /// The area of the set written last.
    double area() const;
    Vec2 conflict() const { return m_nesting.conflict(); }

    /// Makes a set empty.
    static void clear(RegionSet& set, double tolerance);

private:
    /// An element on its way into the set.
    struct Item {
        Element element;
        Index tag;
        Half half;  ///< the run that it is a piece of, and its sense
    };

    void gather(const Loops& loops, std::size_t loop);
    double gatheredArea() const;
    bool joins(const Item& a, const Item& b) const;
    bool sameOrigins(const Item& a, const Item& b) const;
    bool join();
    bool returns(const Element& there, const Element& back) const;
    void dropSpikes();
    void emitLoop(const Loops& loops, std::size_t loop);
    void appendOrigins(const Item& item);
    bool nest();
    void handOver(RegionSet& set);
    void arrange(RegionSet& set);

    const Arrangement* m_arrangement = nullptr;
    const Fans* m_fans = nullptr;
    const OriginSource* m_source = nullptr;
    std::vector<Item> m_items;
    std::vector<Element> m_elements;
    std::vector<Index> m_ends;
    std::vector<double> m_areas;
    std::vector<Origin> m_origins;
    std::vector<Index> m_originEnds;
    std::vector<Element> m_halves;
    std::vector<Index> m_halfEnds;
    std::vector<Index> m_order;
    Nesting m_nesting;
};

}  // namespace gmregion
