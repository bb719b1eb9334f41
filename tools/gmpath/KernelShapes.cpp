#include "KernelShapes.h"

#include "gmkernel/GmArc.h"
#include "gmkernel/GmStretch.h"

namespace gmpath {

GmPoint kernelPoint(Vec2 p) {
    return {p.x, p.y};
}

Vec2 fromKernel(const GmPoint& p) {
    return {p.X(), p.Y()};
}

std::unique_ptr<GmCurve> kernelCurve(const Element& e) {
    const GmPoint sp = kernelPoint(e.sp);
    const GmPoint ep = kernelPoint(e.ep);
    if (!isArc(e)) return std::make_unique<GmStretch>(sp, ep);
    const auto rot = e.bulge > 0.0 ? GmBase::eRotCCW : GmBase::eRotCW;
    return std::make_unique<GmArc>(sp, ep, kernelPoint(centre(e)), rot);
}

}  // namespace gmpath
