// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/ReadSong.h"

#include <fmt/format.h>

#include <string>

/// Songs as tests show them.
namespace brindle::test {

/// "1:5: what is wrong; 2:1: ..."
inline std::string Faults(const CSong& song) {
    std::string text;
    for (const CSongFault& fault : song.mFaults) {
        text += fmt::format("{}{}:{}: {}", text.empty() ? "" : "; ", fault.mLine, fault.mColumn,
                            fault.mText);
    }
    return text;
}

/// "C@0 F@4 end@8", by what was typed; or the faults.
inline std::string Shown(const CSong& song) {
    if (song.HasFault()) return Faults(song);
    std::string text;
    for (std::size_t i = 0; i < song.mChords.size(); ++i) {
        const bool isEnd = i == song.mSymbols.size();
        text += fmt::format("{}{}@{:.4g}", i > 0 ? " " : "", isEnd ? "end" : song.mSymbols[i],
                            song.mChords[i].mPosition);
    }
    return text;
}

/// "C F", without positions; or the faults.
inline std::string Played(const CSong& song) {
    if (song.HasFault()) return Faults(song);
    return fmt::format("{}", fmt::join(song.mSymbols, " "));
}

/// "Verse@0, Chorus@16"
inline std::string ShownSections(const CSong& song) {
    std::string text;
    for (const CSongSection& section : song.mSections) {
        text += fmt::format("{}{}@{}", text.empty() ? "" : ", ", section.mName, section.mPosition);
    }
    return text;
}

/// "1@0+4 2@4+4": number, position and length.
inline std::string ShownBars(const CSong& song) {
    std::string text;
    for (const CSongBar& bar : song.mBars) {
        text += fmt::format("{}{}@{}+{}", text.empty() ? "" : " ", bar.mNumber, bar.mPosition,
                            bar.mLength);
    }
    return text;
}

}  // namespace brindle::test
