// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/LookUpChord.h"

#include "brindle/guitarchords/FindFingerings.h"
#include "brindle/guitarchords/GChChord.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <limits>
#include <vector>

namespace brindle {
namespace {

constexpr int kHighestSoundingPitch = 127;

std::vector<int> SoundingPitches(const GChChord& chord, int capo) {
    std::vector<int> pitches;
    for (int i = 0; i < chord.numberOfStrings(); ++i) {
        pitches.push_back(chord.pitchForStringIndex(i, capo));
    }
    return pitches;
}

/// The place of a grid in the order of FindFingerings; what one hand cannot hold stands behind.
int CostForPlayer(const GChChord& grid, const CChordLite& chord, int capo) {
    std::vector<int> frets;
    for (int i = 0; i < grid.numberOfStrings(); ++i) {
        frets.push_back(grid.maxAbsFretIndexPlusOneForStringIndex(i));
    }
    CFingeringOptions options;
    options.mCapo = capo;
    const auto held = FingeringForChord(frets, chord, grid.basicChord()->shortTuning(), options);
    return held ? held->mCost : std::numeric_limits<int>::max();
}

/// Whether a library tells a bass, and the same as the chord.
bool HasBassOf(const GChChord& grid, const CChordLite& chord, int capo) {
    const int bass = grid.bassNote(capo);
    const bool isTold = bass >= 0 && bass != grid.rootNote(capo);
    if (!chord.IsSlashChord()) return !isTold;
    return !isTold || bass == chord.mBassKeyEnh.mKeyNr;
}

}  // namespace

std::optional<CSemitones> TonesLeftOut(std::span<const int> pitches, const CChordLite& chord) {
    if (chord.IsUndef()) return std::nullopt;
    const int root = chord.mRootKeyEnh.mKeyNr;
    CSemitones allowed = chord.mSemitones;
    if (chord.IsSlashChord()) allowed.AddIntvl(chord.mBassKeyEnh.mKeyNr - root);
    CSemitones sounding;
    int lowest = kHighestSoundingPitch + 1;
    for (const int pitch : pitches) {
        if (pitch < 0) continue;
        sounding.AddIntvl(pitch - root);
        lowest = std::min(lowest, pitch);
    }
    const CSemitones omitted = allowed - sounding;
    const bool isChord = !sounding.IsEmpty() && (sounding - allowed).IsEmpty() &&
                         (omitted - OmittableTones(chord.mSemitones)).IsEmpty();
    const bool isOverBass =
        !chord.IsSlashChord() || FoldIntoOctave(lowest) == chord.mBassKeyEnh.mKeyNr;
    return isChord && isOverBass ? std::optional(omitted) : std::nullopt;
}

std::vector<CFoundGrid> LookUpChord(const GChDatabase& database, const CChordLite& chord,
                                    const GChShortTuning& tuning, int capo) {
    std::vector<CFoundGrid> found;
    for (const auto& library : database.allLibrariesForAnyTuning()) {
        if (!GChIsEqualShortTuning(library->gchTuning()->shortTuning(), tuning)) continue;
        for (const auto& basicChord : library->basicChords()) {
            const GChChord grid = *GChChord::make(basicChord, 0);
            if (grid.rootNote(capo) != chord.mRootKeyEnh.mKeyNr) continue;
            if (!HasBassOf(grid, chord, capo)) continue;
            const auto omitted = TonesLeftOut(SoundingPitches(grid, capo), chord);
            if (omitted) {
                found.push_back({basicChord, *omitted, CostForPlayer(grid, chord, capo)});
            }
        }
    }
    std::stable_sort(found.begin(), found.end(),
                     [](const CFoundGrid& a, const CFoundGrid& b) { return a.mCost < b.mCost; });
    return found;
}

}  // namespace brindle
