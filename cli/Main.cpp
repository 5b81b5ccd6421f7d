// SPDX-License-Identifier: MIT
#include "cli/Guard.h"
#include "cli/Program.h"

using namespace brindle::cli;

int main(int argc, char** argv) {
    return static_cast<int>(Guarded(RunProgram, argc, argv));
}
