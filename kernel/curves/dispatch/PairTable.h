// SPDX-License-Identifier: MIT
#pragma once

#include <array>
#include <cstddef>

#include "gmkernel/GmBase.h"

namespace gmkernel_detail {

/// Functions for ordered pairs of kinds, found by their type tags in constant time.
template <class Function>
class PairTable {
public:
    void enter(GmBase::eGmTypes first, GmBase::eGmTypes second, Function function) {
        m_functions[placeOf(first)][placeOf(second)] = function;
    }
    /// Null for a pair that was not entered.
    Function find(GmBase::eGmTypes first, GmBase::eGmTypes second) const {
        return m_functions[placeOf(first)][placeOf(second)];
    }

private:
    static constexpr std::size_t kNoPlace = 0;  ///< nothing is entered for kinds without a place
    static constexpr std::size_t kPlaces = 8;

    static std::size_t placeOf(GmBase::eGmTypes tag) {
        switch (tag) {
            case GmBase::eGmPoint:
                return 1;
            case GmBase::eGmLine:
                return 2;
            case GmBase::eGmBeam:
                return 3;
            case GmBase::eGmStretch:
                return 4;
            case GmBase::eGmCircle:
                return 5;
            case GmBase::eGmArc:
                return 6;
            case GmBase::eGmContour:
                return 7;
            default:
                return kNoPlace;
        }
    }

    std::array<std::array<Function, kPlaces>, kPlaces> m_functions{};
};

}  // namespace gmkernel_detail
