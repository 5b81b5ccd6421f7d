// SPDX-License-Identifier: MIT
#include "cli/CorpusProgress.h"

#include <fmt/format.h>
#include <unistd.h>

#include <algorithm>

namespace brindle::cli {

CCorpusProgress::CCorpusProgress() : mIsTerminal(isatty(STDERR_FILENO) == 1) {}

void CCorpusProgress::CountSong(bool hasFault) {
    ++mSongs;
    mFaults += hasFault ? 1 : 0;
}

void CCorpusProgress::Show() {
    constexpr std::chrono::milliseconds pause{100};
    const auto now = TClock::now();
    if (!mIsTerminal || now - mLastShown < pause) return;
    mLastShown = now;
    ShowProgress(Summary());
}

std::string CCorpusProgress::Summary() const {
    const double seconds = std::chrono::duration<double>(TClock::now() - mBegin).count();
    const std::string faults = mFaults == 0 ? "" : fmt::format(", {} with faults", mFaults);
    return fmt::format("{} {}{}, in {:.1f} s: {:.0f} songs/s", mSongs,
                       mSongs == 1 ? "song" : "songs", faults, seconds,
                       static_cast<double>(mSongs) / std::max(seconds, 1e-3));
}

}  // namespace brindle::cli
