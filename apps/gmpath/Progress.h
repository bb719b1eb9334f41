// SPDX-License-Identifier: MIT
#pragma once

#include <cstddef>
#include <ostream>

namespace gmpath {

/// A line on a terminal that tells how far a long job is, and vanishes when the job is done.
class Progress {
public:
    /// Shows nothing when `visible` is false, as when the stream is no terminal.
    Progress(std::ostream& stream, bool visible) : m_stream(stream), m_visible(visible) {}
    ~Progress() { clear(); }
    Progress(const Progress&) = delete;
    Progress& operator=(const Progress&) = delete;

    /// Tells that `done` of `total` steps are done.
    void show(std::size_t done, std::size_t total) {
        if (!m_visible) return;
        m_stream << "\roffset " << done << " of " << total << std::flush;
        m_shown = true;
    }

    /// Takes the line away.
    void clear() {
        if (m_shown) m_stream << "\r\033[K" << std::flush;
        m_shown = false;
    }

private:
    std::ostream& m_stream;
    bool m_visible;
    bool m_shown = false;
};

}  // namespace gmpath
