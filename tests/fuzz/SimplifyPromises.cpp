// SPDX-License-Identifier: MIT
#include "tests/fuzz/SimplifyPromises.h"

#include <algorithm>
#include <cmath>

#include "tests/support/PathDistance.h"

namespace gmregion::fuzz {

namespace {

double largestOf(const Paths& paths) {
    double largest = 0.0;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        for (const Element& e : paths[i])
            largest = std::max({largest, std::fabs(e.sp.x), std::fabs(e.sp.y), std::fabs(e.ep.x),
                                std::fabs(e.ep.y)});
    }
    return largest;
}

/// How many elements there are, those of more than half a turn counted twice: closed paths without
/// corners may start in their middles.
std::size_t divided(const PathView& path) {
    const auto isWide = [](const Element& e) { return std::fabs(e.bulge) > 1.0; };
    return path.size() + static_cast<std::size_t>(std::count_if(path.begin(), path.end(), isWide));
}

void checkChain(const PathView& path, Complaints& complaints) {
    for (const Element& e : path) {
        complaints.expect(std::isfinite(e.sp.x + e.sp.y + e.ep.x + e.ep.y + e.bulge),
                          "numbers of a path are finite");
    }
    for (std::size_t i = path.closed ? 0 : 1; i < path.size(); ++i) {
        const Element& before = path.first[i == 0 ? path.size() - 1 : i - 1];
        complaints.expect(before.ep == path.first[i].sp, "a path is connected bit by bit");
    }
}

void checkRanges(const PathView& path, const SourceRange* ranges, std::size_t elements,
                 Complaints& complaints) {
    for (std::size_t i = 0; i < path.size(); ++i) {
        complaints.expect(ranges[i].first < elements && ranges[i].last < elements,
                          "ranges name elements of the source");
        complaints.expect(path.closed || ranges[i].first <= ranges[i].last,
                          "ranges of open paths rise");
    }
}

void checkDistances(const PathView& source, const PathView& path, double tolerance, double rounding,
                    Complaints& complaints) {
    // Elements shorter than rounding are passed over, whatever their bulge.
    std::vector<Element> kept;
    std::copy_if(source.begin(), source.end(), std::back_inserter(kept), [&](const Element& e) {
        return std::hypot(e.ep.x - e.sp.x, e.ep.y - e.sp.y) > rounding;
    });
    const std::vector<Element> made(path.begin(), path.end());
    const double limit = tolerance + 1e-6 * tolerance + 16.0 * rounding;
    if (made.empty() || kept.empty()) return;
    const double ofResult = shapes::farthest(made, kept, 3);
    const double ofSource = shapes::farthest(kept, made, 3);
    complaints.expect(ofResult <= limit, "the result is near its source", ofResult / limit);
    complaints.expect(ofSource <= limit, "the source is near the result", ofSource / limit);
}

void checkRefusal(const Simplified& simplified, Complaints& complaints) {
    complaints.expect(simplified.paths.empty() && simplified.sources.empty(),
                      "a refusal goes without paths");
}

}  // namespace

void checkSimplified(const Paths& source, const SimplifyOptions& options,
                     const Simplified& simplified, Complaints& complaints) {
    if (simplified.refusal) return checkRefusal(simplified, complaints);
    const Paths& paths = simplified.paths;
    if (!complaints.expect(
            paths.size() == source.size() && paths.elementCount() == simplified.sources.size(),
            "a path for each of the source, a range for each element"))
        return;
    const double rounding = std::ldexp(largestOf(source), -44);
    std::size_t element = 0;
    for (std::size_t i = 0; i < paths.size(); ++i) {
        const PathView from = source[i];
        const PathView path = paths[i];
        complaints.expect(path.closed == from.closed && path.id == from.id,
                          "a path is open or closed like its source");
        complaints.expect(path.size() <= std::max<std::size_t>(divided(from), 2),
                          "a result has no more elements than its source",
                          double(path.size()) - double(from.size()));
        checkChain(path, complaints);
        checkRanges(path, simplified.sources.data() + element, from.size(), complaints);
        checkDistances(from, path, options.tolerance, rounding, complaints);
        element += path.size();
        if (path.closed || path.size() == 0) continue;
        complaints.expect(path.first->sp == from.first->sp && path.last[-1].ep == from.last[-1].ep,
                          "ends of open paths stay bit by bit");
    }
}

void checkCurve(const std::vector<TangentPoint>& points, bool closed, const Simplified& simplified,
                Complaints& complaints) {
    if (simplified.refusal) return checkRefusal(simplified, complaints);
    const Paths& paths = simplified.paths;
    if (!complaints.expect(paths.size() == 1 && paths.elementCount() == simplified.sources.size(),
                           "a curve gives one path, a range for each element"))
        return;
    const PathView path = paths[0];
    complaints.expect(path.closed == closed && path.id == 0, "the path has the number 0");
    checkChain(path, complaints);
    checkRanges(path, simplified.sources.data(), points.size() - (closed ? 0 : 1), complaints);
    if (closed || path.size() == 0) return;
    complaints.expect(path.first->sp == points.front().at && path.last[-1].ep == points.back().at,
                      "ends of open curves stay bit by bit");
}

}  // namespace gmregion::fuzz
