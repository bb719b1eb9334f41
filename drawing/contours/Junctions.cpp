// SPDX-License-Identifier: MIT
/// @file
/// Which ends of open paths belong together.
///
/// Ends within the tolerance are at one place, and so are those that a row of such ends connects.
/// At a place the pairs are joined by how straight they go on, the straightest first: a line that
/// another one touches goes on as one line. Straightness is compared in steps, and equal ones by
/// position, so that the result depends on the drawing and not on the order in which it is written.
/// It does not look ahead: a choice here may leave an end free elsewhere.

#include "drawing/contours/Junctions.h"

#include <algorithm>
#include <numeric>
#include <tuple>
#include <unordered_map>

#include "drawing/InputError.h"
#include "drawing/Text.h"
#include "region/search/PointGrid.h"

namespace gmdrawing {

using gmpart::Path;
using gmregion::Element;
using gmregion::PointGrid;
using gmregion::Vec2;

namespace {

constexpr std::size_t kMaxEndsAtOnePlace = 200;

/// A path shorter than this many tolerances does not go round anything.
constexpr double kShortestRound = 3.0;

/// Straightness is compared in steps of this size, so that rounding decides nothing.
constexpr double kStraightnessStep = 1e-9;

/// What is needed to know of an end.
struct EndView {
    Vec2 p;
    Vec2 direction;  ///< unit, from the end into its path
    Vec2 halfWay;    ///< halving point of the outermost element
};

EndView viewOf(const std::vector<Path>& paths, PathEnd end) {
    const std::vector<Element>& elements = paths[pathOf(end)].elements;
    const Element e = isStart(end) ? elements.front() : reversed(elements.back());
    return {e.sp, tangentStart(e), halvingPoint(e)};
}

/// Disjoint sets of ends.
class Places {
public:
    explicit Places(std::size_t count) : m_parent(count) {
        std::iota(m_parent.begin(), m_parent.end(), std::size_t{0});
    }
    std::size_t find(std::size_t i) {
        while (m_parent[i] != i)
            i = m_parent[i] = m_parent[m_parent[i]];
        return i;
    }
    void unite(std::size_t a, std::size_t b) { m_parent[find(a)] = find(b); }

private:
    std::vector<std::size_t> m_parent;
};

[[noreturn]] void failCrowded(Vec2 p) {
    throw InputError("more than " + counted(kMaxEndsAtOnePlace, "end") + " meet at (" +
                     formatReal(p.x, 6) + ", " + formatReal(p.y, 6) +
                     "), the join tolerance is too wide");
}

/// Sets of ends that are at one place, each with at least two members.
std::vector<std::vector<PathEnd>> endsByPlace(const std::vector<Path>& paths,
                                              const std::vector<EndView>& ends, double tolerance) {
    PointGrid grid(tolerance);
    Places places(ends.size());
    for (PathEnd end = 0; end < ends.size(); ++end) {
        std::size_t near = 0;
        grid.visitNear(ends[end].p, [&](PathEnd other) {
            if (distance(ends[end].p, ends[other].p) > tolerance) return;
            if (paths[pathOf(end)].layer != paths[pathOf(other)].layer) return;
            if (++near > kMaxEndsAtOnePlace) failCrowded(ends[end].p);
            places.unite(end, other);
        });
        grid.add(ends[end].p, end);
    }
    std::unordered_map<std::size_t, std::vector<PathEnd>> byPlace;
    for (PathEnd end = 0; end < ends.size(); ++end)
        byPlace[places.find(end)].push_back(end);
    std::vector<std::vector<PathEnd>> result;
    for (auto& entry : byPlace) {
        if (entry.second.size() > kMaxEndsAtOnePlace) failCrowded(ends[entry.first].p);
        if (entry.second.size() > 1) result.push_back(std::move(entry.second));
    }
    return result;
}

struct Pair {
    PathEnd a;
    PathEnd b;
    double bend;  ///< 0 straight on, 2 for a turn back, in steps
    Vec2 first;   ///< the smaller of the two halving points
    Vec2 second;  ///< the larger one
};

bool straighter(const Pair& p, const Pair& q) {
    return std::tie(p.bend, p.first, p.second) < std::tie(q.bend, q.first, q.second);
}

bool mayJoin(const std::vector<Path>& paths, PathEnd a, PathEnd b, double tolerance) {
    return pathOf(a) != pathOf(b) || length(paths[pathOf(a)]) > kShortestRound * tolerance;
}

std::vector<Pair> pairsOf(const std::vector<Path>& paths, const std::vector<EndView>& ends,
                          const std::vector<PathEnd>& place, double tolerance) {
    std::vector<Pair> pairs;
    for (std::size_t i = 0; i < place.size(); ++i) {
        for (std::size_t j = i + 1; j < place.size(); ++j) {
            if (!mayJoin(paths, place[i], place[j], tolerance)) continue;
            const EndView& a = ends[place[i]];
            const EndView& b = ends[place[j]];
            const double bend = 1.0 + dot(a.direction, b.direction);
            pairs.push_back({place[i], place[j], std::round(bend / kStraightnessStep),
                             std::min(a.halfWay, b.halfWay), std::max(a.halfWay, b.halfWay)});
        }
    }
    std::sort(pairs.begin(), pairs.end(), straighter);
    return pairs;
}

}  // namespace

std::vector<std::optional<PathEnd>> joinEnds(const std::vector<Path>& paths, double tolerance) {
    std::vector<EndView> ends;
    for (PathEnd end = 0; end < 2 * paths.size(); ++end)
        ends.push_back(viewOf(paths, end));

    std::vector<std::optional<PathEnd>> joined(ends.size());
    for (const std::vector<PathEnd>& place : endsByPlace(paths, ends, tolerance)) {
        for (const Pair& pair : pairsOf(paths, ends, place, tolerance)) {
            if (joined[pair.a] || joined[pair.b]) continue;
            joined[pair.a] = pair.b;
            joined[pair.b] = pair.a;
        }
    }
    return joined;
}

}  // namespace gmdrawing
