// SPDX-License-Identifier: MIT
#include "brindle/chords/NameNotes.h"
#include "brindle/chords/internal/CheapestPath.h"
#include "brindle/chords/internal/NamedChords.h"

#include <algorithm>

namespace brindle {
namespace {

constexpr std::size_t kMostChoices = 5;

int CostOfNextName(const CNamingCandidate& chord, const CNamingCandidate& next) {
    const bool isSame = chord.mRoot == next.mRoot && chord.TonesOfType() == next.TonesOfType();
    if (isSame) return 0;
    // The mean of what both chords say to the step, weighed as NameNotes weighs known neighbours.
    return (NextRootCost(chord, next.mRoot) + PreviousRootCost(next, chord.mRoot)) * 4 / 10;
}

using TNameChoices = std::vector<std::span<const CNamingCandidate>>;

TNameChoices ChoicesOf(const std::vector<CNamingCandidates>& candidates) {
    TNameChoices choices;
    choices.reserve(candidates.size());
    for (const CNamingCandidates& each : candidates) {
        choices.push_back(each.List().first(std::min(each.List().size(), kMostChoices)));
    }
    return choices;
}

/// The candidates with the chosen one at the front.
std::vector<CNamingCandidate> WithFirst(std::span<const CNamingCandidate> candidates,
                                        std::size_t chosen) {
    std::vector<CNamingCandidate> list(candidates.begin(), candidates.end());
    if (chosen >= list.size()) return list;
    const auto place = list.begin() + static_cast<std::ptrdiff_t>(chosen);
    std::rotate(list.begin(), place, place + 1);
    return list;
}

}  // namespace

std::vector<std::vector<CNamedChord>> NameProgression(std::span<const std::vector<CNote>> sets,
                                                      const CNamingOptions& options) {
    std::vector<CNamingCandidates> candidates;
    candidates.reserve(sets.size());
    for (std::size_t ix = 0; ix < sets.size(); ++ix) {
        CNamingOptions own = options;
        if (ix > 0) own.mPreviousRoot = kKeyNrUndef;
        if (ix + 1 < sets.size()) own.mNextRoot = kKeyNrUndef;
        candidates.emplace_back(NoteKeysOf(sets[ix]), own);
    }
    const auto costOf = [](const CNamingCandidate& candidate) { return candidate.mCost; };
    const auto path = CheapestPath(ChoicesOf(candidates), costOf, CostOfNextName);
    std::vector<std::vector<CNamedChord>> names;
    names.reserve(sets.size());
    for (std::size_t ix = 0; ix < sets.size(); ++ix) {
        names.push_back(NamedChords(WithFirst(candidates[ix].List(), path[ix]), sets[ix], options));
    }
    return names;
}

}  // namespace brindle
