// SPDX-License-Identifier: MIT
#include "cli/Analysis.h"

#include "cli/ChordSymbols.h"
#include "cli/Json.h"
#include "cli/KeysJson.h"
#include "cli/Names.h"
#include "cli/Output.h"

#include "brindle/musicxml/TMusicXMLDoc.h"

namespace brindle::cli {
namespace {

Json DistanceToJson(int distance) {
    return distance < 0 ? Json(nullptr) : Json(distance);
}

Json NameToJson(bool isUndef, const std::string& name) {
    return isUndef ? Json(nullptr) : Json(name);
}

class CJsonMaker {
public:
    explicit CJsonMaker(const CChordSymbols& symbols) : mSymbols(symbols) {}

    [[nodiscard]] Json Make(const CHarmAnlsChordWithPos& chord,
                            const CHarmCenterLite& center) const {
        const std::string& symbol = mSymbols.SymbolOf(chord);
        const std::string numeral(NumeralOf(chord, center));
        return {{"Position", NumberToJson(chord.mPosition)},
                {"Symbol", NameToJson(symbol.empty(), symbol)},
                {"RootKeyEnh", KeyEnhToJson(chord.mRootKeyEnh)},
                {"BassKeyEnh", KeyEnhToJson(chord.mBassKeyEnh)},
                {"Semitones", chord.mSemitones.Mask()},
                {"Intervals", IntervalsToJson(chord.mSemitones)},
                {"RootDistToHarmCenter", DistanceToJson(chord.mRootDistToHarmCenter)},
                {"BassDistToHarmCenter", DistanceToJson(chord.mBassDistToHarmCenter)},
                {"Numeral", NameToJson(numeral.empty(), numeral)}};
    }

    [[nodiscard]] Json Make(const CHarmAnlsCenter& center) const {
        const CHarmCenterLite& harmCenter = center.mHarmCenter;
        Json chords = Json::array();
        for (const auto& chord : center.mChords) chords.push_back(Make(chord, harmCenter));
        return {{"Probability", NumberToJson(center.mProbability)},
                {"Position", NumberToJson(center.mPosition)},
                {"HarmCenter",
                 {{"Name", NameToJson(center.IsUndef(), harmCenter.NameLong(NamePrefs()))},
                  {"CKeyEnh", KeyEnhToJson(harmCenter.mRootKeyEnh)},
                  {"Semitones", harmCenter.mSemitones.Mask()},
                  {"Intervals", IntervalsToJson(harmCenter.mSemitones)}}},
                {"HarmChords", chords}};
    }

    [[nodiscard]] Json Make(const CHarmAnlsSignKey& signKey) const {
        const CSignKeyLite& key = signKey.mSignKey;
        return {{"Probability", NumberToJson(signKey.mProbability)},
                {"Position", NumberToJson(signKey.mPosition)},
                {"SignKey",
                 {{"Name", NameToJson(signKey.IsUndef(), key.NameLong(NamePrefs()))},
                  {"CKeyEnh", KeyEnhToJson(key.mRootKeyEnh)},
                  {"Type", NameToJson(key.mSignKeyType == TSignKeyType_Undef,
                                      std::string(JSONWord(key.mSignKeyType)))}}},
                {"HarmCenters", List(signKey.mHarmCenters)}};
    }

    template <class TList>
    [[nodiscard]] Json List(const TList& list) const {
        Json array = Json::array();
        for (const auto& element : list) array.push_back(Make(element));
        return array;
    }

private:
    const CChordSymbols& mSymbols;
};

Json ScoreToJson(const TMusicXMLDoc& sheet) {
    Json times = Json::array();
    for (const TMusicXMLTimeSignature& time : sheet.TimeSignatures) {
        times.push_back({{"Position", NumberToJson(time.mPosition)},
                         {"Numerator", time.mNumerator},
                         {"Denominator", time.mDenominator}});
    }
    Json sections = Json::array();
    for (const CHarmSection& section : sheet.HarmSections) {
        sections.push_back(
            {{"Position", NumberToJson(section.mPosition)}, {"IsFirst", section.mIsFirst}});
    }
    Json copies = Json::array();
    for (const CHarmCopy& copy : sheet.HarmCopies) {
        copies.push_back({{"Position", NumberToJson(copy.mTargetPos)},
                          {"SourceOffsetBars", copy.mSourceOffsetBars},
                          {"LengthBars", copy.mLengthBars}});
    }
    Json bars = Json::array();
    for (const CHarmBarline& barline : sheet.HarmBarlines) bars.push_back(barline.mPosition);
    return {{"Title", Printable(sheet.Title)},
            {"TimeSignatures", times},
            {"Sections", sections},
            {"Copies", copies},
            {"Bars", bars}};
}

}  // namespace

std::string AnalysisJson(const CHarmonicAnalyse& analyse, const CHarmAnlsCenters* readings,
                         const CChordSymbols& symbols, const TSongKeys& keys,
                         const TMusicXMLDoc* sheet) {
    const CJsonMaker maker(symbols);
    Json json;
    if (sheet != nullptr) json["Score"] = ScoreToJson(*sheet);
    json["HarmSignKeys"] = maker.List(analyse.mSignKeys);
    if (readings != nullptr) json["Readings"] = maker.List(*readings);
    AppendKeysJson(json, keys);
    return JsonText(json);
}

}  // namespace brindle::cli
