// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/CMuxmlTranspose.h"
#include "brindle/musicxml/MuxmlBlocks.h"

namespace brindle {

class CSignKeyHeavy;

/// A key signature.
struct CMuxmlSignKey : CMuxmlXYColor, CMuxmlFont {
    /// Ticks from the start of the part, from where it holds.
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    /// The staff of the part, 1 is the uppermost; 0 for all of them.
    std::uint64_t mStaffNumber = 0;
    /// No: it holds without being printed.
    TMuxmlEnum_YesNo mPrintObject = TMuxmlEnum_YesNo_Yes;
    std::int32_t mFifths = 0;  ///< number of sharps, negative for flats
    /// Major, too, where the file tells no mode or an unknown one.
    TMuxmlEnum_SignKeyMode mMode = TMuxmlEnum_SignKeyMode_Major;
    /// The transposition that was in force or follows in the same measure.
    CMuxmlTranspose mPartTransposeAtSignKey;

    /// Reads `number`, `print-object`, and those of the blocks.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);

    /// The key as it is written. Minor, dorian, phrygian, aeolian and locrian count as minor.
    [[nodiscard]] CSignKeyHeavy ConvertToCSignKeyTransposedPitch() const;
    /// The key that is heard, in the spelling with the fewest signs.
    [[nodiscard]] CSignKeyHeavy ConvertToCSignKeySoundingPitch() const;

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(
            CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"}, CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
            MuxmlField("mPositionAsMidiTicks", &CMuxmlSignKey::mPositionAsMidiTicks),
            MuxmlField("mStaffNumber", &CMuxmlSignKey::mStaffNumber),
            MuxmlField("mPrintObject", &CMuxmlSignKey::mPrintObject),
            MuxmlField("mFifths", &CMuxmlSignKey::mFifths),
            MuxmlField("mMode", &CMuxmlSignKey::mMode),
            MuxmlField("mPartTransposeAtSignKey", &CMuxmlSignKey::mPartTransposeAtSignKey));
    }
};

}  // namespace brindle
