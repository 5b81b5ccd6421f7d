// SPDX-License-Identifier: MIT
#include "brindle/present/NumeralsJson.h"

#include "brindle/analysis/ReadNumerals.h"
#include "brindle/analysis/ReadRomanText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/internal/CTextPlaces.h"
#include "brindle/present/JsonValues.h"
#include "brindle/present/ShownNames.h"
#include "brindle/present/ShownText.h"

#include <nlohmann/json.hpp>
#include <span>
#include <utility>

namespace brindle {
namespace {

std::string KeyNameInJson(const CSignKeyLite& key) {
    return key.IsUndef() ? std::string() : key.NameLong(NamePrefs());
}

Json ChordWithNumeral(const CChordLite& chord, std::string symbol, std::string numeral,
                      std::string nashville) {
    return {{"Symbol", std::move(symbol)},
            {"Numeral", std::move(numeral)},
            {"Nashville", std::move(nashville)},
            {"RootKeyEnh", KeyEnhToJson(chord.mRootKeyEnh)},
            {"BassKeyEnh", KeyEnhToJson(chord.mBassKeyEnh)},
            {"Semitones", chord.mSemitones.Mask()},
            {"Intervals", IntervalsToJson(chord.mSemitones)}};
}

Json ChordOfAnalysis(const CRomanTextChord& chord) {
    Json json =
        ChordWithNumeral(chord.mChord, WriteChordSymbol(chord.mChord), Printable(chord.mNumeral),
                         RomanNumeral(chord.mChord, chord.mKey, nullptr, {.mNashville = true}));
    json["Key"] = KeyNameInJson(chord.mKey);
    json["Position"] = chord.mPosition;
    json["Length"] = chord.mLength;
    if (!chord.mNumeralBefore.empty()) {
        json["KeyBefore"] = KeyNameInJson(chord.mKeyBefore);
        json["NumeralBefore"] = Printable(chord.mNumeralBefore);
    }
    return json;
}

/// The word around a place, empty where none is.
std::string_view WordAround(std::size_t offset, std::string_view text) {
    std::size_t begin = offset;
    while (begin > 0 && !Ascii::IsWhiteSpace(text[begin - 1])) --begin;
    const std::string_view rest = text.substr(begin);
    return rest.substr(0, rest.find_first_of(Ascii::kWhiteSpace));
}

Json FaultsToJson(std::string_view text, std::span<const CTextFault> faults) {
    constexpr std::size_t longestWord = 60;
    CTextPlaces places(text);
    Json list = Json::array();
    for (const CTextFault& fault : faults) {
        places.GoToColumn(fault.mLine, fault.mColumn);
        const std::string word = Printable(WordAround(places.Offset(), text));
        list.push_back({{"Line", fault.mLine},
                        {"Column", fault.mColumn},
                        {"Word", FirstCharacters(word, longestWord)},
                        {"Text", Printable(fault.mText)}});
    }
    return list;
}

template <class TList, class TMake>
Json ListOf(const TList& list, TMake make) {
    Json json = Json::array();
    for (const auto& element : list) json.push_back(make(element));
    return json;
}

Json TimeOfAnalysis(const CRomanTextTime& time) {
    return {{"Position", time.mPosition}, {"Beats", time.mBeats}, {"BeatValue", time.mBeatValue}};
}

Json KeyOfAnalysis(const CRomanTextKey& key) {
    return {{"Position", key.mPosition}, {"Key", KeyNameInJson(key.mKey)}};
}

Json BarOfAnalysis(const CRomanTextBar& bar) {
    return {{"Number", bar.mNumber}, {"Position", bar.mPosition}, {"Length", bar.mLength}};
}

}  // namespace

std::string NumeralsJson(const CNumeralsReading& reading, std::string_view text,
                         const CSignKeyLite& key, bool areNumerals,
                         const CNumeralOptions& options) {
    CNumeralOptions style = options;
    style.mNashville = false;
    const std::vector<std::string> roman = NumeralsOfWords(reading.mWords, key, style);
    style.mNashville = true;
    const std::vector<std::string> nashville = NumeralsOfWords(reading.mWords, key, style);
    Json chords = Json::array();
    for (std::size_t i = 0; i < reading.mWords.size(); ++i) {
        const CNumeralWord& word = reading.mWords[i];
        if (word.IsMark() || word.mChord.IsUndef()) continue;
        chords.push_back(ChordWithNumeral(
            word.mChord, areNumerals ? WriteChordSymbol(word.mChord) : Printable(word.mText),
            roman[i], nashville[i]));
    }
    return JsonText({{"Key", KeyNameInJson(key)},
                     {"Chords", std::move(chords)},
                     {"Faults", FaultsToJson(text, reading.mFaults)}});
}

std::string RomanTextJson(const CRomanTextReading& reading, std::string_view text) {
    std::vector<CTextFault> faults = reading.mFaults;
    faults.insert(faults.end(), reading.mNotes.begin(), reading.mNotes.end());
    const CSignKeyLite key = reading.mKeys.empty() ? CSignKeyLite() : reading.mKeys.front().mKey;
    return JsonText({{"Key", KeyNameInJson(key)},
                     {"Title", Printable(reading.mTitle)},
                     {"Movement", Printable(reading.mMovement)},
                     {"Composer", Printable(reading.mComposer)},
                     {"Analyst", Printable(reading.mAnalyst)},
                     {"Times", ListOf(reading.mTimes, TimeOfAnalysis)},
                     {"Keys", ListOf(reading.mKeys, KeyOfAnalysis)},
                     {"Bars", ListOf(reading.mBars, BarOfAnalysis)},
                     {"Chords", ListOf(reading.mChords, ChordOfAnalysis)},
                     {"Faults", FaultsToJson(text, faults)}});
}

}  // namespace brindle
