// SPDX-License-Identifier: MIT
// The key of a song as one sum of points for each of the 24 keys. The points ask only how far a
// chord lies above the tonic, so the song is first summed up by roots: how long each class sounds
// on each root, how long each bass, how often each step leads to each root. The sums cost a few
// operations a chord, and the keys then cost the same for every song.

#include "brindle/analysis/internal/KeyScores.h"

#include "brindle/analysis/internal/KeyTables.h"
#include "brindle/theory/KeyIntervals.h"

namespace brindle {
namespace {

using TByRoot = std::array<double, 12>;

// How a chord steps on: as a tonic or subdominant of major, as a dominant, as minor.
constexpr std::array<std::size_t, kKeyChordClassCount> kGroupOfClass{
    0,  // triad
    0,  // maj7
    1,  // dom
    2,  // min
    2,  // min7
    2,  // hdim
    1,  // dim
    0,  // open
};

// The parts add up to 1 for the time, the bass and the steps each.
struct CSumsByRoot {
    std::array<TByRoot, kKeyChordClassCount> mTime{};
    TByRoot mBass{};
    std::array<TByRoot, 36> mSteps{};
};

std::size_t StepRow(const CKeyChord& from, const CKeyChord& to) {
    return kGroupOfClass[from.mClass] * 12 +
           static_cast<std::size_t>(FoldIntoOctave(to.mRoot - from.mRoot));
}

// The steps are counted here and made parts by DivideSteps.
void AddChord(const CKeyChord& chord, const CKeyChord* before, double total, CSumsByRoot& sums) {
    const auto root = static_cast<std::size_t>(chord.mRoot);
    const double part = chord.mBeats / total;
    sums.mTime[chord.mClass][root] += part;
    sums.mBass[static_cast<std::size_t>(chord.mBass)] += part;
    if (before == nullptr || IsSameKind(*before, chord)) return;
    sums.mSteps[StepRow(*before, chord)][root] += 1.0;
}

void DivideSteps(std::array<TByRoot, 36>& steps) {
    double count = 0.0;
    for (const TByRoot& row : steps) {
        for (const double part : row) count += part;
    }
    if (count == 0.0) return;
    for (TByRoot& row : steps) {
        for (double& part : row) part /= count;
    }
}

CSumsByRoot SumsByRoot(std::span<const CKeyChord> chords) {
    double total = 0.0;
    for (const CKeyChord& chord : chords) total += chord.mBeats;
    CSumsByRoot sums;
    const CKeyChord* before = nullptr;
    for (const CKeyChord& chord : chords) {
        AddChord(chord, before, total, sums);
        before = &chord;
    }
    DivideSteps(sums.mSteps);
    return sums;
}

// The points of one row for a tonic.
double Points(const TByRoot& sums, const TByRoot& row, int tonic) {
    double points = 0.0;
    for (std::size_t dist = 0; dist < 12; ++dist) {
        points += sums[(static_cast<std::size_t>(tonic) + dist) % 12] * row[dist];
    }
    return points;
}

template <std::size_t Rows>
double Points(const std::array<TByRoot, Rows>& sums, const std::array<TByRoot, Rows>& rows,
              int tonic) {
    double points = 0.0;
    for (std::size_t row = 0; row < Rows; ++row) points += Points(sums[row], rows[row], tonic);
    return points;
}

double PointsOfChord(const CKeyChord& chord, const TKeyTable<8>& table, int key) {
    return table[static_cast<std::size_t>(ModeOfKey(key))][chord.mClass]
                [static_cast<std::size_t>(FoldIntoOctave(chord.mRoot - TonicOfKey(key)))];
}

}  // namespace

std::array<double, kKeyCount> KeyScores(std::span<const CKeyChord> chords) {
    const CSumsByRoot sums = SumsByRoot(chords);
    std::array<double, kKeyCount> scores{};
    for (int key = 0; key < kKeyCount; ++key) {
        const auto mode = static_cast<std::size_t>(ModeOfKey(key));
        const int tonic = TonicOfKey(key);
        double& score = scores[static_cast<std::size_t>(key)];
        score = Points(sums.mTime, kKeyTimeTable[mode], tonic);
        score += Points(sums.mBass, kKeyBassTable[mode][0], tonic);
        score += PointsOfChord(chords.front(), kKeyFirstTable, key);
        score += PointsOfChord(chords.back(), kKeyLastTable, key);
        score += Points(sums.mSteps, kKeyStepTable[mode], tonic);
    }
    return scores;
}

}  // namespace brindle
