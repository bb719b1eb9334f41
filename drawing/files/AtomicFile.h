// SPDX-License-Identifier: MIT
#pragma once

#include <string>

namespace gmdrawing {

/// A file that comes into being as a whole: written under another name beside its place, then
/// renamed. Until `commit` the name holds what it held before; what is not committed is removed.
class AtomicFile {
public:
    /// Creates the file beside its later place. Throws InputError, with the name and the cause,
    /// when the directory is missing or not writable or the name is that of a directory.
    explicit AtomicFile(std::string name);
    ~AtomicFile();
    AtomicFile(AtomicFile&& other) noexcept;
    AtomicFile(const AtomicFile&) = delete;
    AtomicFile& operator=(const AtomicFile&) = delete;
    AtomicFile& operator=(AtomicFile&&) = delete;

    /// The name that the file gets.
    const std::string& name() const { return m_name; }

    /// The name to write under until the file is committed.
    const std::string& besideName() const { return m_besideName; }

    /// Writes the text as the whole content. Throws InputError when it cannot be written.
    void write(const std::string& text);

    /// Waits until the content is on the disk. Throws InputError when it cannot be brought there.
    void synchronise() const;

    /// Gives the file its name. Throws InputError when that fails; the file is removed then. Only
    /// what was synchronised before is sure to be whole after a loss of power.
    void commit();

private:
    [[noreturn]] void fail(const std::string& cause) const;

    std::string m_name;
    std::string m_besideName;  ///< empty once committed or moved from
};

}  // namespace gmdrawing
