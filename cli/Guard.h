// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

namespace brindle::cli {

/// Runs all of a program. What it throws becomes a message and the status of bad input, short
/// memory too, also where nothing may be thrown: JSON values ask for memory when they are freed.
/// A program with this function in it ends so also before main.
TStatus Guarded(TStatus (*run)(int argc, char** argv), int argc, char** argv);

}  // namespace brindle::cli
