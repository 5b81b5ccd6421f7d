// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnls.h"

#include "brindle/platform/DictionaryValues.h"

#include <nlohmann/json.hpp>

namespace brindle {

namespace CHarmAnls {

CHarmAnlsChord Chord::FromDictionary(const nlohmann::json& dictionary) {
    CHarmAnlsChord chord(CChordLite::FromDictionary(dictionary));
    const auto rootDist = IntegerIn(dictionary, "RootDistToHarmCenter");
    const auto bassDist = IntegerIn(dictionary, "BassDistToHarmCenter");
    if (rootDist && bassDist) {
        chord.mRootDistToHarmCenter = *rootDist;
        chord.mBassDistToHarmCenter = *bassDist;
    }
    return chord;
}

CHarmAnlsChordWithPos ChordWithPos::FromDictionary(const nlohmann::json& dictionary) {
    return CHarmAnlsChordWithPos(Chord::FromDictionary(dictionary),
                                 NumberIn(dictionary, "Position").value_or(kPosUndef));
}

CHarmAnlsChordWithLength ChordWithLength::FromDictionary(const nlohmann::json& dictionary) {
    return CHarmAnlsChordWithLength(CChordLite::FromDictionary(dictionary),
                                    NumberIn(dictionary, "Length").value_or(kPosUndef));
}

}  // namespace CHarmAnls

CHarmAnlsChordWithLength
CHarmAnlsChordWithLength::JSONDeserializer_Helper::CHarmAnlsChordWithLengthFromJSONDictionary(
    const nlohmann::json& dictionary) {
    const CHarmAnlsChord chord(CChordLite::FromDictionary(dictionary),
                               IntegerIn(dictionary, "RootDistToHarmCenter").value_or(0),
                               IntegerIn(dictionary, "BassDistToHarmCenter").value_or(0));
    return CHarmAnlsChordWithLength(chord, NumberIn(dictionary, "Length").value_or(0.0));
}

}  // namespace brindle
