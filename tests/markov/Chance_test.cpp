// SPDX-License-Identifier: MIT
// What holds for every sequence that a model makes, and for many of them together.

#include "MarkovForms.h"

#include "brindle/markov/TMarkovSamplingInformation.h"
#include "brindle/platform/SeededRandom.h"

#include <doctest/doctest.h>

#include <map>

using namespace brindle;
using namespace brindle::test;

namespace {

VariableLengthMarkovModel SeededModel(std::uint64_t order,
                                      const std::vector<std::string>& sequences) {
    VariableLengthMarkovModel model(order);
    for (const std::string& sequence : sequences) Learn(model, sequence);
    model.SetRandomSource([random = SeededRandom(5)]() mutable { return random.Next(); });
    return model;
}

VariableLengthMarkovModel SongModel(std::uint64_t order) {
    return SeededModel(order, {"(4,C);(4,Am);(4,F);(4,G7);(4,C);(2,F);(2,G7);(4,C)",
                               "(4,Am);(4,F);(4,C);(4,G7);(4,Am);(2,Dm7);(2,G7);(4,C)",
                               "(2,C);(2,G7);(4,C);(2,F);(2,C);(4,G7);(4,F);(4,C)"});
}

TMarkovGenerateOptions OptionsFor(VariableLengthMarkovModel& model, const std::string& wanted,
                                  std::uint64_t samples) {
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects(SymbolsOf(wanted));
    options.mMaxHistoryLength = model.mMaxHistoryLength;
    options.mMinHistoryLength = 1;
    options.mEvidenceHistoryLength = 1;
    options.mAcceptAtMinHistory = true;
    options.mMinNormalizedEntropy = 0.3;
    options.mSampleCount = samples;
    return options;
}

/// The sum over all symbols of (counted - expected)^2 / expected.
double ChiSquare(const std::map<std::uint32_t, int>& counted,
                 const std::map<std::uint32_t, double>& shares) {
    double total = 0.0;
    for (const auto& [place, count] : counted) total += count;
    double sum = 0.0;
    for (const auto& [place, share] : shares) {
        const auto found = counted.find(place);
        const double difference = (found == counted.end() ? 0 : found->second) - share * total;
        sum += difference * difference / (share * total);
    }
    return sum;
}

}  // namespace

TEST_CASE("Chords follow each other as often as was learned") {
    // Behind C: F five times, G three times, Am twice; all of them go back to C.
    auto model = SeededModel(1, {"(4,C);(4,F);(4,C);(4,G);(4,C);(4,F);(4,C);(4,Am);(4,C);(4,F);"
                                 "(4,C);(4,G);(4,C);(4,F);(4,C);(4,G);(4,C);(4,F);(4,C);(4,Am);"
                                 "(4,C);(4,F)"});
    const MarkovSequence chords =
        model.IteratorSequenceForObjects(SymbolsOf("(4,C);(4,F);(4,G);(4,Am)"));
    const std::map<std::uint32_t, double> learned{{chords[1]->mPlace, 6.0 / 11},
                                                  {chords[2]->mPlace, 3.0 / 11},
                                                  {chords[3]->mPlace, 2.0 / 11}};
    std::map<std::uint32_t, int> counted;
    TMarkovSampledSequence sequence;
    for (int draw = 0; draw < 20000; ++draw) {
        model.AppendNextSymbol(sequence, MarkovSequenceView(chords).first(1), {});
        ++counted[sequence.mSymbols.back()->mPlace];
    }
    CHECK(counted.size() == 3);
    // With two degrees of freedom, chance alone goes beyond 13.8 once in 1000 runs.
    CHECK(ChiSquare(counted, learned) < 13.8);
    // The check itself sees a share that is wrong by two in a hundred.
    auto wrong = learned;
    wrong[chords[1]->mPlace] -= 0.02;
    wrong[chords[2]->mPlace] += 0.02;
    CHECK(ChiSquare(counted, wrong) > 13.8);
}

TEST_CASE("Samples keep the chords of the template and have its length") {
    auto model = SongModel(3);
    const auto options = OptionsFor(model, "(4,C);(8,U);(4,G7);(16,U);(4,F);(4,C)", 200);
    TMarkovSampledSequence chosen;
    std::vector<TMarkovSampledSequence> sequences;
    model.SampleSequenceWithLength(chosen, sequences, true, options);
    REQUIRE(sequences.size() > 3);
    int drawn = 0;
    for (const TMarkovSampledSequence& sequence : sequences) {
        std::map<double, MarkovIterator> at;
        double beats = 0.0;
        for (const MarkovIterator symbol : sequence.mSymbols) {
            at[beats] = symbol;
            beats += symbol->mChord.mLength;
        }
        CHECK(beats == 40.0);
        CHECK((at[0.0] == options.mTemplate[0] && at[12.0] == options.mTemplate[2] &&
               at[32.0] == options.mTemplate[4] && at[36.0] == options.mTemplate[0]));
        drawn += sequence.mCount;
    }
    CHECK(drawn == 200);
}

TEST_CASE("Free sequences have the wanted length, and those of one chord can be ruled out") {
    auto model = SongModel(2);
    auto options = OptionsFor(model, "(12,U)", 300);
    TMarkovSampledSequence chosen;
    std::vector<TMarkovSampledSequence> sequences;
    model.SampleSequenceWithLength(chosen, sequences, false, options);
    CHECK(sequences.size() > 3);
    for (const TMarkovSampledSequence& sequence : sequences) {
        CHECK(TMarkovSequenceLengthInBeats(sequence.mSymbols) == 12.0);
    }

    auto steady = SeededModel(1, {"(4,C);(4,C);(4,C);(4,F);(4,C)"});
    options = OptionsFor(steady, "(12,U)", 300);
    options.mAllEqualFactor = 0.0;
    sequences.clear();
    steady.SampleSequenceWithLength(chosen, sequences, false, options);
    REQUIRE_FALSE(sequences.empty());
    for (const auto& sequence : sequences) CHECK_FALSE(sequence.AllElementsAreEqual());
}

TEST_CASE("One seed makes one sequence") {
    const auto make = [] {
        auto model = SongModel(3);
        TMarkovSampledSequence chosen;
        std::vector<TMarkovSampledSequence> sequences;
        model.SampleSequenceWithLength(chosen, sequences, true, OptionsFor(model, "(64,U)", 5));
        return test::FormOf(chosen.mSymbols);
    };
    CHECK(make().size() > 10);
    CHECK(make() == make());
}

TEST_CASE("A template of 10,000 beats is filled") {
    auto model = SongModel(4);
    const auto options = OptionsFor(model, "(4,C);(9992,U);(4,C)", 1);
    TMarkovSampledSequence chosen;
    std::vector<TMarkovSampledSequence> sequences;
    model.SampleSequenceWithLength(chosen, sequences, true, options);
    CHECK(TMarkovSequenceLengthInBeats(chosen.mSymbols) == 10000.0);
}

TEST_CASE("What cannot be made ends without a result") {
    struct CRow {
        const char* mWhy;
        std::string mLearned;
        std::string mTemplate;
        bool mRecursive;
    };
    const std::vector<CRow> rows{
        {"chords of two beats do not fill three", "(2,C);(2,G);(2,C)", "(3,U)", true},
        {"the same, freely", "(2,C);(2,G);(2,C)", "(3,U)", false},
        {"E was never learned", "(4,C);(4,G);(4,C)", "(4,C);(4,U);(4,E)", true},
        {"chords without length do not get on", "(0,C);(0,G);(0,C);(0,F);(0,C)", "(8,U)", true},
        {"the same, freely", "(0,C);(0,G);(0,C)", "(8,U)", false},
        {"chords go back in time", "(-1,C);(1,G);(-1,C);(1,C)", "(8,U)", true},
        {"chords below one beat", "(0.5,C);(0.5,G);(0.5,C)", "(8,U)", false},
        {"the length is no number", "(1e999,C);(-1e999,C)", "(8,U);(1e999,C);(-1e999,U)", true},
        {"a template without length", "(4,C);(4,G)", "(4,U);(-4,U)", true},
        {"no template", "(4,C);(4,G)", "", true},
    };
    for (const CRow& row : rows) {
        INFO(row.mWhy << ": " << row.mTemplate << " from " << row.mLearned);
        auto model = SeededModel(2, {row.mLearned});
        model.SetSearchLimits({20, 20000});
        TMarkovSampledSequence chosen;
        std::vector<TMarkovSampledSequence> sequences;
        model.SampleSequenceWithLength(chosen, sequences, row.mRecursive,
                                       OptionsFor(model, row.mTemplate, 1));
        CHECK(chosen.mSymbols.empty());
        CHECK(sequences.empty());
    }
}

TEST_CASE("A gap is filled by the chord that stands between its neighbours") {
    auto model = SongModel(2);
    const MarkovSequence sequence =
        model.IteratorSequenceForObjects(SymbolsOf("(4,Am);(4,F);(4,U);(4,G7)"));
    const MarkovSequence chords = model.IteratorSequenceForObjects(SymbolsOf("(4,C);(4,G7)"));
    int ofC = 0;
    int ofG7 = 0;
    for (int draw = 0; draw < 400; ++draw) {
        const MarkovIterator chord = model.FillGapInSequence(sequence);
        ofC += chord == chords[0] ? 1 : 0;
        ofG7 += chord == chords[1] ? 1 : 0;
    }
    // Am F went on to G7 once and to C once, each with the chance 1/2. G7 came behind F C, but
    // never behind F G7, so C gets 1/2 + 1 and G7 1/2.
    CHECK(ofC + ofG7 == 400);
    CHECK((ofC > 260 && ofC < 340));
    CHECK(sequence[2]->IsGap());
}

TEST_CASE("Of dead ends at one position the shortest histories are remembered") {
    VariableLengthMarkovModel model;
    const MarkovSequence chords =
        model.IteratorSequenceForObjects(SymbolsOf("(4,C);(4,F);(4,G);(4,Am);(4,C#);(4,Db)"));
    const auto history = [&](std::vector<std::size_t> places) {
        MarkovSequence symbols;
        for (const std::size_t place : places) symbols.push_back(chords[place]);
        return symbols;
    };
    TMarkovSamplingInformation info;
    info.AddToBlocklist(8.0, history({0, 1, 2}));
    info.AddToBlocklist(8.0, history({3, 1, 2}));
    info.AddToBlocklist(8.0, history({0, 2}));
    CHECK(info.BlocklistSize() == 3);
    CHECK_FALSE(info.IsBlocklisted(8.0, history({1, 2})));
    info.AddToBlocklist(8.0, history({1, 2}));
    CHECK(info.BlocklistSize() == 2);
    info.AddToBlocklist(8.0, history({3, 3, 1, 2}));
    CHECK(info.BlocklistSize() == 2);
    CHECK(info.IsBlocklisted(8.0, history({0, 0, 1, 2})));
    CHECK_FALSE(info.IsBlocklisted(8.0, history({2, 2})));
    CHECK_FALSE(info.IsBlocklisted(8.5, history({1, 2})));
    // C sharp and D flat are one in all tables.
    info.AddToBlocklist(4.0, history({4}));
    CHECK(info.IsBlocklisted(4.0, history({0, 5})));
    CHECK(info.mBlockedCount == 2);
    info.Clear(true);
    CHECK_FALSE(info.IsBlocklisted(8.0, history({1, 2})));
}
