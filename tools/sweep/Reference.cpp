// SPDX-License-Identifier: MIT
#include "Reference.h"

#include "gmregion/Offset.h"
#include "gmregion/Questions.h"

namespace sweep {

using namespace gmregion;

namespace {

/// Tolerances by which the result of a rounded part and the reference may be off, each.
constexpr double kTolerances = 4.0;

}  // namespace

std::optional<Reference> referenceOf(const RegionSet& exact, double d, double rounding,
                                     Workspace& workspace) {
    const double h = rounding + kTolerances * exact.tolerance();
    Outcome below;
    Outcome same;
    Outcome above;
    if (!offset(exact, d - h, {}, workspace, below) || !offset(exact, d, {}, workspace, same) ||
        !offset(exact, d + h, {}, workspace, above))
        return std::nullopt;
    Reference reference;
    const double slack =
        kTolerances * exact.tolerance() * (perimeter(below.regions) + perimeter(above.regions));
    reference.leastArea = area(below.regions) - slack;
    reference.mostArea = area(above.regions) + slack;
    const std::size_t loops = same.regions.loops().size();
    if (same.marginal.empty() && below.regions.loops().size() == loops &&
        above.regions.loops().size() == loops)
        reference.loops = loops;
    return reference;
}

}  // namespace sweep
