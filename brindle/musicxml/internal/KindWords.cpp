// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/KindWords.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/musicxml/HarmonyKinds.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/musicxml/internal/KindRows.h"
#include "brindle/platform/Ascii.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <string>
#include <utility>

namespace brindle {

namespace {

struct CKindAlias {
    std::string_view mAlias;
    std::string_view mKind;
    /// A tone that the alias has beside those of the kind, in semitones above the root; 0 for none.
    std::size_t mAddedTone = 0;
};

// Other names of kinds that scores use, or signs that they print, and the kind that has the same
// tones. Capitals count only for the signs of major.
constexpr auto kKindAliases = std::to_array<CKindAlias>({
    {"M", "major"},
    {"M7", "major-seventh"},
    {"M9", "major-ninth"},
    {"n.c.", "none"},
    {"no-chord", "none"},
    {"neapolitan", "Neapolitan"},
    {"italian", "Italian"},
    {"french", "French"},
    {"german", "dominant"},          // G B D E#, heard as G7
    {"tristan", "half-diminished"},  // F B D# G#, heard as Fm7b5
    {"minor-major", "major-minor"},
    {"minor-major-seventh", "major-minor"},
    {"major-minor-seventh", "major-minor"},
    {"dominant-seventh", "dominant"},
    {"seventh", "dominant"},
    {"half-diminished-seventh", "half-diminished"},
    {"augmented-dominant-seventh", "augmented-seventh"},
    {"augmented-ninth", "augmented-seventh", 2},
    {"augmented-dominant-ninth", "augmented-seventh", 2},
    {"sixth", "major-sixth"},
    {"ninth", "dominant-ninth"},
    {"dominant-9th", "dominant-ninth"},
    {"major-9th", "major-ninth"},
    {"minor-9th", "minor-ninth"},
    {"dominant-eleventh", "dominant-11th"},
    {"major-eleventh", "major-11th"},
    {"minor-eleventh", "minor-11th"},
    {"dominant-thirteenth", "dominant-13th"},
    {"major-thirteenth", "major-13th"},
    {"minor-thirteenth", "minor-13th"},
    {"suspended", "suspended-fourth"},
    {"fifth", "power"},
    {"m", "minor"},
    {"-", "minor"},
    {"-7", "minor-seventh"},
    {"+", "augmented"},
    {"+7", "augmented-seventh"},
    {"7+", "augmented-seventh"},
    {"+9", "augmented-seventh", 2},
    {"9+", "augmented-seventh", 2},
    {"o", "diminished"},
    {"\u00B0", "diminished"},
    {"o7", "diminished-seventh"},
    {"\u00B07", "diminished-seventh"},
    {"\u00F8", "half-diminished"},
    {"\u00F87", "half-diminished"},
    {"\u0394", "major-seventh"},
    {"\u03947", "major-seventh"},
    {"maj13", "major-13th"},
    {"maj11", "major-11th"},
    {"sus", "suspended-fourth"},
});

// The degree that adds one tone and nothing else, for each semitone above the root.
constexpr auto kDegreeOfSemitone = std::to_array<std::string_view>(
    {"", "add b9", "add 9", "b3", "3", "add 11", "b5", "5", "#5", "6", "7", "ma7"});

constexpr auto kAugmentedSixthWords =
    std::to_array<std::string_view>({"italian", "french", "german"});

constexpr std::size_t kLongestPrinted = 64;
constexpr std::string_view kNoChord = "none";
constexpr std::string_view kRootAlone = "pedal";

// Of kinds with equal tones one is enough.
constexpr auto kKindsFromMostTones = std::to_array<std::string_view>({
    "major-13th",
    "minor-13th",
    "dominant-13th",
    "major-11th",
    "minor-11th",
    "dominant-11th",
    "major-ninth",
    "minor-ninth",
    "dominant-ninth",
    "major-seventh",
    "minor-seventh",
    "dominant",
    "major-minor",
    "half-diminished",
    "diminished-seventh",
    "augmented-seventh",
    "major-sixth",
    "minor-sixth",
    "major",
    "minor",
    "augmented",
    "diminished",
    "suspended-fourth",
    "suspended-second",
    "power",
});

// By value: sanitized builds take no comparison of a row's address for a constant. -1 for no kind.
constexpr int ToneCountOf(std::string_view kind) {
    for (const CKindRow& row : kKindRows) {
        if (row.mWord == kind) return static_cast<int>(row.mCount);
    }
    return -1;
}

// A kind that another one is a part of would never be found behind it.
constexpr bool AreFromMostTones() {
    int before = ToneCountOf(kKindsFromMostTones.front());
    for (std::string_view kind : kKindsFromMostTones) {
        const int count = ToneCountOf(kind);
        if (count < 0 || before < count) return false;
        before = count;
    }
    return true;
}
static_assert(AreFromMostTones());

// The three augmented sixths and the pedal are kinds that no printed sign asks for.
static_assert(kKindsFromMostTones.size() + 4 == kKindRows.size());

constexpr bool AllAliasesHaveAKind() {
    for (const CKindAlias& alias : kKindAliases) {
        if (alias.mKind != kNoChord && ToneCountOf(alias.mKind) < 0) return false;
        if (ToneCountOf(alias.mAlias) >= 0) return false;
    }
    return true;
}
static_assert(AllAliasesHaveAKind());

bool IsKind(std::string_view word) {
    return word == kNoChord || !XMLHarmonyKindToIntvlSetExceptRoot(word).empty();
}

std::string FoldedKindWord(std::string_view word) {
    std::string folded(word);
    std::transform(folded.begin(), folded.end(), folded.begin(), [](char c) {
        if (c == ' ' || c == '_') return '-';
        return Ascii::ToLower(c);
    });
    return folded;
}

bool IsAugmentedSixth(std::string_view kind) {
    const auto* const end = kAugmentedSixthWords.end();
    return std::find(kAugmentedSixthWords.begin(), end, FoldedKindWord(kind)) != end;
}

std::string_view WithoutBlanks(std::string_view text) {
    const std::size_t begin = std::min(text.find_first_not_of(' '), text.size());
    return text.substr(begin, text.find_last_not_of(' ') + 1 - begin);
}

void AddTone(TMusicXMLHarmony& harmony, std::size_t intvl) {
    harmony.mDegrees.push_back({std::string(kDegreeOfSemitone[intvl]), 0, "add"});
}

// Takes the kind that another word for it means. False for a word without meaning.
bool SetKindOfAlias(TMusicXMLHarmony& harmony, std::string_view word) {
    std::string folded = FoldedKindWord(word);
    if (IsKind(folded)) {
        harmony.mKind = std::move(folded);
        return true;
    }
    for (const std::string_view name : {word, std::string_view(folded)}) {
        const auto* const row =
            std::find_if(kKindAliases.begin(), kKindAliases.end(),
                         [name](const CKindAlias& alias) { return alias.mAlias == name; });
        if (row == kKindAliases.end()) continue;
        harmony.mKind = row->mKind;
        if (row->mAddedTone > 0) AddTone(harmony, row->mAddedTone);
        return true;
    }
    return false;
}

// The kind with the most of these tones and no other one, and degrees for what is left.
void SetTones(TMusicXMLHarmony& harmony, CSemitones tones) {
    std::uint64_t left = tones.Mask();
    harmony.mKind = kRootAlone;
    for (const std::string_view kind : kKindsFromMostTones) {
        const std::uint64_t mask = XMLHarmonyKindToSemitones(kind).Mask();
        if ((mask & ~tones.Mask()) != 0) continue;
        harmony.mKind = kind;
        left &= ~mask;
        break;
    }
    for (std::size_t intvl = 1; intvl < kDegreeOfSemitone.size(); ++intvl) {
        if ((left >> intvl & 1) == 0) continue;
        AddTone(harmony, intvl);
    }
}

}  // namespace

void SetKind(TMusicXMLHarmony& harmony, std::string_view printed) {
    harmony.mHasAugmentedSixth = IsAugmentedSixth(harmony.mKind);
    if (IsKind(harmony.mKind)) return;
    printed = WithoutBlanks(printed);
    if (printed.size() > kLongestPrinted) printed = {};
    if (SetKindOfAlias(harmony, std::string(harmony.mKind))) return;
    if (!printed.empty() && SetKindOfAlias(harmony, printed)) return;
    if (!printed.empty()) {
        const CChordLite chord("C" + std::string(printed), CChordNamePrefs());
        SetTones(harmony, chord.mSemitones);
    } else {
        harmony.mKind = harmony.mKind.empty() ? "major" : kRootAlone;
    }
}

}  // namespace brindle
