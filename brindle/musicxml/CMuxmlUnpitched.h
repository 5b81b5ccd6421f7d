// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlEnums.h"
#include "brindle/musicxml/MuxmlFields.h"

namespace brindle {

struct CMuxmlSignKey;

/// Where a note without a pitch, or a rest, stands on its staff.
struct CMuxmlUnpitched {
    /// In the clef in force; a percussion clef counts as treble.
    TMuxmlEnum_Step mDisplayStep = TMuxmlEnum_Step_Undef;
    std::int32_t mDisplayOctave = 0;  ///< as that of a pitch

    /// The note number of that place under a key signature; -1 for an undefined step.
    [[nodiscard]] std::int64_t ToNoteNrLarge(const CMuxmlSignKey& signKey) const;

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mDisplayStep", &CMuxmlUnpitched::mDisplayStep),
                          MuxmlField("mDisplayOctave", &CMuxmlUnpitched::mDisplayOctave));
    }
};

}  // namespace brindle
