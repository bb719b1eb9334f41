#include "kernel/contour/transitions/FilletCircle.h"

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace gmkernel_detail {

namespace {

GmCircle filletAfter(GmStretch const& first, GmCurve const& second, double r) {
    if (second.IsStretch())
        return GmCircle(first.Inverted(), static_cast<GmStretch const&>(second), r);
    if (second.IsArc()) return GmCircle(static_cast<GmArc const&>(second), first, r, false, false);
    return GmCircle();
}

GmCircle filletAfter(GmArc const& first, GmCurve const& second, double r) {
    if (second.IsStretch())
        return GmCircle(first, static_cast<GmStretch const&>(second), r, true, false);
    if (second.IsArc()) return GmCircle(first, static_cast<GmArc const&>(second), r, false);
    return GmCircle();
}

}  // namespace

GmCircle filletCircle(GmCurve const& first, GmCurve const& second, double r) {
    if (first.IsStretch()) return filletAfter(static_cast<GmStretch const&>(first), second, r);
    if (first.IsArc()) return filletAfter(static_cast<GmArc const&>(first), second, r);
    return GmCircle();
}

}  // namespace gmkernel_detail
