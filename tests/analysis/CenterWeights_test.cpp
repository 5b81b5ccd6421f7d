// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/analysis/CHarmCenterWeightAnalysis.h"
#include "brindle/analysis/TChordStringParse.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

CHarmAnlsChords ChordsOf(const std::string& text, double beatsPerChord = 1.0) {
    TChordStringParse parse;
    parse.mBeatsPerChord = beatsPerChord;
    return CHarmAnlsChords(text, parse);
}

json Detect(const CHarmAnlsChords& chords, CHarmCenterWeightAnalysisParams params = {}) {
    CHarmCenterWeightAnalysis analysis(params);
    CHarmAnlsCenters centers(3);
    analysis.DetectHarmCentersFromChords(chords, centers);
    json found = json::array();
    for (const auto& center : centers) {
        found.push_back({center.mPosition, test::FormOf(center.mHarmCenter.mRootKeyEnh),
                         center.mHarmCenter.mSemitones.Mask()});
    }
    return {{"centers", found}, {"mAmbiguous", analysis.mAmbiguous}};
}

}  // namespace

TEST_CASE("The key that most chords speak for weighs most") {
    CheckExpected(
        "center_weights",
        {{"CHarmCenterWeightAnalysis::DetectHarmCentersFromChords", [](const json& in) {
              return Detect(ChordsOf(in.at(0).get<std::string>(), in.at(1).get<double>()));
          }}});
}

TEST_CASE("Keys are weighed and chosen by the settings") {
    const auto found = [](const char* text, CHarmCenterWeightAnalysisParams params) {
        return Detect(ChordsOf(text), params).at("centers").dump();
    };
    CHECK(found("Am Dm F G", {}) == "[[0.0,[9,2],1453]]");
    CHECK(found("Am Dm F G", {0, 0}) == "[[0.0,[0,2],2741]]");
    CHECK(found("Am Dm F G", {0, 2}) == "[]");
    CHECK(found("Am Dm F G", {1, 1}) == "[]");
    CHECK(found("", {}) == "[]");
}

TEST_CASE("The dominant of a minor key needs its major third") {
    // Em is in C major, but not in A minor, so C major wins.
    CHECK(Detect(ChordsOf("Am Dm Em F G")).at("centers").dump() == "[[0.0,[0,2],2741]]");
}
