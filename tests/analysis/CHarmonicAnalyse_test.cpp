// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/analysis/CHarmonicAnalyse.h"
#include "brindle/analysis/TChordStringParse.h"

#include <doctest/doctest.h>

#include <filesystem>
#include <fstream>
#include <iterator>
#include <random>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// [text, [[key, enh, type, position]...], route]
json AnalyseFromChordString(const json& in) {
    CHarmAnlsSignKeys signKeys;
    for (const json& form : in.at(1)) {
        CHarmAnlsSignKey& signKey = signKeys.emplace_back();
        signKey.mSignKey = {{form.at(0), EnhOf(form.at(1))}, form.at(2).get<TSignKeyType>()};
        signKey.mPosition = form.at(3) == "Undef" ? kPosUndef : form.at(3).get<double>();
    }
    CHarmonicAnalyse analyse;
    analyse.AnalyseFromChordString(in.at(0).get<std::string>(), signKeys, in.at(2).get<TAnalyse>(),
                                   TChordStringParse());
    return JSONStringOf(analyse);
}

std::filesystem::path TemporaryPath() {
    return std::filesystem::temp_directory_path() /
           ("brindle_analysis_" + std::to_string(std::random_device()()));
}

std::string ContentOf(const std::filesystem::path& path) {
    std::ifstream file(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(file), {}};
}

}  // namespace

TEST_CASE("Without a route the chords are laid out and nothing is found") {
    CheckExpected("analysis_json_none",
                  {{"CHarmonicAnalyse::AnalyseFromChordString", AnalyseFromChordString}});
}

TEST_CASE("All chords go into the last center of the last given sign key") {
    CHarmAnlsSignKeys signKeys(2);
    signKeys[0].mSignKey = {{7, TEnh_n}, TSignKeyType_Major};
    signKeys[0].mHarmCenters.resize(1);
    signKeys[1].mSignKey = {{9, TEnh_n}, TSignKeyType_Minor};
    signKeys[1].mPosition = 8.0;
    const CHarmAnlsChords chords("Am Dm/F", TChordStringParse());
    CHarmonicAnalyse analyse;
    for (int run = 0; run < 2; ++run) {  // an entry replaces what the entry before it left
        analyse.AnalyseFromChords(chords, signKeys, TAnalyse_None);
        REQUIRE(analyse.mSignKeys.size() == 2);
        const CHarmAnlsCenters& last = analyse.mSignKeys[1].mHarmCenters;
        REQUIRE(last.size() == 1);
        CHECK(last[0].mPosition == 8.0);
        CHECK(last[0].mHarmCenter == CHarmCenterLite({9, TEnh_n}, kSemitonesNaturalMinor));
        REQUIRE(last[0].mChords.size() == 3);
        CHECK(last[0].mChords[1].mRootDistToHarmCenter == 5);
        CHECK(last[0].mChords[1].mBassDistToHarmCenter == 8);
        // The input itself is left as it came, also when it is handed in again.
        CHECK(analyse.mChords == chords);
        analyse.AnalyseFromChords(analyse.mChords, analyse.mSignKeys, TAnalyse{77});
        CHECK(analyse.mChords == chords);
    }
}

TEST_CASE("A host fills the object by hand, and neighbours in the same key join") {
    CHarmonicAnalyse analyse;
    analyse.Analyse(TAnalyse_None);
    CHECK(analyse.mSignKeys.empty());

    CHarmAnlsSignKey aMajor;
    aMajor.mSignKey = {{9, TEnh_n}, TSignKeyType_Major};
    const CHarmAnlsChordWithPos e(CChordLite({4, TEnh_n}, CKeyEnh_Undef, CSemitones(145)), 1.0);
    for (int i = 0; i < 2; ++i) {
        const auto signKey = analyse.FillManually_AppendSignKey(aMajor);
        const auto center = analyse.FillManually_AppendHarmCenterInSignKey(signKey, {});
        CHECK(*analyse.FillManually_AppendChordInHarmCenter(center, e) == e);
    }
    analyse.Analyse(TAnalyse_None);
    REQUIRE(analyse.mSignKeys.size() == 1);
    REQUIRE(analyse.mSignKeys[0].mHarmCenters.size() == 1);
    CHECK(analyse.mSignKeys[0].mHarmCenters[0].mHarmCenter.mRootKeyEnh.mKeyNr == 9);
    CHarmAnlsChords& chords = analyse.mSignKeys[0].mHarmCenters[0].mChords;
    analyse.ListAllHarmChords(chords);  // into a part of the object itself
    REQUIRE(chords.size() == 2);
    CHECK(chords[1].mRootDistToHarmCenter == 7);
}

TEST_CASE(
    "An undefined sign key is filled from the center that sorts last, B major at the latest") {
    for (const bool hasB : {false, true}) {
        CHarmAnlsSignKey signKey;
        for (const int keyNr : {0, hasB ? 11 : 7, 0}) {
            CHarmAnlsCenter& center = signKey.mHarmCenters.emplace_back();
            center.mHarmCenter = {{keyNr, TEnh_n}, kSemitonesMajor};
            center.mPosition = static_cast<double>(signKey.mHarmCenters.size());
        }
        CHarmonicAnalyse analyse;
        analyse.FillManually_AppendSignKey(signKey);
        analyse.Analyse(TAnalyse_None);
        CHECK(analyse.mSignKeys[0].mSignKey.mRootKeyEnh.mKeyNr == (hasB ? 11 : 15));
    }
}

TEST_CASE("A file is analysed by tonic progressions whatever the arguments ask for") {
    const auto path = TemporaryPath();
    std::ofstream(path) << "Dm7 G7\n\nC";
    TChordStringParse slow;
    slow.mBeatsPerChord = 8.0;
    CHarmonicAnalyse fromFile;
    fromFile.AnalyseFromChordStringFile(path.string(), CHarmAnlsSignKeys(3), TAnalyse_CenterWeights,
                                        slow);
    std::filesystem::remove(path);
    CHarmonicAnalyse fromText;
    fromText.AnalyseFromChordString("Dm7 G7 C", {}, TAnalyse_TonicProgressions, {});
    CHECK(JSONStringOf(fromFile) == JSONStringOf(fromText));

    // A file that is missing, or a folder, is an empty text.
    fromText.AnalyseFromChordString("", {}, TAnalyse_TonicProgressions, {});
    for (const auto& unreadable : {path, path.parent_path()}) {
        fromFile.AnalyseFromChordStringFile(unreadable.string(), {}, TAnalyse_None, {});
        CHECK(JSONStringOf(fromFile) == JSONStringOf(fromText));
    }
}

TEST_CASE(
    "The result goes to a file in the given mode, and a file that cannot be written is no harm") {
    CHarmonicAnalyse analyse;
    analyse.AnalyseFromChordString("C G7", {}, TAnalyse_None, TChordStringParse());
    const std::string text = JSONStringOf(analyse);
    const auto path = TemporaryPath();
    analyse.WriteAnalysisResultToFile(path.string(), 0);
    CHECK(ContentOf(path) == text);
    analyse.WriteAnalysisResultToFile(path.string(), 1);
    CHECK(ContentOf(path) == text + text);
    analyse.WriteAnalysisResultToFile(path.string(), 32);
    CHECK(ContentOf(path) == text);
    std::filesystem::remove(path);
    analyse.WriteAnalysisResultToFile(path.string(), 8);  // input as well: must exist
    CHECK_FALSE(std::filesystem::exists(path));
    analyse.WriteAnalysisResultToFile("/", 0);
}
