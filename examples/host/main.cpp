// SPDX-License-Identifier: MIT
// A small host program: prints a spelled key and the major scale's mask as JSON.

#include "brindle/brindle.h"

#include <iostream>

int main() {
    const brindle::CScaleLite scale{{6, brindle::TEnh_s}, brindle::kSemitonesMajor};
    scale.AppendJSONString(std::cout);
    std::cout << '\n';
    return 0;
}
