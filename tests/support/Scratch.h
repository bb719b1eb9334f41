// SPDX-License-Identifier: MIT
#pragma once

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

/// A directory for the files of one test, removed with everything in it.
class Scratch {
public:
    Scratch() {
        std::string pattern = (std::filesystem::temp_directory_path() / "gmpath-XXXXXX").string();
        m_directory = mkdtemp(pattern.data());
    }
    ~Scratch() { std::filesystem::remove_all(m_directory); }
    Scratch(const Scratch&) = delete;
    Scratch& operator=(const Scratch&) = delete;

    std::string directory() const { return m_directory.string(); }
    std::string file(const std::string& name) const { return (m_directory / name).string(); }

    std::size_t files() const {
        const std::filesystem::directory_iterator begin(m_directory);
        return static_cast<std::size_t>(std::distance(begin, {}));
    }
    void store(const std::string& name, const std::string& text) const {
        std::ofstream(file(name), std::ios::binary) << text;
    }
    std::string content(const std::string& name) const {
        std::ifstream stream(file(name), std::ios::binary);
        return {std::istreambuf_iterator<char>(stream), {}};
    }

private:
    std::filesystem::path m_directory;
};
