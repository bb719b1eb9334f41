// SPDX-License-Identifier: MIT
#pragma once

#include <vector>

#include "region/model/Element.h"
#include "region/model/Index.h"

namespace gmregion {

/// How often something runs round, for each of two sets.
struct Weight {
    int a = 0;
    int b = 0;
};
inline Weight operator+(Weight v, Weight w) {
    return {v.a + w.a, v.b + w.b};
}
inline Weight operator-(Weight v, Weight w) {
    return {v.a - w.a, v.b - w.b};
}
inline bool operator==(Weight v, Weight w) {
    return v.a == w.a && v.b == w.b;
}

/// A chain of elements each of which starts where the one before ends, bit by bit.
struct Strand {
    Index first;  ///< number of its first element
    Index last;   ///< behind its last element
    bool closed;  ///< the first starts where the last ends
    Weight weight;
};

/// An element of a strand, with what is known about it.
struct StrandElement : Element {
    Index tag = 0;        ///< the number of whoever made it, handed on to its pieces
    bool joined = false;  ///< it meets the next one nowhere but in their common end
};

/// Elements in strands, each turning by half a turn at the most and none without length.
struct Strands {
    std::vector<StrandElement> elements;
    std::vector<Strand> strands;

    void clear() {
        elements.clear();
        strands.clear();
    }
    /// Ends the strand of all elements since the last one; nothing when there are none.
    void endStrand(bool closed, Weight weight) {
        const Index first = strands.empty() ? 0 : strands.back().last;
        const Index last = static_cast<Index>(elements.size());
        if (first < last) strands.push_back({first, last, closed, weight});
    }
};

}  // namespace gmregion
