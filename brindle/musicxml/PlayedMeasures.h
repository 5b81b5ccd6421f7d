// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/TMusicXMLMeasure.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string_view>
#include <utility>

namespace brindle {

struct TMusicXMLDoc;
struct TMusicXMLHarmony;

/// The written measures of a lead sheet and the jumps between them.
struct CWrittenMeasures {
    /// In the order of the file; not owned.
    std::span<const TMusicXMLMeasure> mMeasures;
    /// From the index of each coda sign to that of the next one.
    std::span<const std::pair<std::int32_t, std::int32_t>> mCodaPairs;
    /// From the index of each "D.S. al Coda" to that of the segno before it.
    std::span<const std::pair<std::int32_t, std::int32_t>> mSegnoPairs;
};

/// How much of a song is written or played.
struct CPlayExtent {
    std::size_t mMeasures = 0;   ///< each as often as it is played
    std::size_t mHarmonies = 0;  ///< the same
    std::size_t mBytes = 0;      ///< the room that the harmonies take, about

    /// One harmony more.
    void Add(const TMusicXMLHarmony& harmony);
    /// Whether the harmonies are no more than in `limits`.
    [[nodiscard]] bool HasRoomIn(const CPlayExtent& limits) const {
        return mHarmonies <= limits.mHarmonies && mBytes <= limits.mBytes;
    }
};

/// How far repeats and jumps may lead: `kMaxTimesPlayed` times what is written, between the bounds
/// of TMusicXMLDoc.h, and never less than what is written.
[[nodiscard]] CPlayExtent PlayLimitsOf(const CPlayExtent& written);

/// Walks the measures in playing order and appends what they hold to `doc`. False when the walk was
/// cut at its limits.
bool PlayMeasures(const CWrittenMeasures& written, TMusicXMLDoc& doc);

/// Whether a text tells how often a repeat is played: 2 to 4 characters with an "x", as in "3x".
[[nodiscard]] bool IsRepeatWord(std::string_view text);

}  // namespace brindle
