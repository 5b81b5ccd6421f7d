// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"

namespace brindle {

CChordHeavy::CChordHeavy(std::string_view symbol, const CChordNamePrefs& prefs)
    : CChordHeavy(CChordLite(symbol, prefs).ToChordHeavy(DefaultWrapIntvl)) {}

void SetFromString(std::string_view symbol, CChordHeavy& chord, const CChordNamePrefs& prefs) {
    chord = CChordLite(symbol, prefs).ToChordHeavy(chord.WrapIntvl());
}

}  // namespace brindle
