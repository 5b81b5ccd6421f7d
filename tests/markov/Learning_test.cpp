// SPDX-License-Identifier: MIT
#include "MarkovForms.h"

#include "tests/support/Expected.h"

#include "brindle/markov/CIteratorIndexConverter.h"

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

TEST_CASE("Counts of a chord add up, and are read back as they were written") {
    VariableLengthMarkovModel model(2);
    Learn(model, "(4,C);(2,F);(2,G);(4,C)");
    const MarkovSequence chords = model.IteratorSequenceForObjects(SymbolsOf("(4,C);(2,F)"));
    MarkovCounts counts;
    VariableLengthMarkovModel::MapAddToOrInsert(counts, {chords[0], 2});
    VariableLengthMarkovModel::MapAddToOrInsert(counts, {chords[1], 1});
    VariableLengthMarkovModel::MapAddToOrInsert(counts, {chords[0], 3});
    CHECK(counts.size() == 2);
    CHECK(counts[chords[0]] == 5);
    CHECK(counts[chords[1]] == 1);

    CIteratorIndexConverter converter(model.mObjects);
    const auto written = [&] {
        std::ostringstream text;
        model.TransitionMapAppendToJSON(text, converter);
        return text.str();
    };
    const std::string text = written();
    model.mTransitionMap = VariableLengthMarkovModel::JSONDeserialization_Helper::
        MarkovTransitionMapFromJSONDictionary(
            nlohmann::json{{"TransitionMap", nlohmann::json::parse(text)}}, converter);
    CHECK(written() == text);
}

TEST_CASE("The next fixed chord of a template is told with its distance, the end behind the last") {
    VariableLengthMarkovModel model(1);
    Learn(model, "(4,C);(2,F)");
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects(SymbolsOf("(2,U);(4,C);(2,U);(2,F)"));
    REQUIRE(options.Validate(model));
    const MarkovSequence chords = model.IteratorSequenceForObjects(SymbolsOf("(4,C);(2,F)"));
    struct CRow {
        double mBeats;
        MarkovIterator mObject;
        double mDistance;
    };
    const CRow rows[] = {{0.0, chords[0], 2.0},
                         {2.0, chords[0], 0.0},
                         {3.0, chords[1], 5.0},
                         {8.0, chords[1], 0.0},
                         {9.0, model.mObjects.insertObjectIfUnique(CMarkovObject_End), 1.0}};
    for (const CRow& row : rows) {
        CAPTURE(row.mBeats);
        MarkovIterator object{};
        double distance = -1.0;
        model.NextGivenObjectAndDistance(object, distance, options, row.mBeats);
        CHECK(object == row.mObject);
        CHECK(distance == row.mDistance);
    }
}
