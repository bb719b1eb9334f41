#pragma once

#include <memory>

#include "Element.h"
#include "gmkernel/GmCurve.h"
#include "gmkernel/GmPoint.h"

namespace gmpath {

GmPoint kernelPoint(Vec2 p);
Vec2 fromKernel(const GmPoint& p);

/// The element as a segment or an arc of the kernel; undefined when it is too short for one.
std::unique_ptr<GmCurve> kernelCurve(const Element& e);

}  // namespace gmpath
