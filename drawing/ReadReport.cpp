// SPDX-License-Identifier: MIT
#include "drawing/ReadReport.h"

#include "drawing/Text.h"

namespace gmdrawing {

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
