// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/NumeralSign.h"

#include "brindle/analysis/RomanNumeral.h"
#include "brindle/analysis/internal/KeyChords.h"
#include "brindle/analysis/internal/NumeralTables.h"
#include "brindle/analysis/internal/NumeralText.h"
#include "brindle/analysis/internal/NumeralTones.h"

#include <algorithm>
#include <array>
#include <utility>

// The sign of the chord's class gives most of its tones. Another sign that is nearer is taken
// instead (C9 rather than C7add9), and what is still missing or too much is told behind it.

namespace brindle {
namespace {

bool IsDiminished(CSemitones semitones) {
    const TKeyChordClass chordClass = KeyChordClassOf(semitones);
    return chordClass == TKeyChordClass_HDim || chordClass == TKeyChordClass_Dim;
}

CSemitones TonesOf(const CNumeralSign& sign, bool isSmall) {
    return isSmall ? sign.mMinor : sign.mMajor;
}

const CNumeralSign& RowOf(std::string_view sign) {
    return *std::find_if(kNumeralSigns.begin(), kNumeralSigns.end(),
                         [&](const CNumeralSign& row) { return row.mText == sign; });
}

// How much has to be told behind a sign; what is left out is harder to read than what is added,
// and b5 is one thing.
int DistanceOf(CSemitones sign, CSemitones semitones) {
    const CSemitones missing = sign - semitones;
    const CSemitones extra = semitones - sign;
    if (missing.HasIntvl(7) && (extra.HasIntvl(6) || extra.HasIntvl(8))) {
        return 2 * (missing.size() - 1) + extra.size();
    }
    return 2 * missing.size() + extra.size();
}

// Signs whose tones depend on the key where what has no sign is of the key.
bool DependsOnKey(std::string_view sign) {
    return sign.ends_with('9') || sign == "11" || sign == "13";
}

const CNumeralSign& NearestSign(CSemitones semitones, bool isSmall, bool byKey) {
    const CNumeralSign* nearest = &RowOf(NumeralSignOf(semitones));
    // The sign says diminished; on a Nashville number nothing else does.
    if (IsDiminished(semitones)) return *nearest;
    if (byKey && DependsOnKey(nearest->mText)) nearest = &RowOf("7");
    int best = DistanceOf(TonesOf(*nearest, isSmall), semitones);
    for (const CNumeralSign& row : kNumeralSigns) {
        if (best == 0) break;
        const CSemitones tones = TonesOf(row, isSmall);
        if (tones.IsEmpty() || (byKey && DependsOnKey(row.mText))) continue;
        const int distance = DistanceOf(tones, semitones);
        if (distance >= best) continue;
        best = distance;
        nearest = &row;
    }
    return *nearest;
}

// The number of a tone that a sign has and the chord lacks.
std::string_view NumberOf(CSemitones sign, int semitone) {
    constexpr std::array<std::string_view, 8> numbers{"", "1", "9", "3", "11", "5", "13", "7"};
    return numbers[static_cast<std::size_t>(StepOfSemitone(sign, semitone))];
}

/// A tone that is told behind the sign, and the tone for which it would stand without `add`.
struct CAddition {
    std::string_view mText;
    int mPlain;
};

// By semitones above the root.
// clang-format off
constexpr std::array<CAddition, 12> kAdditions{{
    {"", -1},      {"b9", 2},     {"add9", -1}, {"#9", 2},  {"add3", -1},  {"add11", -1},
    {"#11", 5},    {"add5", -1},  {"b13", 9},   {"add13", -1}, {"add7", -1}, {"add^7", -1},
}};
// clang-format on

std::string AlterationsOf(CSemitones sign, CSemitones semitones) {
    CSemitones missing = sign - semitones;
    CSemitones extra = semitones - sign;
    std::string fifth;
    for (const auto& [semitone, text] : {std::pair{6, "b5"}, std::pair{8, "#5"}}) {
        if (!missing.HasIntvl(7) || !extra.HasIntvl(semitone)) continue;
        missing.SetSemitone(7, false);
        extra.SetSemitone(semitone, false);
        fifth = text;
    }
    std::string text;
    for (int i = 0; i < 12; ++i) {
        if (missing.HasIntvl(i)) (text += "no") += NumberOf(sign, i);
    }
    text += fifth;
    // The altered tones first, since they stand for plain ones that are told before them.
    for (const bool isPlain : {false, true}) {
        for (int i = 0; i < 12; ++i) {
            const CAddition& addition = kAdditions[static_cast<std::size_t>(i)];
            if (!extra.HasIntvl(i) || isPlain != (addition.mPlain < 0)) continue;
            if (sign.HasIntvl(addition.mPlain)) text += "add";
            text += addition.mText;
        }
    }
    return text;
}

}  // namespace

bool HasSmallNumeral(CSemitones semitones) {
    return IsSmallNumeral(KeyChordClassOf(semitones));
}

CChordSign SignOfChord(CSemitones semitones, const CNumeralOptions& options) {
    const bool isSmall = HasSmallNumeral(semitones);
    const CNumeralSign& sign = NearestSign(semitones, isSmall, options.mByKey);
    return {sign.mText, AlterationsOf(TonesOf(sign, isSmall), semitones)};
}

}  // namespace brindle
