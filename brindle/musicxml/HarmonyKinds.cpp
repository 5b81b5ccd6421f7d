// SPDX-License-Identifier: MIT
#include "brindle/musicxml/HarmonyKinds.h"

#include "brindle/analysis/CHarmAnlsChord.h"
#include "brindle/musicxml/internal/KindRows.h"

#include <cstdint>

namespace brindle {

namespace {

constexpr std::string_view kNoKind = "none";

}  // namespace

CIntvlSet XMLHarmonyKindToIntvlSetExceptRoot(std::string_view kind) {
    CIntvlSet intvls;
    if (const CKindRow* row = KindRowOf(kind)) {
        intvls.insert(row->mIntvls.data(), row->mIntvls.data() + row->mCount);
    }
    return intvls;
}

CSemitones XMLHarmonyKindToSemitones(std::string_view kind) {
    const CKindRow* row = KindRowOf(kind);
    return CSemitones(row == nullptr ? 1 : row->Mask() | 1);
}

std::string_view SemitonesToXMLHarmonyKind(CSemitones semitones) {
    const std::uint64_t octave = semitones.Mask() & 0xFFF;
    for (const CKindRow& row : kKindRows) {
        if (row.mIsTested && row.Mask() == octave) return row.mWord;
    }
    return kNoKind;
}

std::string_view ChordToXMLHarmonyKind(const CHarmAnlsChord& chord) {
    return SemitonesToXMLHarmonyKind(chord.mSemitones);
}

}  // namespace brindle
