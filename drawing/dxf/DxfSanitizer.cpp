// SPDX-License-Identifier: MIT
/// @file
/// Making DXF safe for a reader that trusts it.
///
/// The DXF library takes counts, kinds and numbers as they come. So the text is taken apart into
/// records, and only those are written again that consist of known groups with sound numbers,
/// vertices under their polyline, with the counts that are true of them. What is left out is
/// counted with its reason, by block. Nothing is mended: an entity is taken as it is, or not at
/// all.

#include "drawing/dxf/DxfSanitizer.h"

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <initializer_list>
#include <optional>
#include <string_view>

#include "drawing/Text.h"

namespace gmdrawing {

using gmregion::Box;
using gmregion::Vec2;

namespace {

/// Coordinates beyond this leave too few digits for the kernel's tolerance.
constexpr double kLargestNumber = 1e9;

/// Longest name of a layer or block that is handed on.
constexpr std::size_t kLongestName = 255;

constexpr int kLayerCode = 8;

/// What an entity kind must and may hold, by group code.
struct EntityKind {
    std::string_view name;
    std::vector<int> required;
    std::vector<int> optional;
};

const std::vector<EntityKind>& usableKinds() {
    static const std::vector<EntityKind> kinds = {
        {"LINE", {10, 20, 11, 21}, {30, 31}},
        {"ARC", {10, 20, 40, 50, 51}, {30, 210, 220, 230}},
        {"CIRCLE", {10, 20, 40}, {30, 210, 220, 230}},
        {"LWPOLYLINE", {10, 20}, {70, 42, 38, 210, 220, 230}},
        {"POLYLINE", {}, {70, 210, 220, 230}},
        {"VERTEX", {10, 20}, {30, 42}},
        {"ELLIPSE", {10, 20, 11, 21, 40}, {30, 31, 41, 42, 210, 220, 230}},
        {"SPLINE", {}, {70, 71, 10, 20, 30, 40, 41, 11, 21, 31, 12, 22, 13, 23}},
        {"INSERT", {2, 10, 20}, {41, 42, 50, 70, 71, 44, 45, 210, 220, 230}},
        {"BLOCK", {2}, {10, 20}},
    };
    return kinds;
}

bool isNameCode(int code) {
    return code == 2 || code == kLayerCode;
}
bool isIntegerCode(int code) {
    return code == 70 || code == 71;
}

/// Parts of other entities, and windows onto the drawing from its sheet.
bool isNoEntityOfItsOwn(std::string_view kind) {
    return kind == "VERTEX" || kind == "SEQEND" || kind == "VIEWPORT";
}

/// A run of groups that starts with the entity's kind.
struct Record {
    std::string_view kind;
    const DxfGroup* first = nullptr;  ///< first group behind the kind
    const DxfGroup* last = nullptr;   ///< one behind the last group

    std::string_view value(int code) const {
        const auto* found =
            std::find_if(first, last, [&](const DxfGroup& g) { return g.code == code; });
        return found == last ? std::string_view{} : trimmed(found->value).substr(0, kLongestName);
    }
    auto count(int code) const {
        return std::count_if(first, last, [&](const DxfGroup& g) { return g.code == code; });
    }
    bool has(int code) const {
        return std::any_of(first, last, [&](const DxfGroup& g) { return g.code == code; });
    }
    int integer(int code) const { return parseInteger(value(code)).value_or(0); }
    std::string layer() const { return has(kLayerCode) ? std::string(value(kLayerCode)) : "0"; }
};

std::vector<Record> recordsOf(const std::vector<DxfGroup>& groups) {
    std::vector<Record> records;
    for (const DxfGroup& group : groups) {
        if (group.code == 0) records.push_back({trimmed(group.value), &group + 1, &group + 1});
        if (group.code != 0 && !records.empty()) records.back().last = &group + 1;
    }
    return records;
}

bool contains(const std::vector<int>& codes, int code) {
    return std::find(codes.begin(), codes.end(), code) != codes.end();
}

bool isHandedOn(const EntityKind& kind, int code) {
    return code == kLayerCode || contains(kind.required, code) || contains(kind.optional, code);
}

bool isSound(const DxfGroup& group) {
    if (isNameCode(group.code)) return true;
    if (isIntegerCode(group.code)) return parseInteger(group.value).has_value();
    const std::optional<double> number = parseReal(group.value);
    return number && std::abs(*number) <= kLargestNumber;
}

/// Why the record cannot be used, empty when it can.
std::string fault(const EntityKind& kind, const Record& record) {
    for (const int code : kind.required) {
        if (record.value(code).empty()) return "incomplete";
    }
    const auto broken = [&](const DxfGroup& g) { return isHandedOn(kind, g.code) && !isSound(g); };
    if (std::any_of(record.first, record.last, broken)) return "broken number";
    if (record.integer(67) == 1) return "in the paper space";
    if (record.integer(60) == 1) return "hidden";
    constexpr int kMeshFlags = 16 | 64;
    const bool mesh = kind.name == "POLYLINE" && (record.integer(70) & kMeshFlags) != 0;
    return mesh ? "a mesh" : "";
}

/// A box about all points of a record, grown by its radius; empty without points, and for a block
/// reference, which says little about its extent.
Box boxOf(const Record& record) {
    constexpr int kFirstX = 10;
    constexpr int kLastX = 18;
    constexpr int kToY = 10;
    Box box;
    if (record.kind == "INSERT") return box;
    for (const DxfGroup* g = record.first; g != record.last && g + 1 != record.last; ++g) {
        const bool isPoint = g->code >= kFirstX && g->code <= kLastX && g[1].code == g->code + kToY;
        const auto x = parseReal(g->value);
        const auto y = parseReal(g[1].value);
        if (!isPoint || !x || !y) continue;
        box.include(Vec2{*x, *y});
    }
    return box.grown(std::abs(parseReal(record.value(40)).value_or(0.0)));
}

class Sanitizer {
public:
    explicit Sanitizer(std::vector<Record> records) : m_records(std::move(records)) {}

    SanitizedDrawing run() {
        while (m_next < m_records.size()) {
            const Record& record = m_records[m_next++];
            if (record.kind == "SECTION") {
                enterSection(record);
            } else if (m_inside) {
                take(record);
            }
        }
        write("0", "EOF");
        return std::move(m_result);
    }

private:
    void enterSection(const Record& record) {
        const std::string_view name = record.value(2);
        m_inside = name == "BLOCKS" || name == "ENTITIES";
        m_block.clear();
    }

    void take(const Record& record) {
        if (record.kind == "ENDSEC" || record.kind == "EOF") {
            m_inside = false;
        } else if (record.kind == "ENDBLK") {
            write("0", "ENDBLK");
            m_block.clear();
        } else if (record.kind == "POLYLINE") {
            takePolyline(record);
        } else if (!isNoEntityOfItsOwn(record.kind)) {
            takeEntity(record);
        }
    }

    void takeEntity(const Record& record) {
        const EntityKind* kind = usableKind(record.kind);
        if (kind == nullptr) return skip(record, "kind cannot be used");
        if (record.kind == "BLOCK") m_block = std::string(record.value(2));
        const std::string reason = fault(*kind, record);
        if (reason.empty() || record.kind == "BLOCK") {
            write(*kind, record);
        } else {
            skip(record, reason);
        }
    }

    /// A polyline stands and falls with its vertices, which follow as records of their own.
    void takePolyline(const Record& polyline) {
        std::vector<const Record*> vertices;
        while (m_next < m_records.size() && m_records[m_next].kind == "VERTEX") {
            vertices.push_back(&m_records[m_next++]);
        }
        std::string reason = fault(*usableKind("POLYLINE"), polyline);
        const EntityKind& vertexKind = *usableKind("VERTEX");
        for (const Record* vertex : vertices) {
            if (reason.empty()) reason = fault(vertexKind, *vertex);
        }
        if (!reason.empty()) return skip(polyline, reason);
        write(*usableKind("POLYLINE"), polyline);
        constexpr int kSplineFrameFlag = 16;
        for (const Record* vertex : vertices) {
            if ((vertex->integer(70) & kSplineFrameFlag) == 0) write(vertexKind, *vertex);
        }
        write("0", "SEQEND");
    }

    static const EntityKind* usableKind(std::string_view name) {
        const auto& kinds = usableKinds();
        const auto found = std::find_if(kinds.begin(), kinds.end(),
                                        [&](const EntityKind& k) { return k.name == name; });
        return found == kinds.end() ? nullptr : &*found;
    }

    void skip(const Record& record, const std::string& reason) {
        const std::string kind(record.kind.substr(0, kLongestName));
        ++m_result.skipped[m_block][{kind, record.layer(), reason}];
        if (isOutlineKind(kind)) {
            m_result.places[m_block].push_back({kind, record.layer(), boxOf(record)});
        }
    }

    void write(const EntityKind& kind, const Record& record) {
        write("0", record.kind);
        writeCounts(record);
        noteHeights(record);
        for (const DxfGroup* g = record.first; g != record.last; ++g) {
            if (isHandedOn(kind, g->code)) writeValue(*g);
        }
    }

    /// The library takes the counts of vertices, knots and points before any of them.
    void writeCounts(const Record& record) {
        if (record.kind == "LWPOLYLINE") write("90", std::to_string(record.count(10)));
        if (record.kind != "SPLINE") return;
        write("72", std::to_string(record.count(40)));
        write("73", std::to_string(record.count(10)));
        write("74", std::to_string(record.count(11)));
    }

    void noteHeights(const Record& record) {
        if (record.kind == "BLOCK" || record.kind == "INSERT") return;
        for (const DxfGroup* g = record.first; g != record.last; ++g) {
            if (g->code != 30 && g->code != 31 && g->code != 38) continue;
            const double z = parseReal(g->value).value_or(0.0);
            m_result.lowest = m_anyHeight ? std::min(m_result.lowest, z) : z;
            m_result.highest = m_anyHeight ? std::max(m_result.highest, z) : z;
            m_anyHeight = true;
        }
    }

    void writeValue(const DxfGroup& group) {
        std::string value(trimmed(group.value).substr(0, kLongestName));
        if (!isNameCode(group.code)) {
            value = formatReal(parseReal(group.value).value_or(0.0), kAllDigits);
        }
        write(std::to_string(group.code), value);
    }

    void write(std::string_view code, std::string_view value) {
        m_result.text.append(code).append("\n").append(value).append("\n");
    }

    static constexpr int kAllDigits = 17;

    std::vector<Record> m_records;
    std::size_t m_next = 0;
    bool m_inside = false;  ///< inside a section that holds entities
    std::string m_block;    ///< block being defined, empty in the drawing itself
    bool m_anyHeight = false;
    SanitizedDrawing m_result;
};

}  // namespace

SanitizedDrawing sanitizedDrawing(const std::vector<DxfGroup>& groups) {
    return Sanitizer(recordsOf(groups)).run();
}

}  // namespace gmdrawing
