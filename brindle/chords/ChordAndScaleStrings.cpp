// SPDX-License-Identifier: MIT
#include "brindle/chords/ChordAndScaleStrings.h"
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/ScaleStrings.h"

namespace brindle {

std::pair<CChordLite, CScaleLite> ChordAndScaleFromString(std::string_view text,
                                                          const CChordNamePrefs& prefs) {
    CChordLite chord;
    CScaleLite scale;
    const std::size_t chordEnd = text.find(';');
    SetFromString(text.substr(0, chordEnd), chord, prefs);
    if (chordEnd == std::string_view::npos) return {chord, scale};
    const std::string_view rest = text.substr(chordEnd + 1);
    SetFromString(rest.substr(0, rest.find(';')), scale, prefs);
    return {chord, scale};
}

std::pair<CChordLite, CScaleLite> ChordAndScaleFromString(const char* text,
                                                          const CChordNamePrefs& prefs) {
    if (text == nullptr) return {};
    return ChordAndScaleFromString(std::string_view(text), prefs);
}

std::string ChordAndScaleToString(const CChordLite& chord, const CScaleLite& scale,
                                  const CChordNamePrefs& prefs) {
    std::string text = chord.ToChordHeavy(CChordHeavy::DefaultWrapIntvl).Name(prefs);
    if (scale.IsUndef()) return text;
    text += "; ";
    text += CScaleHeavy(scale.mRootKeyEnh, scale.mSemitones).FullName(prefs);
    return text;
}

}  // namespace brindle
