// SPDX-License-Identifier: MIT
#pragma once

#include "part/model/Path.h"

namespace gmpart {

/// How often a closed path runs round p, counter-clockwise positive. 0 means outside. Points on
/// the path itself count to one of the sides that meet there.
int windingNumber(const Path& path, Vec2 p);

}  // namespace gmpart
