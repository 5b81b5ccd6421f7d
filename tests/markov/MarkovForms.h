// SPDX-License-Identifier: MIT
#pragma once

#include "tests/support/Forms.h"

#include "brindle/markov/MarkovChords.h"
#include "brindle/markov/VariableLengthMarkovModel.h"

#include <cmath>
#include <utility>
#include <vector>

/// The forms in which the files of tests/data/expected write models and their symbols.
namespace brindle::test {

inline std::vector<CMarkovObject> SymbolsOf(const std::string& chordString) {
    std::vector<CMarkovObject> symbols;
    MarkovObjectsVectorForHarmChords(HarmChordsFromChordString(chordString), symbols);
    return symbols;
}

inline void Learn(VariableLengthMarkovModel& model, const std::string& chordString) {
    model.StartSequence();
    for (const CMarkovObject& symbol : SymbolsOf(chordString)) model.LearnAddSymbol(symbol);
    model.EndSequence();
}

/// [N, [chord string, ...], ...]
inline VariableLengthMarkovModel ModelOf(const nlohmann::json& in) {
    VariableLengthMarkovModel model(in.at(0).get<std::uint64_t>());
    for (const auto& sequence : in.at(1)) Learn(model, sequence.get<std::string>());
    return model;
}

/// [place, ...]
inline MarkovSequence SequenceOf(const VariableLengthMarkovModel& model,
                                 const nlohmann::json& places) {
    MarkovSequence sequence;
    for (const auto& place : places) {
        sequence.push_back(model.mObjects.At(place.get<std::int64_t>()));
    }
    return sequence;
}

inline nlohmann::json FormOf(MarkovSequenceView sequence) {
    auto form = nlohmann::json::array();
    for (const MarkovIterator symbol : sequence) form.push_back(symbol->mPlace);
    return form;
}

/// [[place, value], ...] of counts or probabilities
template <class Map>
nlohmann::json TableForm(const Map& map) {
    auto form = nlohmann::json::array();
    for (const auto& [symbol, value] : map) form.push_back({symbol->mPlace, value});
    return form;
}

/// A number or "NaN"
inline nlohmann::json NumberForm(double number) {
    return std::isnan(number) ? nlohmann::json("NaN") : nlohmann::json(number);
}

/// The values of a table with numbered symbols that `model` stores.
inline MarkovProbabilities TableOf(VariableLengthMarkovModel& model, const nlohmann::json& values) {
    MarkovProbabilities table;
    CMarkovObject symbol;
    symbol.mType = TMarkovObjectType_Indexed;
    for (const auto& value : values) {
        ++symbol.mIndex;
        table[model.mObjects.insertObjectIfUnique(symbol)] = value.get<double>();
    }
    return table;
}

}  // namespace brindle::test
