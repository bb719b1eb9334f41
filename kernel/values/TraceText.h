// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace gmkernel_detail {

// The trace texts of all classes, every number with five decimals.

/// "(x, y, z)"
std::string coordinatesText(double x, double y, double z);

/// "line (x, y) - (x, y)": start, end.
std::string stretchText(double spX, double spY, double epX, double epY);

/// "circ (x, y) R = r": centre, radius.
std::string circleText(double mX, double mY, double r);

/// "<kind><sense> (x, y) - (x, y) mp (x, y)": start, end, centre. The sense is 2 for clockwise
/// curves, else 3.
std::string arcText(std::string const& kind, bool clockwise, double spX, double spY, double epX,
                    double epY, double mX, double mY);

/// "p-path <id> <curve>" from an identifier and the text of a curve.
std::string offsetPieceText(int id, std::string const& curve);

}  // namespace gmkernel_detail
