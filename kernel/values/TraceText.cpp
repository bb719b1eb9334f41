// SPDX-License-Identifier: MIT
#include "kernel/values/TraceText.h"

#include <wx/string.h>

namespace gmkernel_detail {

std::string coordinatesText(double x, double y, double z) {
    return wxString::Format("(%0.5f, %0.5f, %0.5f)", x, y, z).ToStdString();
}

std::string stretchText(double spX, double spY, double epX, double epY) {
    return wxString::Format("line (%0.5f, %0.5f) - (%0.5f, %0.5f)", spX, spY, epX, epY)
        .ToStdString();
}

std::string circleText(double mX, double mY, double r) {
    return wxString::Format("circ (%0.5f, %0.5f) R = %0.5f", mX, mY, r).ToStdString();
}

std::string arcText(std::string const& kind, bool clockwise, double spX, double spY, double epX,
                    double epY, double mX, double mY) {
    return wxString::Format("%s%d (%0.5f, %0.5f) - (%0.5f, %0.5f) mp (%0.5f, %0.5f)", kind,
                            clockwise ? 2 : 3, spX, spY, epX, epY, mX, mY)
        .ToStdString();
}

std::string offsetPieceText(int id, std::string const& curve) {
    return wxString::Format("p-path %i %s", id, curve).ToStdString();
}

}  // namespace gmkernel_detail
