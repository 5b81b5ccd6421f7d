// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/internal/SongCandidates.h"
#include "brindle/song/internal/SongLengths.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace brindle {

/// Tells for each chord that might begin on a beat how well a stretch can be finished from there.
///
/// All ways from there to the end are added up, from the last beat to the first: a chord and a
/// length at a time, each chord by the one before it. A way that a wish forbids counts 0, so that a
/// way that is followed by these sums alone never ends at a wish that can no longer be met. What
/// was met of rows of chords (`mContains`) is a number beside the slot, the progress.
///
/// Time is beats times chords times 12 keys times progress, times the steps that a chord has.
class CSongLattice {
public:
    CSongLattice(const CSongModel& model, const CSongStretch& stretch);

    [[nodiscard]] const CSongCandidates& Candidates() const { return mCandidates; }
    [[nodiscard]] const CSongLengths& Lengths() const { return mLengths; }

    /// Whether there is any way through the stretch.
    [[nodiscard]] bool IsPossible() const;
    /// The tonic of what stands before the stretch, above that of the song.
    [[nodiscard]] std::size_t TonicBefore() const;

    /// The sum of the ways from a chord that begins on a beat. Sums of different beats have no
    /// common measure.
    [[nodiscard]] double From(std::size_t beat, std::size_t slot, std::size_t progress) const {
        return mBegins[beat][slot * mProgressCount + progress];
    }
    /// The same for a chord that begins on a beat and lasts so long, in the measure of the beat.
    [[nodiscard]] double FromWithLength(std::size_t beat, std::size_t slot, std::size_t progress,
                                        std::size_t length) const;
    /// The progress with one more chord.
    [[nodiscard]] std::size_t ProgressWith(std::size_t progress, std::size_t slot) const {
        return mNextProgress[progress * mCandidates.SlotCount() + slot];
    }
    [[nodiscard]] TBarPlace PlaceAt(std::size_t beat) const;
    [[nodiscard]] std::size_t BeatInBar(std::size_t beat) const {
        return (mStretch.mFirstBeat + beat) % static_cast<std::size_t>(mStretch.mBeatsPerBar);
    }

private:
    void FindAllowed();
    void CountProgress();
    [[nodiscard]] std::size_t NextProgress(std::size_t progress, std::size_t slot) const;
    [[nodiscard]] bool IsAllowed(std::size_t beat, std::size_t slot) const {
        return mAllowed[mAllowedRow[beat]][slot] != 0;
    }
    void SumEnd();
    [[nodiscard]] bool IsFinal(const CSongCandidates::CCandidate& candidate) const;
    [[nodiscard]] double EndWeight(std::size_t slot) const;
    [[nodiscard]] double EndingWeight(std::size_t beat, std::size_t length) const;
    void SumBegins(std::size_t beat);
    void SumSteps(std::size_t beat);

    const CSongModel& mModel;
    const CSongStretch& mStretch;
    CSongCandidates mCandidates;
    CSongLengths mLengths;
    /// For each kind of beat and slot whether that may sound; beats without a wish are of one kind.
    std::vector<std::vector<std::uint8_t>> mAllowed;
    std::vector<std::size_t> mAllowedRow;
    std::size_t mProgressCount = 1;
    std::vector<std::size_t> mNextProgress;
    /// By beat, slot and progress: the ways from a chord that begins there, and from a chord that
    /// ends there.
    std::vector<std::vector<double>> mBegins;
    std::vector<std::vector<double>> mEnds;
    /// The logarithm of what the sums of a beat were divided by.
    std::vector<double> mScales;
};

}  // namespace brindle
