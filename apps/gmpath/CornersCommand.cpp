#include "apps/gmpath/CornersCommand.h"

#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "drawing/files/OutputFiles.h"

namespace gmpath {

namespace {

constexpr int kLegendDigits = 6;
constexpr double kHalfTurn = 180.0;

CornerRequest requestOf(const CornersOptions& options) {
    if (!(options.bend > 0.0 && options.bend < kHalfTurn)) {
        throw InputError("--bend: not a number above 0 and below 180");
    }
    const auto of = [&](CornerKind kind, double value, const std::string& option) {
        checkPositive(value, option);
        return CornerRequest{kind, value, options.choice, options.bend / kHalfTurn * kPi};
    };
    if (options.radius) return of(CornerKind::kRounding, *options.radius, "--radius");
    if (options.chamfer) return of(CornerKind::kChamferDistance, *options.chamfer, "--chamfer");
    if (!options.chamferLength) {
        throw InputError("give one of --radius, --chamfer, --chamfer-length");
    }
    return of(CornerKind::kChamferLength, *options.chamferLength, "--chamfer-length");
}

PassName nameOf(const CornerRequest& request) {
    const std::string value = formatReal(request.value, kLegendDigits);
    const bool rounds = request.kind == CornerKind::kRounding;
    return {(rounds ? "rounded by " : "chamfer ") + value, ""};
}

/// What is to be told about a contour, empty when all went well.
std::string remark(const CornerResult& result) {
    if (!result.accepted) return "the kernel cannot take it over";
    if (result.notDone == 0) return {};
    return "no room at " + std::to_string(result.notDone) + " of " +
           counted(result.done + result.notDone, "corner");
}

}  // namespace

bool runCorners(const CornersOptions& options, const Console& console) {
    const CornerRequest request = requestOf(options);
    checkOutputs(options.outputs, options.input.drawing);
    const Part part = readInput(options.input, console);
    ResultDrawing drawing{part.contours, {}, {nameOf(request)}, {}, true};
    const std::vector<CornerResult> results = breakCorners(part.contours, request);
    for (const CornerResult& result : results)
        drawing.results.push_back({{0, result.path, !result.accepted}});
    writeOutputs(drawing, options.outputs);

    std::size_t done = 0;
    std::size_t notDone = 0;
    bool accepted = true;
    for (std::size_t i = 0; i < results.size(); ++i) {
        done += results[i].done;
        notDone += results[i].notDone;
        accepted = accepted && results[i].accepted;
        const std::string text = remark(results[i]);
        if (text.empty()) continue;
        console.err << "gmpath: " << printable(options.input.drawing) << ": contour " << i + 1
                    << ": " << text << "\n";
    }
    console.out << counted(results.size(), "contour") << ", " << counted(done, "corner")
                << " done, " << notDone << " not done\n";
    return accepted;
}

}  // namespace gmpath
