// SPDX-License-Identifier: MIT
#include "brindle/chords/ReadChordText.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

/// The first byte chooses the preferences, the rest is the text. What comes out must hold together,
/// and a normalised symbol must stay as it is (printed names have other rules).
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) return 0;
    brindle::CChordTextOptions prefs;
    prefs.mBIsBFlat = (data[0] & 1) != 0;
    prefs.mSolfege = (data[0] & 2) != 0;
    prefs.mLowerCaseIsMinor = (data[0] & 4) != 0;
    prefs.mOwnName = (data[0] & 8) != 0;
    const std::string_view text(reinterpret_cast<const char*>(data + 1), size - 1);
    const brindle::CChordTextReading reading = brindle::ReadChordText(text, prefs);
    const bool hasFault = reading.mKind == brindle::TChordText_NotUnderstood;
    if (hasFault != (reading.mFaultPos > 0) || hasFault == reading.mFault.empty()) std::abort();
    if (reading.mKind != brindle::TChordText_Chord) return 0;
    if (reading.mChord.IsUndef() || reading.mChord.mSemitones.Mask() > 0xFFF) std::abort();
    if (prefs.mOwnName) return 0;
    if (brindle::NormaliseChordSymbol(reading.mParserText, prefs) != reading.mParserText)
        std::abort();
    return 0;
}
