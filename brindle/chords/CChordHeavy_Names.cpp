// SPDX-License-Identifier: MIT
// The name of a chord: root, basic chord, options, slash and bass.
#include "brindle/chords/BasicChordNames.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/platform/Ascii.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/Spelling.h"

namespace brindle {

namespace {

/// The name of a chord without a root, which its spelling tells.
std::string_view NameOfNonChord(const CNote& root) {
    if (root == CChordHeavy_NoChordYield().RootNote()) return "No Chord Yield";
    if (root == CChordHeavy_NoChordForce().RootNote()) return "No Chord Force";
    return "No Chord";
}

void LowerFirstLetter(std::string& name) {
    // A syllable may be translated by nothing.
    if (!name.empty()) name.front() = Ascii::ToLower(name.front());
}

}  // namespace

std::string CChordHeavy::Name(const CChordNamePrefs& prefs) const {
    return prefs.mChordPrefB && IsNarrowChord() ? NameWithoutSlash(prefs) : NameWithSlash(prefs);
}

std::string CChordHeavy::NameWithoutSlash(const CChordNamePrefs& prefs) const {
    if (mRootNote.IsUndef()) return std::string(NameOfNonChord(mRootNote));
    std::string name = mRootNote.KeyName(prefs);
    if (prefs.mLowerCaseMinorRoot && BasicChord() == Minor) LowerFirstLetter(name);
    if (mNotes.size() >= 2) name += BasicChordAndOptionsName(prefs);
    return name;
}

std::string CChordHeavy::NameWithSlash(const CChordNamePrefs& prefs) const {
    std::string name = NameWithoutSlash(prefs);
    if (mNotes.empty() || LowestNote().KeyNr() == mRootNote.KeyNr()) return name;
    CNote& bass = *mNotes.begin();
    bass.AdjustEnhToScale(CScaleHeavy_Undef.ConstructScaleForChord(*this));
    name += prefs.mCommaParts ? "," : OptionalSpaceAroundSlash(prefs);
    name += prefs.mSlashText;
    name += OptionalSpaceAroundSlash(prefs);
    name += bass.IsUndef() ? "Undefined" : bass.KeyName(prefs);
    return name;
}

bool CChordHeavy::BasicChordNameAfterOptionsName() const {
    const TBasicChord basicChord = BasicChord();
    return basicChord == Sus4 || basicChord == Sus2;
}

std::string CChordHeavy::BasicChordAndOptionsName(const CChordNamePrefs& prefs) const {
    const TBasicChord basicChord = BasicChord();
    const bool optionsFirst = BasicChordNameAfterOptionsName();
    std::string name;
    if (prefs.mCommaParts) {
        name += ',';
        name += optionsFirst ? OptionsName(prefs)
                             : BasicChordNameWithPreceedingOptionalSpace(basicChord, prefs);
        name += ',';
        name += optionsFirst ? std::string(BasicChordName(basicChord, prefs)) : OptionsName(prefs);
        return name;
    }
    if (optionsFirst) name += OptionsNameWithPreceedingOptionalSpace(prefs);
    name += BasicChordNameWithPreceedingOptionalSpace(basicChord, prefs);
    if (!optionsFirst) name += OptionsNameWithPreceedingOptionalSpace(prefs);
    return name;
}

std::string CChordHeavy::NameForThisRootNote(const CNote& note,
                                             const CChordNamePrefs& prefs) const {
    CNote root = note;
    if (!root.HasSensefulEnh()) root.AdjustEnhToScale(CScaleHeavy(0, st_maj));
    CChordHeavy chord = *this;
    chord.SetRootNote(root);
    return chord.Name(prefs);
}

std::string CChordHeavy::NameWithLeastSignsForThisRootNote(CNote& note,
                                                           const CChordNamePrefs& prefs) const {
    note = _RootWithLeastSigns(note);
    CChordHeavy chord = *this;
    chord.SetRootNote(note);
    return chord.Name(prefs);
}

}  // namespace brindle
