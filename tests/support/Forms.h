// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/CChordLite.h"
#include "brindle/theory/CIntvlSet.h"
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CScaleLite.h"
#include "brindle/theory/CSignKeyLite.h"

#include <nlohmann/json.hpp>
#include <sstream>
#include <string>

/// The forms in which the files of tests/data/expected write our records.
namespace brindle::test {

inline TEnh EnhOf(const nlohmann::json& number) {
    return static_cast<TEnh>(number.get<int>());
}

/// [keyNr, enh]
inline CKeyEnh KeyEnhOf(const nlohmann::json& pair) {
    return {pair.at(0).get<int>(), EnhOf(pair.at(1))};
}

inline nlohmann::json FormOf(const CKeyEnh& keyEnh) {
    return {keyEnh.mKeyNr, static_cast<int>(keyEnh.mEnh)};
}

inline CSemitones SemitonesOf(const nlohmann::json& mask) {
    return CSemitones(mask.get<std::uint64_t>());
}

/// {"mRootKeyEnh": [keyNr, enh], "mSemitones": mask}
inline CScaleLite ScaleLiteOf(const nlohmann::json& form) {
    return {KeyEnhOf(form.at("mRootKeyEnh")), SemitonesOf(form.at("mSemitones"))};
}

inline nlohmann::json FormOf(const CScaleLite& scale) {
    return {{"mRootKeyEnh", FormOf(scale.mRootKeyEnh)}, {"mSemitones", scale.mSemitones.Mask()}};
}

/// {"mRootKeyEnh": [keyNr, enh], "mSignKeyType": number}
inline CSignKeyLite SignKeyLiteOf(const nlohmann::json& form) {
    return {KeyEnhOf(form.at("mRootKeyEnh")),
            static_cast<TSignKeyType>(form.at("mSignKeyType").get<int>())};
}

inline nlohmann::json FormOf(const CSignKeyLite& signKey) {
    return {{"mRootKeyEnh", FormOf(signKey.mRootKeyEnh)},
            {"mSignKeyType", static_cast<int>(signKey.mSignKeyType)}};
}

/// {"root": [keyNr, enh], "bass": [keyNr, enh], "semitones": mask}
inline CChordLite ChordLiteOf(const nlohmann::json& form) {
    return {KeyEnhOf(form.at("root")), KeyEnhOf(form.at("bass")),
            SemitonesOf(form.at("semitones"))};
}

inline nlohmann::json FormOf(const CChordLite& chord) {
    return {{"root", FormOf(chord.mRootKeyEnh)},
            {"bass", FormOf(chord.mBassKeyEnh)},
            {"semitones", chord.mSemitones.Mask()}};
}

/// [interval, ...], in any number and range
inline CIntvlSet IntvlSetOf(const nlohmann::json& members) {
    CIntvlSet intvls;
    for (const nlohmann::json& member : members) intvls.insert(member.get<int>());
    return intvls;
}

template <class T>
std::string JSONStringOf(const T& value) {
    std::ostringstream stream;
    value.AppendJSONString(stream);
    return stream.str();
}

}  // namespace brindle::test
