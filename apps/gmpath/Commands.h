#pragma once

#include <ostream>
#include <string>
#include <vector>

#include "drawing/files/PartReader.h"
#include "region/offset/OffsetJob.h"

namespace gmpath {

/// The drawing to read, and how.
struct InputOptions {
    std::string drawing;
    ReadOptions read;
    bool strict = false;  ///< entities that cannot be used are an error
};

struct OffsetOptions {
    InputOptions input;
    double distance = 0.0;  ///< of the first pass
    double step = 0.0;      ///< from one pass to the next
    int count = 1;          ///< number of passes
    Side side = Side::kWaste;
    std::vector<std::string> outputs;
};

/// Streams of a command.
struct Console {
    std::ostream& out;
    std::ostream& err;
    bool showProgress = false;  ///< `err` is a terminal
};

/// Throws InputError, naming the option, for a value that is not positive and finite or beyond 1e9.
void checkPositive(double value, const std::string& option);

/// Reads the drawing and reports what of it cannot be used. Throws InputError for options and input
/// that cannot be used.
Part readInput(const InputOptions& options, const Console& console);

/// What is wrong with an offset, in words.
std::string faultText(const FaultyOffset& faulty);

/// Prints the table of contours. Throws InputError for input that cannot be used.
void runInfo(const InputOptions& options, const Console& console);

/// Offsets every contour and writes the outputs; contours that yield nothing are reported. Throws
/// InputError for input, distances and outputs that cannot be used; then no output is written.
/// False when some offset has a fault or could not be made; it is reported, the outputs are
/// written, and its results are dashed in pictures.
bool runOffset(const OffsetOptions& options, const Console& console);

}  // namespace gmpath
