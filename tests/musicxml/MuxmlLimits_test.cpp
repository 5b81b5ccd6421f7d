// SPDX-License-Identifier: MIT
// What an import does where a file goes beyond the limits.

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/CTiePendingInfos.h"
#include "brindle/musicxml/MusicXmlParser.h"

#include <doctest/doctest.h>
#include <zip.h>

#include <ctime>
#include <memory>
#include <string>
#include <utility>
#include <vector>

using namespace brindle;

namespace {

std::string Repeated(int count, const std::string& piece) {
    std::string text;
    for (int n = 0; n < count; ++n) text += piece;
    return text;
}

std::string Score(const std::string& partList, const std::string& parts) {
    return "<score-partwise><part-list>" + partList + "</part-list>" + parts + "</score-partwise>";
}

std::string Part(const std::string& measure) {
    return "<part id=\"P\"><measure>" + measure + "</measure></part>";
}

// The bytes of an archive with one file.
std::string ZipOf(const char* name, const std::string& contents) {
    zip_source_t* const archiveSource = zip_source_buffer_create(nullptr, 0, 0, nullptr);
    zip_source_keep(archiveSource);
    zip_t* const archive = zip_open_from_source(archiveSource, ZIP_TRUNCATE, nullptr);
    zip_source_t* const source = zip_source_buffer(archive, contents.data(), contents.size(), 0);
    zip_file_add(archive, name, source, ZIP_FL_ENC_UTF_8);
    REQUIRE(zip_close(archive) == 0);
    zip_stat_t status;
    zip_source_stat(archiveSource, &status);
    std::string bytes(status.size, '\0');
    zip_source_open(archiveSource);
    zip_source_read(archiveSource, bytes.data(), bytes.size());
    zip_source_close(archiveSource);
    zip_source_free(archiveSource);
    return bytes;
}

// Time of the processor, so that other work of the machine does not count. Generous, for slow
// machines and sanitizers: what is not linear takes minutes.
constexpr double kMaxSeconds = 20;

double SecondsSince(std::clock_t begin) {
    return static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC;
}

}  // namespace

TEST_CASE("What a score says once is looked through once, however often it is needed") {
    const std::string many = Repeated(100'000, "<a/>");
    std::string manyParts;
    for (int n = 0; n < 20'000; ++n) {
        manyParts += "<part id=\"" + std::to_string(n) + "\"><measure/></part>";
    }
    const struct {
        const char* mWhat;
        std::string mScore;
    } rows[] = {
        {"the texts of an instrument that all parts get",
         Score("<score-instrument>" + many + "</score-instrument>", Repeated(20'000, "<part/>"))},
        {"the first time signature of the document",
         Score("", Part("<attributes><time>" + many + "</time></attributes>") + manyParts)},
        {"a transposition that follows its keys",
         Score("", Part("<attributes>" + Repeated(20'000, "<key/>") + "<transpose>" + many +
                        "</transpose></attributes>"))},
        {"the ties of the first note of a chord",
         Score("", Part("<note><pitch/>" + Repeated(100'000, "<tie/>") + "</note>" +
                        Repeated(60'000, "<note><pitch/><chord/></note>")))},
    };
    for (const auto& row : rows) {
        INFO(row.mWhat);
        const std::clock_t begin = std::clock();
        CHECK(MusicXmlParser().parseBytes(row.mScore, std::make_shared<MusicXmlParserDelegate>()));
        CHECK(SecondsSince(begin) < kMaxSeconds);
    }
}

TEST_CASE("The name of the score is found soon in a list of files without end") {
    const std::string container = "<container>" + Repeated(300, "<rootfiles/>") + "</container>";
    const std::string packed =
        ZipOf("META-INF/container.xml", "<list>" + Repeated(3'000, container) + "</list>");
    std::string score;
    const std::clock_t begin = std::clock();
    const auto error = MusicXmlParser::unpackCompressedMusicXML(packed, score);
    CHECK(SecondsSince(begin) < kMaxSeconds);
    REQUIRE(error.has_value());
    CHECK(error->description ==
          "Compressed MusicXML file seems to be malformed (could not find ‘full-path’)");
    for (const auto& [list, found] : std::vector<std::pair<std::string, bool>>{
             {"<container><rootfiles><rootfile full-path='a'/></rootfiles></container>", true},
             {"<x><container><x><rootfiles><rootfile><x full-path='a'/></rootfile></rootfiles></x>"
              "</container></x>",
              true},
             {"<container><rootfile full-path='a'><rootfiles/></rootfile></container>", false},
             {"<rootfiles><container><rootfile full-path='a'/></container></rootfiles>", false}}) {
        const std::string logged(list);
        INFO(logged);
        const auto failure =
            MusicXmlParser::unpackCompressedMusicXML(ZipOf("META-INF/container.xml", list), score);
        REQUIRE(failure.has_value());
        CHECK((failure->description == "Could not create temporary conversion file") == found);
    }
}

TEST_CASE("A long name is not kept again for each clef, nor for each part of an identifier") {
    std::string font = "a";
    for (int n = 0; n < 600; ++n) font += "ü";
    std::size_t fontSize = 0;
    std::vector<std::size_t> nameSizes;
    const auto host = std::make_shared<MusicXmlParserDelegate>();
    host->didEncounterPartStart = [&](const CMuxmlPart& part) {
        nameSizes.push_back(part.mPartName.size());
    };
    host->didEncounterPartEnd = [&](const CMuxmlPartGatheredInfo& info) {
        if (!info.mClefs.empty()) fontSize = info.mClefs.back().mFontFamily.size();
    };
    const std::string name(5'000'000, 'n');
    CHECK(MusicXmlParser().parseBytes(
        Score("<score-part id=\"P\"><part-name>" + name + "</part-name></score-part>",
              Part("<attributes><clef font-family=\"" + font + "\"/></attributes><clef/>") +
                  Repeated(200, "<part id=\"P\"/>")),
        host));
    CHECK(fontSize == 999);  // whole letters
    REQUIRE(nameSizes.size() == 201);
    CHECK(nameSizes.front() == name.size());
    CHECK(nameSizes[1] == name.size());
    CHECK(nameSizes.back() == 0);
}

TEST_CASE("A time signature keeps some of its summands and adds all") {
    CMuxmlSignTime time;
    time.SetElementFromString("beats", Repeated(5'000, "1+") + "1");
    CHECK(time.mNomAkaBeats == 5'001);
    CHECK(time.mCompoundNomsAkaBeats.size() == kMuxmlMaxSummands);
}

TEST_CASE("No tie is opened while too many notes wait for the ends of theirs") {
    CTiePendingInfos ties;
    CMuxmlNote low;
    CMuxmlNote high;
    high.mPitch.mOctave = 1;
    for (std::size_t n = 0; n + 1 < kMuxmlMaxPendingNotes; ++n) ties.StartEncounteredFor(low, 1);
    ties.ContinueEncounteredFor(low, 10);
    ties.ContinueEncounteredFor(low, 100);
    REQUIRE(ties.PendingDurationFor(low) != nullptr);
    CHECK(ties.PendingDurationFor(low)->mPendingLengthAsMidiTicks == 111);
    CHECK(ties.PendingDurationFor(low)->mNotes.size() == 2);
    ties.StartEncounteredFor(high, 1);
    CHECK(ties.PendingDurationFor(high) == nullptr);
    ties.StopEncounteredFor(low);
    ties.StartEncounteredFor(high, 1);
    CHECK(ties.PendingDurationFor(high) != nullptr);
}
