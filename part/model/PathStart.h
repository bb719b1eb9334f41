// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>

#include "part/model/Path.h"

namespace gmpart {

/// A point of a path.
struct PathPlace {
    std::size_t element;
    Vec2 point;
};

/// The point of the path nearest to p, of equally near ones the first. The path has elements.
PathPlace nearestPlace(const Path& path, Vec2 p);

/// A closed path run from another of its points. The element there is split, unless the place lies
/// within ten times the kernel's tolerance of a joint, which then becomes the start.
Path startedAt(const Path& path, const PathPlace& place);

}  // namespace gmpart
