#pragma once

#include <string>

#include "OffsetDrawing.h"

namespace gmpath {

/// Writes the drawing as DXF: polylines with bulges, the sources on layer SOURCE, every pass on a
/// layer of its own (OFFSET_1, OFFSET_2, ...) with its own colour.
/// Returns false when the file cannot be written as a whole.
bool writeDxf(const OffsetDrawing& drawing, const std::string& fileName);

}  // namespace gmpath
