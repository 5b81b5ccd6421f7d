// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlClef.h"
#include "brindle/musicxml/CTransposeNoteCounts.h"
#include "brindle/musicxml/MuxmlBlocks.h"

#include <boost/rational.hpp>

#include <set>
#include <utility>
#include <vector>

namespace brindle {

/// Values with the positions from which they hold, in ticks.
template <class Value>
struct CPositionedInfo : std::vector<std::pair<std::int32_t, Value>> {
    /// Where the last value ends to hold; an import leaves it undefined.
    std::int32_t mEndPosition = kMuxmlUndef;
};

/// What was learned about a part while it was read.
struct CMuxmlPartGatheredInfo {
    /// A fraction of a whole note. A negative number wraps around.
    using TAsDurDiv = boost::rational<unsigned long>;

    std::int32_t mPartEndPosAsMidiTicks = kMuxmlUndef;  ///< the end of its last bar
    std::vector<CMuxmlClef> mClefs;                     ///< in reading order
    /// Numbers of staves, 0 for measures that do not tell it.
    CPositionedInfo<std::int32_t> mPositionedStaves;
    /// Of notes and rests, as the file numbers them; 0 for those without.
    std::set<std::int32_t> mFoundVoices;
    // Of all notes and rests except tuplets other than plain triplets:
    /// Where in their bars they begin. What an upbeat lacks is added in all bars of the part. Kept:
    /// a further note of a chord is found where the chord ends.
    std::set<TAsDurDiv> mFoundBinaryAndTripletNotePosInBarAsDurDiv;
    /// How long they are; a tied note as long as its chain.
    std::set<TAsDurDiv> mFoundBinaryAndTripletNoteLengthsAsDurDiv;
    CTransposeNoteCounts mFoundTransposeNoteCounts;  ///< notes and rests under each transposition
    /// -1 while unset. Kept: a rest sets the lowest one back to -1.
    std::int64_t mLowestNoteNr = -1;
    /// As it sounds; -1 while there is none.
    std::int64_t mHighestNoteNr = -1;

    /// Whether the part begins on two staves, one with a treble and one with a bass clef.
    [[nodiscard]] bool IsPianoPartAtBegin() const;

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("mPartEndPosAsMidiTicks", &CMuxmlPartGatheredInfo::mPartEndPosAsMidiTicks),
            MuxmlField("mClefs", &CMuxmlPartGatheredInfo::mClefs),
            MuxmlField("mPositionedStaves", &CMuxmlPartGatheredInfo::mPositionedStaves),
            MuxmlField("mFoundVoices", &CMuxmlPartGatheredInfo::mFoundVoices),
            MuxmlField("mFoundBinaryAndTripletNotePosInBarAsDurDiv",
                       &CMuxmlPartGatheredInfo::mFoundBinaryAndTripletNotePosInBarAsDurDiv),
            MuxmlField("mFoundBinaryAndTripletNoteLengthsAsDurDiv",
                       &CMuxmlPartGatheredInfo::mFoundBinaryAndTripletNoteLengthsAsDurDiv),
            MuxmlField("mFoundTransposeNoteCounts",
                       &CMuxmlPartGatheredInfo::mFoundTransposeNoteCounts),
            MuxmlField("mLowestNoteNr", &CMuxmlPartGatheredInfo::mLowestNoteNr),
            MuxmlField("mHighestNoteNr", &CMuxmlPartGatheredInfo::mHighestNoteNr));
    }
};

}  // namespace brindle
