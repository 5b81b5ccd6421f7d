// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/platform/CTextFault.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

// An analysis as musicologists keep it in a text file, RomanText: headers, then a line for each
// measure with keys, beats and numerals, `m1 C: I b3 V65/V`. All positions and lengths are in
// quarter notes, from the first measure as it is written: repeats are not played.

/// A chord of such an analysis.
struct CRomanTextChord {
    /// "No Chord Yield" for `NC` and for a numeral that is not understood.
    CChordLite mChord;
    /// The key in which the numeral is read; undefined for an `NC` before the first key.
    CSignKeyLite mKey;
    /// As it is written.
    std::string mNumeral;
    double mPosition = 0.0;  ///< where it begins, in quarters
    double mLength = 0.0;    ///< up to the next chord, in quarters
    /// The chord where two keys meet: its numeral in the key before, else undefined and empty.
    CSignKeyLite mKeyBefore;
    std::string mNumeralBefore;  ///< as it is written, for that key
};

/// The key from a position on.
struct CRomanTextKey {
    CSignKeyLite mKey;       ///< the key; never undefined
    double mPosition = 0.0;  ///< in quarters
};

/// A measure: its number in the text, and its place and length in quarter notes.
struct CRomanTextBar {
    int mNumber = 0;         ///< as the text counts, a pickup is 0
    double mPosition = 0.0;  ///< where it begins, in quarters
    double mLength = 0.0;    ///< in quarters
};

/// A time signature that holds from a position on: 3 and 4 for 3/4.
struct CRomanTextTime {
    int mBeats = 4;          ///< beats in a measure, the upper number
    int mBeatValue = 4;      ///< which note is one, the lower number: 4 is a quarter
    double mPosition = 0.0;  ///< from where on, in quarters
};

/// What ReadRomanText makes of a text.
struct CRomanTextReading {
    std::string mTitle;     ///< of the piece; empty if there is none, as the next three
    std::string mMovement;  ///< its number or name
    std::string mComposer;  ///< who wrote it
    std::string mAnalyst;   ///< who read it
    /// By position; each sounds up to the next one or the end.
    std::vector<CRomanTextChord> mChords;
    std::vector<CRomanTextKey> mKeys;  ///< by position
    /// Measures that are left out between two others are there, too: the chord before them sounds.
    std::vector<CRomanTextBar> mBars;
    std::vector<CRomanTextTime> mTimes;  ///< by position
    /// Where `||` and other double bars stand.
    std::vector<double> mDoubleBars;
    /// Empty if all is understood; what is not, is left out.
    std::vector<CTextFault> mFaults;
    /// What is understood and left out: other readings of a measure, pedals.
    std::vector<CTextFault> mNotes;
};

/// Reads an analysis in RomanText.
///
/// Numerals are read by ReadNumeral with `mFigures` and `mByKey`. The beat is that of the time
/// signature: a dotted quarter in 6/8, the whole bar in 3/8. `b2.33` is a third of a beat behind
/// the second one. `m5-8 = m1-4` copies measures, in the key of the place. A chord sounds up to the
/// next one or the end. A measure 0 begins with its first beat.
///
/// A line may have no measure, as people type it. With beats it is the next measure,
/// `C: I b3 V65/V`; without them each numeral has a beat, in as many measures as that takes, and
/// `|`, `||` and `.` are bar lines and holds: `C: I V | vi . a: i`.
///
/// Keys may be in words, `m1 E flat: I b3 a minor: V`.
///
/// `key` is that of the numerals before the first key that the text states; if it is undefined,
/// they are faults.
///
/// Time is linear in the length of what is read and copied; more than 100,000 measures or copied
/// words are a fault.
[[nodiscard]] CRomanTextReading ReadRomanText(std::string_view text, const CSignKeyLite& key = {});

}  // namespace brindle
