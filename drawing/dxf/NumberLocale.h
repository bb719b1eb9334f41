// SPDX-License-Identifier: MIT
#pragma once

namespace gmdrawing {

/// The DXF library reads and writes numbers by the global locale of the process. Throws InputError
/// where that does not read "1.5" as 1.5 and write 12345 as "12345"; a program sets the classic
/// locale (`std::locale::global`) before it reads or writes drawings.
void requirePlainNumbers();

}  // namespace gmdrawing
