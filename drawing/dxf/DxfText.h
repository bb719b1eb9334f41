// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <string_view>

namespace gmdrawing {

/// The text of a DXF file in UTF-8. Files of old hold bytes of the code page that their header
/// names; any file may write characters as \U+XXXX. Bytes that stand for no character stay.
std::string plainDxfText(std::string_view text);

}  // namespace gmdrawing
