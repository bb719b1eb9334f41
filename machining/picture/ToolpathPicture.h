// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "machining/ToolpathJob.h"

namespace gmmachining {

/// The moves of the tool's centre over the contours, as an SVG picture with y upwards: contours
/// black, cuts, leads and rapid moves in colours of their own, rapid moves dashed. A dot and an
/// arrow head mark start and direction of every cut, a circle every place where the tool goes down.
/// Of cuts on several levels the lowest is drawn. Offsets with a fault, which are not cut, are
/// dashed.
std::string svgOf(const std::vector<gmpart::Path>& contours, const ToolpathResult& result);

}  // namespace gmmachining
