// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"

namespace brindle {

struct CPlayMarks;

/// Writes into a played bar which written one it is, and what that has for jumps.
void SetWritten(std::size_t written, const CPlayMarks& marks, CSongBar& bar);

}  // namespace brindle
