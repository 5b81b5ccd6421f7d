// SPDX-License-Identifier: MIT
#include "cli/Progress.h"

#include <fmt/format.h>
#include <unistd.h>

#include <utility>

namespace brindle::cli {
namespace {

constexpr std::size_t kBarWidth = 30;
constexpr std::size_t kNameWidth = 40;
/// What is done before needs no bar.
constexpr std::chrono::milliseconds kUnshown{500};

using TProgressClock = std::chrono::steady_clock;

/// At most ten times a second.
bool IsTimeToShow(TProgressClock::time_point& nextShow) {
    constexpr std::chrono::milliseconds pause{100};
    const auto now = TProgressClock::now();
    if (now < nextShow) return false;
    nextShow = now + pause;
    return true;
}

}  // namespace

CCountProgress::CCountProgress(std::string_view name, std::string unit)
    : mName(FirstCharacters(Printable(name), kNameWidth)),
      mUnit(std::move(unit)),
      mIsTerminal(isatty(STDERR_FILENO) == 1),
      mNextShow(TProgressClock::now() + kUnshown) {}

void CCountProgress::CountOne() {
    ++mCount;
    if (!mIsTerminal || !IsTimeToShow(mNextShow)) return;
    ShowProgress(fmt::format("{}: {} {}", mName, mCount, mUnit));
}

CProgress::CProgress(std::size_t steps)
    : mSteps(steps),
      mIsTerminal(steps > 1 && isatty(STDERR_FILENO) == 1),
      mNextShow(TProgressClock::now() + kUnshown) {}

void CProgress::Step(std::string_view name) {
    const std::size_t filled = kBarWidth * mBegun++ / mSteps;
    if (!mIsTerminal || !IsTimeToShow(mNextShow)) return;
    ShowProgress(fmt::format("[{}{}] {}/{} {}", std::string(filled, '#'),
                             std::string(kBarWidth - filled, '.'), mBegun, mSteps,
                             FirstCharacters(Printable(name), kNameWidth)));
}

}  // namespace brindle::cli
