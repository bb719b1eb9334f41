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
        Index run;
        bool backward;
    };

    void gather(const Arrangement& arrangement, const Loops& loops, std::size_t loop);
    bool joins(const Item& a, const Item& b) const;
    bool sameOrigins(const Item& a, const Item& b) const;
    void join();
    bool returns(const Element& there, const Element& back) const;
    void dropSpikes();
    void emitLoop();
    void appendOrigins(const Item& item);
    bool nest();
    void arrange(RegionSet& set);

    const Arrangement* m_arrangement = nullptr;
    const Fans* m_fans = nullptr;
    const OriginSource* m_source = nullptr;
    std::vector<Item> m_items;
    std::vector<Item> m_joined;  ///< those of an element made one
    std::vector<Item> m_kept;    ///< without what goes there and back
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
