// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"

#include <string_view>
#include <vector>

namespace brindle {

/// A time signature, 4/4 by default.
struct CMuxmlSignTime : CMuxmlXYColor, CMuxmlFont {
    /// Ticks from the start of the part, from where it holds.
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    /// The staff of the part, 1 is the uppermost; 0 for all of them.
    std::uint64_t mStaffNumber = 0;
    /// No: it holds without being printed.
    TMuxmlEnum_YesNo mPrintObject = TMuxmlEnum_YesNo_Yes;
    /// "common" for C and "cut" for a struck C; empty for plain numbers.
    std::string mSymbol;
    /// The upper number: beats in a bar. Of 2/4 + 3/8 in one signature it is the last one.
    std::int32_t mNomAkaBeats = 4;
    /// The summands of a count such as 3+2; empty for a plain count.
    std::vector<std::int32_t> mCompoundNomsAkaBeats;
    /// The lower number: 4 where a quarter is the beat; not always a power of two.
    std::int32_t mDenomAkaBeatTypeAsInt = 4;
    bool mSenzaMisura = false;  ///< the music has no bars

    /// Reads `symbol`, `number`, `print-object`, and those of the blocks.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    /// Reads one element inside `time`: "beats", "beat-type" or "senza-misura".
    void SetElementFromString(std::string_view element, std::string_view text);

    /// Length of a bar in units of the file, `divisions` to the quarter. Not finite for a beat type
    /// of 0.
    [[nodiscard]] double BarLengthFromDivisisionsPQNAsDuration(std::uint64_t divisions) const;

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(
            CMuxmlBlock<CMuxmlXYColor>{"CMuxmlXYColor"}, CMuxmlBlock<CMuxmlFont>{"CMuxmlFont"},
            MuxmlField("mPositionAsMidiTicks", &CMuxmlSignTime::mPositionAsMidiTicks),
            MuxmlField("mStaffNumber", &CMuxmlSignTime::mStaffNumber),
            MuxmlField("mPrintObject", &CMuxmlSignTime::mPrintObject),
            MuxmlField("mSymbol", &CMuxmlSignTime::mSymbol),
            MuxmlField("mNomAkaBeats", &CMuxmlSignTime::mNomAkaBeats),
            MuxmlField("mCompoundNomsAkaBeats", &CMuxmlSignTime::mCompoundNomsAkaBeats),
            MuxmlField("mDenomAkaBeatTypeAsInt", &CMuxmlSignTime::mDenomAkaBeatTypeAsInt),
            MuxmlField("mSenzaMisura", &CMuxmlSignTime::mSenzaMisura));
    }

private:
    void _SetBeats(std::string_view text);
};

}  // namespace brindle
