// SPDX-License-Identifier: MIT
#include "brindle/analysis/ReadChordSheet.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

/// The first byte chooses the preferences, the rest is the song. What comes out must hold together.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) return 0;
    brindle::CChordSheetPrefs prefs;
    prefs.mForm = static_cast<brindle::TChordSheetForm>(data[0] & 3);
    prefs.mEven = (data[0] & 4) != 0;
    prefs.mLenient = (data[0] & 8) != 0;
    if ((data[0] & 16) != 0) prefs.mBeatsPerChord = 1e300;
    const std::string_view text(reinterpret_cast<const char*>(data + 1), size - 1);
    const brindle::CChordSheetReading reading = brindle::ReadChordSheet(text, prefs);
    const brindle::CHarmAnlsChords& chords = reading.mChords;
    if (!prefs.mLenient && !reading.mFaults.empty() && !chords.empty()) std::abort();
    if (reading.mFaults.empty() && !chords.empty() &&
        chords.size() != reading.mSymbols.size() + 1) {
        std::abort();
    }
    for (std::size_t i = 1; i < chords.size(); ++i) {
        if (!(chords[i - 1].mPosition <= chords[i].mPosition)) std::abort();
    }
    for (const brindle::CChordSheetFault& fault : reading.mFaults) {
        if (fault.mLine == 0 || fault.mColumn == 0 || fault.mText.empty()) std::abort();
    }
    return 0;
}
