// SPDX-License-Identifier: MIT
#include "brindle/present/ShowSong.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/XmlDocument.h"
#include "brindle/present/AnalysisJson.h"
#include "brindle/present/AnalysisSvg.h"
#include "brindle/present/KeysSvg.h"
#include "brindle/present/MakeSongKeys.h"
#include "brindle/song/AnalyseSong.h"
#include "brindle/song/ReadLeadSheet.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/SheetTimes.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <algorithm>
#include <nlohmann/json.hpp>
#include <string>
#include <variant>
#include <vector>

namespace brindle::test {
namespace {

/// "C 0-4; G 4-8", in the order of time.
std::string ShownChords(const CShownSong& song) {
    std::vector<CShownChord> chords;
    ForEachChord(song, [&](const CShownChord& chord) { chords.push_back(chord); });
    std::stable_sort(chords.begin(), chords.end(), [](const auto& a, const auto& b) {
        return a.mRange.mBegin < b.mRange.mBegin;
    });
    std::string text;
    for (const CShownChord& chord : chords) {
        text += fmt::format("{}{} {:g}-{:g}", text.empty() ? "" : "; ", chord.mSymbol,
                            chord.mRange.mBegin, chord.mRange.mEnd);
    }
    return text;
}

CShownSong Shown(const CSong& song) {
    return ShowSong(song, AnalyseSong(song));
}

TEST_CASE("Of several chords at one place the last one sounds and the others last no time") {
    CSong song = ReadSong("C F G C");
    song.mChords[2].mPosition = song.mChords[1].mPosition;
    const std::string shown = ShownChords(Shown(song));
    CAPTURE(shown);
    CHECK(shown.find("C 0-1") == 0);
    CHECK(shown.find("F 1-1") != shown.npos);
    CHECK(shown.find("G 1-3") != shown.npos);
    CHECK(shown.find("F 1-3") == shown.npos);
}

TEST_CASE("A length of bars that no music has is four beats") {
    struct CRow {
        int mNumerator;
        int mDenominator;
        double mBeats;
    };
    const CRow rows[] = {{3, 4, 3.0},       {6, 8, 3.0},    {1, 256, 1.0 / 64}, {1, 512, 4.0},
                         {1024, 4, 1024.0}, {1025, 4, 4.0}, {0, 4, 4.0},        {4, 0, 4.0}};
    for (const CRow& row : rows) {
        CAPTURE(row.mNumerator);
        CAPTURE(row.mDenominator);
        TMusicXMLDoc sheet;
        sheet.TimeSignatures.emplace_back();
        sheet.TimeSignatures.back().mNumerator = row.mNumerator;
        sheet.TimeSignatures.back().mDenominator = row.mDenominator;
        CHECK(BeatsPerBarOf(sheet) == row.mBeats);
    }
    CHECK(BeatsPerBarOf({}) == 4.0);
}

TEST_CASE("Without a time signature bars are as long as most of them") {
    TMusicXMLDoc sheet;
    for (const double position : {0.0, 1.0, 4.0, 7.0, 10.0}) {
        sheet.HarmBarlines.emplace_back();
        sheet.HarmBarlines.back().mPosition = position;
    }
    CHECK(BeatsPerBarOf(sheet) == 3.0);
}

TEST_CASE("Any song becomes a picture and JSON without a command line") {
    const CSong song = ReadSong("Title: Piece\nTime Signature: 3/4\nm0 b3 C: V\nm1 I\nm2 V7\nm3 I");
    CAnalyseSongOptions options;
    options.mReadings = true;
    const CSongAnalysis found = AnalyseSong(song, options);
    const CShownSong shown = ShowSong(song, found);
    CHECK(ShownChords(shown) == "G 0-1; C 1-4; G7 4-7; C 7-10");
    CHECK(shown.mBarStarts == std::vector<double>{0.0, 1.0, 4.0, 7.0});
    CHECK(shown.mScore.mTitle == "Piece");
    REQUIRE(shown.mScore.mTimes.size() == 1);
    CHECK(shown.mScore.mTimes[0].mName == "3/4");
    CHECK(shown.mHasReadings);
    CHECK(AnalysisSvg(shown).find("G7") != std::string::npos);
    const auto json = nlohmann::json::parse(AnalysisJson(song, found));
    CHECK(json.contains("Readings"));
    CHECK(json.at("HarmSignKeys").size() == found.mAnalyse.mSignKeys.size());

    const CShownSong even = Shown(ReadSong("C | F | G | C |"));
    CHECK(even.mBarStarts.empty());
    CHECK_FALSE(even.mHasReadings);
    CHECK(ShownChords(Shown(CSong())).empty());
}

TEST_CASE("JSON of a score tells its bars, times and repeats, whichever form it was read in") {
    const std::string score =
        "<score-partwise><part-list><score-part id='P'/></part-list><part id='P'>"
        "<measure number='1'><barline location='left'><repeat direction='forward'/></barline>"
        "<attributes><divisions>1</divisions><time><beats>3</beats><beat-type>4</beat-type></time>"
        "</attributes><direction><direction-type><rehearsal>A</rehearsal></direction-type>"
        "</direction><harmony><root><root-step>C</root-step></root><kind>major</kind></harmony>"
        "<note><rest/><duration>3</duration></note></measure>"
        "<measure number='2'><harmony><root><root-step>G</root-step></root><kind>dominant</kind>"
        "</harmony><note><rest/><duration>3</duration></note>"
        "<barline location='right'><repeat direction='backward'/></barline></measure>"
        "</part></score-partwise>";
    const CSong song = ReadSong(score);
    const auto json = nlohmann::json::parse(AnalysisJson(song, AnalyseSong(song)));
    CHECK(json.at("Score") ==
          nlohmann::json::parse(
              R"({"Bars":[0,3,6,9],"Copies":[{"LengthBars":2,"Position":6,"SourceOffsetBars":-2}],)"
              R"("Sections":[{"IsFirst":true,"Position":0},{"IsFirst":false,"Position":6}],)"
              R"("TimeSignatures":[{"Denominator":4,"Numerator":3,"Position":0}],"Title":""})"));
    const CLeadSheetReading sheet = ReadLeadSheet(score, TLeadSheetTiming::Played);
    REQUIRE_FALSE(sheet.mFault);
    CHECK(nlohmann::json::parse(AnalysisJson(sheet.mSheet, AnalyseSheet(sheet.mSheet))) == json);
    const CSong typed = ReadSong("C | G");
    CHECK(AnalysisJson(typed, AnalyseSong(typed)).find("\"Score\"") == std::string::npos);

    for (const auto timing : {TLeadSheetTiming::Played, TLeadSheetTiming::Native}) {
        const CLeadSheetReading broken = ReadLeadSheet("<score-partwise>\n</part>", timing);
        REQUIRE(broken.mFault);
        CHECK(FaultWithPlace(*broken.mFault).starts_with("2:"));
    }
}

TEST_CASE("A copy ends where its last chord ends, as does its source") {
    const CSong song = ReadSong("C | F | G7 | C | Am | C | F | G7 | C | Dm");
    const CShownSong shown = ShowSong(song, AnalyseSong(song, {.mCopies = true}));
    REQUIRE(shown.mCopies.size() == 1);
    CHECK(shown.mCopies[0].mSource.mBegin == 0.0);
    CHECK(shown.mCopies[0].mSource.mEnd == 16.0);
    CHECK(shown.mCopies[0].mTarget.mBegin == 20.0);
    CHECK(shown.mCopies[0].mTarget.mEnd == 36.0);
}

TEST_CASE("The pictures of a song tell a screen reader what they show") {
    const CShownSong song = Shown(ReadSong("Dm7 G7 | C C"));
    for (const std::string& svg : {AnalysisSvg(song), KeysSvg(song)}) {
        CHECK(svg.find("<svg xmlns=\"http://www.w3.org/2000/svg\" role=\"img\" ") != svg.npos);
        CHECK(svg.find("</title>\n<desc>") != svg.npos);
        CHECK(svg.find(" in time. C major: Dm7 G7 C C</desc>") != svg.npos);
    }
    CSong stated = ReadSong("Dm7 G7 | C C");
    stated.mStatedKey = CSignKeyLite({4, TEnh_n}, TSignKeyType_Minor);
    CShownSong contradicting = Shown(stated);
    contradicting.mKeys =
        MakeSongKeys(stated, ReadHarmony(stated.mChords, {.mStatedKey = *stated.mStatedKey}));
    CHECK(contradicting.mKeys.mName == "E minor");
    for (const std::string& svg : {AnalysisSvg(contradicting), KeysSvg(contradicting)}) {
        const std::string_view word = "E minor is the stated key; the chords alone would show";
        CHECK(svg.find(word, svg.find("</desc>")) != svg.npos);
        CHECK(svg.find(word) < svg.find("</desc>"));
    }
    std::string text;
    for (int i = 0; i < 2000; ++i) text += "C7 F | ";
    CShownSong hostile = Shown(ReadSong(text));
    hostile.mKeys.mRegions.at(0).mChords.at(0).mSymbol = "<&\x01" + std::string(10'000, 'x');
    for (const std::string& svg : {AnalysisSvg(hostile), KeysSvg(hostile)}) {
        CHECK(std::holds_alternative<XmlDocument>(
            XmlDocument::FromBytes(svg.substr(0, svg.find("</desc>") + 7) + "</svg>")));
        CHECK(svg.find("</desc>") - svg.find("<desc>") < 700);
    }
}

}  // namespace
}  // namespace brindle::test
