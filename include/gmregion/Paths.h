// SPDX-License-Identifier: MIT
#pragma once

#include "gmregion/Element.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace gmregion {

/// One path of a heap: a range of elements that belongs to somebody else.
struct PathView {
    const Element* first = nullptr;
    const Element* last = nullptr;  ///< behind the last element
    bool closed = false;
    std::int64_t id = 0;

    const Element* begin() const { return first; }
    const Element* end() const { return last; }
    std::size_t size() const { return static_cast<std::size_t>(last - first); }
};

/// A heap of paths, closed and open, as a drawing gives them: nothing is asked of them here.
///
/// Elements lie in one array, so that a heap costs two allocations however many paths it has.
class Paths {
public:
    /// Appends a path. Its elements follow each other; where one starts beside the end of the one
    /// before, operations close the gap if it is within the tolerance, and refuse it otherwise.
    /// @param first its first element
    /// @param last behind its last element
    /// @param closed whether the last element ends where the first starts
    /// @param id a number of the caller's, found again in the origins of results
    void add(const Element* first, const Element* last, bool closed, std::int64_t id) {
        m_elements.insert(m_elements.end(), first, last);
        m_paths.push_back({m_elements.size(), id, closed});
    }
    void add(const std::vector<Element>& elements, bool closed, std::int64_t id) {
        add(elements.data(), elements.data() + elements.size(), closed, id);
    }
    /// The same with the number of paths before it as its number.
    void add(const std::vector<Element>& elements, bool closed) {
        add(elements, closed, static_cast<std::int64_t>(size()));
    }

    std::size_t size() const { return m_paths.size(); }
    bool empty() const { return m_paths.empty(); }
    std::size_t elementCount() const { return m_elements.size(); }
    PathView operator[](std::size_t index) const {
        const std::size_t first = index == 0 ? 0 : m_paths[index - 1].end;
        const Entry& path = m_paths[index];
        return {m_elements.data() + first, m_elements.data() + path.end, path.closed, path.id};
    }
    /// Forgets all paths and keeps the memory.
    void clear() {
        m_elements.clear();
        m_paths.clear();
    }

private:
    struct Entry {
        std::size_t end;
        std::int64_t id;
        bool closed;
    };
    std::vector<Element> m_elements;
    std::vector<Entry> m_paths;
};

}  // namespace gmregion
