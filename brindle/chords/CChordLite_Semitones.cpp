// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CNote.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {

namespace {

TBasicChord WithMinorThird(const CSemitones& semitones) {
    const bool fifth = semitones.HasIntvl(7);
    if (semitones.HasIntvl(6)) return fifth ? TBasicChord::Minor : TBasicChord::Diminished;
    if (fifth) return TBasicChord::Minor;
    return semitones.HasIntvl(8) ? TBasicChord::None : TBasicChord::Minor;
}

TBasicChord WithoutThird(const CSemitones& semitones) {
    if (!semitones.HasIntvl(7)) return TBasicChord::None;
    if (semitones.HasIntvl(5)) return TBasicChord::Sus4;
    if (semitones.HasIntvl(2)) return TBasicChord::Sus2;
    return semitones.HasIntvl(0) ? TBasicChord::Drone : TBasicChord::None;
}

}  // namespace

TBasicChord CChordLite::BasicChord() const {
    if (mSemitones.HasIntvl(4)) {
        const bool augmented = mSemitones.HasIntvl(8) && !mSemitones.HasIntvl(7);
        return augmented ? TBasicChord::Augmented : TBasicChord::Major;
    }
    return mSemitones.HasIntvl(3) ? WithMinorThird(mSemitones) : WithoutThird(mSemitones);
}

TBasicChord CChordLite::BasicChordForNaming() const {
    const bool halfDiminished =
        mSemitones.HasIntvl(3) && mSemitones.HasIntvl(6) && mSemitones.HasIntvl(10);
    return halfDiminished ? TBasicChord::Minor : BasicChord();
}

CSemitones CChordLite::BasicChordSemitones() const {
    CSemitones semitones;
    semitones.SetFromBasicChord(BasicChord());
    return semitones;
}

CSemitones CChordLite::OptionsSemitones() const {
    return mSemitones - BasicChordSemitones();
}

bool CChordLite::HasBasicChordIntvl(int intvl) const {
    return BasicChordSemitones().HasIntvl(intvl);
}

bool CChordLite::HasOptionsIntvl(int intvl) const {
    return OptionsSemitones().HasIntvl(intvl);
}

int CChordLite::ChordKeyNrFromKeyNr(int keyNr) const {
    if (IsUndef() || keyNr == kKeyNrUndef) return kKeyNrUndef;
    return FoldIntoOctave(std::int64_t{keyNr} - mRootKeyEnh.mKeyNr);
}

int CChordLite::KeyNrFromChordKeyNr(int chordKeyNr) const {
    if (IsUndef() || chordKeyNr == kKeyNrUndef) return kKeyNrUndef;
    return FoldIntoOctave(std::int64_t{mRootKeyEnh.mKeyNr} + chordKeyNr);
}

std::int64_t CChordLite::QuantizeToChord(std::int64_t noteNr, TQuantizeDirection direction) const {
    return _QuantizeToSemitones(noteNr, direction, mSemitones);
}

std::int64_t CChordLite::QuantizeToBasicChord(std::int64_t noteNr,
                                              TQuantizeDirection direction) const {
    return _QuantizeToSemitones(noteNr, direction, BasicChordSemitones());
}

std::int64_t CChordLite::_QuantizeToSemitones(std::int64_t noteNr, TQuantizeDirection direction,
                                              const CSemitones& semitones) const {
    if (IsUndef()) return noteNr;
    if (IsNoteNrUndef(noteNr)) return kNoteNrUndef;
    const int chordKeyNr = ChordKeyNrFromKeyNr(KeyNrOfNoteNr(noteNr));
    const int distance =
        semitones.QuantizeToActiveSemitonesAsIntvl(chordKeyNr, {direction, TWrapAtOctave_Yes});
    if (distance == kIntvlUndef) return noteNr;
    // Unsigned, because a number off the keyboard may be any number.
    return static_cast<std::int64_t>(static_cast<std::uint64_t>(noteNr) +
                                     static_cast<std::uint64_t>(distance));
}

}  // namespace brindle
