// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordLite.h"
#include "brindle/chords/CChordSetFromStringHelper.h"

namespace brindle {

CChordLite::CChordLite(std::string_view symbol, const CChordNamePrefs& prefs) {
    SetFromString(symbol, prefs);
}

CChordLite::CChordLite(const char* symbol, const CChordNamePrefs& prefs) {
    if (symbol != nullptr) SetFromString(symbol, prefs);
}

void CChordLite::SetFromString(std::string_view symbol, const CChordNamePrefs& prefs) {
    CChordSetFromStringHelper::SetFromString(symbol, *this, prefs);
}

void SetFromString(std::string_view symbol, CChordLite& chord, const CChordNamePrefs& prefs) {
    CChordSetFromStringHelper::SetFromString(symbol, chord, prefs);
}

}  // namespace brindle
