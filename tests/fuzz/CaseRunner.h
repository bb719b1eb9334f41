// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

#include "gmregion/Outcome.h"
#include "gmregion/Workspace.h"
#include "tests/fuzz/Complaints.h"
#include "tests/fuzz/FuzzCase.h"
#include "tests/fuzz/SetPromises.h"

namespace gmregion::fuzz {

/// Runs a case and asks everything that comes out for what it must hold. One workspace goes from
/// one operation to the next.
class CaseRunner {
public:
    explicit CaseRunner(const FuzzCase& fuzzCase);

    /// Broken promises; none is what should be.
    const std::vector<std::string>& run();
    /// Reasons of refusals of all operations.
    const std::vector<Reason>& refusals() const { return m_refusals; }

private:
    void cleanUpHeap(const Heap& heap);
    void cleanUpAgain(const RegionSet& set);
    void take(const Step& step);
    bool accept(const Outcome& outcome, bool answered);
    void combineBoth(const RegionSet& a, const RegionSet& b, const Step& step);
    void checkAreas(const RegionSet& a, const RegionSet& b, const std::vector<Outcome>& all);
    void uniteMade();
    void offsetOne(const RegionSet& source, const Step& step);
    void offsetMany(const RegionSet& source, const Step& step);
    void checkOffset(const RegionSet& source, double distance, const OffsetOptions& options,
                     const Outcome& outcome, bool answered);
    void thickenHeap(const Heap& heap, const Step& step);
    void openOrClose(const RegionSet& source, double radius, bool opens);
    void simplifyHeap(const Heap& heap, const Step& step);
    void simplifyPoints(const Heap& heap, const Step& step);

    const FuzzCase& m_case;
    PathSizes m_sizes;
    Complaints m_complaints;
    std::vector<Reason> m_refusals;
    Workspace m_workspace;
    std::vector<RegionSet> m_made;
};

}  // namespace gmregion::fuzz
