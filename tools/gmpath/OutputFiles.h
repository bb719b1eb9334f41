#pragma once

#include <string>
#include <vector>

#include "OffsetDrawing.h"

namespace gmpath {

/// Checks the names of the files to write before any work is done. Throws InputError for an ending
/// other than .svg or .dxf, for a name given twice, for the name of the drawing that is read, and
/// where no file can be created.
void checkOutputs(const std::vector<std::string>& names, const std::string& inputName);

/// Writes the drawing to every name, in the format of its ending. All files are written beside
/// their places first and renamed when all are complete. Throws InputError when one cannot be
/// written.
void writeOutputs(const OffsetDrawing& drawing, const std::vector<std::string>& names);

}  // namespace gmpath
