// SPDX-License-Identifier: MIT
#include "brindle/c/internal/Values.h"

#include "brindle/theory/KeyNames.h"
#include "brindle/theory/SetFromStringHelper.h"

#include <algorithm>

namespace brindle::border {
namespace {

constexpr std::uint32_t kMaskOfOctave = 0xFFF;

}  // namespace

brindle_tone ToC(const CKeyEnh& key) {
    if (key.mKeyNr < 0 || key.mKeyNr > 11) return {BRINDLE_NONE, BRINDLE_UNSPELLED};
    return {key.mKeyNr, key.mEnh == TEnh_Undef ? BRINDLE_UNSPELLED : EnhToSemitone(key.mEnh)};
}

brindle_key ToC(const CSignKeyLite& key) {
    return {ToC(key.mRootKeyEnh), key.mSignKeyType};
}

brindle_scale ToC(const CScaleLite& scale) {
    return {ToC(scale.mRootKeyEnh), static_cast<std::uint32_t>(scale.mSemitones.Mask())};
}

brindle_chord ToC(const CChordLite& chord) {
    return {ToC(chord.mRootKeyEnh), ToC(chord.mBassKeyEnh),
            static_cast<std::uint32_t>(chord.mSemitones.Mask() & kMaskOfOctave)};
}

CKeyEnh FromC(const brindle_tone& tone) {
    if (tone.pitch_class < 0 || tone.pitch_class > 11) return {};
    const bool isSpelled = tone.accidental >= -3 && tone.accidental <= 3;
    const CKeyEnh key{tone.pitch_class, isSpelled ? SemitoneToEnh(tone.accidental) : TEnh_Undef};
    return key.HasSensefulEnh() ? key : CKeyEnh{tone.pitch_class, TEnh_Undef};
}

CSignKeyLite FromC(const brindle_key& key) {
    if (key.mode == BRINDLE_MODE_MAJOR) return {FromC(key.tonic), TSignKeyType_Major};
    if (key.mode == BRINDLE_MODE_MINOR) return {FromC(key.tonic), TSignKeyType_Minor};
    return {};
}

CScaleLite FromC(const brindle_scale& scale) {
    CScaleLite result;
    result.mRootKeyEnh = FromC(scale.root);
    result.mSemitones = CSemitones(scale.mask & kMaskOfOctave);
    return result;
}

CChordLite FromC(const brindle_chord& chord) {
    const CKeyEnh root = FromC(chord.root);
    if (root.IsUndef()) return {};
    return {root, FromC(chord.bass), CSemitones(chord.mask & kMaskOfOctave)};
}

CChordSymbolStyle FromC(const brindle_style* style) {
    if (style == nullptr) return {};
    CChordSymbolStyle result;
    if (style->naming == BRINDLE_NAMING_GERMAN) result.mNotes = TNoteNaming_German;
    if (style->naming == BRINDLE_NAMING_SOLFEGE) result.mNotes = TNoteNaming_Solfege;
    result.mUnicodeSigns = style->unicode_signs != 0;
    return result;
}

CChordTextOptions ChordOptionsOf(unsigned flags) {
    CChordTextOptions options;
    options.mBIsBFlat = (flags & BRINDLE_READ_B_IS_B_FLAT) != 0;
    options.mSolfege = (flags & BRINDLE_READ_SOLFEGE) != 0;
    options.mLowerCaseIsMinor = (flags & BRINDLE_READ_LOWER_CASE_MINOR) != 0;
    return options;
}

void GiveTones(const std::vector<CKeyEnh>& keys, brindle_tone* tones, std::size_t* count) {
    *count = std::min<std::size_t>(keys.size(), 12);
    for (std::size_t i = 0; i < *count; ++i) tones[i] = ToC(keys[i]);
}

}  // namespace brindle::border
