// SPDX-License-Identifier: MIT
/// @file
/// Corners by the kernel's transitions.
///
/// Each is made on a copy, which takes the place of the contour when there is room. Linear in the
/// elements for each corner.

#include "part/kernel/CornerBreaker.h"

#include "gmbridge/Curves.h"

namespace gmpart {

namespace {

GmContour::eTransType kernelType(CornerKind kind) {
    switch (kind) {
        case CornerKind::kChamferDistance:
            return GmContour::eTransChamferDist;
        case CornerKind::kChamferLength:
            return GmContour::eTransChamferLength;
        case CornerKind::kRounding:
            break;
    }
    return GmContour::eTransRadius;
}

/// The element that a contour made itself, of a contour whose other elements it did not; -1 when
/// there is none.
int insertedElement(const GmContour& contour) {
    for (int i = 0; i < contour.ElementCount(); ++i) {
        if (contour.GetContElement(i)->bInserted) return i;
    }
    return -1;
}

}  // namespace

CornerBreaker::CornerBreaker(const Path& path)
    : m_source(simplifiedForKernel(path)), m_refusal(fillContour(m_contour, m_source)) {}

bool CornerBreaker::breakCorner(std::size_t index, CornerKind kind, double value,
                                const CornerRoom& room) {
    GmContour attempt(m_contour);
    const int first = static_cast<int>(index);
    const Vec2 corner = gmbridge::planePoint(attempt.GetElement(first)->EP());
    if (!attempt.AddTrans(kernelType(kind), first, value, true)) return false;
    const int made = insertedElement(attempt);
    if (made < 0 || !room.allows(attempt, made, corner)) return false;
    m_contour = attempt;
    return true;
}

Path CornerBreaker::result() const {
    return pathFromKernel(m_contour, m_source.path.layer).path;
}

}  // namespace gmpart
