// SPDX-License-Identifier: MIT
#include "machining/moves/MoveRecorder.h"

namespace gmmachining {

using gmpart::Path;
using gmregion::kKernelTolerance;
using gmregion::Vec2;

MoveRecorder::MoveRecorder(double safeZ) : m_safeZ(safeZ) {
    lift();
}

void MoveRecorder::rapidTo(Vec2 p) {
    if (m_placed && distance(m_place, p) < kKernelTolerance) return;
    lift();
    follow(MoveKind::kRapid, {{{m_place, p}}, false, {}});
}

void MoveRecorder::plungeTo(double z) {
    moveTo(MoveKind::kPlunge, z);
}

void MoveRecorder::follow(MoveKind kind, const Path& path) {
    if (path.elements.empty()) return;
    m_moves.push_back({kind, path, m_z, m_contour});
    m_place = path.elements.back().ep;
    m_placed = true;
}

void MoveRecorder::lift() {
    if (m_z != m_safeZ) moveTo(MoveKind::kRapid, m_safeZ);
}

void MoveRecorder::moveTo(MoveKind kind, double z) {
    m_moves.push_back({kind, {}, z, m_contour});
    m_z = z;
}

}  // namespace gmmachining
