#include "drawing/files/AtomicFile.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <utility>

#include "drawing/InputError.h"

namespace gmpath {

namespace {

/// Permissions of a file that a program creates in the ordinary way.
mode_t ordinaryMode() {
    const mode_t mask = umask(0);
    umask(mask);
    constexpr mode_t kReadWriteForAll = 0666;
    return kReadWriteForAll & ~mask;
}

}  // namespace

AtomicFile::AtomicFile(std::string name) : m_name(std::move(name)) {
    const std::filesystem::path path(m_name);
    std::error_code error;
    if (std::filesystem::is_directory(path, error)) fail("is a directory");
    const std::string pattern = "." + path.filename().string() + ".XXXXXX";
    m_besideName = (path.parent_path() / pattern).string();
    const int descriptor = mkstemp(m_besideName.data());
    if (descriptor < 0) {
        m_besideName.clear();
        fail(std::strerror(errno));
    }
    fchmod(descriptor, ordinaryMode());
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

void AtomicFile::commit() {
    if (std::rename(m_besideName.c_str(), m_name.c_str()) != 0) fail(std::strerror(errno));
    m_besideName.clear();
}

void AtomicFile::fail(const std::string& cause) const {
    throw InputError(m_name + ": cannot be written: " + cause);
}

}  // namespace gmpath
