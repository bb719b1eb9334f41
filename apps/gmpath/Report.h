// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <ostream>
#include <string>

namespace gmpath {

/// Writes what is to be told about a drawing, one line a remark: "gmpath: FILE: contour N: text".
class Report {
public:
    /// `subject` is the name of the drawing, or of what else the remarks are about.
    Report(std::ostream& stream, const std::string& subject);

    /// A remark about the drawing as a whole.
    void tell(const std::string& text) const;

    /// A remark about a contour, by index. Nothing is written for an empty text.
    void tell(std::size_t contour, const std::string& text) const;

private:
    std::ostream& m_stream;
    std::string m_prefix;
};

}  // namespace gmpath
