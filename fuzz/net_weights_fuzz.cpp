// SPDX-License-Identifier: MIT
// Any text as the weights of a net, which is then used and trained.

#include "brindle/neural/NeuronalNet.h"

#include <cstddef>
#include <cstdint>
#include <iostream>
#include <sstream>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::cout.rdbuf(nullptr);  // the loader prints each weight
    std::istringstream stream(std::string(reinterpret_cast<const char*>(data), size));
    brindle::NeuronalNet net({2, 2}, {1, {3}, {}});
    net.load_weights(stream);
    net.use({1.0, 0.5});
    if (net.get_weights().size() != 12 || net.winner() > 1) __builtin_trap();
    (void)net.train({{1.0, 0.5}, {0.0, 1.0}, 0, ""});
    return 0;
}
