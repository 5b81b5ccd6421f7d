// SPDX-License-Identifier: MIT
#include "cli/Progress.h"

#include "cli/Output.h"

#include <fmt/format.h>
#include <unistd.h>

#include <cstdio>
#include <utility>

namespace brindle::cli {
namespace {

constexpr std::size_t kBarWidth = 30;
constexpr std::size_t kNameWidth = 40;
/// What is done before needs no bar.
constexpr std::chrono::milliseconds kUnshown{500};

}  // namespace

CCountProgress::CCountProgress(std::string_view name, std::string unit)
    : mName(FirstCharacters(Printable(name), kNameWidth)),
      mUnit(std::move(unit)),
      mIsTerminal(isatty(STDERR_FILENO) == 1),
      mNextShow(TClock::now() + kUnshown) {}

CCountProgress::~CCountProgress() {
    if (mIsShown) fmt::print(stderr, "\r\x1B[K");
}

void CCountProgress::CountOne() {
    constexpr std::chrono::milliseconds pause{100};
    ++mCount;
    if (!mIsTerminal || TClock::now() < mNextShow) return;
    mNextShow = TClock::now() + pause;
    mIsShown = true;
    fmt::print(stderr, "\r\x1B[K{}: {} {}", mName, mCount, mUnit);
    std::fflush(stderr);
}

CProgress::CProgress(std::size_t steps)
    : mSteps(steps), mIsTerminal(steps > 1 && isatty(STDERR_FILENO) == 1) {}

CProgress::~CProgress() {
    Hide();
}

void CProgress::Hide() {
    if (mIsShown) fmt::print(stderr, "\r\x1B[K");
    mIsShown = false;
}

void CProgress::Step(std::string_view name) {
    const std::size_t filled = kBarWidth * mBegun++ / mSteps;
    if (!mIsTerminal || std::chrono::steady_clock::now() - mBegin < kUnshown) return;
    mIsShown = true;
    fmt::print(stderr, "\r\x1B[K[{}{}] {}/{} {}", std::string(filled, '#'),
               std::string(kBarWidth - filled, '.'), mBegun, mSteps,
               FirstCharacters(Printable(name), kNameWidth));
    std::fflush(stderr);
}

}  // namespace brindle::cli
