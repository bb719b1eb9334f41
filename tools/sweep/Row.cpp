// SPDX-License-Identifier: MIT
#include "Row.h"

#include <algorithm>
#include <cmath>
#include <ostream>

#include "Reference.h"
#include "gmregion/CleanUp.h"
#include "gmregion/Offset.h"
#include "gmregion/Questions.h"
#include "gmregion/Verify.h"

namespace sweep {

using namespace gmregion;
using shapes::Drawing;
using shapes::DrawnPart;

namespace {

bool clean(const std::vector<shapes::Elements>& loops, Workspace& workspace, Outcome& outcome) {
    Paths paths;
    for (const shapes::Elements& loop : loops)
        paths.add(loop, true);
    return cleanUp(paths, {FillRule::kEvenOdd, 0.0}, workspace, outcome);
}

bool closes(const RegionSet& set) {
    const std::vector<Element>& elements = set.elements();
    return std::all_of(set.loops().begin(), set.loops().end(), [&](const Loop& loop) {
        for (std::uint32_t i = loop.first; i < loop.last; ++i) {
            const std::uint32_t next = i + 1 < loop.last ? i + 1 : loop.first;
            if (elements[i].ep != elements[next].sp) return false;
        }
        return true;
    });
}

/// The offsets of one part.
class PartSweep {
public:
    PartSweep(const DrawnPart& part, std::ostream& faults)
        : m_part(part), m_distances(distancesOf(part)), m_faults(faults) {
        m_row.distances = m_distances.size();
        for (const shapes::Elements& loop : part.loops)
            m_row.elements += loop.size();
        Outcome exact;
        clean(part.loops, m_workspace, exact);
        for (int decimals = kFewestDecimals; decimals <= kMostDecimals; ++decimals) {
            const double rounding = shapes::roundingOf({0, decimals, 0});
            for (const double d : m_distances)
                m_references.push_back(referenceOf(exact.regions, d, rounding, m_workspace));
        }
    }

    void run(const Drawing& drawing) {
        ++m_row.drawings;
        m_drawing = drawing;
        Outcome source;
        if (!clean(shapes::drawn(m_part, drawing), m_workspace, source)) {
            ++m_row.runs;
            report(m_row.refused, 0.0, textOf(source.refusal.reason));
            return;
        }
        for (std::size_t i = 0; i < m_distances.size(); ++i)
            compare(source.regions, i);
    }

    const Row& row() const { return m_row; }

private:
    void compare(const RegionSet& source, std::size_t index) {
        const double d = m_distances[index];
        ++m_row.runs;
        if (!offset(source, d, {}, m_workspace, m_outcome)) {
            report(m_row.refused, d, textOf(m_outcome.refusal.reason));
            return;
        }
        const RegionSet& result = m_outcome.regions;
        m_row.marginal += m_outcome.marginal.empty() ? 0 : 1;
        if (!closes(result)) report(m_row.open, d, "a loop is open");
        const auto decimals = static_cast<std::size_t>(m_drawing.decimals - kFewestDecimals);
        compare(result, m_references[decimals * m_distances.size() + index], d);
        const Verdict verdict = verifyOffset(source, d, result);
        if (!verdict.isSound()) report(m_row.unsound, d, textOf(verdict.faults.front().kind));
    }

    void compare(const RegionSet& result, const std::optional<Reference>& reference, double d) {
        if (!reference) {
            report(m_row.lost, d, "the exact part was refused");
            return;
        }
        const double covered = area(result);
        if (covered < reference->leastArea || covered > reference->mostArea)
            report(m_row.lost, d, "the area is wrong");
        else if (!reference->loops)
            ++m_row.hanging;
        else if (m_outcome.marginal.empty() && result.loops().size() != *reference->loops)
            report(m_row.lost, d, "the number of loops is wrong");
    }

    void report(std::size_t& count, double d, const char* what) {
        ++count;
        m_faults << m_part.name << ", " << m_drawing.degrees << " degrees, " << m_drawing.decimals
                 << " decimals, start " << m_drawing.start << ", distance " << d << ": " << what
                 << '\n';
    }

    const DrawnPart& m_part;
    std::vector<double> m_distances;
    std::ostream& m_faults;
    std::vector<std::optional<Reference>> m_references;  ///< by decimals, then by distances
    Workspace m_workspace;
    Outcome m_outcome;
    Drawing m_drawing;
    Row m_row;
};

}  // namespace

Row& operator+=(Row& sum, const Row& row) {
    sum.drawings += row.drawings;
    sum.runs += row.runs;
    sum.lost += row.lost;
    sum.open += row.open;
    sum.refused += row.refused;
    sum.unsound += row.unsound;
    sum.marginal += row.marginal;
    sum.hanging += row.hanging;
    return sum;
}

std::vector<double> distancesOf(const DrawnPart& part) {
    constexpr double kBeyond = 150.0;
    std::vector<double> lengths = part.lengths;
    lengths.insert(lengths.end(), {0.001, 0.01, 0.1, 0.3, 1.0, 3.7, kBeyond});
    std::sort(lengths.begin(), lengths.end());
    lengths.erase(std::unique(lengths.begin(), lengths.end()), lengths.end());
    std::vector<double> distances;
    for (const double d : lengths)
        distances.insert(distances.end(), {d, -d});
    return distances;
}

Row sweepPart(const DrawnPart& part, std::size_t every, std::ostream& faults) {
    PartSweep sweep(part, faults);
    constexpr std::size_t kDecimals = kMostDecimals - kFewestDecimals + 1;
    const std::size_t count = kTurns * kDecimals * shapes::startsOf(part);
    for (std::size_t i = 0; i < count; i += every) {
        const auto degrees = static_cast<double>(i % kTurns);
        const int decimals = kFewestDecimals + static_cast<int>(i / kTurns % kDecimals);
        sweep.run({degrees, decimals, i / (kTurns * kDecimals)});
    }
    return sweep.row();
}

}  // namespace sweep
