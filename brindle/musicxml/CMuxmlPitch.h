// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/musicxml/MuxmlEnums.h"
#include "brindle/musicxml/MuxmlFields.h"
#include "brindle/theory/TEnh.h"

#include <string>

namespace brindle {

/// A pitch as it is written: letter, alteration and octave. C in octave 4 is note 60.
struct CMuxmlPitch {
    /// The letter; undefined for a word that is none of the seven.
    TMuxmlEnum_Step mStep = TMuxmlEnum_Step_Undef;
    float mAlteration = 0;     ///< semitones, may be a fraction
    std::int32_t mOctave = 0;  ///< changes from B to C; 4 begins with the middle C

    /// The note number, not limited to 0 to 127; -1 for an undefined step. Fractions of a semitone
    /// are cut off toward note 0.
    [[nodiscard]] std::int64_t ToNoteNrLarge() const;
    /// Half a semitone counts as a whole one; `TEnh_Undef` beyond double flat and double sharp.
    [[nodiscard]] TEnh AlterationToEnh() const;
    /// Name and octave, with `CurrentChordNamePrefs`.
    [[nodiscard]] std::string ToString() const;

    friend bool operator==(const CMuxmlPitch&, const CMuxmlPitch&) = default;

    /// By name, see CMuxmlField.
    static constexpr auto Fields() {
        return std::tuple(MuxmlField("mStep", &CMuxmlPitch::mStep),
                          MuxmlField("mAlteration", &CMuxmlPitch::mAlteration),
                          MuxmlField("mOctave", &CMuxmlPitch::mOctave));
    }
};

}  // namespace brindle
