// SPDX-License-Identifier: MIT
#include "drawing/files/Libraries.h"

#include <dxflib/dl_dxf.h>
#include <boost/version.hpp>
#include <pugixml.hpp>

namespace gmdrawing {

std::string drawingLibraries() {
    constexpr int kThousand = 1000;
    constexpr int kTen = 10;
    std::string boost = BOOST_LIB_VERSION;
    for (char& c : boost) {
        if (c == '_') c = '.';
    }
    return std::string("dxflib ") + DL_VERSION + ", pugixml " +
           std::to_string(PUGIXML_VERSION / kThousand) + "." +
           std::to_string(PUGIXML_VERSION % kThousand / kTen) + ", Boost " + boost;
}

}  // namespace gmdrawing
