// SPDX-License-Identifier: MIT
#pragma once

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

    /// For the operations of this library.
    Scratch& scratch() { return *m_scratch; }

private:
    std::unique_ptr<Scratch> m_scratch;
};

}  // namespace gmregion
