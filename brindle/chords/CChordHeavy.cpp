// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"

#include "brindle/platform/PlainText.h"
#include "brindle/theory/CompingRange.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/Spelling.h"

#include <ostream>
#include <utility>

namespace brindle {

namespace {

/// The root of the chords that are none; `enh` tells them apart.
CNote RootOfNonChord(TEnh enh) {
    CNote root;
    root.SetEnhAndDontMakeSenseful(enh);
    return root;
}

CIntvlSet IntvlsOfBasicChord(TBasicChord basicChord) {
    CSemitones semitones;
    semitones.SetFromBasicChord(basicChord);
    return semitones.IntvlSet();
}

}  // namespace

CChordHeavy::CChordHeavy(int wrapIntvl) : mRootNote(RootOfNonChord(TEnh_n)) {
    mIntvlSet.SetWrapIntvl(wrapIntvl);
}

CChordHeavy::CChordHeavy(const CNote& root, CMySet<CNote> notes, int wrapIntvl)
    : CChordHeavy(wrapIntvl) {
    mRootNote = root;
    mRootNoteSpecified = !root.IsUndef();
    SetFromNoteSet(std::move(notes));
}

CChordHeavy::CChordHeavy(const CNote& root, const CMySet<unsigned char>& noteNrs, int wrapIntvl)
    : CChordHeavy(root, CMySet<CNote>(), wrapIntvl) {
    SetFromNoteNrSet(noteNrs);
}

CChordHeavy::CChordHeavy(const CNote& root, const CSemitones& semitones, const CNote& bass)
    : CChordHeavy(root, semitones.IntvlSet(), bass) {}

CChordHeavy::CChordHeavy(const CNote& root, const CIntvlSet& intvls, const CNote& bass)
    : CChordHeavy(DefaultWrapIntvl) {
    SetRootNote(root);
    _AddTonesAndBass(intvls, bass.KeyEnh());
}

CChordHeavy::CChordHeavy(const CNote& root, TBasicChord basicChord, int wrapIntvl)
    : CChordHeavy(wrapIntvl) {
    SetRootNote(root);
    _AddTonesAndBass(IntvlsOfBasicChord(basicChord), CKeyEnh_Undef);
}

CChordHeavy::CChordHeavy(CKeyEnh root, const CSemitones& semitones, CKeyEnh bass, int wrapIntvl)
    : CChordHeavy(root, semitones.IntvlSet(), bass, wrapIntvl) {}

CChordHeavy::CChordHeavy(CKeyEnh root, const CIntvlSet& intvls, CKeyEnh bass, int wrapIntvl)
    : CChordHeavy(wrapIntvl) {
    SetRootKeyEnh(root);
    _AddTonesAndBass(intvls, bass);
}

CChordHeavy::CChordHeavy(CKeyEnh root, TBasicChord basicChord, CKeyEnh bass)
    : CChordHeavy(root, IntvlsOfBasicChord(basicChord), bass) {}

CChordHeavy::CChordHeavy(int rootKeyNr, TBasicChord basicChord, int wrapIntvl)
    : CChordHeavy(wrapIntvl) {
    SetRootKeyNr(rootKeyNr);
    _AddTonesAndBass(IntvlsOfBasicChord(basicChord), CKeyEnh_Undef);
}

void CChordHeavy::_AddTonesAndBass(const CIntvlSet& intvls, const CKeyEnh& bass) {
    for (const int intvl : intvls) AddIntvlInCompingPlusWrapIntvlRange(intvl);
    if (!bass.IsUndef()) SetBassKeyEnh(bass);
}

CKeyEnh CChordHeavy::RootKeyEnh() const {
    return mRootNote.KeyEnh();
}

void CChordHeavy::SetRootNote(const CNote& root) {
    SetRootNoteWithoutSpecify(root);
    mRootNoteSpecified = true;
    if (!root.IsUndef()) SetBassKeyEnh(root.KeyEnh());
}

void CChordHeavy::SetRootNoteWithoutSpecify(const CNote& root) {
    mRootNote = root;
    if (!mNotes.empty()) mIntvlSetNeedsUpdate = true;
}

void CChordHeavy::SetRootNoteInCompingRange(const CNote& root) {
    CNote moved = root;
    moved.mNoteNr = ToCompingRangeNoteNr(root.mNoteNr);
    SetRootNoteWithoutSpecify(moved);
    mRootNoteSpecified = true;
    if (moved.IsUndef()) return;
    DeleteAllNotesInOctave(-1);
    AddNote(moved);
}

void CChordHeavy::SetRootKeyNr(int keyNr) {
    SetRootNote(keyNr == kKeyNrUndef ? CNote_Undef : CNote(FoldIntoOctave(keyNr), TEnh_n));
}

void CChordHeavy::SetRootKeyEnh(CKeyEnh root) {
    SetRootNote(CNote(root, -1));
}

void CChordHeavy::SetRootNoteToIntvlIx(std::size_t ix) {
    SetRootNote(ix < IntvlSet().size() ? IntvlIxToNote(static_cast<int>(ix)) : CNote_Undef);
}

void CChordHeavy::SetRootNoteEnhWithLeastSigns() {
    if (mRootNote.IsUndef()) return;
    const TEnh enh = _RootWithLeastSigns(mRootNote).mEnh;
    const bool rootIsBass = BassNoteIsInLowestOctave() && LowestNote().KeyNr() == mRootNote.KeyNr();
    mRootNote.SetEnhAndDontMakeSenseful(enh);
    mIntvlSetNeedsUpdate = true;
    if (rootIsBass) SetBassKeyEnh(mRootNote.KeyEnh());
}

CNote CChordHeavy::_RootWithLeastSigns(CNote given) const {
    given.MakeSensefulEnhAssumingCMajor();
    if (given.IsUndef()) return given;
    CNote flatter = given;
    flatter.EnhShiftToFlats();
    CNote sharper = given;
    sharper.EnhShiftToSharps();

    CChordHeavy respelled = *this;
    const auto signsCountAbs = [&](const CNote& root) {
        respelled.SetRootNote(root);
        return respelled.SignsCountAbs();
    };
    const CNote* best = &given;
    int leastSigns = signsCountAbs(given);
    for (const CNote* candidate : {&flatter, &sharper}) {
        const int signs = signsCountAbs(*candidate);
        if (signs < leastSigns) {
            best = candidate;
            leastSigns = signs;
        }
    }
    return *best;
}

void CChordHeavy::SetUndef() {
    *this = CChordHeavy(WrapIntvl());
}

void CChordHeavy::SetNoChordYield() {
    SetUndef();
    mRootNote = RootOfNonChord(TEnh{0});
}

void CChordHeavy::SetNoChordForce() {
    SetUndef();
    mRootNote = RootOfNonChord(TEnh{1});
}

bool CChordHeavy::IsExactlyTheSame(const CChordHeavy& other) const {
    return mRootNote == other.mRootNote && mNotes == other.mNotes && IntvlSet() == other.IntvlSet();
}

bool CChordHeavy::IsHarmonicallyTheSame(const CChordHeavy& other) const {
    return KeyNrSet() == other.KeyNrSet();
}

bool operator==(const CChordHeavy& a, const CChordHeavy& b) {
    return a.IsExactlyTheSame(b);
}

void CChordHeavy::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"root":)");
    mRootNote.AppendJSONString(stream);
    PlainText::Write(stream, R"(,"basic":)");
    PlainText::WriteInteger(stream, static_cast<int>(BasicChord()));
    PlainText::Write(stream, R"(,"notes":[)");
    for (std::size_t ix = 0; ix < mNotes.size(); ++ix) {
        if (ix > 0) PlainText::Write(stream, ",");
        Note(ix).AppendJSONString(stream);
    }
    PlainText::Write(stream, "]}");
}

std::ostream& operator<<(std::ostream& stream, const CChordHeavy& chord) {
    stream << "CChordHeavy: root " << chord.RootNote() << ", notes";
    for (const CNote& note : chord.Notes()) stream << ' ' << note;
    return stream << ", intervals " << chord.IntvlSet();
}

const CChordHeavy& CChordHeavy_Undef() {
    static const CChordHeavy undef;
    return undef;
}

const CChordHeavy& CChordHeavy_NoChordYield() {
    static const CChordHeavy yield = [] {
        CChordHeavy chord;
        chord.SetNoChordYield();
        return chord;
    }();
    return yield;
}

const CChordHeavy& CChordHeavy_NoChordForce() {
    static const CChordHeavy force = [] {
        CChordHeavy chord;
        chord.SetNoChordForce();
        return chord;
    }();
    return force;
}

}  // namespace brindle
