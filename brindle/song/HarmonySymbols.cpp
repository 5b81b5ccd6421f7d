// SPDX-License-Identifier: MIT
#include "brindle/song/HarmonySymbols.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/musicxml/CChordSetFromMusicXml.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/theory/CChordNamePrefs.h"

namespace brindle {

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
    return WriteChordSymbol(chord);
}

}  // namespace brindle
