#pragma once

#include "gmkernel/GmBase.h"

namespace gmkernel_detail {

/// The key of an ordered pair of kinds in the dispatch maps. Every type tag is below 301, so that
/// distinct pairs have distinct keys.
constexpr int pairKey(GmBase::eGmTypes first, GmBase::eGmTypes second) {
    constexpr int BEYOND_ALL_TAGS = 301;
    static_assert(GmBase::eGmContour < BEYOND_ALL_TAGS, "a type tag would collide");
    return static_cast<int>(first) * BEYOND_ALL_TAGS + static_cast<int>(second);
}

}  // namespace gmkernel_detail
