// SPDX-License-Identifier: MIT
#include "MarkovForms.h"

#include "tests/support/Expected.h"

#include "brindle/markov/TMarkovSamplingInformation.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <algorithm>
#include <cmath>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// Plays the given numbers, then zeros.
VariableLengthMarkovModel::RandomSource NumbersOf(const json& form) {
    return [numbers = form.get<std::vector<std::uint32_t>>(), next = std::size_t{0}]() mutable {
        return next < numbers.size() ? numbers[next++] : 0;
    };
}

/// {field: value, ...}, the template as a chord string
TMarkovGenerateOptions OptionsOf(VariableLengthMarkovModel& model, const json& wanted,
                                 const json& fields) {
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects(SymbolsOf(wanted.get<std::string>()));
    fields.at("mMaxHistoryLength").get_to(options.mMaxHistoryLength);
    fields.at("mMinHistoryLength").get_to(options.mMinHistoryLength);
    fields.at("mEvidenceHistoryLength").get_to(options.mEvidenceHistoryLength);
    fields.at("mAcceptAtMinHistory").get_to(options.mAcceptAtMinHistory);
    fields.at("mAcceptExactFill").get_to(options.mAcceptExactFill);
    fields.at("mMinNormalizedEntropy").get_to(options.mMinNormalizedEntropy);
    fields.at("mAllEqualFactor").get_to(options.mAllEqualFactor);
    fields.at("mSampleCount").get_to(options.mSampleCount);
    return options;
}

/// [N, sequences, template, options, random numbers]
struct CRun {
    VariableLengthMarkovModel mModel;
    TMarkovGenerateOptions mOptions;
    TMarkovSampledSequence mSequence;
    std::vector<TMarkovSampledSequence> mSequences;

    explicit CRun(const json& in)
        : mModel(ModelOf(in)), mOptions(OptionsOf(mModel, in.at(2), in.at(3))) {
        mModel.SetRandomSource(NumbersOf(in.at(4)));
    }
};

json FormOfSampled(const TMarkovSampledSequence& sequence) {
    auto form = json::array();
    for (const TMarkovSampledObject& object : sequence.mSampledObjects) {
        form.push_back({object.mObject->mPlace, NumberForm(object.mProbability),
                        NumberForm(object.mNormalizedEntropy), NumberForm(object.mMaxEntropy),
                        object.mHistoryLength});
    }
    return form;
}

json Filled(const json& in) {
    CRun run(in);
    TMarkovSamplingInformation info;
    const bool result = run.mModel.RecursiveGenerateSequence(run.mSequence, run.mOptions, info);
    if (!result) return {{"result", false}};
    return {{"result", true}, {"mSampledObjects", FormOfSampled(run.mSequence)}};
}

json Free(const json& in) {
    CRun run(in);
    run.mModel.GenerateSequenceWithFixedLength(run.mOptions.mMaxHistoryLength, run.mSequence,
                                               run.mOptions);
    return {{"mSampledObjects", FormOfSampled(run.mSequence)}};
}

json Sampled(const json& in, bool recursive) {
    CRun run(in);
    run.mModel.SampleSequenceWithLength(run.mSequence, run.mSequences, recursive, run.mOptions);
    std::vector<json> sequences;
    for (const TMarkovSampledSequence& sequence : run.mSequences) {
        sequences.push_back({test::FormOf(sequence.mSymbols), sequence.mCount});
    }
    std::sort(sequences.begin(), sequences.end());
    return {{"mSymbols", test::FormOf(run.mSequence.mSymbols)}, {"sequences", sequences}};
}

/// The place of the chosen value
json Chosen(const json& in) {
    VariableLengthMarkovModel model;
    const MarkovProbabilities table = TableOf(model, in.at(0));
    model.SetRandomSource(NumbersOf(in.at(1)));
    return model.ChooseFromProbabilities(table)->mIndex;
}

json Normalized(const json& in) {
    std::vector<CMarkovWeightedSequence> sequences;
    for (const json& weight : in.at(0)) sequences.push_back({{}, weight.get<double>()});
    VariableLengthMarkovModel::NormalizeLogProbabilities(sequences);
    auto form = json::array();
    for (const auto& sequence : sequences) form.push_back(sequence.mWeight);
    return form;
}

/// [N, longest, shortest, evidence]
json Validated(const json& in) {
    VariableLengthMarkovModel model(in.at(0).get<std::uint64_t>());
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects(SymbolsOf("(4,U)"));
    in.at(1).get_to(options.mMaxHistoryLength);
    in.at(2).get_to(options.mMinHistoryLength);
    in.at(3).get_to(options.mEvidenceHistoryLength);
    const bool isValid = options.IsValid(model);
    const bool hasTemplate = options.Validate(model);
    return {isValid, hasTemplate, options.mMaxHistoryLength, options.mMinHistoryLength,
            options.mEvidenceHistoryLength};
}

}  // namespace

TEST_CASE("Given random numbers make the expected sequences") {
    CheckExpected("markov_generation",
                  {
                      {"VariableLengthMarkovModel::RecursiveGenerateSequence", Filled},
                      {"VariableLengthMarkovModel::GenerateSequenceWithFixedLength", Free},
                      {"VariableLengthMarkovModel::SampleSequenceWithLength (recursive)",
                       [](const json& in) { return Sampled(in, true); }},
                      {"VariableLengthMarkovModel::SampleSequenceWithLength (free)",
                       [](const json& in) { return Sampled(in, false); }},
                      {"VariableLengthMarkovModel::ChooseFromProbabilities", Chosen},
                      {"VariableLengthMarkovModel::NormalizeLogProbabilities", Normalized},
                      {"TMarkovGenerateOptions::Validate", Validated},
                  });
}

TEST_CASE("A search that fails at once has not given up, whatever the one before it did") {
    VariableLengthMarkovModel model(1);
    Learn(model, "(3,C);(3,F)");
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects(SymbolsOf("(2,U)"));
    REQUIRE(options.Validate(model));
    TMarkovSampledSequence sequence;
    TMarkovSamplingInformation info;
    info.mHasGivenUp = true;
    CHECK_FALSE(model.RecursiveGenerateSequence(sequence, options, info));
    CHECK_FALSE(info.mHasGivenUp);
}

TEST_CASE("A chord fills a gap the better, the better the chord behind the gap follows it") {
    // Behind C stand F and D equally often, but G follows F alone.
    VariableLengthMarkovModel model(1);
    Learn(model, "(1,C);(1,F);(1,G)");
    Learn(model, "(1,C);(1,D);(1,A)");
    const MarkovSequence sequence =
        model.IteratorSequenceForObjects(SymbolsOf("(1,C);(1,U);(1,G)"));
    const MarkovSequence chords = model.IteratorSequenceForObjects(SymbolsOf("(1,F);(1,D)"));
    int fCount = 0;
    int dCount = 0;
    constexpr std::uint32_t kDraws = 100;
    for (std::uint32_t draw = 0; draw < kDraws; ++draw) {
        model.SetRandomSource([draw] { return 0xFFFF'FFFFU / kDraws * draw + 1000; });
        const MarkovIterator chosen = model.FillGapInSequence(sequence);
        fCount += chosen == chords[0] ? 1 : 0;
        dCount += chosen == chords[1] ? 1 : 0;
    }
    // F weighs 1/2 for itself and 1 for the G behind it, D only 1/2.
    CHECK(fCount == 75);
    CHECK(dCount == 25);
}

TEST_CASE("A free sequence whose last chord is shorter than a beat has missed its length") {
    VariableLengthMarkovModel model(1);
    Learn(model, "(4,C);(0.5,G)");
    const auto weightFor = [&](const std::string& wanted) {
        TMarkovGenerateOptions options;
        options.mTemplate = model.IteratorSequenceForObjects(SymbolsOf(wanted));
        options.mMaxHistoryLength = 1;
        options.mMinHistoryLength = 1;
        TMarkovSampledSequence sequence;
        model.GenerateSequenceWithFixedLength(1, sequence, options);
        REQUIRE_FALSE(sequence.mSymbols.empty());
        CHECK(sequence.mSymbols[0]->mChord.mLength == 4.0);
        return sequence.mLogProbability;
    };
    CHECK(weightFor("(4,U);(0.5,U)") < -700.0);
}

TEST_CASE("The usual options lead to as many beats, or to the wanted chords, with all histories") {
    VariableLengthMarkovModel model(2);
    Learn(model, "(4,C);(4,F);(4,G);(4,C);(4,F);(4,G)");
    const auto symbols = [&](const TMarkovGenerateOptions& options) {
        CHECK(options.IsValid(model));
        CHECK(options.mMaxHistoryLength == 2);
        TMarkovSampledSequence sequence;
        TMarkovSamplingInformation info;
        REQUIRE(model.RecursiveGenerateSequence(sequence, options, info));
        std::string shown;
        for (const MarkovIterator symbol : sequence.mSymbols) {
            shown += fmt::format("{} ", symbol->mChord.mRootKeyEnh.mKeyNr);
        }
        return shown;
    };
    CHECK(symbols(UsualGenerateOptions(model, 12.0)) == "0 5 7 ");
    CHECK(symbols(UsualGenerateOptions(model, SymbolsOf("(4,C);(16,U);(4,G)"))) == "0 5 7 0 5 7 ");
    CHECK_FALSE(UsualGenerateOptions(model, 0.0).IsValid(model));
}
