// SPDX-License-Identifier: MIT
#pragma once

#include "gmkernel/GmBase.h"

namespace gmkernel_detail {

/// The key of an ordered pair of kinds in the dispatch maps. Every type tag is below 301, so that
/// distinct pairs have distinct keys.
constexpr int pairKey(GmBase::eGmTypes first, GmBase::eGmTypes second) {
    constexpr int kBeyondAllTags = 301;
    static_assert(GmBase::eGmContour < kBeyondAllTags, "a type tag would collide");
    return static_cast<int>(first) * kBeyondAllTags + static_cast<int>(second);
}

}  // namespace gmkernel_detail
