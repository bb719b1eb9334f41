#pragma once

#include <optional>
#include <string>
#include <vector>

#include "apps/gmpath/Commands.h"
#include "region/corners/CornerJob.h"

namespace gmpath {

/// Options of `corners`; exactly one of the three sizes is given.
struct CornersOptions {
    InputOptions input;
    std::optional<double> radius;
    std::optional<double> chamfer;
    std::optional<double> chamferLength;
    CornerChoice choice = CornerChoice::kAll;
    double bend = 5.0;  ///< degrees; joints that bend by less are no corners
    std::vector<std::string> outputs;
};

/// Rounds or chamfers the corners of every contour, writes the outputs, and says how many corners
/// were done and how many have no room. Throws InputError for input, sizes and outputs that cannot
/// be used; then no output is written. False when the kernel refuses a contour, which then stays as
/// it is.
bool runCorners(const CornersOptions& options, const Console& console);

}  // namespace gmpath
