// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/song/internal/SongStretch.h"

#include <array>
#include <vector>

namespace brindle {

inline constexpr std::size_t kTonicCount = 12;

/// The chords that may be written: the common ones of the model, and those that are wished for.
/// A chord in a key is a slot: its number times 12 and the tonic of the key above that of the song.
class CSongCandidates {
public:
    CSongCandidates(const CSongModel& model, const CSongStretch& stretch);

    struct CCandidate {
        CRelativeChord mChord;
        std::int32_t mId;
    };
    /// One that may come behind another, and how likely at each place of the bar.
    struct CStep {
        std::size_t mTo;
        std::array<float, kBarPlaceCount> mWeights;
    };

    [[nodiscard]] std::size_t size() const { return mCandidates.size(); }
    [[nodiscard]] std::size_t SlotCount() const { return size() * kTonicCount; }
    [[nodiscard]] const CCandidate& operator[](std::size_t index) const {
        return mCandidates[index];
    }
    /// -1 for a chord that is no candidate.
    [[nodiscard]] std::ptrdiff_t IndexOf(std::int32_t id) const;
    [[nodiscard]] std::span<const CStep> StepsFrom(std::size_t index) const {
        return mSteps[index];
    }
    /// The chance of a step that no song has made.
    [[nodiscard]] double Alone(std::size_t index, TBarPlace place) const {
        return mAlone[index][place];
    }
    [[nodiscard]] bool HasStep(std::size_t from, std::size_t to) const;

    /// Whether the chord of a slot is such a one.
    [[nodiscard]] bool Fits(std::size_t slot, const CWishedChord& wish) const;
    /// The tonic behind a step from a key to a candidate.
    [[nodiscard]] static std::size_t TonicAfter(std::size_t tonic, const CRelativeChord& chord) {
        return (tonic + chord.mShift) % kTonicCount;
    }

private:
    void AddCommon(const CSongModel& model);
    void AddWished(const CSongStretch& stretch);
    void AddWish(const CSongStretch& stretch, const CWishedChord& wish);
    void AddSteps(const CSongModel& model, std::int32_t start);

    const CSongModel& mModel;
    int mHomeTonic;
    std::vector<CCandidate> mCandidates;
    std::vector<std::int32_t> mIndexOfId;
    std::vector<std::vector<CStep>> mSteps;
    std::vector<std::array<double, kBarPlaceCount>> mAlone;
};

}  // namespace brindle
