// SPDX-License-Identifier: MIT
#include "cli/Progress.h"

#include "cli/Output.h"

#include <fmt/format.h>
#include <unistd.h>

#include <cstdio>

namespace brindle::cli {
namespace {

constexpr std::size_t kBarWidth = 30;
constexpr std::size_t kNameWidth = 40;

}  // namespace

CProgress::CProgress(std::size_t steps)
    : mSteps(steps), mIsShown(steps > 1 && isatty(STDERR_FILENO) == 1) {}

CProgress::~CProgress() {
    if (mIsShown) fmt::print(stderr, "\r\x1B[K");
}

void CProgress::Step(std::string_view name) {
    if (!mIsShown) return;
    const std::size_t filled = kBarWidth * mBegun++ / mSteps;
    fmt::print(stderr, "\r\x1B[K[{}{}] {}/{} {}", std::string(filled, '#'),
               std::string(kBarWidth - filled, '.'), mBegun, mSteps,
               FirstCharacters(Printable(name), kNameWidth));
    std::fflush(stderr);
}

}  // namespace brindle::cli
