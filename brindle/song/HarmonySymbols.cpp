// SPDX-License-Identifier: MIT
#include "brindle/song/HarmonySymbols.h"

#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/musicxml/CChordSetFromMusicXml.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/theory/CChordNamePrefs.h"

namespace brindle {

CChordLite ChordOfHarmony(const TMusicXMLHarmony& harmony) {
    CChordLite chord;
    if (harmony.IsNoChord()) return chord;
    chord.SetFromChordHeavy(CChordSetFromMusicXml(harmony, 24, CurrentChordNamePrefs));
    return chord;
}

std::string HarmonySymbol(const TMusicXMLHarmony& harmony) {
    if (harmony.IsNoChord()) return std::string(kNoChordSymbol);
    const CChordHeavy heavy = CChordSetFromMusicXml(harmony, 24, ChordNamePrefsNonUTF8);
    if (heavy.RootKeyEnh().IsUndef()) return "?";
    CChordLite chord;
    chord.SetFromChordHeavy(heavy);
    return WriteChordSymbol(chord);
}

}  // namespace brindle
