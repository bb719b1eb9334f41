// SPDX-License-Identifier: MIT
#pragma once

#include <memory>

namespace gmkernel_detail {

/// Gives up the ownership of an object that a container of raw pointers has just taken.
///
/// The order matters: first the container takes the raw pointer, then ownership is given up here. A
/// container that throws while it grows then leaves the object with `owner`, and nothing leaks.
template <class T>
void handedOver(std::unique_ptr<T>& owner) noexcept {
    static_cast<void>(owner.release());
}

}  // namespace gmkernel_detail
