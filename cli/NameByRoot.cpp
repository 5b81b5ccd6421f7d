// SPDX-License-Identifier: MIT
#include "cli/Name.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/present/CTable.h"
#include "brindle/present/ShownNames.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"

#include <algorithm>
#include <utility>

namespace brindle::cli {
namespace {

// The name that the notes have with one root.
struct CNamed {
    CKeyEnh mRoot;
    CKeyEnh mBass;  // where it is not the root
    std::string mName;
    std::vector<std::string> mOptions;
    TBasicChord mBasicChord = TBasicChord::None;
    bool mIsSounding = false;
};

// All names of some notes, the best one first.
struct CNamedNotes {
    std::vector<CNote> mNotes;
    std::vector<CNamed> mNames;
};

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

// Names the chord as it sounds, its inversions too. A third or a fifth in the bass belongs to the
// triad, so that E G C is C/E; any other bass is foreign to it, as in C/Bb.
CChordHeavy ChordOn(const CKeyEnh& root, const CMySet<CNote>& notes) {
    CChordHeavy chord(CNote(root, -1), notes, 12);
    if (notes.empty()) return chord;
    const CNote bass = *notes.begin();
    const int intvl = AbsKeyIntvlFromTo(root.mKeyNr, bass.KeyNr());
    const bool isOfTriad = intvl == 3 || intvl == 4 || (intvl >= 6 && intvl <= 8);
    if (isOfTriad) chord.AddNote({bass.mNoteNr + 12, bass.mEnh});
    return chord;
}

CNamed NameOn(const CKeyEnh& root, const CMySet<CNote>& notes, const CChordNamePrefs& prefs) {
    const CChordHeavy chord = ChordOn(root, notes);
    CNamed named;
    named.mRoot = root;
    named.mName = chord.NameWithSlash(prefs);  // which spells the bass
    if (chord.IsSlashChord()) named.mBass = chord.BassKeyEnh();
    named.mName = chord.Name(prefs);
    named.mOptions = chord.OptionsStringVector(prefs);
    named.mBasicChord = chord.BasicChord();
    named.mIsSounding = chord.HasKeyNr(root.mKeyNr);
    return named;
}

CKeyEnh LikeliestRoot(const CMySet<CNote>& notes, const std::string& method) {
    CChordHeavy chord;
    chord.SetFromNoteSet(notes);
    chord.SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(
        method == "net" ? TSingleChordAnalysisAlgo_NeuronalNet : TSingleChordAnalysisAlgo_Score);
    return chord.RootKeyEnh();
}

// The key in the spelling with which the chord on it needs the fewest signs.
CKeyEnh SpelledRoot(int keyNr, const CMySet<CNote>& notes) {
    CChordHeavy chord;
    chord.SetFromNoteSet(notes);
    CNote root(keyNr, TEnh_n);
    static_cast<void>(chord.NameWithLeastSignsForThisRootNote(root, NamePrefs()));
    return root.KeyEnh();
}

CNamedNotes NamesOf(const CMySet<CNote>& typed, const CNameOptions& options) {
    const CChordNamePrefs prefs = options.mNaming.Prefs();
    const CMySet<CNote> notes = AwayFromTheEnds(typed);
    const bool isSearched = options.mRootKey.IsUndef();
    const CKeyEnh root = isSearched ? LikeliestRoot(notes, options.mMethod) : options.mRootKey;
    CNamedNotes named{{typed.begin(), typed.end()}, {NameOn(root, notes, prefs)}};
    if (!options.mAllRoots || root.IsUndef()) return named;
    for (int intvl = 1; intvl < 12; ++intvl) {
        const CKeyEnh other = SpelledRoot(FoldIntoOctave(root.mKeyNr + intvl), notes);
        named.mNames.push_back(NameOn(other, notes, prefs));
    }
    // Roots that sound come before those that are left out.
    std::stable_sort(
        named.mNames.begin() + 1, named.mNames.end(),
        [](const CNamed& a, const CNamed& b) { return a.mIsSounding && !b.mIsSounding; });
    return named;
}

Json NameToJson(const CNamed& named) {
    return {{"Name", named.mName},
            {"RootKeyEnh", KeyEnhToJson(named.mRoot)},
            {"BassKeyEnh", KeyEnhToJson(named.mBass)},
            {"BasicChord", BasicChordName(named.mBasicChord)},
            {"Options", named.mOptions},
            {"RootSounds", named.mIsSounding}};
}

std::string NamesJson(const std::vector<CNamedNotes>& chords, const CNameOptions& options) {
    CChordNamePrefs notePrefs = NamePrefs();
    notePrefs.mOctaveNaming = options.mNaming.Prefs().mOctaveNaming;
    Json list = Json::array();
    for (const CNamedNotes& chord : chords) {
        Json json{{"Notes", NotesToJson(chord.mNotes, notePrefs)}};
        json.update(NameToJson(chord.mNames.front()));
        if (options.mAllRoots) {
            json["AllRoots"] = Json::array();
            for (const CNamed& named : chord.mNames) json["AllRoots"].push_back(NameToJson(named));
        }
        list.push_back(std::move(json));
    }
    return JsonText({{"Chords", list}});
}

std::string NamesByRootText(const std::vector<CNamedNotes>& chords, const CNameOptions& options,
                            const CPaint& paint) {
    const CChordNamePrefs prefs = options.mNaming.Prefs();
    const auto nameOf = [&](const CKeyEnh& key) {
        return key.IsUndef() ? "-" : KeyNrAndEnhToName(key.mKeyNr, key.mEnh, prefs);
    };
    CTable table({"notes", "name", "root", "bass", "basic chord"});
    for (const CNamedNotes& chord : chords) {
        std::string notes = NotesName(chord.mNotes, prefs);
        for (const CNamed& named : chord.mNames) {
            const std::string root = nameOf(named.mRoot);
            table.AddRow({std::exchange(notes, {}), named.mName,
                          named.mIsSounding ? root : '(' + root + ')', nameOf(named.mBass),
                          std::string(BasicChordName(named.mBasicChord))});
        }
    }
    return table.Text(paint);
}

std::vector<CNamedNotes> AllNamesByRoot(const std::vector<CNotesText>& sets,
                                        const CNameOptions& options) {
    std::vector<CNamedNotes> chords;
    for (const CNotesText& set : sets) chords.push_back(NamesOf(set.mNotes, options));
    return chords;
}

}  // namespace

std::string NameByRoot(const std::vector<CNotesText>& sets, const CNameOptions& options) {
    const auto chords = AllNamesByRoot(sets, options);
    if (options.mFormat.Format() == TFormat::Json) return NamesJson(chords, options);
    return NamesByRootText(chords, options, PaintOfOutput());
}

}  // namespace brindle::cli
