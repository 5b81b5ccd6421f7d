// SPDX-License-Identifier: MIT
// The keys that a song passes through: the path through the 24 keys with the most points. A chord
// gives points to the keys that it fits, a change of key costs points, so a key changes where a few
// chords together outweigh the change (Viterbi's algorithm).

#include "brindle/analysis/internal/KeyScores.h"
#include "brindle/analysis/internal/KeyTables.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

using TPointsOfKeys = std::array<double, kKeyCount>;
/// [from][to]
using TChangeCosts = std::array<TPointsOfKeys, kKeyCount>;
using TKeysBefore = std::array<std::uint8_t, kKeyCount>;

constexpr double kShortestInBars = 1.0 / 16;
constexpr double kLongestInBars = 4.0;
// Beyond this far the signatures are far enough.
constexpr int kMostFifths = 3;

// The tonic of the major key with the same signature.
int SignatureOf(int key) {
    return FoldIntoOctave(TonicOfKey(key) + 3 * ModeOfKey(key));
}

// Steps on the circle of fifths between the signatures, 0 to 6.
int FifthsBetween(int a, int b) {
    const int up = FoldIntoOctave(7 * (SignatureOf(a) - SignatureOf(b)));
    return std::min(up, 12 - up);
}

double ChangeCost(int from, int to, double base) {
    if (from == to) return 0.0;
    if (TonicOfKey(from) == TonicOfKey(to)) return base + kKeyChangeCosts.mParallel;
    return base + kKeyChangeCosts.mFifth * std::min(FifthsBetween(from, to), kMostFifths);
}

TChangeCosts ChangeCosts(double base) {
    TChangeCosts costs{};
    for (int from = 0; from < kKeyCount; ++from) {
        for (int to = 0; to < kKeyCount; ++to) {
            costs[static_cast<std::size_t>(from)][static_cast<std::size_t>(to)] =
                ChangeCost(from, to, base);
        }
    }
    return costs;
}

TPointsOfKeys Gains(const TKeyChord& chord, int home, const CKeyOptions& options) {
    const double bars =
        std::clamp(chord.mBeats / options.mBeatsPerBar, kShortestInBars, kLongestInBars);
    const double weight = std::sqrt(std::sqrt(bars));
    TPointsOfKeys gains;
    for (int key = 0; key < kKeyCount; ++key) {
        const auto& row = kKeyLocalTable[static_cast<std::size_t>(ModeOfKey(key))][chord.mClass];
        const int dist = FoldIntoOctave(chord.mRoot - TonicOfKey(key));
        gains[static_cast<std::size_t>(key)] = weight * (row[static_cast<std::size_t>(dist)] +
                                                         (key == home ? options.mHomeBonus : 0.0));
    }
    return gains;
}

// Moves `best` on by one chord. Tells for each key from which key its best path comes, the lowest
// of equal ones. The inner loop is free of branches, so that it runs on several keys at once.
TKeysBefore StepOn(TPointsOfKeys& best, const TPointsOfKeys& gains, const TChangeCosts& costs) {
    TPointsOfKeys points;
    TPointsOfKeys before{};
    for (std::size_t to = 0; to < kKeyCount; ++to) points[to] = best[0] - costs[0][to];
    for (std::size_t from = 1; from < kKeyCount; ++from) {
        const auto number = static_cast<double>(from);
        for (std::size_t to = 0; to < kKeyCount; ++to) {
            const double candidate = best[from] - costs[from][to];
            const bool isBetter = candidate > points[to];
            points[to] = isBetter ? candidate : points[to];
            before[to] = isBetter ? number : before[to];
        }
    }
    TKeysBefore keys;
    for (std::size_t to = 0; to < kKeyCount; ++to) {
        best[to] = gains[to] + points[to];
        keys[to] = static_cast<std::uint8_t>(before[to]);
    }
    return keys;
}

bool IsSecondDegree(const TKeyChord& chord, int key) {
    return (chord.mClass == TKeyChordClass_Min7 || chord.mClass == TKeyChordClass_HDim) &&
           FoldIntoOctave(chord.mRoot - TonicOfKey(key)) == 2;
}

bool IsDominant(const TKeyChord& chord, int key) {
    return chord.mClass == TKeyChordClass_Dom && FoldIntoOctave(chord.mRoot - TonicOfKey(key)) == 7;
}

// A second degree before the dominant of a new key already belongs to that key: Fm7 in
// C Fm7 Bb7 Eb.
void MovePivots(std::span<const TKeyChord> chords, std::vector<std::uint8_t>& keys) {
    for (std::size_t i = 0; i + 1 < keys.size(); ++i) {
        const std::uint8_t next = keys[i + 1];
        if (keys[i] != next && IsDominant(chords[i + 1], next) && IsSecondDegree(chords[i], next)) {
            keys[i] = next;
        }
    }
}

}  // namespace

std::vector<std::uint8_t> LocalKeys(std::span<const TKeyChord> chords, int home,
                                    const CKeyOptions& options) {
    if (chords.empty()) return {};
    const TChangeCosts costs = ChangeCosts(options.mChangeCost);
    TPointsOfKeys best = Gains(chords.front(), home, options);
    std::vector<TKeysBefore> before(chords.size());
    for (std::size_t i = 1; i < chords.size(); ++i) {
        before[i] = StepOn(best, Gains(chords[i], home, options), costs);
    }
    std::vector<std::uint8_t> keys(chords.size());
    const auto end = std::max_element(best.begin(), best.end());
    keys.back() = static_cast<std::uint8_t>(end - best.begin());
    for (std::size_t i = chords.size() - 1; i > 0; --i) keys[i - 1] = before[i][keys[i]];
    MovePivots(chords, keys);
    return keys;
}

}  // namespace brindle
