// SPDX-License-Identifier: MIT
// Each pair of bytes is a note: its number and its spelling. The exact symbol of each name reads
// back as the keys that sound.

#include "brindle/chords/NameNotes.h"
#include "brindle/chords/ReadChordText.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <vector>

namespace {

using namespace brindle;

constexpr std::size_t kMostNotes = 24;

std::uint64_t KeysOf(const CChordLite& chord) {
    std::uint64_t keys = 0;
    for (int intvl = 0; intvl < 12; ++intvl) {
        if (chord.mSemitones.HasIntvl(intvl)) {
            keys |= std::uint64_t{1} << (chord.mRootKeyEnh.mKeyNr + intvl) % 12;
        }
    }
    if (chord.HasBassNote()) keys |= std::uint64_t{1} << chord.mBassKeyEnh.mKeyNr;
    return keys;
}

// A chord above a bass alone need not hold the key of that bass again.
void Check(const std::vector<CNamedChord>& names, std::uint64_t keys, std::uint64_t bass,
           bool hasNoSlash) {
    if (names.empty() != (keys == 0)) std::abort();
    for (const CNamedChord& name : names) {
        const CChordTextReading reading = ReadChordText(name.mExactSymbol);
        if (reading.mKind != TChordText_Chord || (KeysOf(reading.mChord) | bass) != keys)
            std::abort();
        if (hasNoSlash && name.mChord.HasBassNote()) std::abort();
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 1 || size > 1 + 2 * kMostNotes) return 0;
    CNamingOptions options;
    options.mBass = static_cast<TBassUse>(data[0] % 3);
    if ((data[0] & 4) != 0) options.mKey = CSignKeyLite("Ab minor");
    options.mPreviousRoot = (data[0] & 8) != 0 ? 11 : kKeyNrUndef;
    std::vector<CNote> notes;
    std::uint64_t keys = 0;
    std::int64_t lowest = 128;
    for (std::size_t i = 1; i + 1 < size; i += 2) {
        notes.emplace_back(data[i], static_cast<TEnh>(data[i + 1] % 9 - 1));
        if (IsNoteNrUndef(notes.back().mNoteNr)) continue;
        lowest = std::min(lowest, notes.back().mNoteNr);
        keys |= std::uint64_t{1} << KeyNrOfNoteNr(notes.back().mNoteNr);
    }
    const bool hasBassAlone = options.mBass == TBassUse::Only && keys != 0;
    const std::uint64_t bass = hasBassAlone ? std::uint64_t{1} << KeyNrOfNoteNr(lowest) : 0;
    Check(NameNotes(notes, options), keys, bass, options.mBass == TBassUse::None);
    (void)NameProgression(std::vector<std::vector<CNote>>{notes, {}, notes}, options);
    return 0;
}
