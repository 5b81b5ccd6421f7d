// SPDX-License-Identifier: MIT
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/AtomicFile.h"
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include <doctest/doctest.h>

#include <unistd.h>

#include <cmath>
#include <filesystem>
#include <string>

using namespace brindle;
using nlohmann::json;

namespace {

json NumberForm(double value) {
    if (value == kPosUndef) return "Undef";
    if (std::isinf(value) && value < 0) return "-Inf";
    return value;
}

json PitchForm(const TMusicXMLPitch& pitch) {
    return {{"mStep", pitch.mStep}, {"mAlter", pitch.mAlter}};
}

json HarmonyForm(const TMusicXMLHarmony& harmony) {
    json form{{"mPosition", NumberForm(harmony.mPosition)},
              {"mDuration", NumberForm(harmony.mDuration)},
              {"mRoot", PitchForm(harmony.mRoot)},
              {"mKind", harmony.mKind}};
    if (harmony.mBass.IsDefined()) form["mBass"] = PitchForm(harmony.mBass);
    for (const TMusicXMLDegree& degree : harmony.mDegrees) {
        form["mDegrees"].push_back(
            {{"mValue", degree.mValue}, {"mAlter", degree.mAlter}, {"mType", degree.mType}});
    }
    return form;
}

json DocForm(bool loaded, const TMusicXMLDoc& doc) {
    json form{{"LoadFromMusicXMLFile", loaded},       {"Title", doc.Title},
              {"HarmSignKeys", json::array()},        {"Harmonies", json::array()},
              {"ChordSequences", doc.ChordSequences}, {"TimeSignatures", json::array()},
              {"HarmSections", json::array()},        {"HarmCopies", json::array()},
              {"HarmBarlines", json::array()}};
    for (const CHarmAnlsSignKey& signKey : doc.HarmSignKeys) {
        form["HarmSignKeys"].push_back({{"mProbability", NumberForm(signKey.mProbability)},
                                        {"mPosition", NumberForm(signKey.mPosition)},
                                        {"mSignKey", test::FormOf(signKey.mSignKey)}});
    }
    for (const TMusicXMLHarmony& harmony : doc.Harmonies) {
        form["Harmonies"].push_back(HarmonyForm(harmony));
    }
    for (const TMusicXMLTimeSignature& time : doc.TimeSignatures) {
        form["TimeSignatures"].push_back({{"mPosition", NumberForm(time.mPosition)},
                                          {"mNumerator", time.mNumerator},
                                          {"mDenominator", time.mDenominator}});
    }
    for (const CHarmSection& section : doc.HarmSections) {
        form["HarmSections"].push_back({{"mPosition", NumberForm(section.mPosition)},
                                        {"mFlag1", section.mFlag1},
                                        {"mFlag2", section.mFlag2},
                                        {"mIsFirst", section.mIsFirst}});
    }
    for (const CHarmCopy& copy : doc.HarmCopies) {
        form["HarmCopies"].push_back(
            {{"mTargetPos", NumberForm(copy.mTargetPos)}, {"mLengthBars", copy.mLengthBars}});
    }
    return form;
}

void CheckFolder(const std::string& expected, const std::string& scores) {
    const std::filesystem::path data = BRINDLE_TEST_DATA;
    int checked = 0;
    for (const auto& entry : std::filesystem::directory_iterator(data / "expected" / expected)) {
        const std::string file = entry.path().filename().string();
        const std::size_t ending = file.find(".doc.json");
        if (ending == std::string::npos) continue;
        json wanted = json::parse(ReadWholeFile(entry.path()).value());
        wanted.erase("about");
        wanted.erase("fields");
        std::filesystem::path score = data / scores / file.substr(0, ending);
        for (const char* suffix : {".musicxml", ".xml", ".mxl"}) {
            if (std::filesystem::exists(score.string() + suffix)) score += suffix;
        }
        TMusicXMLDoc doc;
        const bool loaded = doc.LoadFromMusicXMLFile(score.string());
        const json got = DocForm(loaded, doc);
        CHECK_MESSAGE(test::Agrees(wanted, got, 1e-9),
                      score.filename().string()
                          << ": " << json::diff(wanted, got).dump().substr(0, 2000));
        ++checked;
    }
    CHECK(checked == 14);
}

std::string WriteTemporary(const std::string& text) {
    const auto path = std::filesystem::temp_directory_path() /
                      ("brindle_doc_test_" + std::to_string(getpid()) + ".musicxml");
    REQUIRE(WriteFileAtomically(path, text));
    return path.string();
}

}  // namespace

TEST_CASE("Scores are laid out in playing order") {
    CheckFolder("scores", "expected/scores");
}

TEST_CASE("Lead sheets are laid out in playing order") {
    CheckFolder("leadsheets", "leadsheets");
}

TEST_CASE("A repeat that never ends is cut, and the load says so") {
    const std::string path = WriteTemporary(
        "<score-partwise><part><measure><barline><repeat direction='forward'/></barline>"
        "<harmony><root><root-step>A</root-step></root><kind/></harmony>"
        "<note><duration>1</duration></note><barline><repeat direction='backward'/></barline>"
        "</measure><measure><direction><direction-type><words>4x</words></direction-type>"
        "</direction><barline><repeat direction='backward'/></barline></measure></part>"
        "</score-partwise>");
    TMusicXMLDoc doc;
    CHECK_FALSE(doc.LoadFromMusicXMLFile(path));
    CHECK(doc.Harmonies.size() > 1000);
    std::filesystem::remove(path);
}

TEST_CASE("What was read before a fault stays, and nothing is laid out") {
    const std::string path = WriteTemporary(
        "<score-partwise><movement-title>A &amp; B</movement-title><part><measure><attributes>"
        "<key><fifths>2</fifths><mode>minor</mode></key></attributes><harmony/></measure>");
    TMusicXMLDoc doc;
    CHECK_FALSE(doc.LoadFromMusicXMLFile(path));
    CHECK(doc.Title == "A & B");
    CHECK(doc.HarmSignKeys.size() == 1);
    CHECK(doc.Harmonies.empty());
    CHECK_FALSE(doc.LoadFromMusicXMLFile(path + ".missing"));
    std::filesystem::remove(path);
}
