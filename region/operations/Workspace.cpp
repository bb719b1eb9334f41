// SPDX-License-Identifier: MIT
#include "gmregion/Workspace.h"

#include "region/operations/Scratch.h"

namespace gmregion {

Workspace::Workspace() : m_scratch(std::make_unique<Scratch>()) {}
Workspace::~Workspace() = default;
Workspace::Workspace(Workspace&& other) noexcept = default;
Workspace& Workspace::operator=(Workspace&& other) noexcept = default;

Scratch& Workspace::begin() {
    m_scratch->overlay.arrangement.allow(m_workLimit == 0 ? UINT64_MAX : m_workLimit);
    return *m_scratch;
}

}  // namespace gmregion
