// SPDX-License-Identifier: MIT
#include "machining/moves/Toolpath.h"

#include <cmath>

namespace gmmachining {

double travel(const Toolpath& moves, MoveKind kind) {
    double sum = 0.0;
    double z = 0.0;
    for (const Move& move : moves) {
        if (move.kind == kind) sum += length(move.path) + std::abs(move.z - z);
        z = move.z;
    }
    return sum;
}

}  // namespace gmmachining
