// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/TChordOption.h"
#include "brindle/chords/TSingleChordAnalysisAlgo.h"
#include "brindle/theory/CIntvlSet.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CMySet.h"
#include "brindle/theory/CNote.h"
#include "brindle/theory/CSemitones.h"
#include "brindle/theory/Quantize.h"
#include "brindle/theory/TBasicChord.h"

#include <array>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <iosfwd>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace brindle {

struct CChordNamePrefs;
struct CHarmCenterLite;
class CScaleHeavy;
class CSignKeyHeavy;
struct CSignKeyLite;

/// The full form of a chord: a root note, the sounding notes with octaves and spellings, and the
/// intervals of the notes above the root.
///
/// The lowest note is the bass. Octave -1 (note numbers 0 to 11) holds the bass of a chord that
/// was made from keys or intervals: the root itself, or the key behind the slash.
///
/// The intervals are worked out when they are first read, and naming a chord spells its bass, also
/// by const functions: one chord is not to be read from two threads at once.
class CChordHeavy {
public:
    /// The skeletons under the chord's own name, CChordHeavy::Minor.
    using TBasicChord = brindle::TBasicChord;
    using enum brindle::TBasicChord;
    /// The options under the chord's own name.
    using TChordOption = brindle::TChordOption;

    /// Two octaves: a ninth is not a second.
    static constexpr int DefaultWrapIntvl = 24;

    /// An empty chord with an undefined root. `wrapIntvl` is the span in semitones, 24 or 12 as a
    /// rule, within which the intervals are counted; 0 counts them as they stand.
    explicit CChordHeavy(int wrapIntvl = DefaultWrapIntvl);

    /// Exactly these notes, in their octaves. An undefined root follows the lowest note.
    CChordHeavy(const CNote& root, CMySet<CNote> notes, int wrapIntvl = DefaultWrapIntvl);
    /// The same by note numbers, spelled as naturals.
    CChordHeavy(const CNote& root, const CMySet<unsigned char>& noteNrs,
                int wrapIntvl = DefaultWrapIntvl);

    // From tones above a root: they go to the comping range and keep their interval exactly, while
    // the bass, or else the root, stands in octave -1. An undefined bass is no bass.

    /// `semitones` are the tones above the root, the root among them only if bit 0 is set.
    CChordHeavy(const CNote& root, const CSemitones& semitones, const CNote& bass);
    /// The same; an interval from 12 on is a tone of the octave above.
    CChordHeavy(const CNote& root, const CIntvlSet& intvls, const CNote& bass);
    /// The tones of a skeleton: 0 4 7 for major. No bass.
    CChordHeavy(const CNote& root, TBasicChord basicChord, int wrapIntvl = DefaultWrapIntvl);
    /// The same from keys without an octave.
    CChordHeavy(CKeyEnh root, const CSemitones& semitones, CKeyEnh bass,
                int wrapIntvl = DefaultWrapIntvl);
    /// The same from keys and intervals.
    CChordHeavy(CKeyEnh root, const CIntvlSet& intvls, CKeyEnh bass,
                int wrapIntvl = DefaultWrapIntvl);
    /// The tones of a skeleton over a bass.
    CChordHeavy(CKeyEnh root, TBasicChord basicChord, CKeyEnh bass);
    /// The same from a key number alone, without a bass; the root has its usual spelling.
    CChordHeavy(int rootKeyNr, TBasicChord basicChord, int wrapIntvl = DefaultWrapIntvl);

    /// From a chord symbol such as `F#m7/C#`.
    CChordHeavy(std::string_view symbol, const CChordNamePrefs& prefs);

    // Root

    /// The root with an octave, -1 in a chord made from keys; undefined for no chord.
    [[nodiscard]] const CNote& RootNote() const { return mRootNote; }
    /// Key and spelling of the root.
    [[nodiscard]] CKeyEnh RootKeyEnh() const;
    /// False while the root follows the lowest note.
    [[nodiscard]] bool RootNoteSpecified() const { return mRootNoteSpecified; }

    /// Sets the root as it stands. If it is defined, it also becomes the only note of octave -1,
    /// so that a former bass is lost.
    void SetRootNote(const CNote& root);
    /// Sets the root and nothing else.
    void SetRootNoteWithoutSpecify(const CNote& root);
    /// Moves the root into the comping range, empties octave -1 and adds the moved root as a note.
    void SetRootNoteInCompingRange(const CNote& root);
    /// SetRootNote of the key, reduced into 0 to 11, in octave -1 with its usual spelling.
    void SetRootKeyNr(int keyNr);
    /// SetRootNote of the key in octave -1 with its spelling.
    void SetRootKeyEnh(CKeyEnh root);
    /// SetRootNote of the lowest note that has the interval of this index; undefined behind the
    /// end.
    void SetRootNoteToIntvlIx(std::size_t ix);
    /// Respells root and bass so that the scale of the chord needs the fewest signs; the present
    /// spelling wins a tie, then the one to the flat side.
    void SetRootNoteEnhWithLeastSigns();

    // Finding the root (defined in neural/)

    /// Takes the key that is most likely the root, by the notes alone, as root and only note of
    /// octave -1, and respells the notes by it. A chord without notes becomes undefined.
    ///
    /// The net hears two octaves above the lowest note if the wrap interval is 24, as it is by
    /// default. Several threads may search at once, each in a chord of its own; for the net see
    /// NetForSingleChordAnalysis.
    void SetRootNoteAndEnh_ToLikeliestRegardingNoteSet(TSingleChordAnalysisAlgo algo);
    /// The points of a note's key as root of this chord, whose intervals are taken above its
    /// present root; the more, the likelier.
    [[nodiscard]] int ProbThatNoteIsRootNote(const CNote& note) const;
    /// Sets the wrap interval to the 24 semitones that the net hears.
    void SetWrapIntvlToNeuronalNetInputCount();

    // Notes

    /// In ascending order.
    [[nodiscard]] const CMySet<CNote>& Notes() const { return mNotes; }
    /// The note at an index of that order; undefined behind the end.
    [[nodiscard]] CNote Note(std::size_t ix) const;
    /// The bass; undefined for a chord without notes.
    [[nodiscard]] CNote LowestNote() const;
    /// Undefined for a chord without notes.
    [[nodiscard]] CNote HighestNote() const;
    /// Exactly this note, its spelling included.
    [[nodiscard]] bool HasNote(const CNote& note) const;
    /// Whether the note sounds, in any spelling.
    [[nodiscard]] bool HasNoteNr(std::int64_t noteNr) const;
    /// Whether the key sounds in some octave. The key is not reduced; 15 asks for an undefined
    /// note.
    [[nodiscard]] bool HasKeyNr(int keyNr) const;
    /// Whether all listed keys sound. A list ends at the first value outside 0 to 127.
    [[nodiscard]] bool HasKeyNrs(std::span<const int> keyNrs) const;
    /// The same for values written out.
    template <std::same_as<int>... Rest>
    [[nodiscard]] bool HasKeyNrs(int first, Rest... rest) const {
        return HasKeyNrs(std::to_array({first, rest...}));
    }
    /// Whether the listed keys sound and no other key does.
    [[nodiscard]] bool HasExactTheseKeyNrs(std::span<const int> keyNrs) const;
    /// The same for values written out.
    template <std::same_as<int>... Rest>
    [[nodiscard]] bool HasExactTheseKeyNrs(int first, Rest... rest) const {
        return HasExactTheseKeyNrs(std::to_array({first, rest...}));
    }
    /// The keys of the defined notes, the bass among them.
    [[nodiscard]] CMySet<int> KeyNrSet() const;
    /// How many notes stand in an octave, -1 for the notes 0 to 11. Undefined notes count into -1.
    [[nodiscard]] int CountNotesInOctave(int octave) const;
    /// All notes lie within an octave.
    [[nodiscard]] bool IsNarrowChord() const;

    /// These three replace the notes. A root that was not specified follows the lowest note.
    void SetFromNoteSet(CMySet<CNote> notes);
    /// The numbers are spelled as naturals; 255 is the undefined note.
    void SetFromNoteNrSet(const CMySet<unsigned char>& noteNrs);
    /// The keys go to the comping range.
    void SetFromKeyNrSet(const CMySet<int>& keyNrs);
    /// These replace the notes by the tones above the root, with the root in octave -1.
    void SetSemitones(const CSemitones& semitones);
    /// The same of the tones of a skeleton.
    void SetBasicChord(TBasicChord basicChord);
    /// SetRootKeyNr, then SetBasicChord.
    void SetRootKeyNrAndBasicChord(int rootKeyNr, TBasicChord basicChord);

    /// Adds the note, in its spelling; a root that was not specified follows the lowest note.
    void AddNote(const CNote& note);
    /// Deletes exactly this note, its spelling included; the root follows as in AddNote.
    void DelNote(const CNote& note);
    /// Deletes the note at an index of the ascending order.
    void DelNote(std::size_t ix);
    /// For the octave see CountNotesInOctave. The root stays.
    void DeleteAllNotesInOctave(int octave);
    /// Deletes all notes; the root stays.
    void ClearAllExceptRoot();

    // The tone at an interval above the root, added unless a note of its number is there already.
    // An undefined root or interval adds the undefined note.

    /// In the octave above the root, or the nearest one on the keyboard.
    void AddIntvl(int intvl);
    /// AddIntvl of each.
    void AddIntvlSetAboveRootNote(const CIntvlSet& intvls);
    /// In the comping range; an interval beyond the octave is folded into it.
    void AddIntvlInCompingRange(int intvl);
    /// AddIntvlInCompingRange of each.
    void AddIntvlSetInCompingRange(const CIntvlSet& intvls);
    /// In the span of the wrap interval above the lowest note of the comping range, so that the
    /// interval stays what it is.
    void AddIntvlInCompingPlusWrapIntvlRange(int intvl);

    /// Makes the chord the undefined one; the wrap interval stays.
    void SetUndef();
    /// Makes it "No Chord Yield": without notes, with a root of its own spelling.
    void SetNoChordYield();
    /// Makes it "No Chord Force": the same with another spelling.
    void SetNoChordForce();

    /// Moves root and notes, limited to 0 to 127.
    void Transpose(int intvl);
    /// Lays the lowest note above the highest one. The root stays.
    void Invert();
    /// Moves the notes at the intervals `lo` to `hi` above the root by their distance to interval
    /// `target`. Kept: where that distance is above 5 they move down instead of up.
    void ChangeAllNotesWithinIntvlRange(int lo, int hi, int target);

    // Bass

    /// Key and spelling of the lowest note.
    [[nodiscard]] CKeyEnh BassKeyEnh() const;
    /// The lowest note is one of 0 to 11, where the bass of a chord made from keys stands.
    [[nodiscard]] bool BassNoteIsInLowestOctave() const;
    /// Root and lowest note are defined and are different keys.
    [[nodiscard]] bool IsSlashChord() const;
    /// No other note has the interval that the lowest note has above the root.
    [[nodiscard]] bool BassNoteHasIntvlAlone() const;
    /// The lowest note has exactly this interval above the root, 0 to 11, and no other note has it.
    [[nodiscard]] bool BassNoteHasThisIntvlAlone(int intvl) const;

    /// Makes the key the only note of octave -1; the undefined key empties that octave.
    void SetBassKeyEnh(const CKeyEnh& bass);
    /// Empties octave -1.
    void RemoveBassNote();
    /// Adds the note, spelled as told where the key can be; what stands in that octave stays.
    void SetBassNoteInOctave(int keyNr, int octave, TEnh enh);
    /// The same after deleting every note of that key.
    void SetBassNoteAloneInOctave(int keyNr, int octave, TEnh enh);
    /// Adds the note in octave -1; a note that stood there as the lowest goes to the comping range.
    void AddBassNoteKeepingFormer(const CNote& note);
    /// The same after deleting the lowest note, in whatever octave it is.
    void SetBassNoteDeletingFormer(const CNote& note);

    // Intervals

    /// The interval of each note above the root, reduced by the wrap interval.
    [[nodiscard]] const CIntvlSet& IntvlSet() const;
    /// The span in semitones within which the intervals are counted; 0 or less counts them as they
    /// stand.
    [[nodiscard]] int WrapIntvl() const;
    /// Sets it and works the intervals out anew.
    void IntvlSet_SetWrapIntvl(int wrapIntvl);
    /// The intervals and the answer about the bass are older than the notes.
    [[nodiscard]] bool IntvlSetAndBassNoteHasIntvlAloneNeedsUpdate() const {
        return mIntvlSetNeedsUpdate;
    }
    /// Works both out; the functions that read them do so when it is needed.
    void UpdateIntvlSetAndBassNoteHasIntvlAlone() const;

    /// The interval set folded into one octave.
    [[nodiscard]] CSemitones Semitones() const;
    /// The interval at an index of the ascending order; `kIntvlUndef` behind the end.
    [[nodiscard]] int Intvl(std::size_t ix) const;
    /// Exactly this interval.
    [[nodiscard]] bool HasIntvl(int intvl) const;
    /// This interval or one that lies whole octaves from it.
    [[nodiscard]] bool HasIntvlInAnyOctave(int intvl) const;
    /// The same, but not if only the lowest note has it.
    [[nodiscard]] bool HasIntvlInAnyOctaveButNotInBassNoteAlone(int intvl) const;
    /// The same, and true for the root (0, 12) always.
    [[nodiscard]] bool HasIntvlInAnyOctaveOrRootButNotInBassNoteAlone(int intvl) const;
    /// Has an interval that is neither in a triad nor `intvl`.
    [[nodiscard]] bool HasOtherStackedThirdsOptionThan(int intvl) const;
    /// The lowest note that has the interval of this index; undefined behind the end.
    [[nodiscard]] CNote IntvlIxToNote(int ix) const;
    /// Its key, 0 to 11; 15 behind the end.
    [[nodiscard]] int IntvlIxToKeyNr(int ix) const;
    /// The name of its key by CurrentChordNamePrefs; "Undef" behind the end.
    [[nodiscard]] std::string IntvlIxToKeyName(int ix) const;

    /// The skeleton that is heard; a bass on a tone of its own is not part of it. A half-diminished
    /// chord is Minor here.
    [[nodiscard]] TBasicChord BasicChord() const;
    /// Its tones: 0 3 7 for minor, none for `None`.
    [[nodiscard]] CSemitones BasicChordSemitones() const;
    /// Index in the XG chord table, 0 to 34.
    [[nodiscard]] int XGChordIx() const;

    // Relation to keys and notes

    /// Signs of the scale that belongs to the chord, flats and sharps alike.
    [[nodiscard]] int SignsCountAbs() const;
    /// All intervals are in the key; on the fifth degree of a minor key the chord needs a major
    /// third instead.
    [[nodiscard]] bool IsInSignKeyRegardlessOfEnh(const CSignKeyHeavy& signKey) const;
    /// How many of the intervals are keys of the scale, each counted once.
    [[nodiscard]] int CountIntvlsInSignKey(const CSignKeyHeavy& signKey) const;
    /// How many are not: all intervals less CountIntvlsInSignKey.
    [[nodiscard]] int CountIntvlsNotInSignKey(const CSignKeyHeavy& signKey) const;
    /// How many notes are not keys of the scale, doubled and undefined ones too.
    [[nodiscard]] int CountNotesNotInSignKey(const CSignKeyHeavy& signKey) const;
    /// Intervals in the key less those outside, and 0 to 2 more for a chord at home on that degree.
    [[nodiscard]] int ClosenessToSignKey(const CSignKeyHeavy& signKey) const;

    /// See CChordLite.
    [[nodiscard]] std::int64_t QuantizeToChord(std::int64_t noteNr,
                                               TQuantizeDirection direction) const;
    /// See CChordLite.
    [[nodiscard]] std::int64_t QuantizeToBasicChord(std::int64_t noteNr,
                                                    TQuantizeDirection direction) const;
    /// See CChordLite.
    [[nodiscard]] int ChordKeyNrFromKeyNr(int keyNr) const;
    /// See CChordLite.
    [[nodiscard]] int KeyNrFromChordKeyNr(int chordKeyNr) const;

    // Function in a key

    /// The harmonic function by the scale degree of the root and the basic chord: 0 to 12 for I,
    /// Im, II, IIm, IIdim, III, IIIm, IV, IVm, V, Vm, VI and VIm, 14 for VIIdim; -1 for none.
    [[nodiscard]] int HarmFuncIn(const CScaleHeavy& scale) const;
    /// "IIm", or with `mChordPrefF` 1 the function letters "Sp"; "undef".
    [[nodiscard]] std::string_view HarmFuncName(const CSignKeyHeavy& signKey,
                                                const CChordNamePrefs& prefs) const;
    /// Scale step of the root in a key, counted from 0, whatever the spelling; -1 if it is not in
    /// the key.
    [[nodiscard]] int RootNoteDegreeNrInSignKey(const CSignKeyHeavy& signKey) const;
    /// The same of the lowest note.
    [[nodiscard]] int BassNoteDegreeNrInSignKey(const CSignKeyHeavy& signKey) const;
    /// The scale that belongs to the chord in a key, see CScaleHeavy::ConstructScaleForChord.
    [[nodiscard]] CScaleHeavy ConstructScaleInSignKey(const CSignKeyHeavy& signKey) const;
    /// The same; an undefined key stands for major or minor on the root of the chord.
    [[nodiscard]] CScaleHeavy ConstructScaleInSignKey(const CSignKeyLite& signKey) const;
    /// The same in the scale of a center.
    [[nodiscard]] CScaleHeavy ConstructScaleInHarmCenter(const CHarmCenterLite& center) const;
    /// Spells the notes, but not the root, by the scale that the chord has of itself: `TEnh_Undef`
    /// where that scale is not in the catalogue. `changed` may be null; it is always set to false.
    void AdjustEnhOfChordNotesToRootScale(bool* changed);

    // Names. They are told from the intervals, so that any set of notes has one.

    /// "Dm7/G". With `mChordPrefB` a chord within an octave has no slash.
    [[nodiscard]] std::string Name(const CChordNamePrefs& prefs) const;
    /// Names the bass behind the slash where its key is not the root's, and spells it as the scale
    /// of the chord does: the lowest note keeps that spelling.
    [[nodiscard]] std::string NameWithSlash(const CChordNamePrefs& prefs) const;
    /// "Dm7". A chord of a single note is named by its root alone, one without a root is "No
    /// Chord", "No Chord Yield" or "No Chord Force".
    [[nodiscard]] std::string NameWithoutSlash(const CChordNamePrefs& prefs) const;
    /// The name that the notes have with another root; that root becomes the bass in octave -1.
    [[nodiscard]] std::string NameForThisRootNote(const CNote& note,
                                                  const CChordNamePrefs& prefs) const;
    /// The same with the root in the spelling that needs the fewest signs, which `note` takes.
    [[nodiscard]] std::string NameWithLeastSignsForThisRootNote(CNote& note,
                                                                const CChordNamePrefs& prefs) const;

    /// What stands behind the root: "m7", "7sus4".
    [[nodiscard]] std::string BasicChordAndOptionsName(const CChordNamePrefs& prefs) const;
    /// True for suspended chords, as in "7sus4".
    [[nodiscard]] bool BasicChordNameAfterOptionsName() const;
    /// What the name says beyond the basic chord, in the order of the name; empty without notes.
    [[nodiscard]] TChordOptionsMap OptionsMap(const CChordNamePrefs& prefs) const;
    /// The options in their order, "7/9/13" or "7(9)(13)"; empty for an undefined root.
    [[nodiscard]] std::string OptionsNameFromMap(const TChordOptionsMap& options,
                                                 const CChordNamePrefs& prefs) const;
    /// "add 9"; empty for a value that is no option.
    [[nodiscard]] static std::string OptionName(TChordOption option, const CChordNamePrefs& prefs);
    /// OptionsNameFromMap of OptionsMap.
    [[nodiscard]] std::string OptionsName(const CChordNamePrefs& prefs) const;
    /// The same behind a blank, where `prefs` asks for one and there are options.
    [[nodiscard]] std::string OptionsNameWithPreceedingOptionalSpace(
        const CChordNamePrefs& prefs) const;
    /// One text for each option.
    [[nodiscard]] std::vector<std::string> OptionsStringVector(const CChordNamePrefs& prefs) const;

    /// Same root, notes and intervals.
    [[nodiscard]] bool IsExactlyTheSame(const CChordHeavy& other) const;
    /// Same keys.
    [[nodiscard]] bool IsHarmonicallyTheSame(const CChordHeavy& other) const;

    /// Writes `{"root":...,"basic":1,"notes":[...]}` without blanks.
    void AppendJSONString(std::ostream& stream) const;

private:
    [[nodiscard]] CNote _LikeliestRootByScore() const;
    [[nodiscard]] bool _WinsTie(const CNote& candidate, const CNote& best) const;
    [[nodiscard]] CNote _LikeliestRootByNet();
    void _AddTonesAndBass(const CIntvlSet& intvls, const CKeyEnh& bass);
    void _AddNoteNrAndIntvlIfNotAlreadyContained(std::int64_t noteNr);
    void _FollowLowestNote();
    void _DelNotesOfKeyNr(int keyNr);
    [[nodiscard]] int _IntvlOfNote(const CNote& note) const;
    /// From the root up to the key of the lowest note, 0 to 11.
    [[nodiscard]] int _BassIntvl() const;
    /// The note, its spelling repaired, in that of itself and its neighbours with which the chord
    /// on it needs the fewest signs.
    [[nodiscard]] CNote _RootWithLeastSigns(CNote given) const;

    CNote mRootNote;
    /// Naming a chord spells the lowest one. The order by number always holds, the order by
    /// spelling among notes of one number may not.
    mutable CMySet<CNote> mNotes;
    mutable CIntvlSet mIntvlSet;
    bool mRootNoteSpecified = false;
    mutable bool mIntvlSetNeedsUpdate = false;
    mutable bool mBassNoteHasIntvlAlone = true;
};

/// IsExactlyTheSame.
[[nodiscard]] bool operator==(const CChordHeavy& a, const CChordHeavy& b);

/// Writes root, notes and intervals on one line, for debugging.
std::ostream& operator<<(std::ostream& stream, const CChordHeavy& chord);

/// Reads a chord symbol into `chord`, which keeps its wrap interval.
void SetFromString(std::string_view symbol, CChordHeavy& chord, const CChordNamePrefs& prefs);

/// The three chords that are none: without notes, told apart by the spelling of the root.
[[nodiscard]] const CChordHeavy& CChordHeavy_Undef();
/// See CChordHeavy_Undef.
[[nodiscard]] const CChordHeavy& CChordHeavy_NoChordYield();
/// See CChordHeavy_Undef.
[[nodiscard]] const CChordHeavy& CChordHeavy_NoChordForce();

}  // namespace brindle
