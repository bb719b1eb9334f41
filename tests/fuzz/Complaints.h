// SPDX-License-Identifier: MIT
#pragma once

#include <string>
#include <vector>

namespace gmregion::fuzz {

/// Promises that were found broken, each with what was being done.
class Complaints {
public:
    /// What is done from now on.
    void begin(const char* doing) { m_doing = doing; }
    /// Takes note of a broken promise; answers whether it holds.
    bool expect(bool holds, const char* promise, double by = 0.0) {
        if (!holds) m_broken.push_back(m_doing + ": " + promise + ", by " + std::to_string(by));
        return holds;
    }
    const std::vector<std::string>& broken() const { return m_broken; }

private:
    std::string m_doing;
    std::vector<std::string> m_broken;
};

}  // namespace gmregion::fuzz
