// SPDX-License-Identifier: MIT
/// @file
/// Offsets tried in several positions until one stands the check.
///
/// Where an offset fails in the kernel, it does so by rounding: a side that is nearly upright, a
/// short first element, arcs that nearly vanish. The same path turned, begun elsewhere or offset in
/// two steps meets other roundings, and the check, which shares no code with the kernel, tells when
/// it comes out right. So the first sound result is taken, and the least faulty one otherwise. It
/// is a net under single failures: where the method itself has no answer, as beside a path that
/// crosses itself, no attempt helps. Cost: one offset and one check an attempt, at most eight.

#include "region/offset/CheckedOffset.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <numeric>

#include "region/model/Box.h"
#include "region/model/Placement.h"

namespace gmregion {

namespace {

/// How a path is put before the kernel.
struct Attempt {
    double angle;            ///< turned by, in radians
    std::size_t joint;       ///< begun at: 0 as given, 1 the best joint, 2 the second best ...
    double shortest;         ///< elements below this length are left out
    bool inSteps = false;    ///< a small part of the distance first, then the rest
    bool flattened = false;  ///< with segments for the flattest arcs
};

constexpr double kShorter = 1e-3;
constexpr double kShortestOfAll = 2.5e-3;

/// The angles and their differences are no simple fractions of a right angle: sides that are
/// upright, level or at 45 degrees in one attempt are far from it in the others.
///
/// In two steps, arcs about corners become elements of the intermediate path. So the second step
/// finds results that consist of arcs about corners alone, which the kernel leaves out otherwise.
constexpr std::array<Attempt, 8> kAttempts = {{
    {0.0, 0, kShortestForKernel},
    {0.3517, 1, kShortestForKernel},
    {-0.6143, 1, kShortestForKernel, true},
    {0.0, 0, kShorter},
    {1.2093, 2, kShortestForKernel},
    {0.3517, 1, kShorter},
    {0.3517, 1, kShortestForKernel, false, true},
    {0.8801, 3, kShortestOfAll},
}};

/// Arcs that leave their chord by less are flattened; within the tolerance of the check.
constexpr double kFlatSagitta = 4e-4;

/// Results with ends no farther apart, in tolerances of the check, are closed.
constexpr double kClosableGap = 5.0;

/// The elements of a closed path in the order in which to begin there: first those that are long
/// and come after a long one.
std::vector<std::size_t> jointsByLength(const Path& path) {
    const std::size_t count = path.elements.size();
    std::vector<double> lengths(count);
    for (std::size_t i = 0; i < count; ++i) {
        const Element& before = path.elements[(i + count - 1) % count];
        lengths[i] = std::min(length(before), length(path.elements[i]));
    }
    std::vector<std::size_t> joints(count);
    std::iota(joints.begin(), joints.end(), std::size_t{0});
    std::stable_sort(joints.begin(), joints.end(),
                     [&](std::size_t a, std::size_t b) { return lengths[a] > lengths[b]; });
    return joints;
}

/// The element at which to begin.
std::size_t startOf(const Path& path, const Attempt& attempt) {
    if (!path.closed || attempt.joint == 0 || path.elements.empty()) return 0;
    const std::vector<std::size_t> joints = jointsByLength(path);
    return joints[(attempt.joint - 1) % joints.size()];
}

/// The first of two steps: an eighth of the distance, or of the path's smaller side, so that the
/// bays of the path are still open after it.
double firstStep(const Path& path, double d) {
    const Vec2 size = boundingBox(path).size();
    constexpr double kPart = 0.125;
    return std::copysign(kPart * std::min({std::abs(d), size.x, size.y}), d);
}

/// Offsets every result of the first step by the rest of the distance.
KernelOffset offsetInSteps(const Path& path, double d, const Attempt& attempt) {
    const double first = firstStep(path, d);
    const KernelOffset between = offsetByKernel(path, first, attempt.shortest);
    KernelOffset offset;
    offset.refusal = between.refusal;
    for (std::size_t i = 0; i < between.results.size(); ++i) {
        KernelOffset rest = offsetByKernel(between.results[i], d - first, attempt.shortest);
        if (offset.accepted()) offset.refusal = rest.refusal;
        for (std::size_t k = 0; k < rest.results.size(); ++k) {
            for (std::size_t& origin : rest.origins[k])
                origin = between.origins[i][origin];
            offset.results.push_back(std::move(rest.results[k]));
            offset.origins.push_back(std::move(rest.origins[k]));
        }
    }
    return offset;
}

bool isFlat(const Element& e) {
    return isArc(e) && distance(halvingPoint(e), middle(e.sp, e.ep)) < kFlatSagitta;
}

void flatten(Path& path) {
    for (Element& e : path.elements) {
        if (isFlat(e)) e.bulge = 0.0;
    }
}

KernelOffset offsetAs(const Attempt& attempt, const Path& source, double d) {
    const Box box = boundingBox(source);
    const Vec2 about = middle(box.low, box.high);
    const std::size_t start = startOf(source, attempt);
    Path placed = Placement::turning(attempt.angle, about).apply(source);
    std::rotate(placed.elements.begin(),
                placed.elements.begin() + static_cast<std::ptrdiff_t>(start),
                placed.elements.end());
    if (attempt.flattened) flatten(placed);
    KernelOffset offset = attempt.inSteps ? offsetInSteps(placed, d, attempt)
                                          : offsetByKernel(placed, d, attempt.shortest);
    const Placement back = Placement::turning(-attempt.angle, about);
    for (Path& path : offset.results)
        path = back.apply(path);
    for (std::vector<std::size_t>& origins : offset.origins) {
        for (std::size_t& origin : origins)
            origin = (origin + start) % source.elements.size();
    }
    return offset;
}

void closeGap(Path& path, double closable) {
    const double gap = distance(path.elements.back().ep, path.elements.front().sp);
    if (path.closed || path.elements.size() < 2 || gap > closable) return;
    path.closed = true;
    meetEnds(path);
}

/// The closed results, among them those that all but close.
KernelOffset closedOnes(const KernelOffset& offset, double closable) {
    KernelOffset closed;
    for (std::size_t i = 0; i < offset.results.size(); ++i) {
        Path path = offset.results[i];
        closeGap(path, closable);
        if (!path.closed) continue;
        closed.results.push_back(std::move(path));
        closed.origins.push_back(offset.origins[i]);
    }
    return closed;
}

CheckedOffset checkedAs(const Attempt& attempt, const Path& source, double d) {
    CheckedOffset found{offsetAs(attempt, source, d)};
    if (!found.offset.accepted()) return found;
    found.fault = checkOffset(source, d, found.offset.results);
    if (found.fault != OffsetFault::kOpen) return found;
    KernelOffset closed = closedOnes(found.offset, kClosableGap * checkTolerance(source));
    if (checkOffset(source, d, closed.results) != OffsetFault::kNone) return found;
    return {std::move(closed)};
}

/// An offset without results comes after any other.
bool isBetter(const CheckedOffset& a, const CheckedOffset& b) {
    if (a.offset.results.empty() != b.offset.results.empty()) return !a.offset.results.empty();
    return a.fault < b.fault;
}

bool hasShorter(const Path& path, double shortest) {
    return std::any_of(path.elements.begin(), path.elements.end(),
                       [&](const Element& e) { return length(e) < shortest; });
}

/// False for attempts that cannot differ from others, or that suit closed paths only.
bool isWorthwhile(const Attempt& attempt, const Path& source) {
    if (attempt.inSteps) return source.closed;
    if (attempt.flattened) {
        return std::any_of(source.elements.begin(), source.elements.end(), isFlat);
    }
    return attempt.shortest == kShortestForKernel || hasShorter(source, attempt.shortest);
}

}  // namespace

CheckedOffset offsetChecked(const Path& source, double d) {
    CheckedOffset best;
    int attempts = 0;
    for (const Attempt& attempt : kAttempts) {
        if (!isWorthwhile(attempt, source)) continue;
        CheckedOffset found = checkedAs(attempt, source, d);
        const bool first = ++attempts == 1;
        const bool sound = found.offset.accepted() && found.fault == OffsetFault::kNone;
        if (first || sound || (found.offset.accepted() && isBetter(found, best))) {
            best = std::move(found);
        }
        if (sound || !best.offset.accepted()) break;
    }
    best.attempts = attempts;
    return best;
}

}  // namespace gmregion
