// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace gmdrawing {

/// One group of a DXF text: a code and its value. The value points into the text.
struct DxfGroup {
    int code;
    std::string_view value;
};

/// Content of a file as text.
/// Throws InputError for a file that is missing, unreadable, no regular file, or empty.
std::string readFile(const std::string& fileName);

/// The groups of a DXF text up to its end mark. The values point into `text`.
/// Throws InputError when the text is binary, is no sequence of groups, holds no section of
/// entities, or stops before its end mark (a truncated file).
std::vector<DxfGroup> dxfGroups(std::string_view text);

}  // namespace gmdrawing
