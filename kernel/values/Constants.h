// SPDX-License-Identifier: MIT
#pragma once

namespace gmkernel_detail {

constexpr double kPi = 3.14159265358979323846;

}  // namespace gmkernel_detail
