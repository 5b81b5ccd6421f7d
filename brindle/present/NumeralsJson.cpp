// SPDX-License-Identifier: MIT
#include "brindle/present/NumeralsJson.h"

#include "brindle/analysis/ReadNumerals.h"
#include "brindle/analysis/ReadRomanText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/platform/Ascii.h"
#include "brindle/platform/Utf8.h"
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

/// Walks through a text to places by line and character; in ascending order that is linear.
class CTextWalk {
public:
    explicit CTextWalk(std::string_view text) : mText(text) {}

    /// The word there, empty where none is.
    [[nodiscard]] std::string_view WordAt(std::size_t line, std::size_t column) {
        if (line < mLine || (line == mLine && column < mColumn)) *this = CTextWalk(mText);
        while (mOffset < mText.size() && (mLine < line || (mLine == line && mColumn < column))) {
            if (mText[mOffset] == '\n' && mLine == line) break;
            Step();
        }
        std::size_t begin = mOffset;
        while (begin > 0 && !Ascii::IsWhiteSpace(mText[begin - 1])) --begin;
        const std::string_view rest = mText.substr(begin);
        return rest.substr(0, rest.find_first_of(Ascii::kWhiteSpace));
    }

private:
    void Step() {
        const bool isBreak = mText[mOffset++] == '\n';
        while (mOffset < mText.size() && !BeginsUtf8Character(mText[mOffset])) {
            ++mOffset;
        }
        mLine += isBreak ? 1 : 0;
        mColumn = isBreak ? 1 : mColumn + 1;
    }

    std::string_view mText;
    std::size_t mOffset = 0;
    std::size_t mLine = 1;
    std::size_t mColumn = 1;
};

Json FaultsToJson(std::string_view text, std::span<const CTextFault> faults) {
    constexpr std::size_t longestWord = 60;
    CTextWalk walk(text);
    Json list = Json::array();
    for (const CTextFault& fault : faults) {
        const std::string word = Printable(walk.WordAt(fault.mLine, fault.mColumn));
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
