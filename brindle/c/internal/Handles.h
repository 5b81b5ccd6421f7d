// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/c/brindle.h"

#include "brindle/song/CSong.h"

#include <cstddef>

/// A song whose texts are fit to be shown: UTF-8 without control characters.
struct brindle_song {
    brindle::CSong mSong;
};

namespace brindle::border {

/// The chord at the index is there. "" for one without a symbol.
[[nodiscard]] inline const char* SymbolAt(const CSong& song, std::size_t index) {
    return index < song.mSymbols.size() ? song.mSymbols[index].c_str() : "";
}

[[nodiscard]] inline double LengthAt(const CSong& song, std::size_t index) {
    return song.mChords[index + 1].mPosition - song.mChords[index].mPosition;
}

}  // namespace brindle::border
