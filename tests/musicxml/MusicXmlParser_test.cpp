// SPDX-License-Identifier: MIT
#include "EventLog.h"

#include "brindle/musicxml/MusicXmlContext.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <filesystem>
#include <fstream>

using namespace brindle;
using nlohmann::json;

namespace {

namespace fs = std::filesystem;

std::int32_t PositionOf(const json& number) {
    return number.is_string() ? kMuxmlUndef : number.get<std::int32_t>();
}

json FormOfPosition(std::int32_t position) {
    return position == kMuxmlUndef ? json("Undef") : json(position);
}

CMuxmlSignTime SignTimeOf(const json& form) {
    CMuxmlSignTime time;
    for (const char* element : {"beats", "beat-type"}) {
        time.SetElementFromString(element, form.at(element).get<std::string>());
    }
    return time;
}

json NoteForm(const json& note) {
    const auto position = [&note](const char* name) {
        return FormOfPosition(note.value(name, kMuxmlUndef));
    };
    return {position("mPositionAsMidiTicks"), position("mLengthAsMidiTicks"),
            note.value("mNoteNr", -1), note.value("mVelocity", 255), note.value("mVoice", 0)};
}

json LeadSheetForm(const std::string& file) {
    const test::CEventLog log = test::ImportFile(BRINDLE_TEST_DATA "/leadsheets/" + file);
    json calls = json::object();
    json notes = json::array();
    for (const json& entry : log.mCalls) {
        const std::string call = entry.at("call");
        calls[call] = calls.value(call, 0) + 1;
        if (call == "didEncounterNote") notes.push_back(NoteForm(entry));
    }
    return {{"ok", log.mOk}, {"calls", calls}, {"notes", notes}};
}

// What the expected files say besides the fields of records, worked out by the library.
struct CExtras {
    std::vector<json> mByCall;
    std::shared_ptr<MusicXmlParserDelegate> mHost = std::make_shared<MusicXmlParserDelegate>();

    CExtras() {
        mHost->didEncounterPartStart = [this](const CMuxmlPart& part) {
            mByCall.push_back({{"FindBestPartName", part.FindBestPartName()}});
        };
        mHost->didEncounterSignKey = [this](const CMuxmlSignKey& key) {
            const auto form = [](const CSignKeyHeavy& heavy) -> json {
                return {heavy.RootKeyNr(), static_cast<int>(heavy.RootNote().mEnh),
                        static_cast<int>(heavy.SignKeyType())};
            };
            mByCall.push_back(
                {{"ConvertToCSignKeyTransposedPitch", form(key.ConvertToCSignKeyTransposedPitch())},
                 {"ConvertToCSignKeySoundingPitch", form(key.ConvertToCSignKeySoundingPitch())}});
        };
        mHost->didEncounterPartEnd = [this](const CMuxmlPartGatheredInfo& info) {
            mByCall.push_back({{"IsPianoPartAtBegin", info.IsPianoPartAtBegin()}});
        };
    }
};

void LeaveOutHugeFractions(json& call, const char* name) {
    if (!call.contains(name)) return;
    json kept = json::array();
    for (const json& fraction : call.at(name)) {
        if (fraction.at(0) <= std::uint32_t{0xFFFFFFFF}) kept.push_back(fraction);
    }
    call[name] = kept;
}

// What the expected files write although it is the value of a fresh record.
json AlwaysWritten(const std::string& call) {
    if (call == "didEncounterNote") return {{"mNoteNr", -1}, {"mLengthAsMidiTicks", "Undef"}};
    if (call == "didEncounterSignKey") return {{"mFifths", 0}, {"mMode", 0}};
    if (call == "didEncounterSignTime") {
        return {{"mNomAkaBeats", 4}, {"mDenomAkaBeatTypeAsInt", 4}};
    }
    if (call == "didEncounterClef") return {{"mSign", 6}, {"mStaffLine", 0}};
    if (call == "didEncounterTranspose") return {{"mDiatonic", 0}, {"mChromatic", 0}};
    if (call == "didEncounterPartEnd") {
        return {{"mClefs", json::array()}, {"mLowestNoteNr", -1}, {"mHighestNoteNr", -1}};
    }
    return json::object();
}

// Our calls in the form of the expected files.
std::vector<json> CallsOf(const std::string& path) {
    test::CEventLog log = test::ImportFile(path);
    CExtras extras;
    CHECK(MusicXmlParser().parseURL(path, extras.mHost));
    auto extra = extras.mByCall.begin();
    for (json& call : log.mCalls) {
        const std::string name = call.at("call");
        if (name == "didEncounterPartStart" || name == "didEncounterSignKey" ||
            name == "didEncounterPartEnd") {
            REQUIRE(extra != extras.mByCall.end());
            call.update(*extra++);
        }
        const json always = AlwaysWritten(name);
        for (const auto& [field, value] : always.items()) call.emplace(field, value);
        LeaveOutHugeFractions(call, "mFoundBinaryAndTripletNotePosInBarAsDurDiv");
        LeaveOutHugeFractions(call, "mFoundBinaryAndTripletNoteLengthsAsDurDiv");
    }
    log.mCalls.push_back({{"call", "result"}, {"ok", log.mOk}});
    return log.mCalls;
}

// The lines of an expected file without what only stands for a reference to an element.
std::vector<json> ExpectedCalls(const fs::path& path) {
    std::ifstream stream(path);
    std::vector<json> calls;
    std::string line;
    std::getline(stream, line);  // the heading
    while (std::getline(stream, line)) {
        calls.push_back(json::parse(line));
        calls.back().erase("mStaffDetailsXML");
        if (!calls.back().contains("mClefs")) continue;
        for (json& clef : calls.back().at("mClefs")) clef.erase("mStaffDetailsXML");
    }
    return calls;
}

}  // namespace

TEST_CASE("Durations are ticks, percentages are velocities, and bars have lengths") {
    const auto context = [](const json& state) {
        MusicXmlContext result(state.at("TicksPerQuarter"));
        result.CurrentDivisionsPQN = state.at("CurrentDivisionsPQN");
        return result;
    };
    test::CheckExpected(
        "muxml_times",
        {
            {"ConvertMuxmlDurationToMidiTicks",
             [&](const json& in) {
                 return FormOfPosition(
                     context(in.at(0)).ConvertMuxmlDurationToMidiTicks(PositionOf(in.at(1))));
             }},
            {"ConvertMuxmlDynamicsToMidiVelocity",
             [](const json& in) {
                 return MusicXmlContext::ConvertMuxmlDynamicsToMidiVelocity(in.at(0));
             }},
            {"ConvertMuxmlDynamicsToMidiRelVelocity",
             [](const json& in) {
                 return MusicXmlContext::ConvertMuxmlDynamicsToMidiRelVelocity(in.at(0));
             }},
            {"BarLengthFromDivisisionsPQNAsDuration",
             [](const json& in) {
                 return SignTimeOf(in.at(0)).BarLengthFromDivisisionsPQNAsDuration(in.at(1));
             }},
            {"SetElementFromString",
             [](const json& in) {
                 const CMuxmlSignTime time = SignTimeOf(in.at(0));
                 return json{{"mNomAkaBeats", time.mNomAkaBeats},
                             {"mCompoundNomsAkaBeats", time.mCompoundNomsAkaBeats},
                             {"mDenomAkaBeatTypeAsInt", time.mDenomAkaBeatTypeAsInt}};
             }},
        });
}

TEST_CASE("The notes of lead sheets stand in time") {
    test::CheckExpected("leadsheet_notes",
                        {{"parseURL", [](const json& in) { return LeadSheetForm(in.at(0)); }}});
}

TEST_CASE("A host is told all of a score in its order") {
    int files = 0;
    for (const auto& entry : fs::directory_iterator(BRINDLE_TEST_DATA "/expected/scores")) {
        const std::string extension = entry.path().extension();
        if (extension != ".musicxml" && extension != ".mxl") continue;
        ++files;
        INFO(entry.path().filename().string());
        fs::path expectedPath = entry.path();
        expectedPath.replace_extension(".events.jsonl");
        const std::vector<json> expected = ExpectedCalls(expectedPath);
        const std::vector<json> calls = CallsOf(entry.path());
        for (std::size_t n = 0; n < std::min(calls.size(), expected.size()); ++n) {
            CHECK_MESSAGE(test::Agrees(expected[n], calls[n], 0.0),
                          "line " << n + 2 << "\n  expected " << expected[n].dump()
                                  << "\n  got      " << calls[n].dump());
        }
        CHECK(calls.size() == expected.size());
    }
    CHECK(files == 14);
}

TEST_CASE("A quartet with a bit of everything is told as it sounds") {
    const test::CEventLog log = test::ImportFile(BRINDLE_TEST_DATA "/scores/everything.musicxml");
    REQUIRE(log.mOk);
    // Position, length, note, velocity and voice of each note, part after part.
    const json parts = json::parse(R"([
        [[0,960,67,90,1],[3720,120,71,90,1],[3840,1440,72,105,1],[5280,480,74,90,1],
         [5760,320,75,90,1],[6080,320,74,90,1],[6400,320,72,90,1],[6720,6720,70,90,1],
         [13440,960,77,90,2],[13440,1920,68,90,1]],
        [[0,960,46,90,5],[3840,3840,62,90,1],[3840,3840,65,90,1],[3840,3840,70,90,1],
         [4800,960,55,90,2],[3840,3840,34,105,5],[7680,1440,69,90,1],[9120,960,67,90,1],
         [10080,1920,66,90,1],[12000,1920,61,90,1]],
        [[3840,960,65,90,1],[4800,960,72,90,1],[4800,960,79,90,1],[5760,1920,-1,90,1]],
        [[0,768,70,90,1],[768,768,72,90,1],[1536,768,74,90,1],[2304,768,75,90,1],
         [3072,768,77,90,1]]])");
    json told = json::array();
    for (const json& call : log.mCalls) {
        if (call.at("call") == "didEncounterPartStart") told.push_back(json::array());
        if (call.at("call") == "didEncounterNote") told.back().push_back(NoteForm(call));
    }
    CHECK(told == parts);
    const json clarinet = log.Of("didEncounterNote");
    CHECK(clarinet.at(4).at("mTuplet").at("mTupletActual").dump() ==
          R"({"mTupletNumber":{"CMuxmlFontAndColor":{"CMuxmlFont":{"mFontSize":8}},)"
          R"("mTupletNumber":3},"mTupletType":{"mTupletType":7}})");
    CHECK(clarinet.at(9).at("mScoop").at("CMuxmlLine").at("mLineType") == 3);
    const auto ends = log.Of("didEncounterPartEnd");
    CHECK(ends.at(1).at("mPositionedStaves") == json::parse("[[0,2],[3840,0]]"));
    CHECK(log.Of("didEncounterPartStart").at(3).at("mHasStringInstrument") == true);
}
