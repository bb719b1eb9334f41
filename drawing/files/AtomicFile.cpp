// SPDX-License-Identifier: MIT
/// @file
/// A file that is there as a whole or not at all.
///
/// What is written under another name in the same directory can be renamed in one step, so that
/// readers see the old content or the new one, also after a crash. That holds for one file: of
/// several, the first may have its name when the second one fails. What is left by a process that
/// was killed is not cleared away.

#include "drawing/files/AtomicFile.h"

#include <fcntl.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <cstdio>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <utility>

#include "drawing/InputError.h"

namespace gmdrawing {

namespace {

/// Another number at every call, in every process that runs.
std::string uniqueSuffix() {
    static std::atomic<unsigned> calls{0};
    return std::to_string(getpid()) + "-" + std::to_string(calls++);
}

/// Creates an empty file with the ordinary permissions; -1, with the cause in errno, when there is
/// one already or it cannot be created.
int createNew(const std::string& name) {
    constexpr mode_t kReadWriteForAll = 0666;
    return open(name.c_str(), O_CREAT | O_EXCL | O_WRONLY | O_CLOEXEC, kReadWriteForAll);
}

/// Waits until what was written to a file or directory is on the disk. False, with the cause in
/// errno, when it cannot be brought there.
bool bringToDisk(const std::string& name) {
    const int descriptor = open(name.c_str(), O_RDONLY | O_CLOEXEC);
    if (descriptor < 0) return false;
    const bool done = fsync(descriptor) == 0;
    close(descriptor);
    return done;
}

}  // namespace

AtomicFile::AtomicFile(std::string name) : m_name(std::move(name)) {
    const std::filesystem::path path(m_name);
    std::error_code error;
    if (std::filesystem::is_directory(path, error)) fail("is a directory");
    constexpr int kAttempts = 100;
    int descriptor = -1;
    for (int attempt = 0; attempt < kAttempts && descriptor < 0; ++attempt) {
        m_besideName = (path.parent_path() / (".unfinished-" + uniqueSuffix())).string();
        descriptor = createNew(m_besideName);
        if (descriptor < 0 && errno != EEXIST) break;
    }
    if (descriptor < 0) {
        m_besideName.clear();
        fail(std::strerror(errno));
    }
    close(descriptor);
}

AtomicFile::~AtomicFile() {
    if (!m_besideName.empty()) std::remove(m_besideName.c_str());
}

AtomicFile::AtomicFile(AtomicFile&& other) noexcept
    : m_name(std::move(other.m_name)), m_besideName(std::exchange(other.m_besideName, {})) {}

void AtomicFile::write(const std::string& text) {
    errno = 0;
    std::ofstream stream(m_besideName, std::ios::binary | std::ios::trunc);
    stream << text;
    stream.close();
    if (!stream) fail(std::strerror(errno));
}

void AtomicFile::synchronise() const {
    if (!bringToDisk(m_besideName)) fail(std::strerror(errno));
}

void AtomicFile::commit() {
    if (std::rename(m_besideName.c_str(), m_name.c_str()) != 0) fail(std::strerror(errno));
    m_besideName.clear();
    // The name itself: not every file system can, and the content is safe either way.
    const std::string directory = std::filesystem::path(m_name).parent_path().string();
    bringToDisk(directory.empty() ? "." : directory);
}

void AtomicFile::fail(const std::string& cause) const {
    throw InputError(m_name + ": cannot be written: " + cause);
}

}  // namespace gmdrawing
