#pragma once

#include <locale>

namespace gmpath {

/// Holds the process in the classic locale while it lives, so that the DXF library reads and writes
/// numbers with a decimal point and no grouping. Not for use while other threads format numbers.
class ClassicLocale {
public:
    ClassicLocale() : m_before(std::locale::global(std::locale::classic())) {}
    ~ClassicLocale() { std::locale::global(m_before); }
    ClassicLocale(const ClassicLocale&) = delete;
    ClassicLocale& operator=(const ClassicLocale&) = delete;

private:
    std::locale m_before;
};

}  // namespace gmpath
