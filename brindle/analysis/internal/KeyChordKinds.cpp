// SPDX-License-Identifier: MIT
#include "brindle/analysis/internal/KeyChordKinds.h"

#include "brindle/theory/KeyIntervals.h"

namespace brindle {
namespace {

TKeyChordKind KindOfClass(TKeyChordClass chordClass) {
    return static_cast<TKeyChordKind>(chordClass);
}

TKeyChordKind KindBefore(const CKeyChord& chord, const CKeyChord& next) {
    const int up = FoldIntoOctave(next.mRoot - chord.mRoot);
    const bool isNextDom = next.mClass == TKeyChordClass_Dom;
    if (chord.mClass == TKeyChordClass_Dom) {
        if (up == 5 && !isNextDom) return TKeyChordKind_DomResolving;
        if (up == 11) return TKeyChordKind_DomSubstitute;
    }
    if (up == 5 && isNextDom) {
        if (chord.mClass == TKeyChordClass_Min7) return TKeyChordKind_Min7BeforeDom;
        if (chord.mClass == TKeyChordClass_HDim) return TKeyChordKind_HDimBeforeDom;
    }
    if (chord.mClass == TKeyChordClass_Dim && up == 1) return TKeyChordKind_DimLeading;
    return KindOfClass(chord.mClass);
}

TKeyChordKind KindBehind(const CKeyChord& before, const CKeyChord& chord) {
    const bool isResolved =
        before.mClass == TKeyChordClass_Dom && FoldIntoOctave(chord.mRoot - before.mRoot) == 5;
    if (isResolved && chord.mClass == TKeyChordClass_Triad) return TKeyChordKind_TriadResolved;
    if (isResolved && chord.mClass == TKeyChordClass_Maj7) return TKeyChordKind_Maj7Resolved;
    if (isResolved && chord.mClass == TKeyChordClass_Min) return TKeyChordKind_MinResolved;
    return KindOfClass(chord.mClass);
}

}  // namespace

std::vector<TKeyChordKind> KeyChordKindsOf(std::span<const CKeyChord> chords) {
    std::vector<TKeyChordKind> kinds(chords.size());
    for (std::size_t i = 0; i < chords.size(); ++i) {
        kinds[i] = KindOfClass(chords[i].mClass);
        if (i + 1 < chords.size()) kinds[i] = KindBefore(chords[i], chords[i + 1]);
        const bool isStillItsClass = kinds[i] == KindOfClass(chords[i].mClass);
        if (i > 0 && isStillItsClass) kinds[i] = KindBehind(chords[i - 1], chords[i]);
    }
    return kinds;
}

}  // namespace brindle
