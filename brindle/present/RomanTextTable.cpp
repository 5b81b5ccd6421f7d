// SPDX-License-Identifier: MIT
#include "brindle/present/RomanTextTable.h"

#include "brindle/analysis/ReadRomanText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/present/CTable.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"

#include <algorithm>
#include <iterator>
#include <nlohmann/json.hpp>

namespace brindle {
namespace {

std::string NameOf(const CSignKeyLite& key) {
    return key.NameLong(NamePrefs());
}

// The bar that a position lies in; bars lie one behind the other.
const CRomanTextBar& BarAt(const CRomanTextReading& reading, double position) {
    const auto behind = std::upper_bound(
        reading.mBars.begin(), reading.mBars.end(), position,
        [](double place, const CRomanTextBar& bar) { return place < bar.mPosition; });
    return *std::prev(behind);
}

Json ChordJson(const CRomanTextChord& chord) {
    Json json{{"Position", chord.mPosition},
              {"Length", chord.mLength},
              {"Key", NameOf(chord.mKey)},
              {"Numeral", Printable(chord.mNumeral)},
              {"Symbol", WriteChordSymbol(chord.mChord)},
              {"RootKeyEnh", KeyEnhToJson(chord.mChord.mRootKeyEnh)},
              {"BassKeyEnh", KeyEnhToJson(chord.mChord.mBassKeyEnh)},
              {"Semitones", chord.mChord.mSemitones.Mask()}};
    if (!chord.mNumeralBefore.empty()) {
        json["KeyBefore"] = NameOf(chord.mKeyBefore);
        json["NumeralBefore"] = Printable(chord.mNumeralBefore);
    }
    return json;
}

template <class TList, class TMake>
Json ListJson(const TList& list, TMake make) {
    Json json = Json::array();
    for (const auto& element : list) json.push_back(make(element));
    return json;
}

}  // namespace

std::string RomanTextText(const CRomanTextReading& reading, const CPaint& paint) {
    CTable table({" bar", " position", " length", "key", "numeral", "chord"});
    for (const CRomanTextChord& chord : reading.mChords) {
        std::string numeral = Printable(chord.mNumeral);
        if (!chord.mNumeralBefore.empty()) numeral += " = " + Printable(chord.mNumeralBefore);
        table.AddRow({std::to_string(BarAt(reading, chord.mPosition).mNumber),
                      ShortNumber(chord.mPosition), ShortNumber(chord.mLength), NameOf(chord.mKey),
                      numeral, WriteChordSymbol(chord.mChord)});
    }
    return table.Text(paint);
}

std::string RomanTextJson(const CRomanTextReading& reading) {
    return JsonText(
        {{"Title", Printable(reading.mTitle)},
         {"Movement", Printable(reading.mMovement)},
         {"Composer", Printable(reading.mComposer)},
         {"Analyst", Printable(reading.mAnalyst)},
         {"Times", ListJson(reading.mTimes,
                            [](const CRomanTextTime& time) {
                                return Json{{"Position", time.mPosition},
                                            {"Beats", time.mBeats},
                                            {"BeatValue", time.mBeatValue}};
                            })},
         {"Keys", ListJson(reading.mKeys,
                           [](const CRomanTextKey& key) {
                               return Json{{"Position", key.mPosition}, {"Key", NameOf(key.mKey)}};
                           })},
         {"Bars", ListJson(reading.mBars,
                           [](const CRomanTextBar& bar) {
                               return Json{{"Number", bar.mNumber},
                                           {"Position", bar.mPosition},
                                           {"Length", bar.mLength}};
                           })},
         {"Chords", ListJson(reading.mChords, ChordJson)}});
}

}  // namespace brindle
