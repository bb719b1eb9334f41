#include "apps/gmpath/ShapeCommandLine.h"

namespace gmpath {

namespace {

void addOutputs(CLI::App& command, std::vector<std::string>& outputs) {
    command.add_option("-o,--output", outputs, "output file (.svg or .dxf), repeatable")
        ->required()
        ->allow_extra_args(false);
}

}  // namespace

CLI::App* addCorners(CLI::App& program, CornersOptions& options) {
    CLI::App* corners =
        program.add_subcommand("corners", "Round or chamfer the corners of a part drawing");
    CLI::Option* radius =
        corners->add_option("--radius", options.radius, "round them with this radius");
    CLI::Option* chamfer =
        corners->add_option("--chamfer", options.chamfer, "chamfer them, this far from the corner");
    corners
        ->add_option("--chamfer-length", options.chamferLength,
                     "chamfer them, with a chamfer of this length")
        ->excludes(radius)
        ->excludes(chamfer);
    chamfer->excludes(radius);
    CLI::Option* convex = corners->add_flag_callback(
        "--convex", [&options] { options.choice = CornerChoice::kConvex; },
        "only corners that turn with their closed contour");
    corners
        ->add_flag_callback(
            "--concave", [&options] { options.choice = CornerChoice::kConcave; },
            "only corners that turn against it")
        ->excludes(convex);
    corners->add_option("--bend", options.bend, "joints that bend by fewer degrees are no corners")
        ->capture_default_str();
    addOutputs(*corners, options.outputs);
    corners->footer("Example: gmpath corners bracket.dxf --radius 2 --convex -o rounded.dxf");
    return corners;
}

CLI::App* addMelt(CLI::App& program, MeltOptions& options) {
    CLI::App* melt =
        program.add_subcommand("melt", "Melt the overlapping contours of two part drawings");
    addOutputs(*melt, options.outputs);
    melt->footer("Example: gmpath melt plate.dxf boss.dxf -o outline.dxf -o outline.svg");
    return melt;
}

}  // namespace gmpath
