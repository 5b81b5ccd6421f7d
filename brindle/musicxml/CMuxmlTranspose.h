// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlBlocks.h"
#include "brindle/platform/XmlDocument.h"

#include <string_view>

namespace brindle {

/// How far an instrument sounds from what is written for it: -2 semitones for a clarinet in B flat.
struct CMuxmlTranspose {
    /// The file tells it; otherwise the part sounds as it is written.
    bool mHasBeenReadFromXML = false;
    /// Ticks from the start of the part, from where it holds.
    std::int32_t mPositionAsMidiTicks = kMuxmlUndef;
    /// The staff of the part, 1 is the uppermost; 0 for all of them.
    std::uint64_t mStaffNumber = 0;
    std::int32_t mDiatonic = 0;      ///< steps of the staff
    float mChromatic = 0;            ///< semitones
    std::int32_t mOctaveChange = 0;  ///< octaves that come on top
    bool mDouble = false;            ///< also doubled one octave lower

    /// Reads `number`, and that it has been read.
    void ReadFromAttributes(const CMuxmlAttributes& attributes);
    /// Reads the elements below `element`; what is missing keeps its value.
    void ReadFromXMLElement(const XmlNode& element);

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(
            MuxmlField("mHasBeenReadFromXML", &CMuxmlTranspose::mHasBeenReadFromXML),
            MuxmlField("mPositionAsMidiTicks", &CMuxmlTranspose::mPositionAsMidiTicks),
            MuxmlField("mStaffNumber", &CMuxmlTranspose::mStaffNumber),
            MuxmlField("mDiatonic", &CMuxmlTranspose::mDiatonic),
            MuxmlField("mChromatic", &CMuxmlTranspose::mChromatic),
            MuxmlField("mOctaveChange", &CMuxmlTranspose::mOctaveChange),
            MuxmlField("mDouble", &CMuxmlTranspose::mDouble));
    }
};

/// By staff number, steps, semitones, then doubling. Kept: a change of octave alone does not order,
/// and doubling does not order where the octaves differ.
[[nodiscard]] bool operator<(const CMuxmlTranspose& a, const CMuxmlTranspose& b);

}  // namespace brindle
