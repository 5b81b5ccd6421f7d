// SPDX-License-Identifier: MIT
#include "cli/Guard.h"

#include <cstdio>
#include <cstdlib>
#include <exception>
#include <new>

namespace brindle::cli {
namespace {

// Without asking for memory, of which there may be none.
TStatus Tell(const char* what) {
    for (const char* const part : {"brindle: ", what, "\n"}) std::fputs(part, stderr);
    return TStatus::BadInput;
}

TStatus TellCurrentException() {
    try {
        if (const auto exception = std::current_exception()) std::rethrow_exception(exception);
    } catch (const std::bad_alloc&) {
        return Tell("there is not enough memory");
    } catch (const std::exception& error) {
        return Tell(error.what());
    } catch (...) {
    }
    return Tell("it had to end");
}

[[noreturn]] void EndAtOnce() {
    std::_Exit(static_cast<int>(TellCurrentException()));
}

struct CTerminateHandler {
    CTerminateHandler() { std::set_terminate(EndAtOnce); }
};

// Made before all else: what the library of options makes before main asks for memory, too.
[[maybe_unused, gnu::init_priority(101)]] const CTerminateHandler kTerminateHandler;

}  // namespace

TStatus Guarded(TStatus (*run)(int argc, char** argv), int argc, char** argv) {
    try {
        return run(argc, argv);
    } catch (...) {
        return TellCurrentException();
    }
}

}  // namespace brindle::cli
