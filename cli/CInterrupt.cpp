// SPDX-License-Identifier: MIT
#include "cli/CInterrupt.h"

#include <array>
#include <atomic>
#include <csignal>

namespace brindle::cli {
namespace {

constexpr std::array kEndingSignals{SIGINT, SIGTERM, SIGHUP};

std::atomic<int> gAskedBy{0};
static_assert(std::atomic<int>::is_always_lock_free);

void MarkEnd(int signal) {
    gAskedBy = signal;
    std::signal(signal, SIG_DFL);
}

}  // namespace

CInterrupt::CInterrupt() {
    for (const int signal : kEndingSignals) {
        // What the caller has switched off, as nohup does, stays off.
        if (std::signal(signal, MarkEnd) == SIG_IGN) std::signal(signal, SIG_IGN);
    }
}

CInterrupt::~CInterrupt() {
    for (const int signal : kEndingSignals) {
        if (std::signal(signal, SIG_DFL) == SIG_IGN) std::signal(signal, SIG_IGN);
    }
}

bool CInterrupt::IsAsked() const {
    return gAskedBy != 0;
}

void CInterrupt::EndIfAsked() const {
    if (const int signal = gAskedBy) {
        std::signal(signal, SIG_DFL);
        std::raise(signal);
    }
}

}  // namespace brindle::cli
