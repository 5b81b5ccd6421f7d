// SPDX-License-Identifier: MIT
#include "brindle/song/ReadSong.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

namespace {

void Check(const brindle::CSong& song, bool isLenient) {
    const brindle::CHarmAnlsChords& chords = song.mChords;
    if (!isLenient && song.HasFault() && !chords.empty()) std::abort();
    if (!chords.empty() && chords.size() != song.mSymbols.size() + 1) std::abort();
    for (std::size_t i = 1; i < chords.size(); ++i) {
        if (!(chords[i - 1].mPosition <= chords[i].mPosition)) std::abort();
    }
    for (std::size_t i = 1; i < song.mBars.size(); ++i) {
        if (!(song.mBars[i - 1].mPosition <= song.mBars[i].mPosition)) std::abort();
    }
    for (const brindle::CSongFault& fault : song.mFaults) {
        if (fault.mText.empty()) std::abort();
    }
}

}  // namespace

/// The first two bytes choose the preferences, the rest is the source. What comes out must hold
/// together.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    constexpr std::size_t kMostBytes = 4096;
    if (size < 2 || size > kMostBytes) return 0;
    brindle::CSongOptions prefs;
    prefs.mFormat = static_cast<brindle::TSongFormat>(data[0] % 12);
    prefs.mEven = (data[1] & 4) != 0;
    prefs.mLenient = (data[1] & 8) != 0;
    if ((data[1] & 16) != 0) prefs.mBeatsPerChord = 1e300;
    const std::string_view bytes(reinterpret_cast<const char*>(data + 2), size - 2);
    for (const brindle::CSong& song : brindle::ReadSongs(bytes, prefs)) Check(song, prefs.mLenient);
    return 0;
}
