// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>
#include <iosfwd>
#include <string>

namespace brindle {

/// How names of keys, notes and chords are written and read: letters or syllables, German names,
/// signs in ASCII or not, and the parts of chord names.
struct CChordNamePrefs {
    /// Key 11 is written "H" and not "B".
    bool mHForB = false;
    /// Key 10 is written "B" and not "Bb" or "Bes"; the letter B is read as key 10, flat.
    bool mBForBFlat = false;
    /// Accidentals are words: "Fis", "Ases".
    bool mGermanNames = false;
    /// Non-zero: accidentals are "#" and "b"; zero: the signs U+266F and U+266D.
    std::int32_t mAsciiAccidentals = 0;
    /// Names are syllables: "Do", "Re".
    bool mSolfege = false;
    /// Syllables are translated.
    bool mLocalizeSolfege = false;
    /// Which number the octave of middle C has: 3 for 0, 4 for 1, 5 for 2.
    std::int32_t mOctaveNaming = 0;
    /// The root of a minor chord begins in lower case.
    bool mLowerCaseMinorRoot = false;
    /// A chord within one octave is named without its slash.
    bool mChordPrefB = true;
    /// An option that only repeats the bass note is left out.
    bool mOmitBassOption = true;
    /// A major seventh is "j7" for 1, "maj7" for 2, otherwise "ma7".
    std::int32_t mChordPrefC = 0;
    /// Carried for the host, as mChordPrefE; nothing here reads them.
    std::int32_t mChordPrefD = 0;
    /// Parts of a chord name are joined by ",".
    bool mCommaParts = false;
    /// The second of the two.
    std::int32_t mChordPrefE = 4;
    /// 1: options after the first stand in "(" and ")"; otherwise options are joined by "/".
    std::int32_t mOptionBrackets = 0;
    /// 1: harmonic functions are letters; otherwise they are Roman numerals.
    std::int32_t mChordPrefF = 0;
    /// Zero: OptionalSpaceBetweenNameParts gives a blank.
    std::int32_t mNoSpaceBetweenNameParts = 1;
    /// Zero: OptionalSpaceAroundSlash gives a blank.
    std::int32_t mNoSpaceAroundSlash = 1;
    /// What stands for the slash of a slash chord.
    std::string mSlashText = "/";

    friend bool operator==(const CChordNamePrefs&, const CChordNamePrefs&) = default;
};

/// Writes all fields with their names on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CChordNamePrefs& prefs);

// The global preferences. A host may change them; nothing locks them.

/// What functions without preferences of their own take.
inline CChordNamePrefs CurrentChordNamePrefs{};
/// Parts of names apart and joined by commas.
inline CChordNamePrefs CurrentChordNamePrefs_Fernhill{
    .mCommaParts = true, .mNoSpaceBetweenNameParts = 0, .mNoSpaceAroundSlash = 0};
/// Signs in ASCII.
inline CChordNamePrefs ChordNamePrefsNonUTF8{.mAsciiAccidentals = 1};

}  // namespace brindle
