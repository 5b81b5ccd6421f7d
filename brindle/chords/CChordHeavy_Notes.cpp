// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"

#include "brindle/theory/CompingRange.h"
#include "brindle/theory/KeyIntervals.h"

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

void CChordHeavy::_FollowLowestNote() {
    if (!mRootNoteSpecified && !mNotes.empty()) mRootNote = LowestNote();
}

}  // namespace brindle
