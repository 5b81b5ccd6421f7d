// SPDX-License-Identifier: MIT
// The members of the scales that build chords, and of the chord that counts the signs of a scale.
#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CompingRange.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/Spelling.h"

#include <algorithm>
#include <array>

namespace brindle {

namespace {

/// A degree that a chord may leave open, as the two intervals it can stand on. The first is taken
/// if the base scale has both.
struct CPick {
    int first;
    int second;
};

constexpr CPick kThird{3, 4};
constexpr CPick kPickOfFifth{7, 6};
constexpr auto kOtherDegrees = std::to_array<CPick>({{2, 1}, {5, 6}, {5, 7}, {9, 8}, {10, 11}});

void FillDegree(CSemitones& scale, const CSemitones& base, CPick pick) {
    if (scale.HasIntvl(pick.first) || scale.HasIntvl(pick.second)) return;
    if (base.HasIntvl(pick.first)) {
        scale.AddIntvl(pick.first);
    } else if (base.HasIntvl(pick.second)) {
        scale.AddIntvl(pick.second);
    }
}

/// The keys as intervals above `root`.
CSemitones IntvlsAbove(int root, const CMySet<int>& keyNrs) {
    CSemitones semitones;
    for (const int keyNr : keyNrs) semitones.AddIntvl(keyNr - root);
    return semitones;
}

/// What fills the degrees of a chord's scale when no scale is given.
CScaleHeavy BaseScaleOf(const CNote& root, TBasicChord basicChord) {
    const bool minor = basicChord == TBasicChord::Minor || basicChord == TBasicChord::Diminished;
    return {root, minor ? st_min : st_maj};
}

}  // namespace

CChordHeavy CScaleHeavy::ChordFromScaleStepSet(const CMySet<int>& steps) const {
    if (IsUndef()) return CChordHeavy_Undef();
    CNote start = mRootNote;
    start.mNoteNr = ToCompingRangeNoteNr(start.mNoteNr);

    CChordHeavy chord;
    for (const int step : steps) {
        const CNote note = MoveInScale(start, step);
        if (chord.Notes().empty()) {
            chord.SetRootNoteInCompingRange(note);
        } else {
            chord.AddNote(note);
        }
    }
    return chord;
}

CChordHeavy CScaleHeavy::ChordTriadForScale() const {
    return ChordFromScaleStepSet({0, 2, 4});
}

bool CScaleHeavy::ChordIsDiatonicInScaleDisregardingEnh(const CChordHeavy& chord) const {
    const CMySet<CNote>& notes = chord.Notes();
    return std::all_of(notes.begin(), notes.end(), [this](const CNote& note) {
        return note.IsUndef() || HasKeyNr(note.KeyNr());
    });
}

bool CScaleHeavy::ChordBasicChordAndBassNoteIsDiatonicInScaleDisregardingEnh(
    const CChordHeavy& chord) const {
    const CNote bass = chord.LowestNote();
    if (!bass.IsUndef() && !HasKeyNr(bass.KeyNr())) return false;
    if (chord.RootNote().IsUndef()) return true;
    const CIntvlSet intvls = chord.BasicChordSemitones().IntvlSet();
    return std::all_of(intvls.begin(), intvls.end(), [&](int intvl) {
        return HasKeyNr(FoldIntoOctave(chord.RootNote().KeyNr() + intvl));
    });
}

CScaleHeavy CScaleHeavy::ConstructScaleForChord(const CChordHeavy& chord) const {
    if (chord.RootNote().IsUndef()) return CScaleHeavy_Undef;
    const CKeyEnh root = chord.RootKeyEnh();
    const TBasicChord basicChord = chord.BasicChord();
    const bool given = !IsUndef() && mScaleType != st_Undef;
    const CScaleHeavy baseScale = given ? *this : BaseScaleOf(chord.RootNote(), basicChord);
    const CSemitones base = IntvlsAbove(root.mKeyNr, baseScale.ToKeyNrSet());

    CSemitones scale = IntvlsAbove(root.mKeyNr, chord.KeyNrSet());
    scale.AddIntvl(0);
    FillDegree(scale, base, kThird);
    if (basicChord == TBasicChord::Augmented) {
        scale.AddIntvl(8);
        scale.AddIntvl(9);
    } else {
        FillDegree(scale, base, kPickOfFifth);
    }
    for (const CPick pick : kOtherDegrees) FillDegree(scale, base, pick);

    const TEnh enh = MakeSensefulEnhForKeyNrAssumingCMajor(root.mKeyNr, root.mEnh);
    return {CKeyEnh{root.mKeyNr, enh}, scale};
}

CChordLite CScaleLite::ChordTriadForScale() const {
    CChordLite chord;
    chord.SetFromChordHeavy(CScaleHeavy(mRootKeyEnh, mSemitones).ChordTriadForScale());
    return chord;
}

CScaleLite CScaleLite::ConstructScaleForChord(const CChordLite& chord) const {
    const CScaleHeavy scale(mRootKeyEnh, mSemitones);
    return CScaleLite(
        scale.ConstructScaleForChord(chord.ToChordHeavy(CChordHeavy::DefaultWrapIntvl)));
}

void CScaleLite::SetRootKeyEnhWithLeastSigns() {
    if (IsUndef()) return;
    CChordHeavy chord(mRootKeyEnh, mSemitones, CKeyEnh_Undef);
    chord.SetRootNoteEnhWithLeastSigns();
    mRootKeyEnh.mEnh = chord.RootNote().mEnh;
}

int CChordHeavy::SignsCountAbs() const {
    return CScaleHeavy_Undef.ConstructScaleForChord(*this).SignsCountAbs();
}

}  // namespace brindle
