// SPDX-License-Identifier: MIT
#pragma once

#include <functional>
#include <string>
#include <vector>

#include "drawing/ResultDrawing.h"
#include "drawing/files/AtomicFile.h"

namespace gmdrawing {

/// How a file with a certain ending, in small letters, is written.
struct OutputFormat {
    std::string ending;
    std::function<void(AtomicFile& file)> write;
};

/// The ending of a file name with its point, in small letters.
std::string endingOf(const std::string& name);

/// Checks the names of the files to write before any work is done. Throws InputError for an ending
/// that is none of those given, for a name given twice, for the name of the drawing that is read,
/// and where no file can be created.
void checkOutputs(const std::vector<std::string>& names, const std::string& inputName,
                  const std::vector<std::string>& endings = {".svg", ".dxf"});

/// Writes every name in the format of its ending, which is one of those given. All files are
/// written beside their places first and renamed when all are complete. Throws InputError when one
/// cannot be written.
void writeOutputs(const std::vector<OutputFormat>& formats, const std::vector<std::string>& names);

/// The same for a part and what came of it, as .svg or .dxf.
void writeOutputs(const ResultDrawing& drawing, const std::vector<std::string>& names);

}  // namespace gmdrawing
