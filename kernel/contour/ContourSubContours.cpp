// SPDX-License-Identifier: MIT
/// @file
/// The sub-contours that operations leave in a contour.
///
/// The largest one is found in one pass: as enclosing carries over from box to box, the largest so
/// far stands for all before it. The pass gives up at the first two that do not enclose each other,
/// also where a later one would enclose both.
#include <limits>
#include <memory>

#include "gmkernel/GmContour.h"
#include "gmkernel/GmRect.h"
#include "kernel/contour/ContourElements.h"
#include "kernel/contour/GmContourArray.h"

using gmkernel_detail::chainStart;

namespace {

bool encloses(GmRect const& outer, GmRect const& inner) {
    return outer.Or(inner) == outer;
}

}  // namespace

GmContour* GmContour::GetSubContour_private(int index) const {
    if (!m_pSubConts || index < 0 || index >= m_pSubConts->GetCount()) return nullptr;
    return (*m_pSubConts)[index];
}

GmContour* GmContour::GetSubContour(int index) {
    return GetSubContour_private(index);
}

GmContour const* GmContour::GetSubContour(int index) const {
    return GetSubContour_private(index);
}

GmContour* GmContour::GetMaxSubContour() {
    GmContour* largest = nullptr;
    GmRect box;
    for (int i = 0; i < m_pSubConts->GetCount(); ++i) {
        GmContour* const candidate = (*m_pSubConts)[i];
        if (!candidate || candidate->ElementCount() == 0) continue;
        const GmRect candidateBox = candidate->BoundingRect();
        if (largest && encloses(box, candidateBox)) continue;
        if (largest && !encloses(candidateBox, box)) return nullptr;
        largest = candidate;
        box = candidateBox;
    }
    return largest;
}

GmContour* GmContour::GetNearSubContour(GmPoint const& p) {
    GmContour* nearest = nullptr;
    double dist = std::numeric_limits<double>::max();
    for (int i = 0; i < m_pSubConts->GetCount(); ++i) {
        GmContour* const candidate = (*m_pSubConts)[i];
        if (!candidate || candidate->ElementCount() == 0) continue;
        const double candidateDist = p.Dist(chainStart(*candidate));
        if (nearest && !(candidateDist < dist)) continue;
        nearest = candidate;
        dist = candidateDist;
    }
    return nearest;
}

void GmContour::CopyContourToSubContour() {
    auto copy = std::make_unique<GmContour>();
    for (int i = 0; i < ElementCount(); ++i) {
        copy->AddElement(GetElement(i), false, GetContElement(i)->lId);
    }
    RemoveAllSubConts();
    m_pSubConts->Take(std::move(copy));
}

void GmContour::RemoveAllSubConts() {
    for (int i = 0; i < m_pSubConts->GetCount(); ++i) {
        delete (*m_pSubConts)[i];
    }
    m_pSubConts->Clear();
}
