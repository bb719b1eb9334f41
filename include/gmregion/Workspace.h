// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <memory>

#include "gmregion/export.h"

namespace gmregion {

struct Scratch;

/// The working memory of operations, kept from one call to the next.
///
/// Whoever calls often makes one for each thread and hands it to every call: after the first calls
/// nothing is allocated any more but results that grow. Results do not depend on it. It may be
/// moved; what has been moved from may only be destroyed or assigned to.
class GMREGION_EXPORT Workspace {
public:
    Workspace();
    ~Workspace();
    Workspace(Workspace&& other) noexcept;
    Workspace& operator=(Workspace&& other) noexcept;
    Workspace(const Workspace&) = delete;
    Workspace& operator=(const Workspace&) = delete;

    /// Limits the work of each call: the number of pairs of elements near each other that it may
    /// compare, further attempts included, 0 for no limit. A call that would need more is refused.
    /// A clean drawing needs a few pairs an element; a pair takes tenths of a microsecond.
    void setWorkLimit(std::uint64_t pairs) { m_workLimit = pairs; }

    /// For the operations of this library: the memory, at the beginning of a call.
    Scratch& begin();

private:
    std::unique_ptr<Scratch> m_scratch;
    std::uint64_t m_workLimit = 0;
};

}  // namespace gmregion
