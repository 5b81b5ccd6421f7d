// SPDX-License-Identifier: MIT
#include "brindle/chords/internal/NamedChords.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/chords/internal/NamedChordSpelling.h"
#include "brindle/chords/internal/SignsOfRoot.h"
#include "brindle/chords/internal/SpelledOutChord.h"

#include <algorithm>

namespace brindle {
namespace {

/// The tone of a spelled-out chord as an option: "maj7", "b9", "add11".
std::string OptionText(const CChordDegree& degree) {
    if (degree == CChordDegree{7, 0}) return "maj7";
    return degree.mSigns == 0 ? "add" + degree.Name() : degree.Name();
}

std::string NoText(const CChordDegree& degree) {
    return "no" + std::to_string(degree.mNumber);
}

/// Adds an option in the brackets at the end of a suffix.
void AddOption(std::string& suffix, const std::string& option) {
    const bool isOpened = !suffix.empty() && suffix.back() == ')';
    if (isOpened) suffix.back() = ',';
    if (!isOpened) suffix += '(';
    suffix += option;
    suffix += ')';
}

void TellType(const CNamingCandidate& candidate, CNamedChord& chord) {
    const auto ix = static_cast<std::size_t>(candidate.mType);
    chord.mSuffix = kNamingTypeRows[ix].mSuffix;
    chord.mExactSuffix = chord.mSuffix;
    const TToneMask gone = kNamingTypes[ix].mTones & ~candidate.mTones;
    if (gone == 0) return;
    for (const CChordDegree& degree : kNamingTypes[ix].mDegrees) {
        if (!HasTone(gone, degree.Tone())) continue;
        chord.mOmitted.push_back(degree);
        AddOption(chord.mExactSuffix, NoText(degree));
        if (degree.mNumber == 3) AddOption(chord.mSuffix, NoText(degree));
    }
}

void TellTones(const CNamingCandidate& candidate, CNamedChord& chord) {
    const CSpelledOutChord tones(candidate.mTones);
    chord.mExactSuffix = tones.Head();
    const auto addOptions = [&](bool areFifths) {
        for (int tone = 1; tone < 12; ++tone) {
            if (!HasTone(tones.Options(), tone)) continue;
            const CChordDegree degree = tones.DegreeOf(tone);
            if ((degree.mNumber == 5) == areFifths) chord.mAdded.push_back(degree);
        }
    };
    addOptions(true);
    addOptions(false);
    for (const CChordDegree& degree : chord.mAdded) {
        AddOption(chord.mExactSuffix, OptionText(degree));
    }
    if (tones.HasNoThird()) chord.mOmitted.push_back({3, 0});
    if (tones.HasNoFifth()) chord.mOmitted.push_back({5, 0});
    for (const CChordDegree& degree : chord.mOmitted) {
        AddOption(chord.mExactSuffix, NoText(degree));
    }
    // A lone note is just its key.
    if (candidate.mTones != 1) chord.mSuffix = chord.mExactSuffix;
}

std::vector<CNote> Spelled(std::span<const CNote> sorted, const CNamedChordSpelling& spelling) {
    std::vector<CNote> notes(sorted.begin(), sorted.end());
    for (CNote& note : notes) {
        const int tone = FoldIntoOctave(note.mNoteNr - spelling.Root().mKeyNr);
        note.SetEnhAndDontMakeSenseful(spelling.KeyOfTone(tone).mEnh);
    }
    return notes;
}

std::string SymbolOf(const CNamedChord& chord, const std::string& suffix) {
    std::string symbol = WriteNoteName(chord.mRoot);
    const bool looksLikeSign = !suffix.empty() && (suffix[0] == 'b' || suffix[0] == '#');
    if (TakesSignOf(chord.mRoot, suffix)) symbol += ' ';
    if (looksLikeSign) symbol += '(';
    symbol += suffix;
    if (looksLikeSign) symbol += ')';
    if (chord.mBass.IsUndef()) return symbol;
    return symbol + '/' + WriteNoteName(chord.mBass);
}

CNamedChord NamedChord(const CNamingCandidate& candidate, std::span<const CNote> sorted,
                       const TGivenSpellings& given, const CNamingOptions& options) {
    const CNamedChordSpelling spelling(candidate, given, options.mKey);
    CNamedChord chord;
    chord.mRoot = spelling.Root();
    const bool hasSlash = candidate.mIsInverted && options.mBass != TBassUse::None;
    if (hasSlash) chord.mBass = spelling.KeyOfTone(candidate.BassAboveRoot());
    chord.mChord = CChordLite(chord.mRoot, chord.mBass, CSemitones(candidate.mTones));
    if (candidate.IsSpelledOut()) {
        TellTones(candidate, chord);
    } else {
        TellType(candidate, chord);
    }
    chord.mSymbol = SymbolOf(chord, chord.mSuffix);
    chord.mExactSymbol = SymbolOf(chord, chord.mExactSuffix);
    chord.mNotes = Spelled(sorted, spelling);
    chord.mCost = candidate.mCost;
    return chord;
}

std::vector<CNote> Sorted(std::span<const CNote> notes) {
    std::vector<CNote> sorted(notes.begin(), notes.end());
    std::erase_if(sorted, [](const CNote& note) { return note.IsUndef(); });
    const auto isLower = [](const CNote& a, const CNote& b) { return a.mNoteNr < b.mNoteNr; };
    const auto isSame = [](const CNote& a, const CNote& b) { return a.mNoteNr == b.mNoteNr; };
    std::sort(sorted.begin(), sorted.end(), isLower);
    sorted.erase(std::unique(sorted.begin(), sorted.end(), isSame), sorted.end());
    return sorted;
}

}  // namespace

std::vector<CNamedChord> NamedChords(std::span<const CNamingCandidate> candidates,
                                     std::span<const CNote> notes, const CNamingOptions& options) {
    const TGivenSpellings given = GivenSpellings(notes);
    const std::vector<CNote> sorted = Sorted(notes);
    std::vector<CNamedChord> chords;
    chords.reserve(std::min(candidates.size(), options.mLimit));
    for (const CNamingCandidate& candidate : candidates) {
        if (chords.size() == options.mLimit) break;
        chords.push_back(NamedChord(candidate, sorted, given, options));
    }
    return chords;
}

}  // namespace brindle
