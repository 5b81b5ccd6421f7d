// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/CSong.h"
#include "brindle/song/ReadSong.h"

#include <cstddef>
#include <memory>
#include <string>

namespace brindle::python {

/// A song with what it was read from, so that it can be sent to another process.
struct CSourceSong {
    CSong mSong;
    std::string mSource;
    CSongOptions mOptions;
};

using CSourceSongPtr = std::shared_ptr<CSourceSong>;

/// Without the end marker.
[[nodiscard]] inline std::size_t ChordCount(const CSong& song) {
    return song.mChords.empty() ? 0 : song.mChords.size() - 1;
}

[[nodiscard]] inline double LengthOfChord(const CSong& song, std::size_t index) {
    return song.mChords[index + 1].mPosition - song.mChords[index].mPosition;
}

/// "" for one without a symbol.
[[nodiscard]] inline const std::string& SymbolOfChord(const CSong& song, std::size_t index) {
    static const std::string none;
    return index < song.mSymbols.size() ? song.mSymbols[index] : none;
}

}  // namespace brindle::python
