// SPDX-License-Identifier: MIT
#include "brindle/musicxml/HarmonyKinds.h"

#include "brindle/analysis/CHarmAnlsChord.h"
#include "brindle/chords/internal/ChordKinds.h"
#include "brindle/musicxml/internal/KindRows.h"

#include <algorithm>
#include <array>
#include <cstdint>

namespace brindle {

namespace {

constexpr std::string_view kNoKind = "none";

struct CTonesOfKind {
    std::string_view mKind;
    CSemitones mTones;
};

// The words are those of the format. What players write behind a root has the same tones.
// clang-format off
constexpr auto kTonesOfKinds = std::to_array<CTonesOfKind>({
    {"major",              TonesOfChordKind("")},
    {"minor",              TonesOfChordKind("m")},
    {"augmented",          TonesOfChordKind("aug")},
    {"diminished",         TonesOfChordKind("dim")},
    {"dominant",           TonesOfChordKind("7")},
    {"major-seventh",      TonesOfChordKind("maj7")},
    {"minor-seventh",      TonesOfChordKind("m7")},
    {"diminished-seventh", TonesOfChordKind("dim7")},
    {"augmented-seventh",  TonesOfChordKind("7#5")},
    {"half-diminished",    TonesOfChordKind("m7b5")},
    {"major-minor",        TonesOfChordKind("mmaj7")},
    {"major-sixth",        TonesOfChordKind("6")},
    {"minor-sixth",        TonesOfChordKind("m6")},
    {"dominant-ninth",     TonesOfChordKind("9")},
    {"major-ninth",        TonesOfChordKind("maj9")},
    {"minor-ninth",        TonesOfChordKind("m9")},
    {"dominant-11th",      TonesOfChordKind("11")},
    {"major-11th",         TonesOfChordKind("maj11")},
    {"minor-11th",         TonesOfChordKind("m11")},
    {"dominant-13th",      TonesOfChordKind("13")},
    {"major-13th",         TonesOfChordKind("maj13")},
    {"minor-13th",         TonesOfChordKind("m13")},
    {"suspended-second",   TonesOfChordKind("sus2")},
    {"suspended-fourth",   TonesOfChordKind("sus4")},
    {"French",             TonesOfChordKind("7b5")},
    {"power",              TonesOfChordKind("5")},
});
// clang-format on

constexpr bool HasTonesOfKind(const CTonesOfKind& kind) {
    for (const CKindRow& row : kKindRows) {
        if (row.mWord == kind.mKind) return row.Mask() == kind.mTones.Mask();
    }
    return false;
}
static_assert(std::all_of(kTonesOfKinds.begin(), kTonesOfKinds.end(), HasTonesOfKind));
// Players have no such name for the Neapolitan, the Italian and the pedal.
static_assert(kTonesOfKinds.size() + 3 == kKindRows.size());

}  // namespace

CIntvlSet XMLHarmonyKindToIntvlSetExceptRoot(std::string_view kind) {
    const CKindRow* row = KindRowOf(kind);
    if (row == nullptr) return {};
    const int* const intvls = row->mIntvls.data();
    return CIntvlSet(CMySet<int>(intvls, intvls + row->mCount));
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
