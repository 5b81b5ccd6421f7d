// SPDX-License-Identifier: MIT
#include "brindle/musicxml/internal/CursorReader.h"

#include "brindle/platform/ReadNumber.h"

#include <algorithm>
#include <cmath>

namespace brindle {

namespace {

using enum TScoreElement;

TTicks RoundedTicks(double ticks) {
    const auto most = static_cast<double>(kMostTicks);
    return std::isnan(ticks) ? 0
                             : static_cast<TTicks>(std::llround(std::clamp(ticks, -most, most)));
}

}  // namespace

TTicks CCursorReader::TicksOf(double duration) const {
    const double divisions = mPart.mDivisions > 0.0 ? mPart.mDivisions : 1.0;
    return RoundedTicks(duration * (static_cast<double>(kTicksPerQuarter) / divisions));
}

void CCursorReader::Started(TScoreElement element) {
    if (element == Note || element == Backup || element == Forward) {
        mDuration = 0.0;
        mTakesTime = true;
    } else if (element == Chord || element == Grace) {
        mTakesTime = false;
    }
}

void CCursorReader::Ended(TScoreElement element, TScoreElement parent, std::string_view text) {
    if (element == Duration) {
        if (parent == Note || parent == Backup || parent == Forward) mDuration = ReadDecimal(text);
    } else if (element == Note) {
        if (mTakesTime) Move(TicksOf(mDuration));
    } else if (element == Backup) {
        Move(-TicksOf(mDuration));
    } else if (element == Forward) {
        Move(TicksOf(mDuration));
    } else if (element == Divisions) {
        EndedDivisions(text);
    }
}

void CCursorReader::Move(TTicks ticks) {
    CScoreMeasure& measure = mPart.mMeasures.back();
    mCursor = std::max(TTicks{0}, AddTicks(mCursor, ticks));
    measure.mLength = std::max(measure.mLength, mCursor);
}

// Scores exist that tell their divisions only behind the first notes; these are measured anew.
void CCursorReader::EndedDivisions(std::string_view text) {
    const double divisions = ReadDecimal(text);
    if (!(divisions > 0.0)) return;
    const bool isFirst = mPart.mDivisions <= 0.0;
    mPart.mDivisions = divisions;
    if (!isFirst) return;
    const auto measureAnew = [&](TTicks& ticks) {
        ticks = RoundedTicks(static_cast<double>(ticks) / divisions);
    };
    measureAnew(mCursor);
    for (CScoreMeasure& measure : mPart.mMeasures) {
        measureAnew(measure.mLength);
        for (CWrittenHarmony& harmony : measure.mHarmonies) measureAnew(harmony.mOffset);
    }
}

}  // namespace brindle
