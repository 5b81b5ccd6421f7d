// SPDX-License-Identifier: MIT
// Any text as the properties of a net: the net that comes out can be used, copied and reported.

#include "brindle/neural/NeuronalNet.h"

#include <cstddef>
#include <cstdint>
#include <iostream>
#include <sstream>
#include <string>

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    std::cout.rdbuf(nullptr);  // the loader tells each label that it knows
    std::istringstream stream(std::string(reinterpret_cast<const char*>(data), size));
    brindle::NeuronalNet net({2, 1}, {1, {2}, {}});
    net.load_net_properties(stream);
    net.use();
    (void)net.winner();
    if (net.get_weights().size() > 1000) return 0;
    (void)net.train({{1.0, 0.5}, {1.0}, 0, ""});
    std::istringstream report(net.weights_to_text(1, 0.0, 0.0, {}));
    if (!net.load_net_properties(report)) __builtin_trap();
    return 0;
}
