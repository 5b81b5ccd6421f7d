// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/RomanNumeral.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSignKeyLite.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

class CHarmAnlsChords;

/// What a chord does in its key.
enum THarmFunction : std::uint8_t {
    THarmFunction_Undef,        ///< no chord
    THarmFunction_Tonic,        ///< C in C major
    THarmFunction_Subdominant,  ///< F, Dm7
    THarmFunction_Dominant,     ///< G7
    THarmFunction_None,         ///< a chord that only passes by: Ebo7 in Em7 Ebo7 Dm7
};

/// What a chord is to the chords around it. The examples are in C major.
enum TChordRelation : std::uint8_t {
    TChordRelation_Undef,                 ///< no chord
    TChordRelation_None,                  ///< a chord of the key: Am
    TChordRelation_Tonic,                 ///< C
    TChordRelation_Dominant,              ///< G7; also A7 before Dm, and C/G before G7
    TChordRelation_RelatedSecond,         ///< Dm7 before G7, Em7b5 before A7
    TChordRelation_SubstituteDominant,    ///< Db7 before C, a tritone away from G7
    TChordRelation_LeadingDiminished,     ///< Bo7 before C
    TChordRelation_PassingDiminished,     ///< C#o7 between C and Dm
    TChordRelation_CommonToneDiminished,  ///< Co7 between C and C
    TChordRelation_Backdoor,              ///< Bb7 before C, and Fm7 before that Bb7
    TChordRelation_Plagal,                ///< F before C
    TChordRelation_Borrowed,              ///< Fm, from C minor
    TChordRelation_ChromaticMediant,      ///< E, Ab
    TChordRelation_Neapolitan,            ///< Db/F
    TChordRelation_AugmentedSixth,        ///< Ab7 before G
    TChordRelation_Blues,                 ///< C7 and F7, at rest
    TChordRelation_LineCliche,            ///< Am^7 and Am7 in Am Am^7 Am7 Am6
};

/// How the seventh of a chord is written, where it was read from notes: C to Bb or C to A#.
enum TSeventhSpelling : std::uint8_t {
    TSeventhSpelling_Undef,           ///< not spelled, or no seventh
    TSeventhSpelling_MinorSeventh,    ///< C to B flat
    TSeventhSpelling_AugmentedSixth,  ///< C to A sharp
};

/// The spelling of a written seventh above its root. Undefined if one of the two is not spelled, or
/// if they are not ten semitones apart.
[[nodiscard]] TSeventhSpelling SeventhSpellingOf(const CKeyEnh& root, const CKeyEnh& seventh);

/// How ReadHarmony reads. All that is left out is found from the chords.
struct CReadingOptions {
    CKeyOptions mKeys = {};  ///< how keys are found
    /// The key of the song if it is known; undefined to find it.
    CSignKeyLite mStatedKey = {};
    /// One a chord of the list, or fewer. An augmented sixth makes a German or Italian sixth chord
    /// of a seventh chord whose root falls a semitone, a minor seventh keeps it from being one. A
    /// bass that is the seventh tells this by its own spelling, if there is none here.
    std::span<const TSeventhSpelling> mSevenths = {};
};

/// The degree of a key that a chord serves.
struct CServedDegree {
    /// Above the tonic, 0 to 11; -1 for no degree.
    std::int8_t mSemitones = -1;
    /// As it is written: 3 and -1 for bIII.
    std::int8_t mNumber = 0;
    std::int8_t mAccidental = 0;  ///< -1 for flat, 1 for sharp
    /// In small letters: ii.
    bool mIsMinor = false;

    /// Whether it is the tonic; false for no degree.
    [[nodiscard]] constexpr bool IsTonic() const { return mSemitones == 0; }
    /// "I", "ii", "bIII"; empty for no degree. The tonic is "I" in minor, too.
    [[nodiscard]] std::string Name() const;

    friend constexpr bool operator==(const CServedDegree&, const CServedDegree&) = default;
};

/// One chord as a teacher reads it. All indices are those of the list of chords, -1 for none; of a
/// chord that is written several times in a row, they are those of the first time.
struct CChordReading {
    /// The key of its passage; undefined for no chord.
    CSignKeyLite mKey;
    /// In that key: "ii7", "V7/ii", "subV7/I", "viio7/V", "N6", "Ger6"; empty for no chord. Without
    /// the bass.
    std::string mNumeral;
    THarmFunction mFunction = THarmFunction_Undef;    ///< what it does in that key
    TChordRelation mRelation = TChordRelation_Undef;  ///< what it is to the chords around it
    /// The degree that it prepares or stands for: I for G7 in C major, ii for A7 before Dm. A
    /// related second serves what its dominant serves, in the key of that.
    CServedDegree mServes;
    /// A dominant of the tonic that is followed by vi or VI instead.
    bool mDeceptive = false;
    /// The chord that it leads to.
    std::ptrdiff_t mResolvesTo = -1;
    /// The later chord that it stands under in the tree of the song; -1 for a chord that prepares
    /// nothing. The arcs of two chords never cross.
    std::ptrdiff_t mUnder = -1;

    friend bool operator==(const CChordReading&, const CChordReading&) = default;
};

/// A song as a teacher pencils it over a lead sheet.
struct CSongReading {
    /// Undefined for a song without chords.
    CSignKeyLite mKey;
    /// The share of the key in the points of all 24, 0 to 1; small for a stated key that the chords
    /// do not show. `kPosUndef` without a key.
    double mConfidence = kPosUndef;
    /// In the order of time, without a gap between them.
    std::vector<CKeyRegion> mRegions;
    /// One a chord of the list.
    std::vector<CChordReading> mChords;
};

/// Reads for each chord its key, its numeral, its function, what kind of chord it is there and the
/// chord that it resolves to. `chords` are as a chord text gives them: by position, an undefined
/// chord at the end. Linear in the number of chords.
///
/// A chord that is the same as the one before makes that one longer, and so does an undefined one;
/// the former gets the same reading, the latter an undefined one. Positions that make no sense
/// count as no length; if no chord has a length, all count a beat.
[[nodiscard]] CSongReading ReadHarmony(const CHarmAnlsChords& chords,
                                       const CReadingOptions& options = {});

/// The same reading with its numerals written by other options, see NumeralInStyle: what a chord is
/// applied to stays as it was read. The default options change nothing, and printed signs alone
/// change nothing but the signs. `chords` are those of the reading.
[[nodiscard]] CSongReading WithNumerals(CSongReading reading, const CHarmAnlsChords& chords,
                                        const CNumeralOptions& options);

/// "tonic", "subdominant", "dominant", "none"; empty if undefined.
[[nodiscard]] std::string_view NameOf(THarmFunction function);
/// T, S, D, or - for none; empty if undefined.
[[nodiscard]] std::string_view LetterOf(THarmFunction function);
/// "related second", "substitute dominant" and so on, "none" for TChordRelation_None; empty if
/// undefined.
[[nodiscard]] std::string_view NameOf(TChordRelation relation);

}  // namespace brindle
