// SPDX-License-Identifier: MIT
/// @file
/// DXF text as groups.
///
/// A group is two lines, a code and its value. Anything else ends the reading with the number of
/// the line: a file that is damaged in one place is not guessed at in the next. Values point into
/// the text.

#include "drawing/dxf/DxfGroups.h"

#include <cerrno>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <iterator>

#include "drawing/InputError.h"
#include "drawing/Text.h"

namespace gmdrawing {

namespace {

/// Hands out the lines of a text one by one.
class Lines {
public:
    /// Lines end with a line feed, or in files of old with a carriage return alone.
    explicit Lines(std::string_view text)
        : m_rest(text), m_end(text.find('\n') == std::string_view::npos ? '\r' : '\n') {}

    bool atEnd() const { return m_rest.empty(); }
    std::size_t number() const { return m_number; }

    std::string_view next() {
        const std::size_t end = m_rest.find(m_end);
        std::string_view line = m_rest.substr(0, end);
        m_rest.remove_prefix(end == std::string_view::npos ? m_rest.size() : end + 1);
        ++m_number;
        if (!line.empty() && line.back() == '\r') line.remove_suffix(1);
        return line;
    }

private:
    std::string_view m_rest;
    char m_end;
    std::size_t m_number = 0;
};

std::string_view withoutByteOrderMark(std::string_view text) {
    constexpr std::string_view kMark = "\xEF\xBB\xBF";
    if (text.substr(0, kMark.size()) == kMark) text.remove_prefix(kMark.size());
    return text;
}

bool isEndMark(const DxfGroup& group) {
    return group.code == 0 && trimmed(group.value) == "EOF";
}

bool hasSection(const std::vector<DxfGroup>& groups, std::string_view name) {
    for (std::size_t i = 1; i < groups.size(); ++i) {
        const DxfGroup& opening = groups[i - 1];
        if (opening.code == 0 && trimmed(opening.value) == "SECTION" && groups[i].code == 2 &&
            (name.empty() || trimmed(groups[i].value) == name)) {
            return true;
        }
    }
    return false;
}

[[noreturn]] void failAtLine(std::size_t line, bool anyGroupRead) {
    const std::string where = "line " + std::to_string(line) + " is no group code";
    throw InputError((anyGroupRead ? "damaged DXF file, " + where : "no DXF file, " + where));
}

}  // namespace

std::string readFile(const std::string& fileName) {
    std::error_code error;
    const auto status = std::filesystem::status(fileName, error);
    if (!std::filesystem::exists(status)) throw InputError("no such file");
    if (!std::filesystem::is_regular_file(status)) {
        throw InputError("not a regular file");
    }
    errno = 0;
    std::ifstream stream(fileName, std::ios::binary);
    std::string text(std::istreambuf_iterator<char>(stream), {});
    if (!stream.is_open() || stream.bad()) {
        throw InputError(std::string("cannot be read: ") + std::strerror(errno));
    }
    if (text.empty()) throw InputError("the file is empty");
    return text;
}

std::vector<DxfGroup> dxfGroups(std::string_view text) {
    if (text.find('\0') != std::string_view::npos) {
        throw InputError("a binary file, only DXF in text form is read");
    }
    std::vector<DxfGroup> groups;
    Lines lines(withoutByteOrderMark(text));
    while (!lines.atEnd()) {
        const std::string_view codeLine = lines.next();
        if (lines.atEnd() && trimmed(codeLine).empty()) break;
        const auto code = parseInteger(codeLine);
        if (!code) failAtLine(lines.number(), hasSection(groups, ""));
        if (lines.atEnd()) break;
        groups.push_back({*code, lines.next()});
        if (isEndMark(groups.back())) break;
    }
    if (!hasSection(groups, "")) throw InputError("no DXF file, it has no section");
    if (!isEndMark(groups.back())) {
        throw InputError("truncated, the file stops without its end mark");
    }
    if (!hasSection(groups, "ENTITIES")) {
        throw InputError("the drawing has no section of entities");
    }
    return groups;
}

}  // namespace gmdrawing
