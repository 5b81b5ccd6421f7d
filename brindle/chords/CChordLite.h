// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/Quantize.h"
#include "brindle/theory/TBasicChord.h"

#include <cstdint>
#include <iosfwd>
#include <nlohmann/json_fwd.hpp>
#include <string_view>
#include <type_traits>

namespace brindle {

class CChordHeavy;
struct CChordNamePrefs;
class CScaleHeavy;
class CSignKeyHeavy;
struct CSignKeyLite;

/// The compact form of a chord: a spelled root, a spelled bass or none, and the semitones that
/// sound above the root. No octaves, no heap data.
///
/// Root key number 15 means that this is no real chord; the root's spelling then tells which of
/// the three non-chords it is: undefined, "No Chord Yield" or "No Chord Force".
class CChordLite {
public:
    CKeyEnh mRootKeyEnh;  ///< key 15 for the non-chords
    /// Carried and compared for the host by EqualIncludingDir, never interpreted.
    std::int32_t mRootDir = 0;
    /// (15, TEnh_Undef) is no bass.
    CKeyEnh mBassKeyEnh;
    std::int32_t mBassDir = 0;  ///< as mRootDir
    /// Bit 0 is the root. A bass that is no chord tone has its bit clear.
    CSemitones mSemitones;

    constexpr CChordLite() = default;
    /// Root, bass and semitones as they are; the directions are 0.
    constexpr CChordLite(CKeyEnh root, CKeyEnh bass, CSemitones semitones)
        : mRootKeyEnh(root), mBassKeyEnh(bass), mSemitones(semitones) {}
    /// Reads a chord symbol such as `F#m7/C#`; a text without one gives the undefined root.
    CChordLite(std::string_view symbol, const CChordNamePrefs& prefs);
    /// A null pointer gives the undefined chord.
    CChordLite(const char* symbol, const CChordNamePrefs& prefs);

    /// Becomes the chord of a symbol; the whole record is written, directions included.
    void SetFromString(std::string_view symbol, const CChordNamePrefs& prefs);

    /// Reads what AppendJSONString wrote, or the older form with bare "RootKeyNr" and "BassKeyNr".
    /// A key that is missing altogether reads as the unspelled key 0, missing semitones as none.
    [[nodiscard]] static CChordLite FromDictionary(const nlohmann::json& dictionary);

    /// The same chord with notes: root and bass in octave -1, the tones in the comping range.
    [[nodiscard]] CChordHeavy ToChordHeavy(int wrapIntvl) const;
    /// Takes root, bass and semitones of a chord with notes; the lowest note is a bass only in
    /// octave -1. Semitones stay as they were when the root is undefined.
    void SetFromChordHeavy(const CChordHeavy& chord);

    /// All fields but the directions in 40 bits; equal codes are equal chords.
    [[nodiscard]] std::int64_t GetChordHashCode() const;
    /// The chord of such a code; the directions stay. Kept: a triple flat does not come back, since
    /// it borrows from the field above it: its spelling reads as 15, and of a root also the bass
    /// key as one less.
    void SetFromChordHashCode(std::int64_t code);

    /// True for all three non-chords.
    [[nodiscard]] constexpr bool IsUndef() const { return mRootKeyEnh.IsUndef(); }
    /// Root key 15 spelled as `TEnh{0}`; bass and semitones do not matter.
    [[nodiscard]] bool IsNoChordYield() const;
    /// Root key 15 spelled as `TEnh{1}`; bass and semitones do not matter.
    [[nodiscard]] bool IsNoChordForce() const;

    /// Root key 15 without a spelling; bass and semitones stay.
    void SetUndef();
    /// Root key 15 spelled as `TEnh{0}`; bass and semitones stay.
    void SetNoChordYield();
    /// Root key 15 spelled as `TEnh{1}`; bass and semitones stay.
    void SetNoChordForce();

    /// Whether there is one, on the root's own key, too.
    [[nodiscard]] constexpr bool HasBassNote() const { return !mBassKeyEnh.IsUndef(); }
    /// Root and bass are there and differ, if only in spelling.
    [[nodiscard]] bool IsSlashChord() const;

    // The ways to measure from root to bass. All give `kIntvlUndef` when one of them is missing.

    /// Bass minus root, not reduced: -11 to 11.
    [[nodiscard]] int KeyIntvlFromRootToBass() const;
    /// The same reduced to 0 to 11.
    [[nodiscard]] int AbsKeyIntvlFromRootToBass() const;
    /// The nearer way, -6 to 5; a tritone is -6.
    [[nodiscard]] int SmallestKeyIntvlBetweenRootAndBass() const;
    /// Semitones on the shorter way round, 0 to 6.
    [[nodiscard]] int KeyDistanceBetweenRootAndBass() const;

    /// No chord tone doubles the bass. A bass key below the root key counts as alone, whatever the
    /// semitones, and so does no bass.
    [[nodiscard]] bool BassKeyEnhHasIntvlAlone() const;
    /// The same, if the bass lies exactly `intvl` above the root key, -11 to 11, not reduced.
    [[nodiscard]] bool BassKeyEnhHasThisIntvlAlone(int intvl) const;
    /// Whether a tone of the semitones has this interval, 0 to 11.
    [[nodiscard]] bool HasIntvlButNotInBassKeyEnhAlone(int intvl) const;

    /// The skeleton of the semitones: its third decides, the fifth only chooses within that.
    [[nodiscard]] TBasicChord BasicChord() const;
    /// The same, but a half-diminished seventh chord is named as a minor chord with a flat five.
    [[nodiscard]] TBasicChord BasicChordForNaming() const;
    /// The tones of that skeleton above the root: 0 3 7 for minor, none for `None`.
    [[nodiscard]] CSemitones BasicChordSemitones() const;
    /// What the chord has beyond its skeleton.
    [[nodiscard]] CSemitones OptionsSemitones() const;
    /// Whether the skeleton has this interval, 0 to 11.
    [[nodiscard]] bool HasBasicChordIntvl(int intvl) const;
    /// Whether it is one that the chord has beyond its skeleton, 0 to 11.
    [[nodiscard]] bool HasOptionsIntvl(int intvl) const;

    /// Semitones above the root; 15 if either key is undefined.
    [[nodiscard]] int ChordKeyNrFromKeyNr(int keyNr) const;
    /// The key, 0 to 11, that stands so many semitones above the root; 15 if either is undefined.
    [[nodiscard]] int KeyNrFromChordKeyNr(int chordKeyNr) const;

    /// Scale step of the root in a key, counted from 0, whatever the spelling; -1 if it is not in
    /// the key.
    [[nodiscard]] int RootNoteDegreeNrInSignKey(const CSignKeyHeavy& signKey) const;
    /// The same of the bass; -1 without a bass.
    [[nodiscard]] int BassNoteDegreeNrInSignKey(const CSignKeyHeavy& signKey) const;

    /// The harmonic function, see CChordHeavy::HarmFuncIn and HarmFuncName.
    [[nodiscard]] int HarmFuncIn(const CScaleHeavy& scale) const;
    /// See CChordHeavy::HarmFuncName.
    [[nodiscard]] std::string_view HarmFuncNameIn(const CSignKeyHeavy& signKey,
                                                  const CChordNamePrefs& prefs) const;

    /// Whether the chord belongs to a key. Major and augmented triads and dominant sevenths pass
    /// on the root alone: A7 belongs to C major.
    [[nodiscard]] bool IsInSignKeyRegardlessOfEnh(const CSignKeyHeavy& signKey) const;
    /// The same; an undefined type counts as major.
    [[nodiscard]] bool IsInSignKeyRegardlessOfEnh(const CSignKeyLite& signKey) const;

    /// The note moved to the chord tone that `direction` asks for, within the octave that begins
    /// at the chord's root. An undefined chord leaves the note as it is.
    [[nodiscard]] std::int64_t QuantizeToChord(std::int64_t noteNr,
                                               TQuantizeDirection direction) const;
    /// The same to a tone of its skeleton; a chord without one leaves the note as it is.
    [[nodiscard]] std::int64_t QuantizeToBasicChord(std::int64_t noteNr,
                                                    TQuantizeDirection direction) const;
    /// The same to any tones above the root, 0 to 11.
    [[nodiscard]] std::int64_t _QuantizeToSemitones(std::int64_t noteNr,
                                                    TQuantizeDirection direction,
                                                    const CSemitones& semitones) const;

    /// Writes root, bass and semitones as JSON members without braces.
    void AppendJSONClassSubstring(std::ostream& stream) const;
    /// The same as one object in braces.
    void AppendJSONString(std::ostream& stream) const;

    /// Same semitones.
    [[nodiscard]] bool EqualExceptRootAndBass(const CChordLite& other) const;
    /// Same sound: key numbers and semitones.
    [[nodiscard]] bool EqualWithoutEnh(const CChordLite& other) const;
    /// What operator== compares.
    [[nodiscard]] bool EqualWithoutDir(const CChordLite& other) const;
    /// The same, and the directions too.
    [[nodiscard]] bool EqualIncludingDir(const CChordLite& other) const;

    friend constexpr bool operator==(const CChordLite& a, const CChordLite& b) {
        return a.mRootKeyEnh == b.mRootKeyEnh && a.mBassKeyEnh == b.mBassKeyEnh &&
               a.mSemitones == b.mSemitones;
    }
    /// By root, bass (each as CKeyEnh sorts) and semitones; the directions do not count.
    friend constexpr bool operator<(const CChordLite& a, const CChordLite& b) {
        if (a.mRootKeyEnh != b.mRootKeyEnh) return a.mRootKeyEnh < b.mRootKeyEnh;
        if (a.mBassKeyEnh != b.mBassKeyEnh) return a.mBassKeyEnh < b.mBassKeyEnh;
        return a.mSemitones < b.mSemitones;
    }
};

static_assert(std::is_trivially_copyable_v<CChordLite>);

/// Writes the chord's name under `CurrentChordNamePrefs`, with the bass of a slash chord, and then
/// root, bass and mask: `CChordLite: C/E  RootKeyEnh CKeyEnh(0, TEnh_n), BassKeyEnh ...`.
std::ostream& operator<<(std::ostream& stream, const CChordLite& chord);

/// Reads a chord symbol into `chord`, which is reset first.
void SetFromString(std::string_view symbol, CChordLite& chord, const CChordNamePrefs& prefs);

/// No chord.
inline constexpr CChordLite CChordLite_Undef{};
/// No chord, "No Chord Yield".
inline constexpr CChordLite CChordLite_NoChordYield{{kKeyNrUndef, TEnh{0}}, CKeyEnh_Undef, {}};
/// No chord, "No Chord Force".
inline constexpr CChordLite CChordLite_NoChordForce{{kKeyNrUndef, TEnh{1}}, CKeyEnh_Undef, {}};

}  // namespace brindle
