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
    double mBegin = 0.0;  ///< inside the range
    double mEnd = 0.0;    ///< not inside

    /// It ends where it begins, or before.
    [[nodiscard]] bool IsEmpty() const { return !(mBegin < mEnd); }
};

/// A chord as it is shown.
struct CShownChord {
    CTimeRange mRange;     ///< up to the next chord of the song or its end
    std::string mSymbol;   ///< as it was written
    int mRootDist = -1;    ///< semitones above the center, -1 for none
    int mBassDist = -1;    ///< likewise, of the bass
    std::string mNumeral;  ///< the function in the center, empty for none
};

/// A passage that repeats an earlier one, with its exact ranges and the symbols of its chords.
struct CShownCopy {
    CTimeRange mSource;                 ///< where it was first
    CTimeRange mTarget;                 ///< where it comes again
    std::vector<std::string> mSymbols;  ///< as written at the target
    CHarmCopy mCopy;                    ///< the same in bars
};

/// A center as it is shown. Its range is that of its chords; without chords it is empty and begins
/// where the center does.
struct CShownCenter {
    CHarmCenterLite mHarmCenter;       ///< undefined for chords without a center
    std::string mName;                 ///< "C major"; "unknown" if undefined
    double mProbability = kPosUndef;   ///< as the analysis weighs it; kPosUndef where it does not
    CTimeRange mRange;                 ///< in beats
    std::vector<CShownChord> mChords;  ///< by time, each once
};

/// A key signature from its place on, with the centers that are heard under it.
struct CShownSignKey {
    std::string mName;                   ///< "C major"; "unknown" if undefined
    CSignKeyLite mSignKey;               ///< undefined where none is known
    double mBegin = 0.0;                 ///< in beats
    std::vector<CShownCenter> mCenters;  ///< as the analysis has them
};

/// What a score tells beside its chords.
struct CShownScore {
    std::string mTitle;  ///< empty for none
    /// "6/8", where it begins to hold.
    struct CTime {
        double mPosition = 0.0;  ///< in beats
        std::string mName;       ///< numbers with a slash
    };
    std::vector<CTime> mTimes;  ///< by position
    /// Rehearsal marks.
    std::vector<double> mSections;
    /// A passage that is played again: the bars from `mBegin` are those from `mSource`.
    struct CCopy {
        double mBegin = 0.0;        ///< in beats
        double mSource = 0.0;       ///< in beats, earlier
        std::size_t mBarCount = 0;  ///< how many bars are the same
    };
    std::vector<CCopy> mCopies;  ///< by `mBegin`
};

/// A chord with its numeral in the key of its region; empty for a chord that is none.
struct CShownNumeral {
    CTimeRange mRange;     ///< up to the next chord
    std::string mSymbol;   ///< as it was written
    std::string mNumeral;  ///< "V7/ii"; empty where no chord sounds
};

/// A stretch of a song in one key, with its chords.
struct CShownKeyRegion {
    CSignKeyLite mKey;                   ///< of the stretch
    std::string mName;                   ///< "C major"
    CTimeRange mRange;                   ///< without a gap to the next one
    std::vector<CShownNumeral> mChords;  ///< by time
};

/// The key of a song and its local keys as they are shown.
struct CShownKeys {
    CSignKeyLite mKey;                      ///< undefined for a song without chords
    std::string mName = "none";             ///< "C major", or "none"
    double mConfidence = kPosUndef;         ///< 0 to 1, see CKeyOfSong; kPosUndef without a key
    std::array<double, 24> mScores{};       ///< the points of C to B major, then C to B minor
    std::vector<CShownKeyRegion> mRegions;  ///< by time
    /// Sentences on where the key contradicts what is stated or found otherwise; mostly empty.
    std::vector<std::string> mNotes;
};

/// An analysis prepared for the eye: named, with the length of each chord, each chord once, and
/// without the end marker.
struct CShownSong {
    double mBeatsPerBar = 4.0;  ///< of most bars, or of all where mBarStarts is empty
    /// Where the bars of a score begin; empty where all bars are equal.
    std::vector<double> mBarStarts;
    double mEnd = 0.0;                     ///< where the last chord ends
    CShownScore mScore;                    ///< empty for a text that tells none of it
    std::vector<CShownSignKey> mSignKeys;  ///< by time
    /// Chords of the text that stand in no center.
    std::vector<CShownChord> mLooseChords;
    std::vector<CShownCopy> mCopies;  ///< empty if they were not asked for
    /// By their begins, of those that begin together the longest first.
    std::vector<CShownCenter> mReadings;
    bool mHasReadings = false;  ///< they were asked for, even if none was found
    CShownKeys mKeys;           ///< of the whole song, whatever the centers are
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
