// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/KeyChords.h"

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {
namespace {

// No song is longer; what seems so is a broken position.
constexpr double kLongestInBeats = 1e12;

double BeatsOf(const CHarmAnlsChords& chords, std::size_t ix) {
    // Without an end marker the last chord sounds for a beat.
    if (ix + 1 == chords.size()) return chords[ix].IsUndef() ? 0.0 : 1.0;
    const double beats = chords[ix + 1].mPosition - chords[ix].mPosition;
    return beats > 0.0 && beats <= kLongestInBeats ? beats : 0.0;
}

CKeyChord KeyChordOf(const CHarmAnlsChords& chords, std::size_t ix) {
    const CHarmAnlsChord& chord = chords[ix];
    const CKeyEnh& bass = chord.HasBassNote() ? chord.mBassKeyEnh : chord.mRootKeyEnh;
    return {KeyChordClassOf(chord.mSemitones),
            static_cast<std::int8_t>(FoldIntoOctave(chord.mRootKeyEnh.mKeyNr)),
            static_cast<std::int8_t>(FoldIntoOctave(bass.mKeyNr)),
            chord.HasBassNote(),
            static_cast<std::uint32_t>(ix),
            chord.mSemitones,
            BeatsOf(chords, ix)};
}

bool IsSameChord(const CKeyChord& a, const CKeyChord& b) {
    return a.mRoot == b.mRoot && a.mBass == b.mBass && a.mHasBass == b.mHasBass &&
           a.mSemitones == b.mSemitones;
}

}  // namespace

std::vector<CKeyChord> KeyChordsOf(const CHarmAnlsChords& chords) {
    std::vector<CKeyChord> heard;
    heard.reserve(chords.size());
    double total = 0.0;
    for (std::size_t ix = 0; ix < chords.size(); ++ix) {
        if (chords[ix].IsUndef()) {
            if (heard.empty()) continue;
            const double beats = BeatsOf(chords, ix);
            heard.back().mBeats += beats;
            total += beats;
            continue;
        }
        const CKeyChord chord = KeyChordOf(chords, ix);
        total += chord.mBeats;
        if (!heard.empty() && IsSameChord(heard.back(), chord)) {
            heard.back().mBeats += chord.mBeats;
        } else {
            heard.push_back(chord);
        }
    }
    if (!(total > 0.0)) {
        for (CKeyChord& chord : heard) chord.mBeats = 1.0;
    }
    return heard;
}

}  // namespace brindle
