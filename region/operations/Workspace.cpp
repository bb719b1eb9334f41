// SPDX-License-Identifier: MIT
#include "gmregion/Workspace.h"

#include "region/operations/Scratch.h"

namespace gmregion {

Workspace::Workspace() : m_scratch(std::make_unique<Scratch>()) {}
Workspace::~Workspace() = default;
Workspace::Workspace(Workspace&& other) noexcept = default;
Workspace& Workspace::operator=(Workspace&& other) noexcept = default;

}  // namespace gmregion
