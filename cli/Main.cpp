// SPDX-License-Identifier: MIT
#include "brindle/Version.h"

#include <CLI/CLI.hpp>

int main(int argc, char** argv) {
    CLI::App app{"Music theory and harmony analysis"};
    app.set_version_flag("--version", brindle::BrindleVersionString);
    CLI11_PARSE(app, argc, argv);
    return 0;
}
