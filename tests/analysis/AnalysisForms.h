// SPDX-License-Identifier: MIT
#pragma once

#include "tests/support/Forms.h"

#include "brindle/analysis/CHarmAnlsCenters.h"

/// The forms in which the files of tests/data/expected write analysis records.
namespace brindle::test {

/// A number, "Undef" or "End".
inline double PositionOf(const nlohmann::json& form) {
    if (form == "Undef") return kPosUndef;
    if (form == "End") return kPosEnd;
    return form.get<double>();
}

inline nlohmann::json PositionForm(double position) {
    if (position == kPosUndef) return "Undef";
    if (position == kPosEnd) return "End";
    return position;
}

/// List of [position, root, semitones], without bass.
inline CHarmAnlsChords ChordsOf(const nlohmann::json& form) {
    CHarmAnlsChords chords;
    for (const auto& chord : form) {
        chords.emplace_back(
            CChordLite(KeyEnhOf(chord.at(1)), CKeyEnh_Undef, SemitonesOf(chord.at(2))),
            PositionOf(chord.at(0)));
    }
    return chords;
}

inline nlohmann::json FormOf(const CHarmAnlsChords& chords) {
    auto form = nlohmann::json::array();
    for (const auto& chord : chords) {
        form.push_back(
            {PositionForm(chord.mPosition), FormOf(chord.mRootKeyEnh), chord.mSemitones.Mask()});
    }
    return form;
}

/// List of [key, mask, position, chords]
inline CHarmAnlsCenters CentersOf(const nlohmann::json& form) {
    CHarmAnlsCenters centers;
    for (const auto& in : form) {
        CHarmAnlsCenter& center = centers.emplace_back();
        center.mHarmCenter = {KeyEnhOf(in.at(0)), SemitonesOf(in.at(1))};
        center.mPosition = PositionOf(in.at(2));
        center.mChords = ChordsOf(in.at(3));
    }
    return centers;
}

inline nlohmann::json FormOf(const CHarmAnlsCenters& centers) {
    auto form = nlohmann::json::array();
    for (const auto& center : centers) {
        form.push_back({FormOf(center.mHarmCenter.mRootKeyEnh),
                        center.mHarmCenter.mSemitones.Mask(), PositionForm(center.mPosition),
                        FormOf(center.mChords)});
    }
    return form;
}

}  // namespace brindle::test
