// SPDX-License-Identifier: MIT
// The path through the keys changes key for every cadence. A teacher does not: where a few chords
// only dwell on a degree of the key around them, that degree is tonicized and the key stays.

#include "brindle/analysis/internal/LocalKeys.h"

#include <algorithm>
#include <optional>

namespace brindle {
namespace {

constexpr std::size_t kLongestTonicization = 5;
// The degrees of a cadence: I, ii, IV, V and the leading tone.
constexpr CSemitones kCadenceDegrees{0, 2, 5, 7, 11};

/// The chords [mBegin, mEnd) of one key.
struct CRun {
    std::size_t mBegin;
    std::size_t mEnd;
    int mKey;
};

std::vector<CRun> RunsOf(const std::vector<std::uint8_t>& keys) {
    std::vector<CRun> runs;
    runs.reserve(CountRuns(keys));
    for (std::size_t i = 0; i < keys.size(); ++i) {
        if (runs.empty() || runs.back().mKey != keys[i]) runs.push_back({i, i, keys[i]});
        runs.back().mEnd = i + 1;
    }
    return runs;
}

// Whether the tonic of `key` is a degree of `around` with its own kind of chord there.
bool IsDegreeOf(int key, int around) {
    const int degree = DegreeInKey(TonicOfKey(key), around);
    if (degree == 0 || !ScaleOfKey(around).HasIntvl(degree)) return false;
    // The dominant of a minor key is tonicized as a minor and as a major one.
    if (degree == 7 && IsMinorKey(around)) return true;
    return IsSmallDegree(degree, around) == IsMinorKey(key);
}

bool OnlyCadences(std::span<const CKeyChord> chords, int key, bool mayRest) {
    return std::all_of(chords.begin(), chords.end(), [&](const CKeyChord& chord) {
        const int degree = DegreeInKey(chord.mRoot, key);
        return kCadenceDegrees.HasIntvl(degree) && (degree != 0 || mayRest);
    });
}

// The key that the run `ix` is but an episode of, if any.
std::optional<int> KeyAround(std::span<const CKeyChord> chords, const std::vector<CRun>& runs,
                             std::size_t ix) {
    const CRun& run = runs[ix];
    const bool isFirst = ix == 0;
    const bool isLast = ix + 1 == runs.size();
    if ((isFirst && isLast) || run.mEnd - run.mBegin > kLongestTonicization) return std::nullopt;
    const int around = isFirst ? runs[ix + 1].mKey : runs[ix - 1].mKey;
    if (!isLast && runs[ix + 1].mKey != around) return std::nullopt;
    const auto chordsOfRun = chords.subspan(run.mBegin, run.mEnd - run.mBegin);
    const bool isInside = !isFirst && !isLast;
    if (!IsDegreeOf(run.mKey, around) || !OnlyCadences(chordsOfRun, run.mKey, isInside)) {
        return std::nullopt;
    }
    return around;
}

void JoinTonicizations(std::span<const CKeyChord> chords, std::vector<std::uint8_t>& keys) {
    const std::vector<CRun> runs = RunsOf(keys);
    for (std::size_t ix = 0; ix < runs.size(); ++ix) {
        const std::optional<int> around = KeyAround(chords, runs, ix);
        if (!around) continue;
        for (std::size_t i = runs[ix].mBegin; i < runs[ix].mEnd; ++i) {
            keys[i] = static_cast<std::uint8_t>(*around);
        }
    }
}

// A chord that fits home and not the key that it was put into.
bool IsForeign(const CKeyChord& chord, int key, int home) {
    const bool hasMode = chord.mClass == TKeyChordClass_Triad ||
                         chord.mClass == TKeyChordClass_Maj7 ||
                         chord.mClass == TKeyChordClass_Min ||
                         chord.mClass == TKeyChordClass_Min7 || chord.mClass == TKeyChordClass_HDim;
    return hasMode && !IsInScale(chord, DegreeInKey(chord.mRoot, key), ScaleOfKey(key)) &&
           IsInScale(chord, DegreeInKey(chord.mRoot, home), ScaleOfKey(home));
}

void GiveBordersHome(std::span<const CKeyChord> chords, int home, std::vector<std::uint8_t>& keys) {
    const auto homeKey = static_cast<std::uint8_t>(home);
    for (auto [begin, end, key] : RunsOf(keys)) {
        if (key == home) continue;
        if (begin == 0 || keys[begin - 1] == home) {
            while (begin + 1 < end && IsForeign(chords[begin], key, home)) keys[begin++] = homeKey;
        }
        if (end == keys.size() || keys[end] == home) {
            while (begin + 1 < end && IsForeign(chords[end - 1], key, home)) keys[--end] = homeKey;
        }
    }
}

}  // namespace

void TidyLocalKeys(std::span<const CKeyChord> chords, int home, std::vector<std::uint8_t>& keys) {
    JoinTonicizations(chords, keys);
    GiveBordersHome(chords, home, keys);
}

}  // namespace brindle
