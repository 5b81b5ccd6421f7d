// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLHarmony.h"
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

struct TScoreTime {
    std::int32_t mBeats = 0;
    std::int32_t mBeatType = 0;

    [[nodiscard]] TTicks BarLength() const {
        return mBeatType <= 0 ? 0 : 4 * kTicksPerQuarter / mBeatType * mBeats;
    }
    friend bool operator==(const TScoreTime&, const TScoreTime&) = default;
};

struct TScoreKey {
    /// Number of sharps, negative for flats.
    std::int32_t mFifths = 0;
    /// Undefined where the score does not tell a mode, or tells neither major nor minor.
    TSignKeyType mType = TSignKeyType_Undef;

    friend bool operator==(const TScoreKey&, const TScoreKey&) = default;
};

struct TWrittenHarmony {
    /// From the start of its measure; negative for one that is drawn forward out of it.
    TTicks mOffset = 0;
    TMusicXMLHarmony mHarmony;
};

/// A place that jumps lead to, with the name that the score gives it, if any.
struct TJumpMark {
    bool mIsSet = false;
    std::string mName;

    void Set(std::string_view name = {}) {
        mIsSet = true;
        if (mName.empty()) mName = name;
    }
    void Add(const TJumpMark& other) {
        if (other.mIsSet) Set(other.mName);
    }
};

/// What steers the playing, gathered from signs, words and sound instructions alike.
struct TPlayMarks {
    bool mRepeatForward = false;
    bool mRepeatBackward = false;
    /// Whether the repeat is taken again after a jump back.
    bool mRepeatAfterJump = false;
    /// How often the repeat that ends (or else begins) here is played; 0 where nothing tells it.
    std::int32_t mRepeatTimes = 0;

    bool mEndingStarts = false;
    bool mEndingStops = false;
    /// The passes in which the ending is played, as written.
    std::vector<std::int32_t> mEndingNumbers;

    bool mDaCapo = false;
    TJumpMark mDalSegno;
    bool mAlFine = false;
    bool mAlCoda = false;
    TJumpMark mSegno;
    TJumpMark mCoda;
    TJumpMark mToCoda;
    bool mFine = false;

    [[nodiscard]] bool Jumps() const { return mDaCapo || mDalSegno.mIsSet; }
    /// Joins what another part of the score tells about the same measure.
    void Add(const TPlayMarks& other);
};

struct TScoreMeasure {
    std::vector<TWrittenHarmony> mHarmonies;
    /// What its notes and rests fill; 0 for an empty measure.
    TTicks mLength = 0;
    /// What the notes of other parts fill.
    TTicks mOtherLength = 0;
    std::optional<TScoreTime> mTime;
    std::optional<TScoreKey> mKey;
    TPlayMarks mMarks;
    bool mHasRehearsal = false;
    bool mHasSlash = false;
};

using TScoreMeasures = std::vector<TScoreMeasure>;

/// One part of a score, while it is read.
struct TScorePart {
    TScoreMeasures mMeasures;
    /// Units of duration in a quarter note; 0 until the score tells it.
    double mDivisions = 0.0;
    bool mHasHarmonies = false;
    /// Whether a repeat sign stood behind the last measure that was read.
    bool mRepeatBeginsNext = false;
};

struct TWrittenScore {
    std::string mTitle;
    TScoreMeasures mMeasures;
};

}  // namespace brindle
