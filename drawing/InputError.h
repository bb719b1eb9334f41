// SPDX-License-Identifier: MIT
#pragma once

#include <stdexcept>

namespace gmdrawing {

/// Input or output that cannot be used. The text is one line with the cause; who opens the file
/// puts its name in front (`readPart`, `AtomicFile`).
class InputError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

}  // namespace gmdrawing
