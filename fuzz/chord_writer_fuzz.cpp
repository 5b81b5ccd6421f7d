// SPDX-License-Identifier: MIT
// Five bytes are a chord and a style: what is written reads back as the same chord.

#include "brindle/chords/WriteChordSymbol.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>

namespace {

using namespace brindle;

// A letter with at most two signs.
CKeyEnh NoteOf(std::uint8_t byte) {
    constexpr int kNaturals[] = {0, 2, 4, 5, 7, 9, 11};
    const int signs = byte / 7 % 5 - 2;
    return {(kNaturals[byte % 7] + signs + 12) % 12, SemitoneToEnh(signs)};
}

// A bass on the root's key is not written.
CKeyEnh WrittenBass(const CChordLite& chord) {
    return chord.mBassKeyEnh.mKeyNr == chord.mRootKeyEnh.mKeyNr ? CKeyEnh{} : chord.mBassKeyEnh;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 5) return 0;
    const CSemitones tones(data[0] | static_cast<std::uint64_t>(data[1] & 15) << 8);
    const CKeyEnh bass = data[3] % 2 == 0 ? CKeyEnh{} : NoteOf(data[3] / 2);
    const CChordLite chord(NoteOf(data[2]), bass, tones);
    const CChordSymbolStyle style{static_cast<TNoteNaming>(data[4] % 3), (data[4] & 128) != 0};
    const std::string text = WriteChordSymbol(chord, style);
    const CChordTextReading reading = ReadChordText(text, ReadingPrefsOf(style));
    if (reading.mKind != TChordText_Chord || !(reading.mChord.mRootKeyEnh == chord.mRootKeyEnh) ||
        !(reading.mChord.mBassKeyEnh == WrittenBass(chord))) {
        std::abort();
    }
    if (reading.mChord.mSemitones != tones) std::abort();
    return 0;
}
