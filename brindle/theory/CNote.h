// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <algorithm>
#include <cstdint>
#include <iosfwd>
#include <string>
#include <string_view>
#include <utility>

namespace brindle {

class CScaleHeavy;

/// Note number of no note. Real note numbers are 0 to 127 as in MIDI, 60 is middle C.
inline constexpr std::int64_t kNoteNrUndef = -1;
/// The undefined note number of one unsigned byte. It counts as undefined wherever a note number
/// arrives.
inline constexpr std::int64_t kNoteNrSmallUndef = 255;

/// Whether the note number is -1 or 255.
[[nodiscard]] constexpr bool IsNoteNrUndef(std::int64_t noteNr) {
    return noteNr == kNoteNrUndef || noteNr == kNoteNrSmallUndef;
}
/// The note number limited to 0 to 127, -1 if undefined.
[[nodiscard]] constexpr std::int64_t ClampNoteNr(std::int64_t noteNr) {
    return IsNoteNrUndef(noteNr) ? kNoteNrUndef : std::clamp<std::int64_t>(noteNr, 0, 127);
}
/// The key of a note number, 0 to 11; 15 if undefined.
[[nodiscard]] constexpr int KeyNrOfNoteNr(std::int64_t noteNr) {
    return IsNoteNrUndef(noteNr) ? kKeyNrUndef : FoldIntoOctave(noteNr);
}

/// The plain sum. A number far off the keyboard wraps around, where signed numbers would overflow.
[[nodiscard]] constexpr std::int64_t NoteNrAddIntvl(std::int64_t noteNr, int intvl) {
    return static_cast<std::int64_t>(static_cast<std::uint64_t>(noteNr) +
                                     static_cast<std::uint64_t>(std::int64_t{intvl}));
}

/// A note with its octave and its spelling.
///
/// Fields that are set directly are not checked; a note number beyond 0 to 127 is off the keyboard.
struct CNote {
    std::int64_t mNoteNr = kNoteNrUndef;  ///< as in MIDI, 0 to 127; -1 and 255 are no note
    TEnh mEnh = TEnh_Undef;               ///< how its key is written

    constexpr CNote() = default;
    /// The note number is limited to 0 to 127. The spelling is repaired, unless `TEnh_Undef`.
    constexpr CNote(std::int64_t noteNr, TEnh enh) : mNoteNr(ClampNoteNr(noteNr)) { SetEnh(enh); }
    /// The key in an octave, where octave -1 is the notes 0 to 11. The spelling stays as it is.
    ///
    /// An octave of 10 or more gives 108 plus the key, one below -1 gives minus the key.
    constexpr CNote(const CKeyEnh& keyEnh, int oct) : mEnh(keyEnh.mEnh) {
        if (!keyEnh.IsUndef()) mNoteNr = _NoteNrFromKeyNrAndOct(keyEnh.mKeyNr, oct);
    }
    /// The same from a pair of key number and spelling.
    constexpr CNote(const std::pair<int, TEnh>& keyEnh, int oct)
        : CNote(CKeyEnh{keyEnh.first, keyEnh.second}, oct) {}

    /// True when the note number is -1 or 255, whatever the spelling.
    [[nodiscard]] constexpr bool IsUndef() const { return IsNoteNrUndef(mNoteNr); }
    /// 0 to 11, or 15.
    [[nodiscard]] constexpr int KeyNr() const { return KeyNrOfNoteNr(mNoteNr); }
    /// Key and spelling without the octave.
    [[nodiscard]] constexpr CKeyEnh KeyEnh() const { return {KeyNr(), mEnh}; }
    /// Of the key number: the undefined note counts as black.
    [[nodiscard]] constexpr bool IsBlackKey() const { return brindle::IsBlackKey(KeyNr()); }
    /// Whether one of the seven letters with this accidental is the key of the note.
    [[nodiscard]] constexpr bool HasSensefulEnh() const {
        return IsSensefulEnhForKeyNr(KeyNr(), mEnh);
    }

    /// Limits the number to 0 to 127 and keeps the spelling.
    constexpr void SetNoteNr(std::int64_t noteNr) { mNoteNr = ClampNoteNr(noteNr); }
    /// Sets the spelling, repaired unless `TEnh_Undef`.
    constexpr void SetEnh(TEnh enh) {
        mEnh = enh;
        if (enh != TEnh_Undef) MakeSensefulEnhAssumingCMajor();
    }
    /// Sets the spelling as it is, one that the key cannot have too.
    constexpr void SetEnhAndDontMakeSenseful(TEnh enh) { mEnh = enh; }
    /// As the constructor.
    void SetNoteNrAndEnh(std::int64_t noteNr, TEnh enh);
    /// Repairs the present spelling, `TEnh_Undef` too, as the keys are usually written in C major.
    constexpr void MakeSensefulEnhAssumingCMajor() {
        mEnh = MakeSensefulEnhForKeyNrAssumingCMajor(KeyNr(), mEnh);
    }
    /// As SetNoteNr, then repairs the present spelling, `TEnh_Undef` too.
    void SetNoteNrAndMakeSensefulEnhAssumingCMajor(std::int64_t noteNr);
    /// Changes the key within the octave (the key is first reduced into 0 to 11); key 15 makes the
    /// note undefined. -1 counts as a note of the lowest octave, 255 as one of the octave below it,
    /// which is off the keyboard. Not limited: B in the octave of note 127 is 131.
    void SetKeyNr(int keyNr);
    /// As SetKeyNr, then repairs the present spelling.
    void SetKeyNrAndEnhAssumingCMajor(int keyNr);
    /// Keeps the key and sets the octave as the constructor does. An undefined note counts as a C.
    void SetOct(int oct);
    /// Makes the note undefined.
    void Clear();

    /// One step of respelling as the free functions of these names do it, except that triple
    /// accidentals are not taken as double ones.
    void EnhShiftToFlats();
    /// As EnhShiftToFlats, towards sharps.
    void EnhShiftToSharps();
    /// As EnhShiftToFlats, to and fro: a sharp goes to flats, all others to sharps.
    void EnhShift();
    /// Takes the spelling that the scale gives to this key.
    void AdjustEnhToScale(const CScaleHeavy& scale);

    /// Adds the interval, then moves by whole octaves into 0 to 127. The spelling stays; so does an
    /// undefined note.
    void AddIntvlAndClampToKey(int intvl);

    /// The name of the key with its accidental, "Eb"; "Undef" for an undefined note.
    [[nodiscard]] std::string KeyName(const CChordNamePrefs& prefs) const;
    /// The letter or syllable alone, as the spelling selects it; "Undef" for an undefined note.
    [[nodiscard]] std::string KeyNameWithoutEnh(const CChordNamePrefs& prefs) const;
    /// The octave as a number; note 60 is octave 3, 4 or 5 by `mOctaveNaming`. Empty if undefined.
    [[nodiscard]] std::string OctName(const CChordNamePrefs& prefs) const;

    /// Reads a key name and an octave number behind it: "C#4". A missing number reads as 0. False,
    /// and the undefined note, when there is no key name.
    bool SetFromString(std::string_view text, const CChordNamePrefs& prefs);
    /// Reads a key name, keeps the octave and gives the count of characters used. Without a key
    /// name the note becomes undefined and the count is 0.
    int SetKeyNrAndEnhAssumingCMajorFromString(std::string_view text, const CChordNamePrefs& prefs);

    /// Writes `{"name":"<key name>","nr":<number>,"enh":"<word>"}`, with the key named by
    /// `CurrentChordNamePrefs`.
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CNote&, const CNote&) = default;
    /// By note number, then by spelling, smaller first.
    friend constexpr bool operator<(const CNote& a, const CNote& b) {
        return a.mNoteNr != b.mNoteNr ? a.mNoteNr < b.mNoteNr : a.mEnh < b.mEnh;
    }

private:
    /// The ends are kept as they are, without a check.
    static constexpr std::int64_t _NoteNrFromKeyNrAndOct(int keyNr, int oct) {
        if (oct >= 10) return std::int64_t{108} + keyNr;
        if (oct < -1) return -std::int64_t{keyNr};
        return (std::int64_t{oct} + 1) * 12 + keyNr;
    }
};

/// Writes note number and spelling, for debugging.
std::ostream& operator<<(std::ostream& stream, const CNote& note);

/// No note: number -1, no spelling.
inline constexpr CNote CNote_Undef{};

}  // namespace brindle
