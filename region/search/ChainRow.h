// SPDX-License-Identifier: MIT
#pragma once

#include <algorithm>
#include <cstddef>
#include <vector>

#include "region/model/Index.h"

namespace gmregion {

/// Which chain each of a row of elements belongs to, chains standing one after the other.
class ChainRow {
public:
    void clear() {
        m_chainOf.clear();
        m_ends.clear();
    }
    /// Ends a chain of all elements since the last one, up to that number.
    void endChain(Index last) {
        m_chainOf.resize(last, static_cast<Index>(m_ends.size()));
        m_ends.push_back(last);
    }
    Index chainOf(std::size_t element) const { return m_chainOf[element]; }

    /// Calls visit(chain, first, last) for the chains that a range of elements holds in part, with
    /// that part: one of them, or two at the ends of the range. Cost: constant.
    template <class Visit>
    void visitParts(std::size_t first, std::size_t last, const Visit& visit) const {
        const std::size_t middle = std::min<std::size_t>(last, m_ends[chainOf(first)]);
        visit(chainOf(first), first, middle);
        if (middle == last) return;
        const Index chain = chainOf(last - 1);
        visit(chain, chain == 0 ? std::size_t{0} : m_ends[chain - 1], last);
    }

private:
    std::vector<Index> m_chainOf;
    std::vector<Index> m_ends;
};

}  // namespace gmregion
