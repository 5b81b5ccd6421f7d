// SPDX-License-Identifier: MIT
// The keys that a song passes through: the path through the 24 keys with the most points. A chord
// gives points to the keys that it fits, a change of key costs points, so a key changes where a few
// chords together outweigh the change (Viterbi's algorithm).

#include "brindle/analysis/internal/LocalKeys.h"

#include "brindle/analysis/internal/KeyTables.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace brindle {
namespace {

using TPointsOfKeys = std::array<double, kKeyCount>;
using TKeysBefore = std::array<std::uint8_t, kKeyCount>;

constexpr double kShortestInBars = 1.0 / 16;
constexpr double kLongestInBars = 4.0;
// What the seventh chords on I and IV gain at home in a blues, where they are at rest.
constexpr double kBluesPoints = 2.7;
// What a change costs more to the parallel key, or for each fifth between the signatures.
constexpr double kParallelCost = 1.0;
constexpr double kFifthCost = 0.5;
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
    if (TonicOfKey(from) == TonicOfKey(to)) return base + kParallelCost;
    return base + kFifthCost * std::min(FifthsBetween(from, to), kMostFifths);
}

/// What the changes cost, [from][to], and the range of that. To stay costs nothing, so the most is
/// not below that.
struct CChangeCosts {
    std::array<TPointsOfKeys, kKeyCount> mCosts{};
    double mLeast = std::numeric_limits<double>::infinity();
    double mMost = 0.0;
};

CChangeCosts ChangeCosts(double base) {
    CChangeCosts costs;
    for (int from = 0; from < kKeyCount; ++from) {
        for (int to = 0; to < kKeyCount; ++to) {
            if (from == to) continue;
            const double cost = ChangeCost(from, to, base);
            costs.mCosts[static_cast<std::size_t>(from)][static_cast<std::size_t>(to)] = cost;
            costs.mLeast = std::min(costs.mLeast, cost);
            costs.mMost = std::max(costs.mMost, cost);
        }
    }
    return costs;
}

// One root of the fourth and not two square ones: rounded once, it leaves equal sums equal.
double Weight(const CKeyChord& chord, double beatsPerBar) {
    return std::pow(std::clamp(chord.mBeats / beatsPerBar, kShortestInBars, kLongestInBars), 0.25);
}

bool IsBluesChord(const CKeyChord& chord, int home) {
    const int degree = DegreeInKey(chord.mRoot, home);
    return chord.mClass == TKeyChordClass_Dom && (degree == 0 || degree == 5);
}

TPointsOfKeys Gains(const CKeyChord& chord, TKeyChordKind kind, const CSongTraits& traits,
                    const CKeyOptions& options) {
    const double weight = Weight(chord, options.mBeatsPerBar);
    TPointsOfKeys gains;
    for (int key = 0; key < kKeyCount; ++key) {
        gains[static_cast<std::size_t>(key)] =
            weight * kKeyLocalTable[static_cast<std::size_t>(ModeOfKey(key))][kind]
                                   [static_cast<std::size_t>(DegreeInKey(chord.mRoot, key))];
    }
    double& home = gains[static_cast<std::size_t>(traits.mHome)];
    if (traits.mIsBlues && IsBluesChord(chord, traits.mHome)) {
        home = std::max(home, weight * kBluesPoints);
    }
    home += weight * options.mHomeBonus;
    return gains;
}

// Takes for each key the better way into it, from the key `from` or from where it comes now, and of
// equal ones the latter: to stay, or a lower key. Free of branches, so that it runs on several keys
// at once.
void ChangeFrom(std::size_t from, double best, const TPointsOfKeys& costs, TPointsOfKeys& points,
                TPointsOfKeys& before) {
    const auto number = static_cast<double>(from);
    for (std::size_t to = 0; to < kKeyCount; ++to) {
        const double candidate = best - costs[to];
        const bool isBetter = candidate > points[to];
        points[to] = isBetter ? candidate : points[to];
        before[to] = isBetter ? number : before[to];
    }
}

// Moves `best` on by one chord, and tells from which key the best path into each key comes.
TKeysBefore StepOn(TPointsOfKeys& best, const TPointsOfKeys& gains, const CChangeCosts& costs) {
    TPointsOfKeys points = best;
    TPointsOfKeys before;
    for (std::size_t to = 0; to < kKeyCount; ++to) before[to] = static_cast<double>(to);
    // A key from which the nearest change is worse than the farthest from the leading key is never
    // where a change comes from. That leaves few.
    const double needed = *std::max_element(best.begin(), best.end()) - costs.mMost;
    for (std::size_t from = 0; from < kKeyCount; ++from) {
        if (best[from] - costs.mLeast < needed) continue;
        ChangeFrom(from, best[from], costs.mCosts[from], points, before);
    }
    TKeysBefore keys;
    for (std::size_t to = 0; to < kKeyCount; ++to) {
        best[to] = gains[to] + points[to];
        keys[to] = static_cast<std::uint8_t>(before[to]);
    }
    return keys;
}

bool IsSecondDegree(const CKeyChord& chord, int key) {
    return (chord.mClass == TKeyChordClass_Min7 || chord.mClass == TKeyChordClass_HDim) &&
           DegreeInKey(chord.mRoot, key) == 2;
}

bool IsDominant(const CKeyChord& chord, int key) {
    return chord.mClass == TKeyChordClass_Dom && DegreeInKey(chord.mRoot, key) == 7;
}

// A II before the dominant of a new key already belongs to it: Fm7 in C Fm7 Bb7 Eb.
void MovePivots(std::span<const CKeyChord> chords, std::vector<std::uint8_t>& keys) {
    for (std::size_t i = keys.size() - 1; i-- > 1;) {
        const std::uint8_t next = keys[i + 1];
        if (keys[i] != next && IsDominant(chords[i + 1], next) && IsSecondDegree(chords[i], next)) {
            keys[i] = next;
        }
    }
}

}  // namespace

std::vector<std::uint8_t> LocalKeys(std::span<const CKeyChord> chords,
                                    std::span<const TKeyChordKind> kinds, const CSongTraits& traits,
                                    const CKeyOptions& options) {
    if (chords.empty()) return {};
    const CChangeCosts costs = ChangeCosts(options.mChangeCost);
    TPointsOfKeys best = Gains(chords.front(), kinds.front(), traits, options);
    std::vector<TKeysBefore> before(chords.size());
    for (std::size_t i = 1; i < chords.size(); ++i) {
        before[i] = StepOn(best, Gains(chords[i], kinds[i], traits, options), costs);
    }
    std::vector<std::uint8_t> keys(chords.size());
    const auto end = std::max_element(best.begin(), best.end());
    keys.back() = static_cast<std::uint8_t>(end - best.begin());
    for (std::size_t i = chords.size() - 1; i > 0; --i) keys[i - 1] = before[i][keys[i]];
    MovePivots(chords, keys);
    return keys;
}

}  // namespace brindle
