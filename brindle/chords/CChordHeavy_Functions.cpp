// SPDX-License-Identifier: MIT
// What a chord means in a key: its function, its degrees and the scale that belongs to it.
#include "brindle/chords/CChordHeavy.h"
#include "brindle/chords/CChordLite.h"
#include "brindle/chords/HarmFuncNames.h"
#include "brindle/theory/CHarmCenterLite.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/Spelling.h"

#include <array>
#include <cstddef>

namespace brindle {

namespace {

constexpr int kHarmFuncUndef = -1;

// The function by degree and, from Major on, by the value of the basic chord.
// clang-format off
constexpr auto kHarmFuncs = std::to_array<std::array<int, 7>>({
    // Major Minor Aug. Dim. Sus4 Sus2 Drone
    {  0,    1,   -1,  -1,  -1,  -1,  -1},
    {  2,    3,   -1,   4,  -1,  -1,  -1},
    {  5,    6,   -1,  -1,  -1,  -1,  -1},
    {  7,    8,   -1,  -1,  -1,  -1,  -1},
    {  9,   10,   -1,  -1,   9,   9,  -1},
    { 11,   12,   -1,  -1,  -1,  -1,  -1},
    { -1,   -1,   -1,  14,  -1,  -1,  -1},
});
// clang-format on

}  // namespace

int CChordHeavy::HarmFuncIn(const CScaleHeavy& scale) const {
    if (scale.IsUndef()) return kHarmFuncUndef;
    const auto degree = static_cast<std::size_t>(scale.KeyNrToDegreeNr(mRootNote.KeyNr()));
    const auto column = static_cast<std::size_t>(BasicChord()) - 1;
    if (degree >= kHarmFuncs.size() || column >= kHarmFuncs[degree].size()) return kHarmFuncUndef;
    return kHarmFuncs[degree][column];
}

std::string_view CChordHeavy::HarmFuncName(const CSignKeyHeavy& signKey,
                                           const CChordNamePrefs& prefs) const {
    return brindle::HarmFuncName(HarmFuncIn(signKey), signKey.ScaleType(), prefs);
}

int CChordLite::HarmFuncIn(const CScaleHeavy& scale) const {
    return ToChordHeavy(CChordHeavy::DefaultWrapIntvl).HarmFuncIn(scale);
}

std::string_view CChordLite::HarmFuncNameIn(const CSignKeyHeavy& signKey,
                                            const CChordNamePrefs& prefs) const {
    return ToChordHeavy(CChordHeavy::DefaultWrapIntvl).HarmFuncName(signKey, prefs);
}

int CChordHeavy::RootNoteDegreeNrInSignKey(const CSignKeyHeavy& signKey) const {
    return signKey.KeyNrToDegreeNr(mRootNote.KeyNr());
}

int CChordHeavy::BassNoteDegreeNrInSignKey(const CSignKeyHeavy& signKey) const {
    return signKey.KeyNrToDegreeNr(LowestNote().KeyNr());
}

CScaleHeavy CChordHeavy::ConstructScaleInSignKey(const CSignKeyHeavy& signKey) const {
    return signKey.ConstructScaleForChord(*this);
}

CScaleHeavy CChordHeavy::ConstructScaleInSignKey(const CSignKeyLite& signKey) const {
    return ConstructScaleInSignKey(signKey.ToSignKeyHeavy());
}

CScaleHeavy CChordHeavy::ConstructScaleInHarmCenter(const CHarmCenterLite& center) const {
    CChordLite chord;
    chord.SetFromChordHeavy(*this);
    const CScaleLite scale = center.ToScaleLite().ConstructScaleForChord(chord);
    return {scale.mRootKeyEnh, scale.mSemitones};
}

void CChordHeavy::AdjustEnhOfChordNotesToRootScale(bool* changed) {
    const CScaleHeavy scale = CScaleHeavy_Undef.ConstructScaleForChord(*this);
    for (CNote& note : mNotes) note.SetEnh(scale.EnhForNote(note));
    // Kept: it says so even where a spelling has changed.
    if (changed != nullptr) *changed = false;
}

}  // namespace brindle
