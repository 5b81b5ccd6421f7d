// SPDX-License-Identifier: MIT
#include "brindle/present/MarkovSequencesText.h"

#include "brindle/present/JsonValues.h"

#include <fmt/format.h>

#include <nlohmann/json.hpp>

namespace brindle {
namespace {

constexpr int kBarsOfLine = 4;

Json SampledToJson(const TMarkovSampledObject& sampled, const CMarkovSpelling& spelling) {
    Json json = MarkovSymbolToJson(*sampled.mObject, spelling);
    json["Probability"] = NumberToJson(sampled.mProbability);
    json["NormalizedEntropy"] = NumberToJson(sampled.mNormalizedEntropy);
    json["HistoryLength"] = sampled.mHistoryLength;
    return json;
}

/// One spelling for all that was drawn, in the key of what was chosen.
CMarkovSpelling SpellingOf(const CMarkovDraws& draws) {
    MarkovSequence others;
    for (const TMarkovSampledSequence& sequence : draws.mSequences) {
        others.insert(others.end(), sequence.mSymbols.begin(), sequence.mSymbols.end());
    }
    return CMarkovSpelling(draws.mChosen.mSymbols, others);
}

std::string WeightText(double share, int count) {
    const std::string drawn = count == 1 ? "" : fmt::format(", drawn {} times", count);
    return fmt::format("\nor, with weight {:.2f}{}:\n", share, drawn);
}

}  // namespace

Json MarkovSymbolToJson(const CMarkovObject& object, const CMarkovSpelling& spelling) {
    const std::string symbol = spelling.SymbolOf(object);
    if (!object.HasBeats()) return {{"Symbol", symbol}};
    const CChordLite chord = spelling.Spelled(object.mChord);
    return {{"Symbol", symbol},
            {"Length", object.mChord.mLength},
            {"RootKeyEnh", KeyEnhToJson(chord.mRootKeyEnh)},
            {"BassKeyEnh", KeyEnhToJson(chord.mBassKeyEnh)},
            {"Semitones", chord.mSemitones.Mask()},
            {"Intervals", IntervalsToJson(chord.mSemitones)}};
}

std::string DrawnSequencesText(const CMarkovDraws& draws, int beatsPerBar, std::size_t others,
                               const CPaint& paint) {
    const CMarkovSpelling spelling = SpellingOf(draws);
    const auto textOf = [&](const TMarkovSampledSequence& sequence) {
        return BarsText(sequence.mSymbols, spelling, beatsPerBar, kBarsOfLine) + '\n';
    };
    std::string text = textOf(draws.mChosen);
    for (std::size_t ix = 0; ix < draws.mSequences.size() && others > 0; ++ix) {
        const TMarkovSampledSequence& sequence = draws.mSequences[ix];
        if (sequence.mSymbols == draws.mChosen.mSymbols) continue;
        --others;
        text += paint.Faint(WeightText(draws.mShares[ix], sequence.mCount)) + textOf(sequence);
    }
    return text;
}

std::string DrawnSequencesJson(const CMarkovDraws& draws) {
    const CMarkovSpelling spelling = SpellingOf(draws);
    Json symbols = Json::array();
    for (const auto& sampled : draws.mChosen.mSampledObjects) {
        symbols.push_back(SampledToJson(sampled, spelling));
    }
    Json sequences = Json::array();
    for (std::size_t ix = 0; ix < draws.mSequences.size(); ++ix) {
        const TMarkovSampledSequence& sequence = draws.mSequences[ix];
        sequences.push_back({{"Share", draws.mShares[ix]},
                             {"Count", sequence.mCount},
                             {"LogProbability", sequence.mLogProbability},
                             {"ChordString", ChordString(sequence.mSymbols, spelling)}});
    }
    return JsonText({{"ChordString", ChordString(draws.mChosen.mSymbols, spelling)},
                     {"Symbols", symbols},
                     {"Sequences", sequences}});
}

std::string FilledSequenceJson(MarkovSequenceView filled, MarkovSequenceView typed) {
    const CMarkovSpelling spelling(filled);
    Json symbols = Json::array();
    for (std::size_t ix = 0; ix < filled.size(); ++ix) {
        Json symbol = MarkovSymbolToJson(*filled[ix], spelling);
        symbol["Filled"] = typed[ix]->IsGap();
        symbols.push_back(symbol);
    }
    return JsonText({{"ChordString", ChordString(filled, spelling)}, {"Symbols", symbols}});
}

}  // namespace brindle
