// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLHarmony.h"
#include "brindle/musicxml/internal/PlayMarks.h"
#include "brindle/theory/TSignKeyType.h"

#include <algorithm>
#include <cstdint>
#include <limits>
#include <optional>
#include <string>
#include <vector>

namespace brindle {

/// Time inside a score, in parts of a quarter note so small that all usual notes and tuplets are
/// whole numbers of them.
using TTicks = std::int64_t;
inline constexpr TTicks kTicksPerQuarter = 691'891'200;
inline constexpr TTicks kMostTicks = TTicks{1} << 61;

/// The sum, kept within +-kMostTicks.
[[nodiscard]] constexpr TTicks AddTicks(TTicks a, TTicks b) {
    return std::clamp(a + b, -kMostTicks, kMostTicks);
}
[[nodiscard]] constexpr double QuartersOf(TTicks ticks) {
    return static_cast<double>(ticks) / static_cast<double>(kTicksPerQuarter);
}

struct CScoreTime {
    std::int32_t mBeats = 0;
    std::int32_t mBeatType = 0;

    [[nodiscard]] TTicks BarLength() const {
        return mBeatType <= 0 ? 0 : 4 * kTicksPerQuarter / mBeatType * mBeats;
    }
    friend bool operator==(const CScoreTime&, const CScoreTime&) = default;
};

struct CScoreKey {
    /// Number of sharps, negative for flats.
    std::int32_t mFifths = 0;
    /// Undefined where the score does not tell a mode, or tells neither major nor minor.
    TSignKeyType mType = TSignKeyType_Undef;

    friend bool operator==(const CScoreKey&, const CScoreKey&) = default;
};

struct CWrittenHarmony {
    /// From the start of its measure; negative for one that is drawn forward out of it.
    TTicks mOffset = 0;
    TMusicXMLHarmony mHarmony;
};

struct CScoreMeasure {
    std::vector<CWrittenHarmony> mHarmonies;
    /// What its notes and rests fill; 0 for an empty measure.
    TTicks mLength = 0;
    /// What the notes of other parts fill.
    TTicks mOtherLength = 0;
    std::optional<CScoreTime> mTime;
    std::optional<CScoreKey> mKey;
    /// As printed.
    std::string mNumber;
    std::string mRehearsal;
    bool mHasRehearsal = false;
    bool mHasSlash = false;
};

using TScoreMeasures = std::vector<CScoreMeasure>;

/// One part of a score, while it is read.
struct CScorePart {
    TScoreMeasures mMeasures;
    /// Of each measure.
    std::vector<CPlayMarks> mMarks;
    /// Units of duration in a quarter note; 0 until the score tells it.
    double mDivisions = 0.0;
    bool mHasHarmonies = false;
    /// Whether a repeat sign stood behind the last measure that was read.
    bool mRepeatBeginsNext = false;
};

struct CWrittenScore {
    std::string mTitle;
    /// Composers and writers, separated by ", ".
    std::string mMakers;
    /// Quarter notes a minute at the beginning.
    std::optional<double> mTempo;
    TScoreMeasures mMeasures;
    /// Of each measure.
    std::vector<CPlayMarks> mMarks;
};

}  // namespace brindle
