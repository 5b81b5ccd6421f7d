// SPDX-License-Identifier: MIT
#include "brindle/song/HarmonySymbols.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/musicxml/CChordSetFromMusicXml.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyNames.h"

#include <algorithm>
#include <array>

namespace brindle {
namespace {

struct TSuffix {
    std::string_view mKind;
    std::string_view mSuffix;
};

// What lead sheets print behind the root for each kind of chord.
constexpr auto kSuffixes = std::to_array<TSuffix>({
    {"major", ""},
    {"minor", "m"},
    {"augmented", "aug"},
    {"diminished", "dim"},
    {"dominant", "7"},
    {"major-seventh", "maj7"},
    {"minor-seventh", "m7"},
    {"diminished-seventh", "dim7"},
    {"augmented-seventh", "7#5"},
    {"half-diminished", "m7b5"},
    {"major-minor", "mmaj7"},
    {"major-sixth", "6"},
    {"minor-sixth", "m6"},
    {"dominant-ninth", "9"},
    {"major-ninth", "maj9"},
    {"minor-ninth", "m9"},
    {"dominant-11th", "11"},
    {"major-11th", "maj11"},
    {"minor-11th", "m11"},
    {"dominant-13th", "13"},
    {"major-13th", "maj13"},
    {"minor-13th", "m13"},
    {"suspended-second", "sus2"},
    {"suspended-fourth", "sus4"},
    {"power", "5"},
});

std::string NameOf(const CKeyEnh& key) {
    return KeyNrAndEnhToName(key.mKeyNr, key.mEnh, ChordNamePrefsNonUTF8);
}

std::string DegreeText(const TMusicXMLDegree& degree) {
    std::string text;
    if (degree.mType == "subtract") return "no" + degree.mValue;
    if (degree.mType == "add" && degree.mAlter == 0) text = "add";
    if (degree.mAlter < 0) text = "b";
    if (degree.mAlter > 0) text = "#";
    return text + degree.mValue;
}

// As it is printed; empty for a kind that lead sheets have no sign for.
std::string PrintedSymbol(const TMusicXMLHarmony& harmony) {
    const auto row = std::find_if(kSuffixes.begin(), kSuffixes.end(), [&](const TSuffix& suffix) {
        return suffix.mKind == harmony.mKind;
    });
    if (row == kSuffixes.end()) return {};
    std::string symbol = NameOf(harmony.mRoot.ToKeyEnh(ChordNamePrefsNonUTF8));
    // "C7sus4": what is suspended stands last.
    const bool isSuspended = row->mSuffix.substr(0, 3) == "sus";
    if (!isSuspended) symbol += row->mSuffix;
    for (const TMusicXMLDegree& degree : harmony.mDegrees) {
        symbol += isSuspended && degree.mAlter == 0 ? degree.mValue : DegreeText(degree);
    }
    if (isSuspended) symbol += row->mSuffix;
    const CKeyEnh bass = harmony.mBass.ToKeyEnh(ChordNamePrefsNonUTF8);
    if (!bass.IsUndef()) symbol += '/' + NameOf(bass);
    return symbol;
}

}  // namespace

bool IsNoChord(const TMusicXMLHarmony& harmony) {
    return harmony.mRoot.mStep == kNoChordSymbol || harmony.mKind == "none";
}

CChordLite ChordOfHarmony(const TMusicXMLHarmony& harmony) {
    CChordLite chord;
    if (IsNoChord(harmony)) return chord;
    chord.SetFromChordHeavy(CChordSetFromMusicXml(harmony, 24, CurrentChordNamePrefs));
    return chord;
}

std::string HarmonySymbol(const TMusicXMLHarmony& harmony) {
    if (IsNoChord(harmony)) return std::string(kNoChordSymbol);
    const CChordHeavy heavy = CChordSetFromMusicXml(harmony, 24, ChordNamePrefsNonUTF8);
    if (heavy.RootKeyEnh().IsUndef()) return "?";
    CChordLite chord;
    chord.SetFromChordHeavy(heavy);
    std::string printed = PrintedSymbol(harmony);
    if (!printed.empty() && CChordLite(printed, ChordNamePrefsNonUTF8) == chord) return printed;
    std::string name = heavy.NameWithSlash(ChordNamePrefsNonUTF8);
    const bool isRight = printed.empty() || CChordLite(name, ChordNamePrefsNonUTF8) == chord;
    return isRight ? name : printed;
}

}  // namespace brindle
