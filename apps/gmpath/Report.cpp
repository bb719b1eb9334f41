// SPDX-License-Identifier: MIT
#include "apps/gmpath/Report.h"

#include "drawing/Text.h"

namespace gmpath {

using gmdrawing::printable;

Report::Report(std::ostream& stream, const std::string& subject)
    : m_stream(stream), m_prefix("gmpath: " + printable(subject) + ": ") {}

void Report::tell(const std::string& text) const {
    m_stream << m_prefix << text << "\n";
}

void Report::tell(std::size_t contour, const std::string& text) const {
    if (!text.empty()) tell("contour " + std::to_string(contour + 1) + ": " + text);
}

}  // namespace gmpath
