// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlUnpitched.h"

#include "brindle/musicxml/CMuxmlSignKey.h"
#include "brindle/theory/CSignKeyHeavy.h"

namespace brindle {

std::int64_t CMuxmlUnpitched::ToNoteNrLarge(const CMuxmlSignKey& signKey) const {
    if (mDisplayStep < TMuxmlEnum_Step_C || mDisplayStep > TMuxmlEnum_Step_B) return kNoteNrUndef;
    const CSignKeyHeavy key = signKey.ConvertToCSignKeyTransposedPitch();
    const std::int64_t noteNr =
        key.MoveInScale(std::int64_t{mDisplayOctave} * 12 + 12, mDisplayStep);
    const TEnh enh = key.EnhForKeyNr(FoldIntoOctave(noteNr));
    return enh + 1 < TEnh_Undef ? noteNr + (enh - TEnh_n) : noteNr;
}

}  // namespace brindle
