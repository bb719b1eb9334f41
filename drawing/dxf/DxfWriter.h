// SPDX-License-Identifier: MIT
#pragma once

#include <string>

#include "drawing/ResultDrawing.h"

namespace gmdrawing {

/// Writes the drawing as DXF: polylines with bulges, the sources (unless results take their place)
/// on layer SOURCE, every pass on its layer with a colour of its own.
/// Returns false when the file cannot be written as a whole. Throws InputError when the locale does
/// not allow it (`requirePlainNumbers`).
bool writeDxf(const ResultDrawing& drawing, const std::string& fileName);

}  // namespace gmdrawing
