// SPDX-License-Identifier: MIT
#include "apps/gmpath/Report.h"

#include <algorithm>

#include "apps/gmpath/Phrases.h"
#include "drawing/Text.h"

namespace gmpath {

using gmdrawing::printable;
using gmpart::Path;

namespace {

constexpr std::size_t kMostAlike = 3;

/// The text without its numbers: remarks of the same are alike.
std::string withoutNumbers(const std::string& text) {
    std::string result;
    for (const char c : text) {
        if (std::string_view("0123456789.,- ").find(c) == std::string_view::npos) result += c;
    }
    return result;
}

}  // namespace

Report::Report(std::ostream& stream, const std::string& subject, const std::vector<Path>& contours)
    : m_stream(stream), m_prefix("gmpath: " + printable(subject) + ": "), m_contours(contours) {}

Report::~Report() {
    for (const Group& group : m_groups) {
        if (group.count <= kMostAlike) {
            for (const std::string& line : group.first)
                m_stream << m_prefix << line << "\n";
            continue;
        }
        m_stream << m_prefix << group.count << " times: ";
        for (const std::string& line : group.first)
            m_stream << line << "; ";
        m_stream << "and " << group.count - kMostAlike << " more\n";
    }
}

void Report::tell(const std::string& text) {
    add(withoutNumbers(text), text);
}

void Report::tell(std::size_t contour, const std::string& text) {
    if (text.empty()) return;
    add("contour: " + withoutNumbers(text), contourText(contour, m_contours) + ": " + text);
}

void Report::add(const std::string& key, const std::string& line) {
    auto group = std::find_if(m_groups.begin(), m_groups.end(),
                              [&](const Group& known) { return known.key == key; });
    if (group == m_groups.end()) group = m_groups.insert(group, Group{key, {}, 0});
    if (++group->count <= kMostAlike) group->first.push_back(line);
}

}  // namespace gmpath
