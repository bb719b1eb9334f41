// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Verify.h"

namespace gmregion {

/// Faults as they are found.
class FaultList {
public:
    explicit FaultList(Verdict& verdict) : m_verdict(&verdict) {}

    void add(FaultKind kind, Point at, double by, std::size_t element) {
        if (m_verdict->faults.size() < kKept) m_verdict->faults.push_back({kind, at, by, element});
        ++m_verdict->count;
    }

private:
    static constexpr std::size_t kKept = 100;
    Verdict* m_verdict;
};

}  // namespace gmregion
