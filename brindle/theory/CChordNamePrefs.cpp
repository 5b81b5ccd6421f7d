// SPDX-License-Identifier: MIT
#include "brindle/theory/CChordNamePrefs.h"

#include <ostream>

namespace brindle {

// clang-format off
std::ostream& operator<<(std::ostream& stream, const CChordNamePrefs& prefs) {
    return stream
           << "CChordNamePrefs: "
           << "HForB " << prefs.mHForB
           << ", BForBFlat " << prefs.mBForBFlat
           << ", GermanNames " << prefs.mGermanNames
           << ", AsciiAccidentals " << prefs.mAsciiAccidentals
           << ", Solfege " << prefs.mSolfege
           << ", LocalizeSolfege " << prefs.mLocalizeSolfege
           << ", OctaveNaming " << prefs.mOctaveNaming
           << ", LowerCaseMinorRoot " << prefs.mLowerCaseMinorRoot
           << ", ChordPrefB " << prefs.mChordPrefB
           << ", OmitBassOption " << prefs.mOmitBassOption
           << ", ChordPrefC " << prefs.mChordPrefC
           << ", ChordPrefD " << prefs.mChordPrefD
           << ", CommaParts " << prefs.mCommaParts
           << ", ChordPrefE " << prefs.mChordPrefE
           << ", OptionBrackets " << prefs.mOptionBrackets
           << ", ChordPrefF " << prefs.mChordPrefF
           << ", NoSpaceBetweenNameParts " << prefs.mNoSpaceBetweenNameParts
           << ", NoSpaceAroundSlash " << prefs.mNoSpaceAroundSlash
           << ", SlashText " << prefs.mSlashText;
}
// clang-format on

}  // namespace brindle
