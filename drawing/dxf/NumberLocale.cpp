// SPDX-License-Identifier: MIT
#include "drawing/dxf/NumberLocale.h"

#include <sstream>

#include "drawing/InputError.h"

namespace gmdrawing {

namespace {

bool readsPlainNumbers() {
    std::istringstream stream("1.5");
    double value = 0.0;
    stream >> value;
    return value == 1.5;
}

bool writesPlainNumbers() {
    std::ostringstream stream;
    stream << 12345;
    return stream.str() == "12345";
}

}  // namespace

void requirePlainNumbers() {
    if (readsPlainNumbers() && writesPlainNumbers()) return;
    throw InputError(
        "the locale of the process has numbers that a drawing cannot have: set the "
        "classic locale");
}

}  // namespace gmdrawing
