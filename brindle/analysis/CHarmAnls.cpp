// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnls.h"

#include "brindle/platform/JsonValue.h"

#include <nlohmann/json.hpp>

namespace brindle {

using JsonValue::Integer;
using JsonValue::Number;

namespace CHarmAnls {

CHarmAnlsChord Chord::FromDictionary(const nlohmann::json& dictionary) {
    CHarmAnlsChord chord(CChordLite::FromDictionary(dictionary));
    const auto rootDist = Integer(dictionary, "RootDistToHarmCenter");
    const auto bassDist = Integer(dictionary, "BassDistToHarmCenter");
    if (rootDist && bassDist) {
        chord.mRootDistToHarmCenter = *rootDist;
        chord.mBassDistToHarmCenter = *bassDist;
    }
    return chord;
}

CHarmAnlsChordWithPos ChordWithPos::FromDictionary(const nlohmann::json& dictionary) {
    return CHarmAnlsChordWithPos(Chord::FromDictionary(dictionary),
                                 Number(dictionary, "Position").value_or(kPosUndef));
}

CHarmAnlsChordWithLength ChordWithLength::FromDictionary(const nlohmann::json& dictionary) {
    return CHarmAnlsChordWithLength(CChordLite::FromDictionary(dictionary),
                                    Number(dictionary, "Length").value_or(kPosUndef));
}

}  // namespace CHarmAnls

CHarmAnlsChordWithLength
CHarmAnlsChordWithLength::JSONDeserializer_Helper::CHarmAnlsChordWithLengthFromJSONDictionary(
    const nlohmann::json& dictionary) {
    const CHarmAnlsChord chord(CChordLite::FromDictionary(dictionary),
                               Integer(dictionary, "RootDistToHarmCenter").value_or(0),
                               Integer(dictionary, "BassDistToHarmCenter").value_or(0));
    return CHarmAnlsChordWithLength(chord, Number(dictionary, "Length").value_or(0.0));
}

}  // namespace brindle
