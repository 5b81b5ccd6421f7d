// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"

#include "brindle/theory/CompingRange.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/NoteSearch.h"

#include <algorithm>
#include <limits>
#include <type_traits>
#include <utility>

namespace brindle {

namespace {

/// Octave -1 holds the notes 0 to 11, and the undefined note counts into it.
std::int64_t OctaveOf(const CNote& note) {
    return note.IsUndef() ? -1 : note.mNoteNr / 12 - 1;
}

template <class Predicate>
void EraseNotesIf(CMySet<CNote>& notes, Predicate predicate) {
    notes.erase(std::remove_if(notes.begin(), notes.end(), predicate), notes.end());
}

/// The listed values up to the first that is no key number.
CMySet<int> ListedKeyNrs(std::span<const int> keyNrs) {
    const auto end = std::find_if(keyNrs.begin(), keyNrs.end(),
                                  [](int keyNr) { return keyNr < 0 || keyNr > 127; });
    return {keyNrs.begin(), end};
}

/// The note moved and limited to 0 to 127, in a spelling that suits its new key.
CNote Moved(CNote note, std::int64_t distance) {
    constexpr std::int64_t farAway = std::int64_t{1} << 40;
    const std::int64_t from = std::clamp(note.mNoteNr, -farAway, farAway);
    note.SetNoteNrAndMakeSensefulEnhAssumingCMajor(
        std::clamp<std::int64_t>(from + distance, 0, 127));
    return note;
}

}  // namespace

CNote CChordHeavy::Note(std::size_t ix) const {
    return ix < mNotes.size() ? *mNotes.nth(ix) : CNote_Undef;
}

CNote CChordHeavy::LowestNote() const {
    return mNotes.empty() ? CNote_Undef : *mNotes.begin();
}

CNote CChordHeavy::HighestNote() const {
    return mNotes.empty() ? CNote_Undef : *mNotes.rbegin();
}

bool CChordHeavy::HasNote(const CNote& note) const {
    return mNotes.contains(note);
}

bool CChordHeavy::HasNoteNr(std::int64_t noteNr) const {
    CNote first;
    first.mNoteNr = noteNr;
    first.mEnh = static_cast<TEnh>(std::numeric_limits<std::underlying_type_t<TEnh>>::min());
    const auto it = mNotes.lower_bound(first);
    return it != mNotes.end() && it->mNoteNr == noteNr;
}

bool CChordHeavy::HasKeyNr(int keyNr) const {
    return std::any_of(mNotes.begin(), mNotes.end(),
                       [keyNr](const CNote& note) { return note.KeyNr() == keyNr; });
}

CMySet<int> CChordHeavy::KeyNrSet() const {
    CMySet<int> keyNrs;
    for (const CNote& note : mNotes) {
        if (!note.IsUndef()) keyNrs.insert(note.KeyNr());
    }
    return keyNrs;
}

bool CChordHeavy::HasKeyNrs(std::span<const int> keyNrs) const {
    return KeyNrSet().Includes(ListedKeyNrs(keyNrs));
}

bool CChordHeavy::HasExactTheseKeyNrs(std::span<const int> keyNrs) const {
    return KeyNrSet() == ListedKeyNrs(keyNrs);
}

int CChordHeavy::CountNotesInOctave(int octave) const {
    return static_cast<int>(
        std::count_if(mNotes.begin(), mNotes.end(),
                      [octave](const CNote& note) { return OctaveOf(note) == octave; }));
}

bool CChordHeavy::IsNarrowChord() const {
    // The highest is not below the lowest, so the difference always fits without a sign.
    return static_cast<std::uint64_t>(HighestNote().mNoteNr) -
               static_cast<std::uint64_t>(LowestNote().mNoteNr) <
           13;
}

void CChordHeavy::SetFromNoteSet(CMySet<CNote> notes) {
    mNotes = std::move(notes);
    mIntvlSetNeedsUpdate = true;
    _FollowLowestNote();
}

void CChordHeavy::SetFromNoteNrSet(const CMySet<unsigned char>& noteNrs) {
    CMySet<CNote> notes;
    for (const unsigned char noteNr : noteNrs) notes.emplace(noteNr, TEnh_n);
    SetFromNoteSet(std::move(notes));
}

void CChordHeavy::SetFromKeyNrSet(const CMySet<int>& keyNrs) {
    CMySet<CNote> notes;
    for (const int keyNr : keyNrs) {
        if (keyNr == kKeyNrUndef) continue;
        notes.emplace(ToCompingRangeNoteNr(FoldIntoOctave(keyNr)), TEnh_n);
    }
    SetFromNoteSet(std::move(notes));
}

void CChordHeavy::SetSemitones(const CSemitones& semitones) {
    ClearAllExceptRoot();
    if (!mRootNote.IsUndef()) {
        CNote root(mRootNote.KeyEnh(), -1);
        root.SetEnh(mRootNote.mEnh);
        mNotes.insert(root);
    }
    for (const int intvl : semitones.IntvlSet()) AddIntvlInCompingPlusWrapIntvlRange(intvl);
}

void CChordHeavy::SetBasicChord(TBasicChord basicChord) {
    CSemitones semitones;
    semitones.SetFromBasicChord(basicChord);
    SetSemitones(semitones);
}

void CChordHeavy::SetRootKeyNrAndBasicChord(int rootKeyNr, TBasicChord basicChord) {
    SetRootKeyNr(rootKeyNr);
    SetBasicChord(basicChord);
}

void CChordHeavy::AddNote(const CNote& note) {
    mNotes.insert(note);
    mIntvlSetNeedsUpdate = true;
    _FollowLowestNote();
}

void CChordHeavy::DelNote(const CNote& note) {
    mNotes.erase(note);
    mIntvlSetNeedsUpdate = true;
    _FollowLowestNote();
}

void CChordHeavy::DelNote(std::size_t ix) {
    if (ix < mNotes.size()) DelNote(Note(ix));
}

void CChordHeavy::DeleteAllNotesInOctave(int octave) {
    EraseNotesIf(mNotes, [octave](const CNote& note) { return OctaveOf(note) == octave; });
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::_DelNotesOfKeyNr(int keyNr) {
    EraseNotesIf(mNotes, [keyNr](const CNote& note) { return note.KeyNr() == keyNr; });
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::ClearAllExceptRoot() {
    mNotes.clear();
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::AddIntvl(int intvl) {
    CNote note = mRootNote;
    note.AddIntvlAndClampToKey(intvl);
    _AddNoteNrAndIntvlIfNotAlreadyContained(intvl == kIntvlUndef ? kNoteNrUndef : note.mNoteNr);
}

void CChordHeavy::AddIntvlSetAboveRootNote(const CIntvlSet& intvls) {
    for (const int intvl : intvls) AddIntvl(intvl);
}

void CChordHeavy::AddIntvlInCompingRange(int intvl) {
    const bool undefined = mRootNote.IsUndef() || intvl == kIntvlUndef;
    const int keyNr = FoldIntoOctave(std::int64_t{mRootNote.KeyNr()} + intvl);
    _AddNoteNrAndIntvlIfNotAlreadyContained(undefined ? kNoteNrUndef : ToCompingRangeNoteNr(keyNr));
}

void CChordHeavy::AddIntvlSetInCompingRange(const CIntvlSet& intvls) {
    for (const int intvl : intvls) AddIntvlInCompingRange(intvl);
}

void CChordHeavy::AddIntvlInCompingPlusWrapIntvlRange(int intvl) {
    _AddNoteNrAndIntvlIfNotAlreadyContained(
        NoteNrAddIntvlToCompingPlusWrapIntvlRange(mRootNote.mNoteNr, intvl, WrapIntvl()));
}

void CChordHeavy::_AddNoteNrAndIntvlIfNotAlreadyContained(std::int64_t noteNr) {
    const CNote note(noteNr, TEnh_n);
    if (HasNoteNr(note.mNoteNr)) return;
    // The root does not follow: the interval was counted from it.
    mNotes.insert(note);
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::Transpose(int intvl) {
    CMySet<CNote> moved;
    for (const CNote& note : mNotes) moved.insert(note.IsUndef() ? note : Moved(note, intvl));
    mNotes = std::move(moved);
    if (!mRootNote.IsUndef()) mRootNote = Moved(mRootNote, intvl);
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::Invert() {
    CNote note = LowestNote();
    if (note.IsUndef()) return;
    const std::int64_t highest = HighestNote().mNoteNr;
    mNotes.erase(mNotes.begin());
    note.mNoteNr =
        highest >= 116 ? 108 + note.KeyNr() : NoteNrOfKeyNrLargerThan(note.KeyNr(), highest);
    mNotes.insert(note);
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::ChangeAllNotesWithinIntvlRange(int lo, int hi, int target) {
    if (mRootNote.IsUndef()) return;
    bool anyMoved = false;
    CMySet<CNote> moved;
    for (const CNote& note : mNotes) {
        const int intvl = AbsKeyIntvlFromTo(mRootNote.KeyNr(), note.KeyNr());
        if (note.IsUndef() || intvl < lo || intvl > hi) {
            moved.insert(note);
            continue;
        }
        const std::int64_t distance = std::int64_t{target} - intvl;
        anyMoved = anyMoved || distance != 0;
        // Kept: a far target is left behind instead of reached.
        moved.insert(Moved(note, distance > 5 ? -distance : distance));
    }
    if (!anyMoved) return;
    mNotes = std::move(moved);
    mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::_FollowLowestNote() {
    if (!mRootNoteSpecified && !mNotes.empty()) mRootNote = LowestNote();
}

}  // namespace brindle
