#include "MeltJob.h"

#include <cmath>

#include "KernelShapes.h"
#include "Measure.h"
#include "gmkernel/GmContour.h"

namespace gmpath {

namespace {

/// The areas of the loops may differ from those of the contours by this share.
constexpr double kAreaPrecision = 1e-6;

Path counterClockwise(const Path& path) {
    return sense(path) == Sense::kClockwise ? reversed(path) : path;
}

bool overlap(const Box& a, const Box& b) {
    return a.low.x <= b.high.x && b.low.x <= a.high.x && a.low.y <= b.high.y && b.low.y <= a.high.y;
}

/// Does more of the path lie inside the closed path `outer` than outside?
bool liesInside(const Path& path, const Path& outer) {
    std::size_t inside = 0;
    for (const Element& e : path.elements)
        inside += windingNumber(outer, halvingPoint(e)) != 0 ? 1 : 0;
    return 2 * inside > path.elements.size();
}

/// A loop follows one contour where it is inside the other one, or where it is outside. Its longest
/// element tells most surely.
LoopKind kindOf(const Path& loop, const Path& a, const Path& b) {
    const Element* longest = &loop.elements.front();
    for (const Element& e : loop.elements) {
        if (length(e) > length(*longest)) longest = &e;
    }
    const Vec2 p = halvingPoint(*longest);
    const Path& other = distance(a, p) < distance(b, p) ? b : a;
    return windingNumber(other, p) != 0 ? LoopKind::kCommon : LoopKind::kOutline;
}

bool areasAddUp(const std::vector<MeltLoop>& loops, const Path& a, const Path& b) {
    double sum = 0.0;
    for (const MeltLoop& loop : loops)
        sum += signedArea(loop.path);
    const double expected = signedArea(a) + signedArea(b);
    return std::abs(sum - expected) <= kAreaPrecision * expected;
}

/// What to say of contours whose boundaries give no loops.
MeltOutcome outcomeWithoutLoops(const Path& a, const Path& b) {
    if (liesInside(a, b)) return MeltOutcome::kFirstInside;
    return liesInside(b, a) ? MeltOutcome::kSecondInside : MeltOutcome::kApart;
}

MeltedPair melt(const Path& a, const Path& b) {
    MeltedPair pair{};
    GmContour kernelA;
    GmContour kernelB;
    pair.outcome = MeltOutcome::kFailed;
    if (!fillContour(kernelA, simplifiedForKernel(a))) return pair;
    if (!fillContour(kernelB, simplifiedForKernel(b))) return pair;
    const int count = kernelA.SplitContours(&kernelB);
    for (int i = 0; const GmContour* loop = kernelA.GetSubContour(i); ++i) {
        Path path = pathFromKernel(*loop, a.layer).path;
        const LoopKind kind = kindOf(path, a, b);
        pair.loops.push_back({kind, std::move(path)});
    }
    if (count == 0) pair.outcome = outcomeWithoutLoops(a, b);
    if (count > 0 && areasAddUp(pair.loops, a, b)) pair.outcome = MeltOutcome::kLoops;
    return pair;
}

}  // namespace

std::vector<MeltedPair> meltContours(const std::vector<Path>& first,
                                     const std::vector<Path>& second) {
    std::vector<MeltedPair> pairs;
    for (std::size_t i = 0; i < first.size(); ++i) {
        for (std::size_t j = 0; j < second.size(); ++j) {
            if (sense(first[i]) == Sense::kNone || sense(second[j]) == Sense::kNone) continue;
            if (!overlap(boundingBox(first[i]), boundingBox(second[j]))) continue;
            MeltedPair pair = melt(counterClockwise(first[i]), counterClockwise(second[j]));
            pair.first = i;
            pair.second = j;
            pairs.push_back(std::move(pair));
        }
    }
    return pairs;
}

}  // namespace gmpath
