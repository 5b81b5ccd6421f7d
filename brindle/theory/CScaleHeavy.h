// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CIntvlSet.h"
#include "brindle/theory/CNote.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/Quantize.h"
#include "brindle/theory/ScaleCatalogue.h"
#include "brindle/theory/TScaleType.h"

#include <array>
#include <cstdint>
#include <iosfwd>
#include <optional>
#include <string>
#include <string_view>
#include <type_traits>

namespace brindle {

class CChordHeavy;
struct CChordNamePrefs;

/// A scale in full: a root, the steps above it and the spelling of each of the twelve keys, also
/// of those between the steps. It tells which keys belong to it, counts its sharps and flats, and
/// moves notes along its degrees (0 for the root).
///
/// A scale of type `st_custom` holds steps of its own. A set of steps that is in the table of
/// scales always gets its named type. An undefined root makes an undefined scale: no key belongs
/// to it.
class CScaleHeavy {
public:
    // The table of scales, in its own order

    /// All named scales and, last, the empty row of the undefined scale.
    static constexpr const std::array<CScaleRow, 30>& mScaleData = kScaleCatalogue;

    /// 30: the named scales and the empty row.
    [[nodiscard]] static constexpr int NumAvailableScales() {
        return static_cast<int>(mScaleData.size());
    }
    /// The type of row `index`; `st_maj` when there is no such row.
    [[nodiscard]] static TScaleType GetTypeForScaleAtIndex(int index);
    /// The name of row `index`; "Major" when there is no such row.
    [[nodiscard]] static std::string_view GetNameForScaleAtIndex(int index);
    /// The row of a type; 0, the row of major, for a type without one.
    [[nodiscard]] static int ScaleIndexFromType(TScaleType type);

    // A field of the row of a type, of major for a type without one

    /// The English name, "Natural Minor".
    [[nodiscard]] static std::string_view GetNameForScaleType(TScaleType type);
    /// Whether its colour is major, minor or neither.
    [[nodiscard]] static TScaleMode GetModeForScaleType(TScaleType type);
    /// How many steps an octave has: 5 for a pentatonic scale, 7 for a mode.
    [[nodiscard]] static int GetDegreesPerOctaveForScaleType(TScaleType type);
    /// Semitones above the root of each degree, from degree 0; 0 beyond the last one.
    [[nodiscard]] static const std::array<int, 12>& GetDegreeToRootOffsetIntvlArrayForScaleType(
        TScaleType type);
    /// See CScaleRow::mDegreeEnh.
    [[nodiscard]] static const std::array<TEnh, 12>& GetDegreeEnhForScaleType(TScaleType type);
    /// The name in the user's language, "Major (Ionian)" where there is no translation; none for
    /// a type outside 1 to 30.
    [[nodiscard]] static std::optional<std::string> LocalizedNameForScaleType(TScaleType type);

    // Making a scale. The root takes the key alone, in the lowest octave, with a repaired spelling.

    /// An undefined scale: no root, the empty row, no spellings.
    constexpr CScaleHeavy() { mEnhOfKeyNr.fill(TEnh_Undef); }
    /// A named scale on a key.
    CScaleHeavy(const CKeyEnh& root, TScaleType type);
    /// The same on the key of a note; the octave is not kept.
    CScaleHeavy(const CNote& root, TScaleType type);
    /// The root in the spelling whose major scale has the fewest signs.
    CScaleHeavy(int rootKeyNr, TScaleType type);
    /// The scale of a mask: of its named type, else of type `st_custom`.
    CScaleHeavy(const CKeyEnh& root, CSemitones semitones);
    /// The same of a set of intervals above the root, in semitones.
    CScaleHeavy(const CKeyEnh& root, const CIntvlSet& intvls);
    /// The same on the key of a note.
    CScaleHeavy(const CNote& root, const CIntvlSet& intvls);
    /// The same of the keys of the scale, 0 to 11. Without a root it has no steps.
    CScaleHeavy(const CKeyEnh& root, const CMySet<int>& keyNrs);
    /// The same on the key of a note.
    CScaleHeavy(const CNote& root, const CMySet<int>& keyNrs);
    /// The scale that a text such as "C dorian" names, see ScaleStrings.h.
    CScaleHeavy(std::string_view text, const CChordNamePrefs& prefs);
    /// The same; null is the undefined scale.
    CScaleHeavy(const char* text, const CChordNamePrefs& prefs);

    /// Makes the scale undefined.
    void SetUndef() { *this = CScaleHeavy(); }
    /// As the constructor from a key and a type.
    void SetFromRootKeyEnhAndScaleType_ResetCustomScaleData(const CKeyEnh& root, TScaleType type);
    /// Keeps the steps of a custom scale, for the type `st_custom`.
    void SetFromRootKeyEnhAndScaleType_DontResetCustomScaleData(const CKeyEnh& root,
                                                                TScaleType type);
    /// As the constructor from a mask.
    void SetFromRootKeyEnhAndCustomScaleSemitones_ResetCustomScaleData(const CKeyEnh& root,
                                                                       CSemitones semitones);
    /// As the constructor from intervals. Members from the thirteenth on are left out. Members
    /// above 11 stay as they are.
    void SetFromRootKeyEnhAndCustomScaleIntvlSet_ResetCustomScaleData(const CKeyEnh& root,
                                                                      const CIntvlSet& intvls);
    /// As the constructor from keys.
    void SetFromRootKeyEnhAndCustomScaleKeyNrSet_ResetCustomScaleData(const CKeyEnh& root,
                                                                      const CMySet<int>& keyNrs);
    /// Reads a text such as "C dorian", see ScaleStrings.h.
    void SetFromString(std::string_view text, const CChordNamePrefs& prefs);

    // Changing one thing; the WithoutCalcEnh forms leave the old spellings.

    /// Repairs the spelling of the root as the constructors do.
    void SetRootKeyEnh(const CKeyEnh& root);
    /// The same, with the old spellings of the other keys.
    void SetRootKeyEnhWithoutCalcEnh(const CKeyEnh& root);
    /// Takes the note as it is, octave and spelling included.
    void SetRootNote(const CNote& root);
    /// Keeps the root and spells anew; a type without a row has the steps of major.
    void SetScaleType(TScaleType type);
    /// The same, with the old spellings.
    void SetScaleTypeWithoutCalcEnh(TScaleType type);
    /// Gives the own row, that of the type `st_custom`, the twelve chromatic steps it starts with.
    void InitCustomScaleData() { mCustomScaleData = kCustomScaleRow; }
    /// Sets the steps that count for the type `st_custom`; type, root and spellings stay. A scale
    /// of that type has the new steps at once.
    void SetCustomScaleRootOffsetIntvlSet_ResetCustomScaleData(const CIntvlSet& intvls);
    /// The same, keeping what else the custom row holds.
    void SetCustomScaleRootOffsetIntvlSet_DontResetCustomScaleData(const CIntvlSet& intvls);
    /// Works out the spelling of the twelve keys: first the seven letters under the signs of the
    /// scale, then the keys between them from their neighbours. A custom scale has no spellings,
    /// and some keys of some scales have none either.
    void CalcEnh();

    // Reading

    /// The root with its octave; the lowest one unless SetRootNote has set another.
    [[nodiscard]] constexpr const CNote& RootNote() const { return mRootNote; }
    /// Key and spelling of the root.
    [[nodiscard]] CKeyEnh RootKeyEnh() const { return mRootNote.KeyEnh(); }
    /// 0 to 11, or 15.
    [[nodiscard]] int RootKeyNr() const { return mRootNote.KeyNr(); }
    /// `st_custom` for steps that no named scale has.
    [[nodiscard]] constexpr TScaleType ScaleType() const { return mScaleType; }
    /// True when the root is undefined, whatever the type.
    [[nodiscard]] constexpr bool IsUndef() const { return mRootNote.IsUndef(); }
    /// The row in use: of the table of scales, or the scale's own.
    [[nodiscard]] constexpr const CScaleRow& ScaleRow() const {
        return mScaleRow < 0 ? mCustomScaleData : mScaleData[static_cast<std::size_t>(mScaleRow)];
    }
    /// The row of a type; for `st_custom` the scale's own, for other types without a row major.
    [[nodiscard]] const CScaleRow& ScaleDataFromType(TScaleType type) const;
    /// The first type of the table whose steps are those of the own row; `st_custom` if none is.
    [[nodiscard]] TScaleType FindScaleTypeForCustomScale() const;

    /// Whether it is one of the seven modes of the major scale, by the type alone.
    [[nodiscard]] bool IsModalScale() const { return IsScaleTypeModal(mScaleType); }
    /// How many steps an octave has; 0 for the empty row.
    [[nodiscard]] int DegreesPerOctave() const { return ScaleRow().mDegreesPerOctave; }

    // Which degree (from 0) an interval above the root, a key, or a note is; -1 for none. Intervals
    // and keys are not reduced: 12 is no degree of any scale.

    /// Only the steps are asked, so that a scale without a root has intervals, too.
    [[nodiscard]] int IntvlToDegreeNr(int intvl) const;
    /// The key is 0 to 11; -1 for an undefined scale.
    [[nodiscard]] int KeyNrToDegreeNr(int keyNr) const;
    /// By the key of the note, in any octave.
    [[nodiscard]] int NoteNrToDegreeNr(std::int64_t noteNr) const;
    /// By the key of the note, in any octave and spelling.
    [[nodiscard]] int NoteToDegreeNr(const CNote& note) const;
    /// Whether the interval above the root, 0 to 11, is a step; it is so without a root, too.
    [[nodiscard]] bool HasIntvl(int intvl) const { return IntvlToDegreeNr(intvl) >= 0; }
    /// Whether the key, 0 to 11, belongs to the scale.
    [[nodiscard]] bool HasKeyNr(int keyNr) const { return KeyNrToDegreeNr(keyNr) >= 0; }
    /// Whether the key of the note does.
    [[nodiscard]] bool HasNoteNr(std::int64_t noteNr) const {
        return NoteNrToDegreeNr(noteNr) >= 0;
    }
    /// Whether the key of the note does, in any spelling.
    [[nodiscard]] bool HasNote(const CNote& note) const { return NoteToDegreeNr(note) >= 0; }

    // What stands on a degree, counted on through the octaves. A negative degree, and any degree of
    // a scale without steps, is the root. Undefined for an undefined root.

    /// 0 to 11, or 15.
    [[nodiscard]] int DegreeNrToKeyNr(int degree) const;
    /// Key and spelling; the spelling is undefined in a custom scale.
    [[nodiscard]] CKeyEnh DegreeNrToKeyEnh(int degree) const;
    /// The note with a number of 0 to 11.
    [[nodiscard]] CNote DegreeNrToNoteInLowestOctave(int degree) const;
    /// The key of the degree in octave `oct`, where octave -1 is the lowest. Degree 0 of C major in
    /// octave 4 is 60.
    [[nodiscard]] std::int64_t DegreeNrToNoteNr(int degree, int oct) const;
    /// The same, spelled by the scale.
    [[nodiscard]] CNote DegreeNrToNote(int degree, int oct) const;

    // The spelling of a key; `TEnh_Undef` where the scale has none. Key numbers and steps are
    // reduced into the octave, an undefined note reads as key 3.

    /// Of a key of 0 to 11.
    [[nodiscard]] TEnh EnhForKeyNr(int keyNr) const;
    /// Of the key `step` semitones above the root.
    [[nodiscard]] TEnh EnhForChromStep(int step) const;
    /// Of the key of a note.
    [[nodiscard]] TEnh EnhForNote(const CNote& note) const;
    /// By key number.
    [[nodiscard]] constexpr const std::array<TEnh, 12>& EnhOfKeyNr() const { return mEnhOfKeyNr; }
    // Stores a spelling, repaired as the keys are usually written in C major. CalcEnh overwrites
    // it.
    /// Of a key of 0 to 11.
    void SetEnhForKeyNr(int keyNr, TEnh enh);
    /// Of the key `step` semitones above the root.
    void SetEnhForChromStep(int step, TEnh enh);
    /// Of the key of a note.
    void SetEnhForNote(const CNote& note, TEnh enh);

    /// The steps as a mask, without the root.
    [[nodiscard]] CSemitones ToSemitones() const { return ScaleRow().Semitones(); }
    /// The steps, with the octave as wrap interval.
    [[nodiscard]] CIntvlSet ToIntvlSet() const;
    /// The keys of the scale; empty for an undefined root.
    [[nodiscard]] CMySet<int> ToKeyNrSet() const;

    /// The sharps of the scale, negative for flats: -1 for F major, 0 for E phrygian and for an
    /// undefined scale. A custom scale has those of minor or major, by its third.
    [[nodiscard]] int SignsCount() const;
    /// The same without its sign; 0 for an undefined scale.
    [[nodiscard]] int SignsCountAbs() const;
    /// The root of the major scale that has the notes of this modal scale; undefined if it is none.
    [[nodiscard]] CKeyEnh RelatedIonianScaleRootKeyEnh() const;
    /// That major scale; undefined if this is no modal scale.
    [[nodiscard]] CScaleHeavy RelatedIonianScale() const;

    /// "D Dorian".
    [[nodiscard]] std::string FullName(const CChordNamePrefs& prefs) const;
    /// Writes `{"root":<note>,"type":"dori"}`.
    void AppendJSONString(std::ostream& stream) const;

    // Moving along the scale

    /// The note `steps` degrees higher, lower if negative. A note beside the scale first goes back
    /// to the degree before it. The result may lie outside 0 to 127 unless `fold` brings it back
    /// by whole octaves. An undefined scale leaves the note as it is; an undefined note gives -1.
    [[nodiscard]] std::int64_t MoveInScale(std::int64_t noteNr, int steps, bool fold = false) const;
    /// The same with `fold`, spelled by the scale.
    [[nodiscard]] CNote MoveInScale(const CNote& note, int steps) const;

    /// The degree whose key is nearest to the key, with `octave` -1, 0 or 1 when it lies in the
    /// octave below, the same or the one above. -1 if the scale or the key is undefined.
    [[nodiscard]] int QuantizeToScaleDegreeNr(int keyNr, TQuantizeToScaleDirection direction,
                                              int& octave) const;
    /// The nearest key of the scale, in the spelling of the scale.
    [[nodiscard]] CKeyEnh QuantizeToScaleKeyEnh(const CKeyEnh& keyEnh,
                                                TQuantizeToScaleDirection direction) const;
    /// The nearest note of the scale.
    [[nodiscard]] CNote NoteQuantizeToScaleNote(const CNote& note,
                                                TQuantizeToScaleDirection direction) const;

    // Chords. Defined in chords/.

    /// The chord of the degrees that lie `steps` above the root, the first step being its root.
    [[nodiscard]] CChordHeavy ChordFromScaleStepSet(const CMySet<int>& steps) const;
    /// The triad on the root.
    [[nodiscard]] CChordHeavy ChordTriadForScale() const;
    /// Whether every key of the chord is in the scale; true for a chord without notes.
    [[nodiscard]] bool ChordIsDiatonicInScaleDisregardingEnh(const CChordHeavy& chord) const;
    /// Whether the keys of the basic chord and the bass are in the scale.
    [[nodiscard]] bool ChordBasicChordAndBassNoteIsDiatonicInScaleDisregardingEnh(
        const CChordHeavy& chord) const;
    /// A scale on the root of the chord with all its keys, filled from this scale where the chord
    /// leaves a degree open; an undefined scale stands for major or minor on the root of the chord.
    [[nodiscard]] CScaleHeavy ConstructScaleForChord(const CChordHeavy& chord) const;

    /// Root with octave and spelling, type, and the steps of a custom scale.
    friend bool operator==(const CScaleHeavy& a, const CScaleHeavy& b);

private:
    static constexpr std::int8_t kOwnRow = -1;
    static constexpr std::int8_t kEmptyRow = 29;

    /// The type of this scale, or for a custom scale one whose signs it shares: the signs of a
    /// minor scale for a minor third without a major one, else those of the major scale.
    [[nodiscard]] TScaleType _SignsCount_NamedType() const;

    CNote mRootNote;
    TScaleType mScaleType = st_Undef;
    std::array<TEnh, 12> mEnhOfKeyNr{};
    /// Index of the row in use in mScaleData, or kOwnRow.
    std::int8_t mScaleRow = kEmptyRow;
    CScaleRow mCustomScaleData = kCustomScaleRow;
};

static_assert(std::is_trivially_copyable_v<CScaleHeavy>);

/// Writes root and type on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CScaleHeavy& scale);

/// No scale: no root, no steps, no spellings.
inline constexpr CScaleHeavy CScaleHeavy_Undef{};

}  // namespace brindle
