// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlPitch.h"

#include "brindle/musicxml/internal/ReadMuxml.h"
#include "brindle/theory/CChordNamePrefs.h"
#include "brindle/theory/CNote.h"
#include "brindle/theory/CScaleHeavy.h"

namespace brindle {

namespace {

const CScaleHeavy& CMajor() {
    static const CScaleHeavy scale(CKeyEnh_C, st_maj);
    return scale;
}

}  // namespace

std::int64_t CMuxmlPitch::ToNoteNrLarge() const {
    if (mStep < TMuxmlEnum_Step_C || mStep > TMuxmlEnum_Step_B) return kNoteNrUndef;
    const std::int64_t noteNr = CMajor().MoveInScale(std::int64_t{mOctave} * 12 + 12, mStep);
    if (mAlteration == 0) return noteNr;
    return muxml::TruncatedToLargeInteger(static_cast<float>(noteNr) + mAlteration);
}

TEnh CMuxmlPitch::AlterationToEnh() const {
    // The greatest number below a half: a half itself rounds away from zero, as the sum is rounded.
    constexpr float kAlmostHalf = 0.49999997F;
    const float moved = mAlteration < 0 ? mAlteration - kAlmostHalf : mAlteration + kAlmostHalf;
    const std::int64_t enh = std::int64_t{muxml::TruncatedToInteger(moved)} + TEnh_n;
    return enh >= TEnh_bb && enh <= TEnh_ss ? static_cast<TEnh>(enh) : TEnh_Undef;
}

std::string CMuxmlPitch::ToString() const {
    const CNote note(ToNoteNrLarge(), AlterationToEnh());
    return note.KeyName(CurrentChordNamePrefs) + note.OctName(CurrentChordNamePrefs);
}

}  // namespace brindle
