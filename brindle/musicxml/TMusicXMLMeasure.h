// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLHarmony.h"

#include <cstdint>
#include <string>
#include <vector>

namespace brindle {

/// One written measure of a lead sheet: its chord symbols and the marks that steer the playing.
struct TMusicXMLMeasure {
    std::vector<TMusicXMLHarmony> mHarmonies;  ///< in their order, without positions
    /// Words such as "3x" beside the measure.
    std::vector<std::string> mRepeatWords;
    double mReserved = kPosUndef;  ///< not used
    std::int32_t mBeats = -1;      ///< of the time signature that stands here, -1 for none
    std::int32_t mBeatType = -1;   ///< likewise
    std::int32_t mRehearsal = 0;   ///< 1 if a rehearsal mark stands here
    bool mRepeatForward = false;   ///< a repeat begins here
    bool mRepeatBackward = false;  ///< and ends here
    bool mSegno = false;           ///< the sign that "D.S. al Coda" goes back to
    bool mCoda = false;            ///< the sign of the jump to the coda, or of the coda itself
    bool mDalSegnoAlCoda = false;  ///< the words stand here
    bool mSlash = false;           ///< the word "/", which begins a sequence of chords
    /// Index into the sign keys of the song, -1 for none.
    std::int32_t mHarmSignKeyIndex = -1;
    /// Number of an ending that is not closed by a line, 0 for none.
    std::int32_t mEndingNumber = 0;
    /// How often the repeat that begins here is played unless words tell: 2; 1 where none begins.
    std::int32_t mRepeatTimes = 1;
};

}  // namespace brindle
