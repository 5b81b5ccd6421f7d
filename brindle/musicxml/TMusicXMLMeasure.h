// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLHarmony.h"

#include <cstdint>
#include <string>
#include <vector>

namespace brindle {

/// One written measure of a lead sheet: its chord symbols and the marks that steer the playing.
struct TMusicXMLMeasure {
    std::vector<TMusicXMLHarmony> mHarmonies;
    /// Words such as "3x" beside the measure.
    std::vector<std::string> mRepeatWords;
    double mReserved = kPosUndef;
    std::int32_t mBeats = -1;
    std::int32_t mBeatType = -1;
    std::int32_t mRehearsal = 0;
    bool mRepeatForward = false;
    bool mRepeatBackward = false;
    bool mSegno = false;
    bool mCoda = false;
    bool mDalSegnoAlCoda = false;
    bool mSlash = false;
    /// Index into the sign keys of the song, -1 for none.
    std::int32_t mHarmSignKeyIndex = -1;
    /// Number of an ending that is not closed by a line, 0 for none.
    std::int32_t mEndingNumber = 0;
    std::int32_t mRepeatTimes = 1;
};

}  // namespace brindle
