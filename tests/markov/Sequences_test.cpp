// SPDX-License-Identifier: MIT
#include "MarkovForms.h"

#include "brindle/markov/DrawMarkovSequences.h"
#include "brindle/markov/FillMarkovGaps.h"
#include "brindle/markov/MarkovContinuations.h"
#include "brindle/markov/ReadMarkovSequence.h"
#include "brindle/platform/SeededRandom.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <numeric>

using namespace brindle;
using namespace brindle::test;

namespace {

MarkovSequence TypedSequence(VariableLengthMarkovModel& model, const char* chords) {
    return model.IteratorSequenceForObjects(ReadMarkovSequence(chords).mSymbols);
}

void UseSeed(VariableLengthMarkovModel& model) {
    model.SetRandomSource([random = SeededRandom(5)]() mutable { return random.Next(); });
}

}  // namespace

TEST_CASE("Typed sequences are read as people type them, or their fault is told") {
    struct CRow {
        const char* mText;
        std::size_t mCount;
        const char* mError;
    };
    const char* const wanted =
        "chords with their lengths in beats are wanted, as in \"(4,C);(8,U);(4,G7)\"";
    const CRow rows[] = {
        {"(4,C);(8,U);(4,G7)", 3, ""},
        {"( 4 , C ) ; (4,G7) ;", 2, ""},
        {"(4,F\xE2\x99\xAFm);(4,B\xE2\x99\xAD)", 2, ""},
        {"(4,Gm(maj7))", 1, ""},
        {"(4,C);(4,Xyz)", 0, "Xyz is no chord; a gap is U"},
        {"(0,C)", 0, wanted},
        {"(2000000,C)", 0, wanted},
        {"C F", 0, wanted},
        {"", 0, wanted},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        const CMarkovSequenceText read = ReadMarkovSequence(row.mText);
        CHECK(read.mSymbols.size() == row.mCount);
        CHECK(read.mError == row.mError);
    }
    CHECK(ReadMarkovSequence("(2,U)").mSymbols.front().IsGap());
    CHECK(ReadMarkovSequence("(2,U)").mSymbols.front().mChord.mLength == 2.0);
}

TEST_CASE(
    "A gap is filled by the chord of its length, with shorter histories where long ones fail") {
    VariableLengthMarkovModel model(3);
    UseSeed(model);
    Learn(model, "(4,C);(4,F);(4,G7);(4,C)");
    Learn(model, "(4,C);(2,F);(4,G7);(4,C)");
    const MarkovSequence known = TypedSequence(model, "(4,C);(2,U);(4,G7);(4,C)");
    const auto filled = FillMarkovGaps(model, known);
    REQUIRE(filled.has_value());
    CHECK(*filled == TypedSequence(model, "(4,C);(2,F);(4,G7);(4,C)"));
    CHECK(model.mMaxHistoryLength == 3);
    // No history with Am was heard; F is what stands between C and G7.
    const auto other =
        FillMarkovGaps(model, TypedSequence(model, "(4,Am);(4,C);(4,U);(4,G7);(4,Am)"));
    REQUIRE(other.has_value());
    CHECK((*other)[2] == TypedSequence(model, "(4,F)").front());

    VariableLengthMarkovModel empty(2);
    CHECK_FALSE(FillMarkovGaps(empty, TypedSequence(empty, "(4,C);(4,U)")).has_value());
}

TEST_CASE("What followed a history comes by how often it did") {
    VariableLengthMarkovModel model(2);
    Learn(model, "(4,C);(4,F);(4,C);(4,G);(4,C);(4,G)");
    MarkovSequence history = TypedSequence(model, "(4,Am);(4,C)");
    const auto continuations = MarkovContinuations(model, history);
    CHECK(history == TypedSequence(model, "(4,C)"));  // Am was never heard
    REQUIRE(continuations.size() == 2);
    CHECK(continuations[0].mSymbol == TypedSequence(model, "(4,G)").front());
    CHECK(continuations[0].mCount == 2);
    CHECK(continuations[0].mProbability == doctest::Approx(2.0 / 3.0));
    MarkovSequence unknown = TypedSequence(model, "(4,Eb)");
    CHECK(MarkovContinuations(model, unknown).empty());
    CHECK(unknown.empty());
    const auto rows = HistoriesByLength(model);
    REQUIRE(rows.size() == 2);
    CHECK(rows[0].mEntropy > rows[1].mEntropy);
    CHECK(rows[0].mMaxEntropy >= rows[0].mEntropy);
}

TEST_CASE("Drawn sequences come by weight, and their shares are the whole") {
    VariableLengthMarkovModel model(1);
    UseSeed(model);
    Learn(model, "(4,C);(4,F);(4,C);(4,G);(4,C)");
    Learn(model, "(4,C);(4,G);(4,C);(4,G);(4,C)");
    CMarkovObject gap = CMarkovObject_Gap;
    gap.mChord.mLength = 20.0;
    TMarkovGenerateOptions options;
    options.mTemplate = model.IteratorSequenceForObjects({gap});
    options.mSampleCount = 50;
    options.Validate(model);
    const CMarkovDraws draws = DrawMarkovSequences(model, options);
    REQUIRE(draws.mSequences.size() > 1);
    REQUIRE(draws.mShares.size() == draws.mSequences.size());
    CHECK(std::accumulate(draws.mShares.begin(), draws.mShares.end(), 0.0) == doctest::Approx(1.0));
    CHECK(std::is_sorted(draws.mShares.rbegin(), draws.mShares.rend()));
}
