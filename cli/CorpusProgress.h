// SPDX-License-Identifier: MIT
#pragma once

#include "cli/Output.h"

#include <chrono>
#include <cstddef>
#include <string>

namespace brindle::cli {

/// How many songs are done and how fast, on a terminal's standard error; elsewhere nothing is
/// shown. How many there will be is not known.
class CCorpusProgress {
public:
    CCorpusProgress();
    CCorpusProgress(const CCorpusProgress&) = delete;
    CCorpusProgress& operator=(const CCorpusProgress&) = delete;
    ~CCorpusProgress() { HideProgress(); }

    void CountSong(bool hasFault);
    /// Shows where the work is, at most ten times a second.
    void Show();

    [[nodiscard]] std::size_t Songs() const { return mSongs; }
    [[nodiscard]] std::size_t Faults() const { return mFaults; }
    /// "1200 songs, 3 with faults, in 4.0 s: 300 songs/s"
    [[nodiscard]] std::string Summary() const;
    [[nodiscard]] bool IsOnTerminal() const { return mIsTerminal; }

private:
    using TClock = std::chrono::steady_clock;

    std::size_t mSongs = 0;
    std::size_t mFaults = 0;
    bool mIsTerminal;
    TClock::time_point mBegin = TClock::now();
    TClock::time_point mLastShown = mBegin;
};

}  // namespace brindle::cli
