// SPDX-License-Identifier: MIT
#include "gmkernel/GmArc.h"
#include "gmkernel/GmContour.h"
#include "gmkernel/GmLine.h"
#include "gmkernel/GmRect.h"
#include "gmkernel/GmStretch.h"
#include "kernel/contour/ContourElements.h"
#include "kernel/curves/VerifiedCast.h"

using gmkernel_detail::curveAs;

namespace {

/// Are both segments, or both arcs, and equal as such?
bool sameElement(GmCurve const& a, GmCurve const& b) {
    auto const* const stretchA = curveAs<GmStretch>(a);
    auto const* const stretchB = curveAs<GmStretch>(b);
    if (stretchA && stretchB) return *stretchA == *stretchB;
    auto const* const arcA = curveAs<GmArc>(a);
    auto const* const arcB = curveAs<GmArc>(b);
    return arcA && arcB && *arcA == *arcB;
}

}  // namespace

GmRect GmContour::BoundingRect() const {
    GmRect box;
    for (int i = 0; i < ElementCount(); ++i) {
        box = box.Or(GetElement(i)->BoundingRect());
    }
    return box;
}

bool GmContour::Element(GmPoint const& p, double eps) const {
    for (int i = 0; i < ElementCount(); ++i) {
        if (GetElement(i)->Element(p, eps)) return true;
    }
    return false;
}

bool GmContour::Element(GmPoint const& p) const {
    return Element(p, m_scdPrec);
}

GmPoint GmContour::GetHP(int index) {
    return gmkernel_detail::middleOf(GetElement(index));
}

GmLine GmContour::Tangent(GmPoint const& p) const {
    GmCurve const* const element = GetElement(LastPointElem(p));
    return element ? element->Tangent(p) : GmLine();
}

GmCurve* GmContour::GetParallel(double) const {
    return nullptr;
}

bool GmContour::operator==(GmContour const& other) const {
    if (this == &other) return true;
    if (ElementCount() != other.ElementCount()) return false;
    for (int i = 0; i < ElementCount(); ++i) {
        if (!sameElement(*GetElement(i), *other.GetElement(i))) return false;
    }
    return true;
}
