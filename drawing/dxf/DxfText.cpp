// SPDX-License-Identifier: MIT
/// @file
/// DXF text in UTF-8.
///
/// Newer files are UTF-8, older ones in a code page. The bytes tell: what is sound UTF-8 with
/// characters outside ASCII is hardly ever anything else.

#include "drawing/dxf/DxfText.h"

#include <iconv.h>
#include <utf8.h>

#include <array>
#include <cstdlib>
#include <iterator>

#include "drawing/Text.h"

namespace gmdrawing {

namespace {

/// The value behind the header variable $DWGCODEPAGE, without blanks.
std::string_view codePage(std::string_view text) {
    const std::size_t name = text.find("$DWGCODEPAGE");
    if (name == std::string_view::npos) return {};
    std::string_view rest = text.substr(name);
    for (int line = 0; line < 2; ++line) {
        const std::size_t end = rest.find_first_of("\r\n");
        if (end == std::string_view::npos) return {};
        rest.remove_prefix(end);
        rest.remove_prefix(rest.substr(0, 2) == "\r\n" ? 2 : 1);
    }
    return trimmed(rest.substr(0, rest.find_first_of("\r\n")));
}

/// The name that converters know a code page by: "ansi_1251" is CP1251.
std::string converterName(std::string_view page) {
    const std::size_t digits = page.find_first_of("0123456789");
    if (digits == std::string_view::npos) return "CP1252";
    return "CP" + std::string(page.substr(digits));
}

/// Hands a text to a converter; what has no meaning in the code page becomes '?'.
class Converter {
public:
    explicit Converter(const std::string& from) : m_handle(iconv_open("UTF-8", from.c_str())) {}
    ~Converter() {
        if (isOpen()) iconv_close(m_handle);
    }
    Converter(const Converter&) = delete;
    Converter& operator=(const Converter&) = delete;

    // The handle is a pointer with the value -1 where there is none.
    bool isOpen() const { return m_handle != reinterpret_cast<iconv_t>(-1); }  // NOLINT

    std::string convert(std::string text) const {
        std::string result;
        char* next = text.data();
        std::size_t left = text.size();
        while (left > 0) {
            std::array<char, 4096> buffer{};
            char* out = buffer.data();
            std::size_t room = buffer.size();
            const bool done = iconv(m_handle, &next, &left, &out, &room) != static_cast<size_t>(-1);
            result.append(buffer.data(), buffer.size() - room);
            if (done || room < buffer.size()) continue;
            result += '?';
            ++next;
            --left;
        }
        return result;
    }

private:
    iconv_t m_handle;
};

std::string inUtf8(std::string_view text) {
    if (utf8::is_valid(text.begin(), text.end())) return std::string(text);
    const Converter converter(converterName(codePage(text)));
    return converter.isOpen() ? converter.convert(std::string(text)) : std::string(text);
}

/// Whether a number stands for a character that names may have.
bool isCharacter(unsigned long code) {
    constexpr unsigned long kFirstHalf = 0xD800;  // halves of pairs are no characters
    constexpr unsigned long kLastHalf = 0xDFFF;
    return code >= ' ' && (code < kFirstHalf || code > kLastHalf);
}

/// Replaces \U+XXXX, four hexadecimal digits, but for control characters.
std::string withoutEscapes(const std::string& text) {
    constexpr std::string_view kEscape = "\\U+";
    constexpr std::size_t kDigits = 4;
    std::string result;
    std::size_t from = 0;
    for (std::size_t at = text.find(kEscape); at != std::string::npos;
         at = text.find(kEscape, at + 1)) {
        const std::string digits = text.substr(at + kEscape.size(), kDigits);
        const bool sound = digits.size() == kDigits &&
                           digits.find_first_not_of("0123456789abcdefABCDEF") == std::string::npos;
        const unsigned long code = sound ? std::strtoul(digits.c_str(), nullptr, 16) : 0;
        if (!isCharacter(code)) continue;
        result.append(text, from, at - from);
        utf8::append(static_cast<char32_t>(code), std::back_inserter(result));
        from = at + kEscape.size() + kDigits;
    }
    return result.append(text, from);
}

}  // namespace

std::string plainDxfText(std::string_view text) {
    return withoutEscapes(inUtf8(text));
}

}  // namespace gmdrawing
