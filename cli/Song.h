// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsCenters.h"
#include "brindle/analysis/CHarmCopy.h"
#include "brindle/analysis/CHarmonicAnalyse.h"

#include <array>
#include <cstddef>
#include <string>
#include <vector>

namespace brindle {
struct TMusicXMLDoc;
}

namespace brindle::cli {

class CChordSymbols;

/// A range of time in beats.
struct TRange {
    double mBegin = 0.0;
    double mEnd = 0.0;

    [[nodiscard]] bool IsEmpty() const { return !(mBegin < mEnd); }
};

/// A chord as it is shown.
struct TShownChord {
    TRange mRange;
    std::string mSymbol;
    int mRootDist = -1;  ///< semitones above the center, -1 for none
    int mBassDist = -1;
    std::string mNumeral;  ///< the function in the center, empty for none
};

/// A passage that repeats an earlier one, with its exact ranges and the symbols of its chords.
struct TShownCopy {
    TRange mSource;
    TRange mTarget;
    std::vector<std::string> mSymbols;
    CHarmCopy mCopy;
};

/// A center as it is shown. Its range is that of its chords; without chords it is empty and begins
/// where the center does.
struct TShownCenter {
    CHarmCenterLite mHarmCenter;
    std::string mName;
    double mProbability = kPosUndef;
    TRange mRange;
    std::vector<TShownChord> mChords;
};

struct TShownSignKey {
    std::string mName;
    CSignKeyLite mSignKey;
    double mBegin = 0.0;
    std::vector<TShownCenter> mCenters;
};

/// What a score tells beside its chords.
struct TShownScore {
    std::string mTitle;
    /// "6/8", where it begins to hold.
    struct TTime {
        double mPosition = 0.0;
        std::string mName;
    };
    std::vector<TTime> mTimes;
    /// Rehearsal marks.
    std::vector<double> mSections;
    /// Passages that are played again: the bars from `mBegin` are those from `mSource`.
    struct TCopy {
        double mBegin = 0.0;
        double mSource = 0.0;
        std::size_t mBarCount = 0;
    };
    std::vector<TCopy> mCopies;
};

/// A chord with its numeral in the key of its region; empty for a chord that is none.
struct TShownNumeral {
    TRange mRange;
    std::string mSymbol;
    std::string mNumeral;
};

struct TShownKeyRegion {
    CSignKeyLite mKey;
    std::string mName;
    TRange mRange;
    std::vector<TShownNumeral> mChords;
};

/// The key of a song and its local keys as they are shown.
struct TSongKeys {
    CSignKeyLite mKey;
    std::string mName = "none";
    double mConfidence = kPosUndef;
    std::array<double, 24> mScores{};
    std::vector<TShownKeyRegion> mRegions;
};

/// An analysis prepared for the eye: named, with the length of each chord, each chord once, and
/// without the end marker.
struct TSong {
    double mBeatsPerBar = 4.0;
    /// Where the bars of a score begin; empty where all bars are equal.
    std::vector<double> mBarStarts;
    double mEnd = 0.0;
    TShownScore mScore;
    std::vector<TShownSignKey> mSignKeys;
    /// Chords of the text that stand in no center.
    std::vector<TShownChord> mLooseChords;
    std::vector<TShownCopy> mCopies;
    std::vector<TShownCenter> mReadings;
    bool mHasReadings = false;
    TSongKeys mKeys;
};

/// Calls `function` with every chord of the text: those of the centers, then the loose ones.
template <class TFunction>
void ForEachChord(const TSong& song, const TFunction& function) {
    for (const TShownSignKey& signKey : song.mSignKeys) {
        for (const TShownCenter& center : signKey.mCenters) {
            for (const TShownChord& chord : center.mChords) function(chord);
        }
    }
    for (const TShownChord& chord : song.mLooseChords) function(chord);
}

/// `readings` may be null.
[[nodiscard]] TSong MakeSong(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
                             const CChordSymbols& symbols, double beatsPerBar);

/// The length of the bars of a score by its first time signature; without one, that of most bars.
[[nodiscard]] double BeatsPerBarOf(const TMusicXMLDoc& sheet);

/// The same for the chords of a score.
[[nodiscard]] TSong MakeSong(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
                             const CChordSymbols& symbols, const TMusicXMLDoc& sheet);

}  // namespace brindle::cli
