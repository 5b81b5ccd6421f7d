// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlEnums.h"
#include "brindle/musicxml/MuxmlFields.h"

namespace brindle {

struct CMuxmlSignKey;

/// Where a note without a pitch, or a rest, stands on its staff.
struct CMuxmlUnpitched {
    TMuxmlEnum_Step mDisplayStep = TMuxmlEnum_Step_Undef;
    std::int32_t mDisplayOctave = 0;

    /// The note number of that place under a key signature; -1 for an undefined step.
    [[nodiscard]] std::int64_t ToNoteNrLarge(const CMuxmlSignKey& signKey) const;

    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mDisplayStep", &CMuxmlUnpitched::mDisplayStep),
                          MuxmlField("mDisplayOctave", &CMuxmlUnpitched::mDisplayOctave));
    }
};

}  // namespace brindle
