// SPDX-License-Identifier: MIT
#include "MarkovForms.h"

#include "tests/support/Expected.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

json ObjectsOf(const VariableLengthMarkovModel& model) {
    auto form = json::array();
    for (const CMarkovObject& object : model.mObjects) {
        const CHarmAnlsChordWithLength& chord = object.mChord;
        form.push_back({object.mType, chord.mRootDistToHarmCenter, chord.mLength,
                        chord.mBassDistToHarmCenter, chord.mSemitones.Mask()});
    }
    return form;
}

json TransitionsOf(const VariableLengthMarkovModel& model) {
    auto form = json::array();
    for (const CMarkovTransitions* const entry : model.mTransitionMap.InOrder()) {
        form.push_back({test::FormOf(entry->mHistory), TableForm(entry->mCounts)});
    }
    return form;
}

json ProbabilitiesFor(const json& in) {
    const auto model = ModelOf(in);
    MarkovProbabilities table;
    model.ProbabilitiesForNextSymbol(SequenceOf(model, in.at(2)), table);
    return {{"probabilities", TableForm(table)},
            {"CalculateEntropy", NumberForm(model.CalculateEntropy(table))},
            {"SumProbabilities", model.SumProbabilities(table)}};
}

json SubvectorFor(const json& in) {
    auto model = ModelOf(in);
    MarkovSequence out;
    model.Subvector(in.at(2).get<std::uint64_t>(), SequenceOf(model, in.at(3)), out);
    return test::FormOf(out);
}

json HistorySubvectorFor(const json& in) {
    auto model = ModelOf(in);
    MarkovSequence out;
    model.HistorySubvector(in.at(2).get<std::uint64_t>(), out);
    return test::FormOf(out);
}

json WindowsFor(const json& in) {
    auto model = ModelOf(in);
    model.QueryStartSequence();
    auto form = json::array();
    for (const json& step : in.at(2)) {
        if (step == "remove") {
            model.QueryRemoveLastItem();
        } else {
            model.QueryAddSymbol(*model.mObjects.At(step.get<std::int64_t>()));
        }
        form.push_back(test::FormOf(model.mHistory));
    }
    return form;
}

}  // namespace

TEST_CASE("A model counts what follows each history and estimates its chance") {
    CheckExpected(
        "markov_learning",
        {
            {"mObjects", [](const json& in) { return ObjectsOf(ModelOf(in)); }},
            {"mTransitionMap", [](const json& in) { return TransitionsOf(ModelOf(in)); }},
            {"VariableLengthMarkovModel::ProbabilitiesForNextSymbol", ProbabilitiesFor},
            {"VariableLengthMarkovModel::Subvector", SubvectorFor},
            {"VariableLengthMarkovModel::HistorySubvector", HistorySubvectorFor},
            {"VariableLengthMarkovModel::QueryAddSymbol", WindowsFor},
            {"VariableLengthMarkovModel::CalculateEntropy",
             [](const json& in) {
                 VariableLengthMarkovModel model;
                 return NumberForm(model.CalculateEntropy(TableOf(model, in.at(0))));
             }},
            {"VariableLengthMarkovModel::ValidateHistoryLength",
             [](const json& in) {
                 auto n = in.at(1).get<std::uint64_t>();
                 VariableLengthMarkovModel(in.at(0).get<std::uint64_t>()).ValidateHistoryLength(n);
                 return n;
             }},
        });
}
