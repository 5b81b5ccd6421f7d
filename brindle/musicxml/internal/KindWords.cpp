// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/KindWords.h"

#include "brindle/chords/CChordLite.h"
#include "brindle/musicxml/HarmonyKinds.h"
#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <string>
#include <utility>

namespace brindle {

namespace {

struct TKindAlias {
    std::string_view mAlias;
    std::string_view mKind;
};

// Other names of kinds that scores use, or signs that they print, and the kind that has the same
// tones. Capitals count only for the signs of major.
constexpr auto kKindAliases = std::to_array<TKindAlias>({
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

bool IsKind(std::string_view word) {
    return word == kNoChord || !XMLHarmonyKindToIntvlSetExceptRoot(word).empty();
}

std::string Folded(std::string_view word) {
    std::string folded(word);
    std::transform(folded.begin(), folded.end(), folded.begin(), [](char c) {
        if (c == ' ' || c == '_') return '-';
        return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c;
    });
    return folded;
}

std::string_view WithoutBlanks(std::string_view text) {
    const std::size_t begin = std::min(text.find_first_not_of(' '), text.size());
    return text.substr(begin, text.find_last_not_of(' ') + 1 - begin);
}

// The kind that another word for it means, empty for a word without meaning.
std::string KindOfAlias(std::string_view word) {
    std::string folded = Folded(word);
    if (IsKind(folded)) return folded;
    for (const std::string_view name : {word, std::string_view(folded)}) {
        for (const TKindAlias& row : kKindAliases) {
            if (row.mAlias == name) return std::string(row.mKind);
        }
    }
    return {};
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
        harmony.mDegrees.push_back({std::string(kDegreeOfSemitone[intvl]), 0, "add"});
    }
}

}  // namespace

void SetKind(TMusicXMLHarmony& harmony, std::string_view printed) {
    if (IsKind(harmony.mKind)) return;
    printed = WithoutBlanks(printed);
    if (printed.size() > kLongestPrinted) printed = {};
    std::string kind = KindOfAlias(harmony.mKind);
    if (kind.empty() && !printed.empty()) kind = KindOfAlias(printed);
    if (!kind.empty()) {
        harmony.mKind = std::move(kind);
    } else if (!printed.empty()) {
        const CChordLite chord("C" + std::string(printed), CChordNamePrefs());
        SetTones(harmony, chord.mSemitones);
    } else {
        harmony.mKind = harmony.mKind.empty() ? "major" : kRootAlone;
    }
}

}  // namespace brindle
