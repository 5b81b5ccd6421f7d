// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmCopy.h"
#include "brindle/analysis/Positions.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <array>
#include <cstddef>
#include <string>
#include <vector>

namespace brindle {

// An analysis made ready for the eye. Positions and lengths are beats from the begin of the song;
// texts are as they are shown.

/// A range of time in beats.
struct CTimeRange {
    double mBegin = 0.0;
    double mEnd = 0.0;

    [[nodiscard]] bool IsEmpty() const { return !(mBegin < mEnd); }
};

/// A chord as it is shown.
struct CShownChord {
    CTimeRange mRange;
    std::string mSymbol;
    int mRootDist = -1;  ///< semitones above the center, -1 for none
    int mBassDist = -1;
    std::string mNumeral;  ///< the function in the center, empty for none
};

/// A passage that repeats an earlier one, with its exact ranges and the symbols of its chords.
struct CShownCopy {
    CTimeRange mSource;
    CTimeRange mTarget;
    std::vector<std::string> mSymbols;
    CHarmCopy mCopy;
};

/// A center as it is shown. Its range is that of its chords; without chords it is empty and begins
/// where the center does.
struct CShownCenter {
    CHarmCenterLite mHarmCenter;
    std::string mName;
    double mProbability = kPosUndef;
    CTimeRange mRange;
    std::vector<CShownChord> mChords;
};

/// A key signature from its place on, with the centers that are heard under it.
struct CShownSignKey {
    std::string mName;
    CSignKeyLite mSignKey;
    double mBegin = 0.0;
    std::vector<CShownCenter> mCenters;
};

/// What a score tells beside its chords.
struct CShownScore {
    std::string mTitle;
    /// "6/8", where it begins to hold.
    struct CTime {
        double mPosition = 0.0;
        std::string mName;
    };
    std::vector<CTime> mTimes;
    /// Rehearsal marks.
    std::vector<double> mSections;
    /// Passages that are played again: the bars from `mBegin` are those from `mSource`.
    struct CCopy {
        double mBegin = 0.0;
        double mSource = 0.0;
        std::size_t mBarCount = 0;
    };
    std::vector<CCopy> mCopies;
};

/// A chord with its numeral in the key of its region; empty for a chord that is none.
struct CShownNumeral {
    CTimeRange mRange;
    std::string mSymbol;
    std::string mNumeral;
};

/// A stretch of a song in one key, with its chords.
struct CShownKeyRegion {
    CSignKeyLite mKey;
    std::string mName;
    CTimeRange mRange;
    std::vector<CShownNumeral> mChords;
};

/// The key of a song and its local keys as they are shown.
struct CShownKeys {
    CSignKeyLite mKey;
    std::string mName = "none";
    double mConfidence = kPosUndef;
    std::array<double, 24> mScores{};
    std::vector<CShownKeyRegion> mRegions;
};

/// An analysis prepared for the eye: named, with the length of each chord, each chord once, and
/// without the end marker.
struct CShownSong {
    double mBeatsPerBar = 4.0;
    /// Where the bars of a score begin; empty where all bars are equal.
    std::vector<double> mBarStarts;
    double mEnd = 0.0;
    CShownScore mScore;
    std::vector<CShownSignKey> mSignKeys;
    /// Chords of the text that stand in no center.
    std::vector<CShownChord> mLooseChords;
    std::vector<CShownCopy> mCopies;
    std::vector<CShownCenter> mReadings;
    bool mHasReadings = false;
    CShownKeys mKeys;
};

/// Calls `function` with every chord of the text: those of the centers, then the loose ones.
template <class TFunction>
void ForEachChord(const CShownSong& song, const TFunction& function) {
    for (const CShownSignKey& signKey : song.mSignKeys) {
        for (const CShownCenter& center : signKey.mCenters) {
            for (const CShownChord& chord : center.mChords) function(chord);
        }
    }
    for (const CShownChord& chord : song.mLooseChords) function(chord);
}

}  // namespace brindle
