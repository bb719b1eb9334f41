// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Boolean.h"
#include "region/locate/BoundaryIndex.h"
#include "region/verify/FaultList.h"

namespace gmregion {

/// Checks a boolean against its operands, all as plain loops.
class BooleanVerifier {
public:
    /// @param tolerance in length units, positive
    void verify(const LoopsView& first, const LoopsView& second, Combination combination,
                const LoopsView& result, double tolerance, FaultList& faults);

private:
    bool isWanted(Vec2 p) const;
    bool isClear(Vec2 p) const;
    void checkPoint(Vec2 p, std::size_t element);
    void checkBeside(const BoundaryPiece& piece);
    void checkResultPiece(const BoundaryPiece& piece);
    void checkAreas(const LoopsView& first, const LoopsView& second, const LoopsView& result);
    Vec2 pointOff(const Element& part, const BoundaryIndex& other) const;
    double commonArea(const BoundaryIndex& inner, const BoundaryIndex& outer, bool withShared,
                      Vec2 about) const;

    Combination m_combination = Combination::kUnion;
    double m_tolerance = 0.0;
    double m_margin = 0.0;
    BoundaryIndex m_first;
    BoundaryIndex m_second;
    BoundaryIndex m_result;
    FaultList* m_faults = nullptr;
};

}  // namespace gmregion
