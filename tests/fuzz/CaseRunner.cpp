// SPDX-License-Identifier: MIT
#include "tests/fuzz/CaseRunner.h"

#include <algorithm>
#include <cmath>

#include "gmregion/Boolean.h"
#include "gmregion/Questions.h"
#include "gmregion/Verify.h"
#include "region/overlay/Intake.h"
#include "tests/fuzz/QuestionPromises.h"
#include "tests/fuzz/SimplifyPromises.h"

namespace gmregion::fuzz {

namespace {

/// In slacks of operands: what areas of booleans and offsets may be off by. Points move by up to a
/// tolerance a round, and there are three.
constexpr double kAreaSlack = 8.0;
/// Sets of more elements are not worked on, so that cases stay small.
constexpr std::size_t kMostElements = 400;

constexpr Combination kCombinations[]{Combination::kUnion, Combination::kIntersection,
                                      Combination::kDifference, Combination::kSymmetricDifference};

/// Whether elements are long enough and nest is asked of the set. Sides within the tolerance of
/// each other may be left by crossings of either with a third one.
void complain(const Verdict& verdict, double tolerance, Complaints& complaints) {
    for (const Fault& fault : verdict.faults) {
        if (fault.kind != FaultKind::kShort && fault.kind != FaultKind::kCrossing &&
            fault.kind != FaultKind::kNesting)
            complaints.expect(false, textOf(fault.kind), fault.by / tolerance);
    }
}

/// In distances: sets of a smaller size may be lost on the way out and back.
constexpr double kSmall = 1e-6;
/// Up to here numbers are far from the largest that are taken.
constexpr double kFar = 1e9;

double sizeOf(const RegionSet& set) {
    const std::optional<Bounds> box = bounds(set);
    return box ? std::max(box->high.x - box->low.x, box->high.y - box->low.y) : 0.0;
}

/// Whether a set is neither small beside a distance nor out of the usual range.
bool isUsual(const RegionSet& set, double distance) {
    const double size = sizeOf(set);
    return set.empty() || (size >= kSmall * std::fabs(distance) && size <= kFar);
}

}  // namespace

CaseRunner::CaseRunner(const FuzzCase& fuzzCase)
    : m_case(fuzzCase), m_sizes(pathSizes(fuzzCase.heaps)) {}

const std::vector<std::string>& CaseRunner::run() {
    for (const Heap& heap : m_case.heaps)
        cleanUpHeap(heap);
    for (const Step& step : m_case.steps)
        take(step);
    return m_complaints.broken();
}

void CaseRunner::take(const Step& step) {
    const RegionSet first = m_made[step.first % m_made.size()];
    const RegionSet second = m_made[step.second % m_made.size()];
    const Heap& heap = m_case.heaps[step.first % m_case.heaps.size()];
    if (first.elements().size() + second.elements().size() > kMostElements) return;
    switch (step.task) {
        case Task::kCombine:
            return combineBoth(first, second, step);
        case Task::kUniteAll:
            return uniteMade();
        case Task::kOffset:
            return offsetOne(first, step);
        case Task::kOffsetSeries:
            return offsetMany(first, step);
        case Task::kThicken:
            return thickenHeap(heap, step);
        case Task::kOpened:
            return openOrClose(first, step.size, true);
        case Task::kClosed:
            return openOrClose(first, step.size, false);
        case Task::kQuestions:
            m_complaints.begin("questions");
            return checkQuestions(first, step.at, m_complaints);
        case Task::kSimplify:
            return simplifyHeap(heap, step);
        case Task::kSimplifyCurve:
            return simplifyPoints(heap, step);
    }
}

/// Checks an outcome and keeps its set for the steps to come.
bool CaseRunner::accept(const Outcome& outcome, bool answered) {
    checkOutcome(outcome, answered, m_complaints);
    if (!answered) {
        m_refusals.push_back(outcome.refusal.reason);
        return false;
    }
    checkSet(outcome.regions, m_sizes, m_complaints);
    m_made.push_back(outcome.regions);
    return true;
}

void CaseRunner::cleanUpHeap(const Heap& heap) {
    m_complaints.begin("clean-up");
    Outcome outcome;
    const bool answered = cleanUp(heap.paths, heap.options, m_workspace, outcome);
    m_complaints.expect(isSame(outcome.regions, cleanUp(heap.paths, heap.options).regions),
                        "results do not depend on the workspace");
    if (accept(outcome, answered))
        cleanUpAgain(outcome.regions);
    else
        m_made.push_back({});  // so that there is something to take for every step
}

void CaseRunner::cleanUpAgain(const RegionSet& set) {
    m_complaints.begin("clean-up again");
    Paths paths;
    for (const Loop& loop : set.loops())
        paths.add(set.elements().data() + loop.first, set.elements().data() + loop.last, true, 0);
    Outcome again;
    const CleanUpOptions options{FillRule::kPositive, set.tolerance()};
    if (set.empty()) return;
    const bool answered = cleanUp(paths, options, m_workspace, again);
    checkOutcome(again, answered, m_complaints);
    const double slack = kAreaSlack * slackOf(set);
    const double change = std::fabs(area(again.regions) - area(set));
    if (answered) m_complaints.expect(change <= slack, "it keeps the area", change / slack);
    // A default tolerance may be the least that is allowed, up to rounding.
    if (again.refusal.reason == Reason::kTolerance || !isRoomy(set) || !isUsual(set, 0.0)) return;
    m_complaints.expect(answered, "it is not refused");
    m_complaints.expect(again.regions.loops().size() == set.loops().size(), "it keeps the loops");
    m_complaints.expect(again.regions.elements().size() == set.elements().size(),
                        "it keeps the elements");
}

void CaseRunner::combineBoth(const RegionSet& a, const RegionSet& b, const Step& step) {
    const double tolerance = std::max(a.tolerance(), b.tolerance());
    std::vector<Outcome> all(std::size(kCombinations));
    std::size_t answers = 0;
    for (std::size_t i = 0; i < all.size(); ++i) {
        m_complaints.begin("boolean");
        const bool answered = combine(a, b, kCombinations[i], m_workspace, all[i]);
        checkOutcome(all[i], answered, m_complaints);
        if (!answered) {
            m_refusals.push_back(all[i].refusal.reason);
            continue;
        }
        ++answers;
        checkSet(all[i].regions, m_sizes, m_complaints);
        m_complaints.begin("verified boolean");
        complain(verifyBoolean(a, b, kCombinations[i], all[i].regions), tolerance, m_complaints);
    }
    m_complaints.begin("areas of booleans");
    if (answers == all.size()) checkAreas(a, b, all);
    const Outcome& kept = all[static_cast<unsigned>(step.first + step.second) % all.size()];
    if (!kept.refusal) m_made.push_back(kept.regions);
}

void CaseRunner::checkAreas(const RegionSet& a, const RegionSet& b,
                            const std::vector<Outcome>& all) {
    const double tolerance = std::max(a.tolerance(), b.tolerance());
    const double slack =
        kAreaSlack * tolerance * (perimeter(a) + perimeter(b) + kAreaSlack * tolerance);
    const double both = area(all[0].regions);
    const double common = area(all[1].regions);
    const auto expect = [&](double off, const char* what) {
        m_complaints.expect(std::fabs(off) <= slack, what, off / slack);
    };
    expect(both + common - area(a) - area(b), "union and common part are both operands");
    expect(area(all[2].regions) + common - area(a), "difference and common part are the first");
    expect(area(all[3].regions) - both + common, "what is in one alone is the rest");
}

void CaseRunner::uniteMade() {
    m_complaints.begin("union of all");
    std::vector<RegionSet> sets;
    double tolerance = 0.0;
    double slack = 0.0;
    double largest = 0.0;
    double sum = 0.0;
    for (const RegionSet& made : m_made) {
        tolerance = std::max(tolerance, made.tolerance());
        largest = std::max(largest, area(made));
        sum += area(made);
        slack += perimeter(made);
        sets.push_back(made);
    }
    Outcome outcome;
    const bool answered = uniteAll(sets.data(), sets.size(), m_workspace, outcome);
    if (!accept(outcome, answered)) return;
    slack = kAreaSlack * tolerance * (slack + kAreaSlack * tolerance);
    const double found = area(outcome.regions);
    m_complaints.expect(found >= largest - slack && found <= sum + slack,
                        "a union covers what its sets cover", (found - largest) / slack);
}

void CaseRunner::offsetOne(const RegionSet& source, const Step& step) {
    m_complaints.begin("offset");
    Outcome outcome;
    const bool answered = offset(source, step.size, step.offset, m_workspace, outcome);
    m_complaints.expect(isSame(outcome.regions, offset(source, step.size, step.offset).regions),
                        "results do not depend on the workspace");
    checkOffset(source, step.size, step.offset, outcome, answered);
}

void CaseRunner::offsetMany(const RegionSet& source, const Step& step) {
    m_complaints.begin("offset series");
    const std::vector<double> distances{step.size, 2.0 * step.size, -step.size};
    std::vector<Outcome> outcomes(distances.size());
    const bool answered = offsetSeries(source, distances.data(), distances.size(), step.offset,
                                       m_workspace, outcomes.data());
    for (std::size_t i = 0; i < distances.size(); ++i) {
        checkOffset(source, distances[i], step.offset, outcomes[i], !outcomes[i].refusal);
        if (!outcomes[i].refusal) continue;
        m_complaints.expect(!answered, "a series with a refusal is not answered");
        return;
    }
    m_complaints.expect(answered, "a series without a refusal is answered");
}

void CaseRunner::checkOffset(const RegionSet& source, double distance, const OffsetOptions& options,
                             const Outcome& outcome, bool answered) {
    if (!accept(outcome, answered) || !isUsual(source, distance)) return;
    const double slack = kAreaSlack * (slackOf(source) + slackOf(outcome.regions));
    const double growth = area(outcome.regions) - area(source);
    m_complaints.expect(distance < 0.0 ? growth <= slack : growth >= -slack,
                        "outward grows, inward shrinks", growth / slack);
    m_complaints.begin("verified offset");
    complain(verifyOffset(source, distance, outcome.regions, options), source.tolerance(),
             m_complaints);
}

void CaseRunner::thickenHeap(const Heap& heap, const Step& step) {
    m_complaints.begin("thickening");
    const double tolerance = heap.options.tolerance;
    Outcome outcome;
    const bool answered =
        thicken(heap.paths, step.size, tolerance, step.offset, m_workspace, outcome);
    accept(outcome, answered);
}

void CaseRunner::openOrClose(const RegionSet& source, double radius, bool opens) {
    m_complaints.begin(opens ? "opening" : "closing");
    Outcome outcome;
    const bool answered = opens ? opened(source, radius, m_workspace, outcome)
                                : closed(source, radius, m_workspace, outcome);
    if (!accept(outcome, answered) || !isUsual(source, radius)) return;
    const double slack = kAreaSlack * (slackOf(source) + slackOf(outcome.regions));
    const double growth = area(outcome.regions) - area(source);
    m_complaints.expect(opens ? growth <= slack : growth >= -slack,
                        "opening takes away, closing adds", growth / slack);
}

void CaseRunner::simplifyHeap(const Heap& heap, const Step& step) {
    m_complaints.begin("simplify");
    SimplifyOptions options = step.simplify;
    options.tolerance = step.size;
    Simplified simplified;
    const bool answered = simplify(heap.paths, options, simplified);
    m_complaints.expect(answered == !simplified.refusal, "no result means a refusal");
    checkSimplified(heap.paths, options, simplified, m_complaints);
}

void CaseRunner::simplifyPoints(const Heap& heap, const Step& step) {
    m_complaints.begin("simplify curve");
    std::vector<TangentPoint> points;
    for (std::size_t i = 0; i < heap.paths.size(); ++i) {
        for (const Element& e : heap.paths[i])
            points.push_back({e.sp, {e.ep.x - e.sp.x, e.ep.y - e.sp.y}});
    }
    SimplifyOptions options = step.simplify;
    options.tolerance = step.size;
    const bool isClosed = step.second % 2 != 0;
    Simplified simplified;
    const bool answered =
        simplifyCurve(points.data(), points.size(), isClosed, options, simplified);
    m_complaints.expect(answered == !simplified.refusal, "no result means a refusal");
    checkCurve(points, isClosed, simplified, m_complaints);
}

}  // namespace gmregion::fuzz
