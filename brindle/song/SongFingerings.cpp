// SPDX-License-Identifier: MIT
#include "brindle/song/SongFingerings.h"

#include "brindle/song/internal/CSpelledInterval.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/MakeSensefulEnh.h"

#include <algorithm>
#include <cstdlib>
#include <limits>
#include <map>
#include <optional>

namespace brindle {
namespace {

// On the scale of CFingering::mCost.
constexpr int kCostOfWay = 20;     // each fret along the neck
constexpr int kCostOfFinger = 12;  // a finger that is put down anew
constexpr int kCostOfHole = 5000;
constexpr int kCostOfDifficulty = 50;  // a song is played at speed
constexpr int kCostOfBarre = 80;       // it tires the hand
constexpr int kCostOfCapo = 30;
constexpr int kCostOfCapoFret = 6;
constexpr std::size_t kMostFingerings = 32;
constexpr int kMostCapo = 12;

int MovementBetween(const CFingering& from, const CFingering& to) {
    int cost = 0;
    if (from.mFingerCount > 0 && to.mFingerCount > 0) {
        cost = kCostOfWay * std::abs(from.Position() - to.Position());
    }
    for (const CFingerPlace& place : to.Fingers()) {
        const auto fingers = from.Fingers();
        if (std::find(fingers.begin(), fingers.end(), place) == fingers.end()) {
            cost += kCostOfFinger;
        }
    }
    return cost;
}

using TCandidates = std::vector<CFingering>;

TCandidates CandidatesOf(const CChordLite& chord, const GChShortTuning& tuning,
                         const CSongFingeringOptions& options) {
    CFingeringOptions search = options.mFingering;
    search.mLimit = std::clamp<std::size_t>(options.mCandidates, 1, kMostFingerings);
    TCandidates found = FindFingerings(chord, tuning, search);
    if (!found.empty()) return found;
    search.mSpan = search.mSpanUpTheNeck = std::max(search.mSpan, 5);
    search.mMostInnerMutes = 2;
    search.mMayOmitTones = search.mMayOmitRoot = true;
    return FindFingerings(chord, tuning, search);
}

/// How much worse a fingering is than the best one of its chord, and how hard. Costs of different
/// chords say nothing about which of them is easier.
int CostOfHolding(const CFingering& fingering, const TCandidates& ofChord) {
    const auto fingers = fingering.Fingers();
    const bool hasBarre = std::any_of(fingers.begin(), fingers.end(),
                                      [](const CFingerPlace& place) { return place.IsBarre(); });
    return fingering.mCost - ofChord.front().mCost + kCostOfDifficulty * fingering.mDifficulty +
           (hasBarre ? kCostOfBarre : 0);
}

/// The cheapest ways to the candidates of a chord, and from where each comes.
struct CStage {
    const TCandidates* mCandidates = nullptr;
    std::size_t mChord = 0;
    std::vector<long long> mCosts;
    std::vector<std::size_t> mFrom;
};

CStage StageAfter(const CStage* before, const TCandidates& candidates, std::size_t chord) {
    CStage stage{&candidates, chord, {}, {}};
    for (const CFingering& candidate : candidates) {
        long long best = before == nullptr ? 0 : std::numeric_limits<long long>::max();
        std::size_t from = 0;
        for (std::size_t i = 0; before != nullptr && i < before->mCosts.size(); ++i) {
            const long long cost =
                before->mCosts[i] + MovementBetween((*before->mCandidates)[i], candidate);
            if (cost >= best) continue;
            best = cost;
            from = i;
        }
        stage.mCosts.push_back(best + CostOfHolding(candidate, candidates));
        stage.mFrom.push_back(from);
    }
    return stage;
}

/// Walks the cheapest path back and writes its fingerings. Gives its cost.
long long TakePath(const std::vector<CStage>& stages, std::vector<CFingering>& fingerings) {
    if (stages.empty()) return 0;
    const auto& last = stages.back().mCosts;
    const auto cheapest = std::min_element(last.begin(), last.end());
    auto at = static_cast<std::size_t>(cheapest - last.begin());
    for (auto stage = stages.rbegin(); stage != stages.rend(); ++stage) {
        fingerings[stage->mChord] = (*stage->mCandidates)[at];
        at = stage->mFrom[at];
    }
    return *cheapest;
}

/// A chord that sounds again is not changed to.
bool IsHeldOn(const std::vector<CStage>& stages, const TCandidates& candidates) {
    return !stages.empty() && stages.back().mCandidates == &candidates;
}

void SumUp(CSongFingerings& song, long long cost, std::size_t changes) {
    cost += static_cast<long long>(song.mHoles) * kCostOfHole;
    song.mCost = static_cast<int>(cost / static_cast<long long>(std::max<std::size_t>(changes, 1)));
    if (song.mCapo > 0) song.mCost += kCostOfCapo + kCostOfCapoFret * song.mCapo;
    std::size_t held = 0;
    for (const CFingering& fingering : song.mFingerings) {
        if (fingering.mStringCount == 0) continue;
        song.mDifficulty += fingering.mDifficulty;
        ++held;
    }
    if (held > 0) song.mDifficulty /= static_cast<double>(held);
}

/// Signs of the scale that a chord is the first step of, as far as it has a spelling.
int SignsOf(const CChordLite& chord, const CSpelledInterval& interval) {
    constexpr int kFifthsToRelativeMajor = 3;
    const CKeyEnh& root = chord.mRootKeyEnh;
    if (chord.IsUndef() || !IsSensefulEnhForKeyNr(root.mKeyNr, root.mEnh)) return 0;
    const bool isMinor = chord.mSemitones.HasIntvl(3) && !chord.mSemitones.HasIntvl(4);
    return std::abs(FifthOf(root) + interval.mFifths - (isMinor ? kFifthsToRelativeMajor : 0));
}

/// Of the intervals to the same keys the one after which all chords together have the fewest signs;
/// of two the one with sharps.
CSpelledInterval EasiestToRead(std::span<const CChordLite> chords, int semitones) {
    constexpr int kFifthsToSameKey = 12;
    const int fifths = FoldIntoOctave(std::int64_t{semitones} * 7);
    std::optional<CSpelledInterval> best;
    long long fewest = 0;
    for (const int turns : {1, 0, -1, -2}) {
        const CSpelledInterval interval{semitones, fifths + kFifthsToSameKey * turns};
        long long signs = 0;
        for (const CChordLite& chord : chords) signs += SignsOf(chord, interval);
        if (best && signs >= fewest) continue;
        best = interval;
        fewest = signs;
    }
    return *best;
}

}  // namespace

CSongFingerings ChooseFingerings(std::span<const CChordLite> chords, const GChShortTuning& tuning,
                                 const CSongFingeringOptions& options) {
    CSongFingerings song;
    song.mCapo = std::clamp(options.mFingering.mCapo, 0, kMostCapo);
    song.mFingerings.resize(chords.size());
    std::map<std::int64_t, TCandidates> candidatesOf;
    std::vector<CStage> stages;
    for (std::size_t i = 0; i < chords.size(); ++i) {
        if (chords[i].IsUndef()) continue;
        const auto [row, isNew] = candidatesOf.try_emplace(chords[i].GetChordHashCode());
        if (isNew) row->second = CandidatesOf(chords[i], tuning, options);
        const TCandidates& candidates = row->second;
        if (candidates.empty()) {
            ++song.mHoles;
        } else if (!IsHeldOn(stages, candidates)) {
            stages.push_back(StageAfter(stages.empty() ? nullptr : &stages.back(), candidates, i));
        }
    }
    const long long cost = TakePath(stages, song.mFingerings);
    for (std::size_t i = 1; i < chords.size(); ++i) {
        const bool isHeld = !chords[i].IsUndef() && song.mFingerings[i].mStringCount == 0;
        if (isHeld && chords[i] == chords[i - 1]) song.mFingerings[i] = song.mFingerings[i - 1];
    }
    SumUp(song, cost, stages.size() + song.mHoles);
    return song;
}

std::vector<CSongFingerings> CompareCapos(std::span<const CChordLite> chords,
                                          const GChShortTuning& tuning,
                                          const CSongFingeringOptions& options) {
    std::vector<CSongFingerings> songs;
    CSongFingeringOptions atCapo = options;
    for (int capo = 0; capo <= std::clamp(options.mHighestCapo, 0, kMostCapo); ++capo) {
        atCapo.mFingering.mCapo = capo;
        songs.push_back(ChooseFingerings(chords, tuning, atCapo));
    }
    std::stable_sort(songs.begin(), songs.end(),
                     [](const auto& a, const auto& b) { return a.mCost < b.mCost; });
    return songs;
}

std::vector<CChordLite> ShapesUnderCapo(std::span<const CChordLite> chords, int capo) {
    std::vector<CChordLite> shapes(chords.begin(), chords.end());
    const int down = FoldIntoOctave(-std::int64_t{capo});
    if (down == 0) return shapes;
    const CSpelledInterval interval = EasiestToRead(shapes, down);
    for (CChordLite& shape : shapes) {
        if (!shape.IsUndef()) interval.Move(shape);
    }
    return shapes;
}

CChordLite ShapeUnderCapo(const CChordLite& chord, int capo) {
    return ShapesUnderCapo({&chord, 1}, capo).front();
}

}  // namespace brindle
