// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/KeyNumbers.h"

#include <array>

namespace brindle {
namespace {

// By class. A MAJ7 without its seventh is a sixth chord, a diminished chord may have four tones.
constexpr std::array<CSemitones, kKeyChordClassCount> kCoreTones{{
    {0, 4, 7},      // triad
    {0, 4, 7, 9},   // maj7
    {0, 4, 7, 10},  // dom
    {0, 3, 7},      // min
    {0, 3, 7, 10},  // min7
    {0, 3, 6, 10},  // hdim
    {0, 3, 6},      // dim
    {0, 7},         // open
}};

CSemitones CoreTones(const CKeyChord& chord) {
    if (chord.mClass == TKeyChordClass_Maj7 && chord.Has(11)) return {0, 4, 7, 11};
    if (chord.mClass == TKeyChordClass_Dim && chord.Has(9)) return {0, 3, 6, 9};
    return kCoreTones[chord.mClass];
}

}  // namespace

bool IsInScale(const CKeyChord& chord, int degree, CSemitones scale) {
    const std::uint64_t raised = CoreTones(chord).Mask() << degree;
    const std::uint64_t folded = (raised | raised >> 12) & 0xFFF;
    return (folded & ~scale.Mask()) == 0;
}

}  // namespace brindle
