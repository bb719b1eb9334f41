// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <ostream>
#include <string>
#include <vector>

#include "part/model/Path.h"

namespace gmpath {

/// Tells what there is to say about a drawing, one line a remark: "gmpath: FILE: text". Remarks
/// that differ in their numbers and contours alone are alike: more than three of them become one
/// line with their count and the first three. Remarks are written in their order when the report
/// ends.
class Report {
public:
    /// `subject` is the name of the drawing, or of what else the remarks are about. `contours`,
    /// which must live as long as this, are those that remarks may name.
    Report(std::ostream& stream, const std::string& subject,
           const std::vector<gmpart::Path>& contours);
    ~Report();
    Report(const Report&) = delete;
    Report& operator=(const Report&) = delete;

    /// A remark about the drawing as a whole.
    void tell(const std::string& text);

    /// A remark about a contour, by index, which is named with its layer and place. Nothing is
    /// written for an empty text.
    void tell(std::size_t contour, const std::string& text);

private:
    struct Group {
        std::string key;
        std::vector<std::string> first;  ///< at most three
        std::size_t count = 0;
    };

    void add(const std::string& key, const std::string& line);

    std::ostream& m_stream;
    std::string m_prefix;
    const std::vector<gmpart::Path>& m_contours;
    std::vector<Group> m_groups;
};

}  // namespace gmpath
