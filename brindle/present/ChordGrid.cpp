// SPDX-License-Identifier: MIT
#include "brindle/present/ChordGrid.h"

#include "brindle/chords/CChordTypes.h"
#include "brindle/chords/ChordTones.h"
#include "brindle/chords/NameNotes.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/guitarchords/GChChordDescr.h"
#include "brindle/guitarchords/GChHarmonyStrings.h"
#include "brindle/guitarchords/GChLibrary.h"
#include "brindle/guitarchords/GChPitches.h"
#include "brindle/guitarchords/GChTuningDescr.h"
#include "brindle/guitarchords/LookUpChord.h"
#include "brindle/guitarchords/NameFingering.h"
#include "brindle/guitarchords/Tunings.h"
#include "brindle/platform/Ascii.h"
#include "brindle/present/ShownText.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>

namespace brindle {
namespace {

constexpr int kShownFrets = 4;
constexpr int kMuted = -1;
/// Names what the strings sound. Other names are those of whole chords that are nearly as likely.
void SetNames(CChordGrid& grid, const std::optional<CChordNamePrefs>& style) {
    constexpr int kNearlyAsLikely = 12;
    const auto names = NameFingering(grid.mPitches, grid.mTuning);
    if (names.empty()) return;
    const auto symbolOf = [&](const CNamedChord& name) {
        return style ? Printable(NamedChordSymbol(name, *style)) : name.mSymbol;
    };
    grid.mName = symbolOf(names.front());
    grid.mRoot = names.front().mRoot.mKeyNr;
    grid.mChord = names.front().mChord;
    for (std::size_t i = 1; i < names.size(); ++i) {
        const bool isWhole = names[i].mOmitted.empty() && names[i].mAdded.empty();
        const bool isNear = names[i].mCost <= names.front().mCost + kNearlyAsLikely;
        if (isWhole && isNear) grid.mOtherNames.push_back(symbolOf(names[i]));
    }
}

/// The chord of a fingering of a library; undefined where the library does not tell its type.
CChordLite StoredChord(const GChChord& chord, int root, int capo) {
    const CChordTypes& types = _s_chordTypes();
    const auto type = types.ChordTypeBuiltInFromId(chord.chordType());
    if (root < 0 || type == types.BuiltIn().end()) return {};
    const auto keyOf = [](int keyNr) {
        if (keyNr < 0) return CKeyEnh();
        return CKeyEnh{keyNr, MakeSensefulEnhForKeyNrAssumingCMajor(keyNr, TEnh_Undef)};
    };
    return {keyOf(root), keyOf(chord.bassNote(capo)), type->mIntvls.ToSemitones()};
}

/// What a library says that its fingering is, as people type it.
std::string StoredName(const GChChord& chord, int root, int capo) {
    if (root >= 0 && !chord.userName().empty()) {
        const CKeyEnh key{root, MakeSensefulEnhForKeyNrAssumingCMajor(root, TEnh_Undef)};
        return WriteNoteName(key) + Printable(chord.userName());
    }
    const CChordLite stored = StoredChord(chord, root, capo);
    return stored.IsUndef() ? Printable(chord.chordName(capo)) : WriteChordSymbol(stored);
}

/// The degree of a tone above a root as the chord names it; of any other tone as guitarists count.
std::string DegreeOnDot(const CChordLite& chord, int tone) {
    static constexpr auto kDegrees = std::to_array<std::string_view>(
        {"1", "b2", "2", "b3", "3", "4", "b5", "5", "#5", "6", "b7", "7"});
    const CChordDegree degree = DegreeOfTone(chord, tone);
    if (!degree.IsUndef()) return degree.Name();
    return std::string(kDegrees[static_cast<std::size_t>(tone)]);
}

/// Degrees that a chord leaves out, by the numbers of its name.
std::vector<std::string> OmittedDegrees(const CChordLite& chord, CSemitones omitted) {
    // Ninths and elevenths stand behind what lies within the octave.
    static constexpr auto kOrder = std::to_array({0, 1, 3, 4, 6, 7, 8, 9, 10, 11, 2, 5});
    std::vector<std::string> degrees;
    for (const int tone : kOrder) {
        if (omitted.HasIntvl(tone)) degrees.push_back(DegreeOnDot(chord, tone));
    }
    return degrees;
}

/// Whether a fingering of a library is one that the options allow.
bool IsWithin(const CFoundGrid& found, const CFingeringOptions& options) {
    if (!options.mMayOmitTones && !found.mOmitted.IsEmpty()) return false;
    const auto& elems = found.mGrid->chordElems();
    if (elems.empty()) return true;
    const auto [low, high] = std::minmax_element(
        elems.begin(), elems.end(),
        [](const auto& a, const auto& b) { return a.absFretIndex() < b.absFretIndex(); });
    const int position = low->absFretIndex() + 1;
    const int span = position >= kFingeringUpTheNeck ? options.mSpanUpTheNeck : options.mSpan;
    return high->absFretIndex() + 1 + options.mCapo <= options.mHighestFret &&
           high->absFretIndex() - low->absFretIndex() < span;
}

/// The bass behind a slash stands as it is written, other notes as tones of the chord, and as they
/// are usually called without a chord that spells.
CKeyEnh SpelledKey(const CChordLite& chord, int pitch) {
    const int keyNr = FoldIntoOctave(pitch);
    if (chord.IsUndef() || chord.mRootKeyEnh.mEnh == TEnh_Undef) {
        const std::string_view usual = GChOctPitchDefaultName(keyNr);
        return {keyNr, usual.ends_with('#') ? TEnh_s : usual.ends_with('b') ? TEnh_b : TEnh_n};
    }
    const CKeyEnh& bass = chord.mBassKeyEnh;
    if (chord.HasBassNote() && bass.mKeyNr == keyNr && bass.mEnh != TEnh_Undef) return bass;
    return ToneAboveRoot(chord, FoldIntoOctave(keyNr - chord.mRootKeyEnh.mKeyNr));
}

std::string KeyText(const CChordGrid& grid, const CKeyEnh& key) {
    return grid.mStyle ? Printable(KeyNrAndEnhToName(key.mKeyNr, key.mEnh, *grid.mStyle))
                       : WriteNoteName(key);
}

}  // namespace

CFretWindow WindowOf(const CChordGrid& grid) {
    if (grid.mElems.empty()) return {};
    const auto [lowest, highest] = std::minmax_element(
        grid.mElems.begin(), grid.mElems.end(),
        [](const auto& a, const auto& b) { return a.absFretIndex() < b.absFretIndex(); });
    if (highest->absFretIndex() < kShownFrets) return {};
    return {lowest->absFretIndex(),
            std::max(kShownFrets, highest->absFretIndex() - lowest->absFretIndex() + 1)};
}

std::string NamesText(const CChordGrid& grid) {
    std::string text = grid.mName;
    for (const std::string& name : grid.mOtherNames) text += ", " + name;
    if (grid.mOmitted.empty()) return text;
    return text + fmt::format(" (no {})", fmt::join(grid.mOmitted, ", "));
}

std::string FretsText(const CChordGrid& grid) {
    const bool isLong =
        std::any_of(grid.mFrets.begin(), grid.mFrets.end(), [](int fret) { return fret > 9; });
    std::string text;
    for (const int fret : grid.mFrets) {
        if (isLong && !text.empty()) text += '-';
        text += fret == kMuted ? "x" : std::to_string(fret);
    }
    return text;
}

std::string NoteText(const CChordGrid& grid, std::size_t string) {
    constexpr int kOctaveOfMidiZero = -2;
    const int pitch = grid.mPitches[string];
    if (pitch < 0) return {};
    const CKeyEnh key = SpelledKey(grid.mChord, pitch);
    // B# lies in the octave below the C that it sounds as, and Cb in the one above.
    const int natural = pitch - EnhToSemitone(key.mEnh);
    return fmt::format("{}{}", KeyText(grid, key), natural / 12 + kOctaveOfMidiZero);
}

std::string DotText(const CChordGrid& grid, std::size_t string, TGridDots dots) {
    const int pitch = grid.mPitches[string];
    if (pitch < 0 || dots == TGridDots::Fingers) return {};
    if (dots == TGridDots::Notes) return KeyText(grid, SpelledKey(grid.mChord, pitch));
    if (grid.mRoot < 0) return {};
    return DegreeOnDot(grid.mChord, FoldIntoOctave(pitch - grid.mRoot));
}

std::string TuningTitle(const CChordGrid& grid) {
    if (grid.mTuning == kGChStandardGuitar) return {};
    const std::string_view title = TitleOfTuning(grid.mTuning);
    return title.empty() ? TuningText(grid.mTuning) : std::string(title);
}

std::optional<CChordGrid> GridOfFrets(std::string_view symbol, const std::vector<int>& frets,
                                      const GChShortTuning& tuning, int capo,
                                      const std::optional<CChordNamePrefs>& style) {
    const GChTuningDescr tuningDescr(tuning, capo);
    GChChordDescr chord;
    for (std::size_t i = 0; i < frets.size(); ++i) {
        const auto string = static_cast<int>(i);
        chord.setMuted(frets[i] == kMuted, string);
        if (frets[i] > 0 && !chord.addFingerNum(0, frets[i] - 1, string)) return std::nullopt;
    }
    CChordGrid grid;
    grid.mSymbol = symbol;
    grid.mTuning = tuning;
    grid.mCapo = capo;
    grid.mElems = chord.chordElems();
    grid.mFrets = frets;
    grid.mStyle = style;
    for (std::size_t i = 0; i < frets.size(); ++i) {
        grid.mPitches.push_back(chord.pitchForStringIndex1(static_cast<int>(i), tuningDescr));
    }
    SetNames(grid, style);
    if (const auto held = FingeringOfFrets(frets, tuning, capo)) {
        grid.mElems = held->Elems();
        grid.mDifficulty = held->mDifficulty;
    }
    return grid;
}

CChordGrid GridOfChord(std::string_view symbol, const GChChord& chord, int capo) {
    CChordGrid grid;
    grid.mSymbol = symbol;
    grid.mTuning = chord.basicChord()->shortTuning();
    grid.mCapo = capo;
    grid.mElems = chord.chordElems();
    for (int i = 0; i < chord.numberOfStrings(); ++i) {
        grid.mFrets.push_back(chord.maxAbsFretIndexPlusOneForStringIndex(i));
        grid.mPitches.push_back(chord.pitchForStringIndex(i, capo));
    }
    grid.mRoot = chord.rootNote(capo);
    if (grid.mRoot < 0) grid.mRoot = GChProposedRootNoteFromChord(&chord, capo);
    grid.mChord = StoredChord(chord, grid.mRoot, capo);
    grid.mName = symbol.empty() ? StoredName(chord, grid.mRoot, capo) : std::string(symbol);
    grid.mDifficulty = chord.difficultyLevel();
    const auto library = chord.gchLibrary();
    if (library != nullptr) grid.mLibrary = Printable(library->libraryName());
    return grid;
}

CChordGrid GridOfFingering(std::string_view symbol, const CFingering& fingering,
                           const CChordLite& chord) {
    CChordGrid grid;
    grid.mSymbol = symbol;
    grid.mName = symbol;
    grid.mTuning = fingering.mTuning;
    grid.mCapo = fingering.mCapo;
    grid.mElems = fingering.Elems();
    for (int i = 0; i < fingering.mStringCount; ++i) {
        grid.mFrets.push_back(fingering.mFrets[static_cast<std::size_t>(i)]);
        grid.mPitches.push_back(fingering.Pitch(i));
    }
    grid.mRoot = chord.mRootKeyEnh.mKeyNr;
    grid.mChord = chord;
    grid.mOmitted = OmittedDegrees(chord, fingering.mOmitted);
    grid.mDifficulty = fingering.mDifficulty;
    return grid;
}

std::vector<CChordGrid> FoundGrids(std::string_view symbol, const CChordLite& chord,
                                   const GChShortTuning& tuning, const CFingeringOptions& options) {
    std::vector<CChordGrid> grids;
    for (const CFingering& fingering : FindFingerings(chord, tuning, options)) {
        grids.push_back(GridOfFingering(symbol, fingering, chord));
    }
    return grids;
}

std::vector<CChordGrid> GridsForChord(const GChDatabase& database, std::string_view symbol,
                                      const CChordLite& chord, const GChShortTuning& tuning,
                                      const CFingeringOptions& options) {
    std::vector<CChordGrid> grids;
    for (const CFoundGrid& found : LookUpChord(database, chord, tuning, options.mCapo)) {
        if (grids.size() == options.mLimit) break;
        if (!IsWithin(found, options)) continue;
        grids.push_back(GridOfChord(symbol, *GChChord::make(found.mGrid, 0), options.mCapo));
        grids.back().mChord = chord;
        grids.back().mOmitted = OmittedDegrees(chord, found.mOmitted);
    }
    return grids.empty() ? FoundGrids(symbol, chord, tuning, options) : grids;
}

}  // namespace brindle
