// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/KeyNumbers.h"

namespace brindle {
namespace {

CSemitones CoreTones(const CKeyChord& chord) {
    switch (chord.mClass) {
        case TKeyChordClass_Triad:
            return {0, 4, 7};
        case TKeyChordClass_Maj7:
            return chord.Has(11) ? CSemitones{0, 4, 7, 11} : CSemitones{0, 4, 7, 9};
        case TKeyChordClass_Dom:
            return {0, 4, 7, 10};
        case TKeyChordClass_Min:
            return {0, 3, 7};
        case TKeyChordClass_Min7:
            return {0, 3, 7, 10};
        case TKeyChordClass_HDim:
            return {0, 3, 6, 10};
        case TKeyChordClass_Dim:
            return chord.Has(9) ? CSemitones{0, 3, 6, 9} : CSemitones{0, 3, 6};
        case TKeyChordClass_Open:
            return {0, 7};
    }
    return {0, 7};
}

}  // namespace

bool IsInScale(const CKeyChord& chord, int degree, CSemitones scale) {
    const std::uint64_t raised = CoreTones(chord).Mask() << degree;
    const std::uint64_t folded = (raised | raised >> 12) & 0xFFF;
    return (folded & ~scale.Mask()) == 0;
}

}  // namespace brindle
