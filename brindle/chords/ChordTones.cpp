// SPDX-License-Identifier: MIT
#include "brindle/chords/ChordTones.h"

#include "brindle/chords/ChordDegree.h"
#include "brindle/chords/internal/SpelledOutChord.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {
namespace {

constexpr TToneMask kTonesOfOctave = 0xFFF;

// A sixth beside a diminished triad is its seventh, unless the chord has another.
bool HasDiminishedSeventh(TToneMask tones) {
    constexpr TToneMask kAsked = 0x249;    // 0 3 6 9
    constexpr TToneMask kForeign = 0xC90;  // 4 7 10 11
    return (tones & kAsked) == kAsked && (tones & kForeign) == 0;
}

TToneMask ToneMaskOf(const CChordLite& chord) {
    return static_cast<TToneMask>(chord.mSemitones.Mask() & kTonesOfOctave);
}

CChordDegree DegreeIn(const CSpelledOutChord& spelled, TToneMask tones, int tone) {
    const bool isSeventh = tone == 9 && HasDiminishedSeventh(tones);
    return isSeventh ? CChordDegree{7, -2} : spelled.DegreeOf(tone);
}

}  // namespace

CChordDegree DegreeOfTone(const CChordLite& chord, int intvl) {
    const TToneMask tones = ToneMaskOf(chord);
    const bool isTone = intvl >= 0 && intvl < 12 && HasTone(tones, intvl);
    return isTone ? DegreeIn(CSpelledOutChord(tones), tones, intvl) : CChordDegree();
}

std::vector<CKeyEnh> ChordTones(const CChordLite& chord) {
    if (chord.IsUndef()) return {};
    const TToneMask tones = ToneMaskOf(chord);
    const CSpelledOutChord spelled(tones);
    std::vector<CKeyEnh> keys;
    for (int tone = 0; tone < 12; ++tone) {
        if (!HasTone(tones, tone)) continue;
        const CKeyEnh key = DegreeIn(spelled, tones, tone).KeyOver(chord.mRootKeyEnh);
        keys.push_back(key.IsUndef() ? chord.mRootKeyEnh + tone : key);
    }
    return keys;
}

CKeyEnh ToneAboveRoot(const CChordLite& chord, int intvl) {
    CChordLite with = chord;
    with.mSemitones.AddIntvl(intvl);
    const CKeyEnh& root = chord.mRootKeyEnh;
    for (const CKeyEnh& tone : ChordTones(with)) {
        if (FoldIntoOctave(tone.mKeyNr - root.mKeyNr) == intvl) return tone;
    }
    return root + intvl;
}

}  // namespace brindle
