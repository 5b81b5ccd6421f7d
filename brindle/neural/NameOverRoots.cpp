// SPDX-License-Identifier: MIT
#include "brindle/neural/NameOverRoots.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>

namespace brindle {
namespace {

// Octaves do not matter for a name, but the lowest octave of the keyboard is that of the root and
// there must be room for one note above the others.
CMySet<CNote> AwayFromTheEnds(const CMySet<CNote>& notes) {
    constexpr std::int64_t lowest = 12;
    constexpr std::int64_t highest = 127;
    const bool isLow = !notes.empty() && notes.begin()->mNoteNr < lowest;
    const bool isHigh = !notes.empty() && notes.begin()->mNoteNr + 12 > highest;
    CMySet<CNote> moved;
    for (CNote note : notes) {
        if (isHigh) note.mNoteNr -= 12;
        if (isLow && note.mNoteNr + 12 <= highest) note.mNoteNr += 12;
        moved.insert(note);
    }
    return moved;
}

// Of a bass that belongs to the triad the chord has the note above it, too.
CChordHeavy ChordOn(const CKeyEnh& root, const CMySet<CNote>& notes) {
    CChordHeavy chord(CNote(root, -1), notes, 12);
    if (notes.empty()) return chord;
    const CNote bass = *notes.begin();
    const int intvl = AbsKeyIntvlFromTo(root.mKeyNr, bass.KeyNr());
    const bool isOfTriad = intvl == 3 || intvl == 4 || (intvl >= 6 && intvl <= 8);
    if (isOfTriad) chord.AddNote({bass.mNoteNr + 12, bass.mEnh});
    return chord;
}

CChordOverRoot NameOn(const CKeyEnh& root, const CMySet<CNote>& notes,
                      const CChordNamePrefs& prefs) {
    const CChordHeavy chord = ChordOn(root, notes);
    CChordOverRoot named;
    named.mRoot = root;
    named.mName = chord.NameWithSlash(prefs);  // which spells the bass
    if (chord.IsSlashChord()) named.mBass = chord.BassKeyEnh();
    named.mName = chord.Name(prefs);
    named.mOptions = chord.OptionsStringVector(prefs);
    named.mBasicChord = chord.BasicChord();
    named.mIsSounding = chord.HasKeyNr(root.mKeyNr);
    return named;
}

CKeyEnh LikeliestRoot(const CMySet<CNote>& notes, TSingleChordAnalysisAlgo search) {
    CChordHeavy chord;
    chord.SetFromNoteSet(notes);
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(search);
    return chord.RootKeyEnh();
}

// The key in the spelling with which the chord on it needs the fewest signs.
CKeyEnh SpelledRoot(int keyNr, const CMySet<CNote>& notes) {
    CChordHeavy chord;
    chord.SetFromNoteSet(notes);
    CNote root(keyNr, TEnh_n);
    static_cast<void>(chord.NameWithLeastSignsForThisRootNote(root, ChordNamePrefsNonUTF8));
    return root.KeyEnh();
}

}  // namespace

std::vector<CChordOverRoot> NameOverRoots(const CMySet<CNote>& typed,
                                          const CNameOverRootOptions& options) {
    const CMySet<CNote> notes = AwayFromTheEnds(typed);
    const CKeyEnh root =
        options.mRoot.IsUndef() ? LikeliestRoot(notes, options.mSearch) : options.mRoot;
    std::vector<CChordOverRoot> names{NameOn(root, notes, options.mPrefs)};
    if (!options.mAllRoots || root.IsUndef()) return names;
    for (int intvl = 1; intvl < 12; ++intvl) {
        const CKeyEnh other = SpelledRoot(FoldIntoOctave(root.mKeyNr + intvl), notes);
        names.push_back(NameOn(other, notes, options.mPrefs));
    }
    std::stable_sort(names.begin() + 1, names.end(),
                     [](const CChordOverRoot& a, const CChordOverRoot& b) {
                         return a.mIsSounding && !b.mIsSounding;
                     });
    return names;
}

}  // namespace brindle
