// SPDX-License-Identifier: MIT
#include "drawing/ReadReport.h"

#include <algorithm>
#include <array>

#include "drawing/Text.h"

namespace gmdrawing {

bool isOutlineKind(std::string_view kind) {
    constexpr std::array<std::string_view, 26> kOthers = {
        "TEXT",      "MTEXT",        "ATTDEF",  "ATTRIB",     "RTEXT",       "ARCALIGNEDTEXT",
        "DIMENSION", "LEADER",       "TABLE",   "TOLERANCE",  "MULTILEADER", "HATCH",
        "SOLID",     "TRACE",        "WIPEOUT", "IMAGE",      "OLEFRAME",    "OLE2FRAME",
        "POINT",     "XLINE",        "RAY",     "ACAD_TABLE", "text",        "image",
        "flowRoot",  "foreignObject"};
    return std::find(kOthers.begin(), kOthers.end(), kind) == kOthers.end();
}

std::string kindText(const SkippedKind& kind, std::size_t count) {
    return std::to_string(count) + " " + printable(kind.kind) + " on layer " +
           printable(kind.layer) + ": " + kind.reason;
}

std::string kindsText(const SkipCounts& counts) {
    std::string text;
    for (const auto& [kind, count] : counts)
        text += (text.empty() ? "" : "; ") + kindText(kind, count);
    return text;
}

}  // namespace gmdrawing
