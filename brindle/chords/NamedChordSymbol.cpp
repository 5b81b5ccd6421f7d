// SPDX-License-Identifier: MIT
#include "brindle/chords/NameNotes.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/platform/Ascii.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/KeyNames.h"

#include <string_view>

namespace brindle {
namespace {

std::string_view MajorSeventhWord(const CChordNamePrefs& prefs) {
    if (prefs.mChordPrefC == 1) return "j";
    return prefs.mChordPrefC == 2 ? "maj" : "ma";
}

// A sign of a degree, and not the b of "sub".
bool IsSignAt(std::string_view suffix, std::size_t ix) {
    const bool isSign = suffix[ix] == 'b' || suffix[ix] == '#';
    return isSign && ix + 1 < suffix.size() && suffix[ix + 1] >= '1' && suffix[ix + 1] <= '9';
}

std::string SuffixInStyle(std::string_view suffix, const CChordNamePrefs& prefs) {
    constexpr std::string_view major = "maj";
    std::string text;
    for (std::size_t ix = 0; ix < suffix.size(); ++ix) {
        if (suffix.substr(ix, major.size()) == major) {
            text += MajorSeventhWord(prefs);
            ix += major.size() - 1;
        } else if (IsSignAt(suffix, ix)) {
            text += suffix[ix] == 'b' ? FlatAsUTF8OrNot(prefs) : SharpAsUTF8OrNot(prefs);
        } else {
            text += suffix[ix];
        }
    }
    return text;
}

bool IsMinor(std::string_view suffix) {
    return suffix.substr(0, 1) == "m" && suffix.substr(0, 3) != "maj";
}

std::string RootInStyle(const CNamedChord& chord, const CChordNamePrefs& prefs) {
    std::string root = KeyNrAndEnhToName(chord.mRoot.mKeyNr, chord.mRoot.mEnh, prefs);
    const bool isSmall = prefs.mLowerCaseMinorRoot && IsMinor(chord.mSuffix);
    if (isSmall && !root.empty()) root[0] = Ascii::ToLower(root[0]);
    return root;
}

}  // namespace

std::string NamedChordSymbol(const CNamedChord& chord, const CChordNamePrefs& prefs, bool isExact) {
    if (chord.mRoot.IsUndef()) return {};
    std::string symbol = RootInStyle(chord, prefs);
    const std::string suffix = SuffixInStyle(isExact ? chord.mExactSuffix : chord.mSuffix, prefs);
    if (!suffix.empty()) symbol += OptionalSpaceBetweenNameParts(prefs);
    symbol += suffix;
    if (chord.mBass.IsUndef()) return symbol;
    symbol += OptionalSpaceAroundSlash(prefs);
    symbol += prefs.mSlashText;
    symbol += OptionalSpaceAroundSlash(prefs);
    return symbol + KeyNrAndEnhToName(chord.mBass.mKeyNr, chord.mBass.mEnh, prefs);
}

std::string ChordSymbolInStyle(const CChordLite& chord, const CChordNamePrefs& prefs) {
    CNamedChord named;
    named.mRoot = chord.mRootKeyEnh;
    if (chord.HasBassNote()) named.mBass = chord.mBassKeyEnh;
    named.mSuffix = ChordSymbolSuffix(chord.mSemitones);
    return NamedChordSymbol(named, prefs);
}

}  // namespace brindle
