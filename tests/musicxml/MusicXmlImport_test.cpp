// SPDX-License-Identifier: MIT
// What becomes of a score note by note, and of files that were not made for players.

#include "EventLog.h"

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/platform/Alerts.h"
#include "brindle/platform/AtomicFile.h"

#include <doctest/doctest.h>
#include <sys/stat.h>
#include <boost/rational.hpp>

#include <cstdlib>
#include <ctime>
#include <filesystem>
#include <stdexcept>

using namespace brindle;
using nlohmann::json;

namespace {

namespace fs = std::filesystem;

const std::string kQuarters =
    "<attributes><divisions>1</divisions><time><beats>4</beats><beat-type>4</beat-type></time>"
    "</attributes>";

std::string Part(const std::string& measures, const std::string& id = "P1") {
    return "<score-partwise><part-list><score-part id=\"" + id +
           "\"><part-name>Part</part-name></score-part></part-list><part id=\"" + id + "\">" +
           measures + "</part></score-partwise>";
}

std::string Measure(const std::string& content) {
    return Part("<measure number=\"1\">" + kQuarters + content + "</measure>");
}

std::string Note(const std::string& step, const std::string& more = "",
                 const std::string& duration = "1") {
    return "<note><pitch><step>" + step + "</step><octave>4</octave></pitch><duration>" + duration +
           "</duration>" + more + "</note>";
}

std::string Tie(const char* type) {
    return std::string("<tie type=\"") + type + "\"/>";
}

/// Position, length and number of each note that is told; "?" for what is undefined.
std::string Notes(const test::CEventLog& log) {
    std::string text;
    for (const json& note : log.Of("didEncounterNote")) {
        const auto field = [&note](const char* name) {
            return note.contains(name) ? note.at(name).dump() : "?";
        };
        text += (text.empty() ? "" : " ") + field("mPositionAsMidiTicks") + ":" +
                field("mLengthAsMidiTicks") + ":" + field("mNoteNr");
    }
    return text;
}

/// The alerts that are shown while it lives.
struct CAlerts {
    std::vector<CAlert> mAlerts;

    CAlerts() {
        SetAlertHandler([this](const CAlert& alert) { mAlerts.push_back(alert); });
    }
    CAlerts(const CAlerts&) = delete;
    CAlerts& operator=(const CAlerts&) = delete;
    ~CAlerts() { SetAlertHandler({}); }
};

/// A folder for temporary files of this test alone.
struct CTemporaryFolder {
    fs::path mPath = fs::temp_directory_path() / ("brindle-import-" + std::to_string(getpid()));
    fs::path mFile = mPath / "ThornbankMusicXMLImport.xml";

    CTemporaryFolder() {
        fs::create_directories(mPath);
        setenv("TMPDIR", mPath.c_str(), 1);
    }
    CTemporaryFolder(const CTemporaryFolder&) = delete;
    CTemporaryFolder& operator=(const CTemporaryFolder&) = delete;
    ~CTemporaryFolder() {
        unsetenv("TMPDIR");
        fs::remove_all(mPath);
    }
};

const std::string kScores = BRINDLE_TEST_DATA "/expected/scores/";

// Time of the processor, so that other work of the machine does not count.
double SecondsToImport(const std::string& text) {
    const std::clock_t begin = std::clock();
    MusicXmlParser().parseBytes(text, std::make_shared<MusicXmlParserDelegate>());
    return static_cast<double>(std::clock() - begin) / CLOCKS_PER_SEC;
}

std::string Repeated(int count, const std::function<std::string(int)>& piece) {
    std::string text;
    for (int n = 0; n < count; ++n) text += piece(n);
    return text;
}

}  // namespace

TEST_CASE("Notes stand where chords, ties, grace notes, cues, backups and bars put them") {
    struct CCase {
        std::string mWhat;
        std::string mContent;
        std::string mNotes;
    };
    const std::string chord = "<chord/>";
    const std::string start = Tie("start");
    const std::string stop = Tie("stop");
    const std::vector<CCase> cases{
        {"a chord moves on once", Note("C") + Note("E", chord) + Note("G", chord) + Note("A"),
         "0:960:60 0:960:64 0:960:67 960:960:69"},
        {"a chain of ties is told once, where it begins",
         Note("C", start) + Note("C", stop + start, "2") + Note("C", stop) + Note("D"),
         "0:3840:60 3840:960:62"},
        {"a chain without an end is never told", Note("C", start) + Note("D"), "960:960:62"},
        {"an end without a beginning has no length", Note("C", stop) + Note("D"),
         "0:?:60 960:960:62"},
        {"another spelling is no tie",
         Note("C", start) +
             "<note><pitch><step>B</step><alter>1</alter><octave>3</octave></pitch>"
             "<duration>1</duration>" +
             stop + "</note>",
         "960:?:60"},
        {"voices tie by themselves",
         Note("C", start + "<voice>1</voice>") + Note("C", stop + "<voice>2</voice>") +
             Note("C", stop + "<voice>1</voice>"),
         "960:?:60 960:1920:60"},
        {"the older of two chains on a pitch closes first",
         Note("C", start) + Note("C", start, "2") + Note("C", stop) + Note("C", stop),
         "1920:1920:60 1920:2880:60"},
        {"a tied first note ties its chord, and what closes it opens a new chain",
         Note("C", start) + Note("E", chord) + Note("C", stop) + Note("E", chord) + Note("D"),
         "0:1920:60 1920:960:62"},
        {"only continued or unreadable ties are not told",
         Note("C", Tie("continue")) + Note("D", "<tie/>") + Note("E"), "1920:960:64"},
        {"grace notes take an eighth of a quarter before the beat",
         Note("C", "<grace/>") + Note("D") + Note("E", "<grace/>"), "0:120:60 0:960:62 840:120:64"},
        {"cues do not move on", Note("C", "<cue/>") + Note("D"), "0:960:60 0:960:62"},
        {"a backup stops at the bar",
         Note("C") + "<backup><duration>9</duration></backup>" + Note("D") +
             "<forward><duration>1</duration></forward>" + Note("E"),
         "0:960:60 0:960:62 1920:960:64"},
        {"a rest in a chord stays a rest",
         Note("C") + "<note><chord/><rest/><duration>1</duration></note>" + Note("D"),
         "0:960:60 960:960:62"},
        {"a negative length goes back to the bar", Note("C") + Note("D", "", "-5") + Note("E"),
         "0:960:60 960:-4800:62 0:960:64"},
        {"a note without length has none",
         "<note><pitch><step>C</step><octave>4</octave></pitch></note>" + Note("D"),
         "0:?:60 0:960:62"},
        {"a note that is none is not told", "<note><duration>2</duration></note>" + Note("D"),
         "0:960:62"},
        {"an unknown letter is no pitch", Note("H") + Note("D"), "0:960:? 960:960:62"},
    };
    for (const CCase& entry : cases) {
        INFO(entry.mWhat);
        const test::CEventLog log = test::ImportText(Measure(entry.mContent));
        CHECK(log.mOk);
        CHECK(Notes(log) == entry.mNotes);
    }
}

TEST_CASE("A closed chain carries the first note, the longer type and all lyrics in its element") {
    const std::string text = Measure(
        Note("C", Tie("start") + "<type>quarter</type><lyric><text>one</text></lyric>") +
        Note("C", Tie("stop") + Tie("start") + "<type>half</type><lyric><text>two</text></lyric>") +
        Note("C", Tie("stop") + "<type>eighth</type><lyric><text>three</text></lyric>"));
    std::string lyrics;
    const auto host = std::make_shared<MusicXmlParserDelegate>();
    host->didEncounterNote = [&lyrics](const CMuxmlNote& note) {
        CHECK(note.mGraphicalNoteType.mValue == TMuxmlEnum_NoteTypeValue_Quarter);
        CHECK(note.mLyricXMLs.size() == 1);
        for (const XmlNode& lyric : note.mNoteXML.descendants("lyric")) {
            lyrics += lyric.stringValue() + " ";
        }
    };
    CHECK(MusicXmlParser().parseBytes(text, host));
    CHECK(lyrics == "one two ");
}

TEST_CASE("Bars end by their time signature, whatever they hold") {
    struct CCase {
        const char* mTime;
        int mEnd;
    };
    for (const CCase& entry : {CCase{"<beats>4</beats><beat-type>4</beat-type>", 3840},
                               CCase{"<beats>3+2</beats><beat-type>8</beat-type>", 2400},
                               CCase{"<beats>2</beats><beat-type>3</beat-type>", 2560},
                               CCase{"<beats>2</beats><beat-type>7</beat-type>", 1096},
                               CCase{"<beats>4</beats><beat-type>0</beat-type>", 0},
                               CCase{"<beats/><beat-type>4</beat-type>", 0}}) {
        INFO(entry.mTime);
        const test::CEventLog log = test::ImportText(
            Part("<measure number=\"7\"><attributes><divisions>2</divisions><time>" +
                 std::string(entry.mTime) + "</time></attributes>" + Note("C") + "</measure>"));
        const json end = log.Of("didEncounterMeasureEnd").at(0);
        CHECK(end.at("mEndPositionAsMidiTicks") == entry.mEnd);
        CHECK(end.at("mNumber") == "7");
    }
}

TEST_CASE("A host hears only the methods that it has, and clefs only beside keys") {
    const std::string text = Measure(
        "<attributes><key><fifths>1</fifths></key><clef><sign>F</sign></clef></attributes>" +
        Note("C"));
    for (const bool hasKeys : {false, true}) {
        int clefs = 0;
        const auto host = std::make_shared<MusicXmlParserDelegate>();
        host->didEncounterClef = [&clefs](const CMuxmlClef&) { ++clefs; };
        if (hasKeys) host->didEncounterSignKey = [](const CMuxmlSignKey&) {};
        CHECK(MusicXmlParser().parseBytes(text, host));
        CHECK(clefs == (hasKeys ? 1 : 0));
    }
    CHECK(MusicXmlParser().parseBytes(text, nullptr));
}

TEST_CASE(
    "Scores in time order, without a list of parts or identifiers are told as far as they go") {
    test::CEventLog log = test::ImportText(
        "<score-timewise><part-list><score-part id=\"P1\"/></part-list>"
        "<measure><part id=\"P1\">" +
        Note("C") + "</part></measure></score-timewise>");
    std::string calls;
    for (const json& call : log.mCalls)
        calls += call.at("call").get<std::string>().substr(12) + " ";
    CHECK(calls == "DocumentStartWithProgressBarInfo SignTime PartStart PartEnd DocumentEnd ");
    CHECK(log.mCalls.front().at("in") == json::array({0}));

    log = test::ImportText(
        "<score-partwise><part-list><score-part id=\"\"><part-name>N</part-name>"
        "<score-instrument id=\"I1\"/></score-part></part-list>"
        "<part><measure>" +
        Note("C", Tie("start")) + Note("C", Tie("stop")) + "</measure></part></score-partwise>");
    CHECK(log.mOk);
    CHECK(Notes(log) == "0:1920:60");
    const json part = log.Of("didEncounterPartStart").at(0);
    CHECK_FALSE(part.contains("mPartName"));
    CHECK(part.at("mScoreInstruments").size() == 1);
}

TEST_CASE("Files that are no scores fail with an error and without a call") {
    struct CCase {
        const char* mText;
        const char* mDescription;
    };
    for (const CCase& entry :
         {CCase{"", "Line"}, CCase{"<score-partwise>", "Line 1"},
          CCase{"<score-partwise><part id='1'></score-partwise>", "Line 1, column"},
          CCase{"<opus/>", "File is not a MusicXML File"},
          CCase{"<!DOCTYPE score-partwise SYSTEM 'file:///etc/passwd' [<!ENTITY e SYSTEM "
                "'file:///etc/passwd'>]><opus>&e;</opus>",
                ""}}) {
        INFO(entry.mText);
        const test::CEventLog log = test::ImportText(entry.mText);
        CHECK_FALSE(log.mOk);
        CHECK(log.mCalls.empty());
        CHECK(log.mError.description.starts_with(entry.mDescription));
    }
    const test::CEventLog log = test::ImportText("<score-partwise-and-more/>");
    CHECK(log.mOk);
    CHECK(log.mCalls.size() == 2);
    CHECK(test::ImportFile(kScores + "no-such-file.xml").mError.domain == "NSCocoaErrorDomain");
}

TEST_CASE("A compressed score is unpacked to a file of its owner, and no link is followed") {
    const CTemporaryFolder folder;
    const fs::path victim = folder.mPath / "victim";
    REQUIRE(WriteFileAtomically(victim, "precious"));
    fs::create_symlink(victim, folder.mFile);
    CHECK(test::ImportFile(kScores + "compressed_lead.mxl").mOk);
    CHECK(ReadWholeFile(victim) == "precious");
    CHECK_FALSE(fs::is_symlink(folder.mFile));
    struct stat status {};
    REQUIRE(stat(folder.mFile.c_str(), &status) == 0);
    CHECK((status.st_mode & 07777) == 0600);

    fs::path url = kScores + "ties.musicxml";
    CHECK_FALSE(MusicXmlParser().wrapCompressedMusicXMLFile(&url).has_value());
    CHECK(url == kScores + "ties.musicxml");
    CHECK_FALSE(MusicXmlParser().wrapCompressedMusicXMLFile(nullptr).has_value());
    url = kScores + "compressed_lead.mxl";
    CHECK_FALSE(MusicXmlParser().wrapCompressedMusicXMLFile(&url).has_value());
    CHECK(url == folder.mFile);
}

TEST_CASE("Compressed files without a score have errors of their own") {
    const CTemporaryFolder folder;
    const fs::path bad = folder.mPath / "bad.mxl";
    REQUIRE(WriteFileAtomically(bad, "PK no archive"));
    test::CEventLog log = test::ImportFile(bad);
    CHECK(log.mError ==
          Error{"org.thornbank.host10", 259, "Could not decompress (compressed MusicXML file)"});

    // Its list of files is not well-formed.
    log = test::ImportFile(BRINDLE_TEST_DATA "/leadsheets/makin_whoopee.mxl");
    CHECK(log.mError.description ==
          "Compressed MusicXML file seems to be malformed (could not find ‘full-path’)");

    // A folder for temporary files that is not there.
    fs::remove_all(folder.mPath);
    fs::path url = kScores + "compressed_lead.mxl";
    const auto error = MusicXmlParser().wrapCompressedMusicXMLFile(&url);
    REQUIRE(error.has_value());
    CHECK(error->description == "Could not create temporary conversion file");

    REQUIRE(WriteFileAtomically(kScores + "../upper.MXL", "PK"));
    CHECK(test::ImportFile(kScores + "../upper.MXL").mError.domain == "NSXMLParserErrorDomain");
    fs::remove(kScores + "../upper.MXL");
}

TEST_CASE("Divisions of zero are an alert, and the next note has no place in the bar") {
    const CAlerts alerts;
    const std::string zero = "<attributes><divisions>0</divisions></attributes>";
    const std::string fives =
        "<time-modification><actual-notes>5</actual-notes><normal-notes>4</normal-notes>"
        "</time-modification>";
    const test::CEventLog log = test::ImportText(Measure(zero + Note("C", fives)));
    CHECK(Notes(log) == "0:0:60");
    REQUIRE(alerts.mAlerts.size() == 1);
    CHECK(alerts.mAlerts[0].messageText == "MusicXML Parsing Error");
    CHECK(alerts.mAlerts[0].informativeText.starts_with(
        "Parsing error 1, Description: MusicXML File contains zero or negative value for "
        "“divisions”, Line: 1, Column: "));
    CHECK(alerts.mAlerts[0].button == "OK");

    test::CEventLog broken;
    const auto host = test::HostFor(broken);
    CHECK_THROWS_AS(MusicXmlParser().parseBytes(Measure(zero + Note("C")), host),
                    boost::bad_rational);
    CHECK(broken.Of("didEncounterNote").empty());
    CHECK(test::ImportText(Measure(Note("C"))).mOk);  // the next import is not harmed

    const std::string many = Repeated(100, [&zero](int) { return zero; });
    CHECK(test::ImportText(Measure(many)).mOk);
    CHECK(alerts.mAlerts.size() == 2 + kMuxmlMaxAlerts);
}

TEST_CASE("What a host throws ends the import and reaches the caller") {
    const auto host = std::make_shared<MusicXmlParserDelegate>();
    host->didEncounterNote = [](const CMuxmlNote&) { throw std::runtime_error("enough"); };
    CHECK_THROWS_WITH(MusicXmlParser().parseBytes(Measure(Note("C")), host), "enough");
}

TEST_CASE("Instruments belong to all parts whose identifiers theirs hold") {
    const test::CEventLog log = test::ImportText(
        "<score-partwise><part-list>"
        "<score-part id=\"P1\"><score-instrument id=\"P1-I1\"><instrument-name>Violin"
        "</instrument-name><instrument-sound>Strings.Violin</instrument-sound></score-instrument>"
        "</score-part><score-part id=\"P10\"><score-instrument id=\"P10-I1\"/></score-part>"
        "</part-list><part id=\"P1\"/><part id=\"P10\"/></score-partwise>");
    const auto parts = log.Of("didEncounterPartStart");
    REQUIRE(parts.size() == 2);
    CHECK(parts[0].at("mScoreInstruments").size() == 2);
    CHECK(parts[0].at("mScoreInstruments")[0].at("mInstrumentSound") == "strings.violin");
    CHECK(parts[0].at("mHasStringInstrument") == true);
    CHECK(parts[1].at("mScoreInstruments").size() == 1);
}

TEST_CASE("Files made to do harm take no more time than others of their size") {
    const std::string start = Tie("start");
    const auto parts = [](int count, const std::string& id, const std::string& content) {
        return Repeated(count, [&](int n) {
            return "<part id=\"" + id + (id.empty() ? std::to_string(n) : "") + "\">" + content +
                   "</part>";
        });
    };
    const std::string manyNotes = Repeated(3000, [&](int) { return Note("C", start); });
    const std::string lyricNote = Note("C", start + "<lyric><text>a</text></lyric>") +
                                  Note("C", start + Tie("stop") + "<lyric/>") +
                                  Note("C", Tie("stop") + "<lyric/>");
    std::string deep = "</measure>";
    for (int n = 0; n < 240; ++n) deep = "<note>" + deep + "</note>";
    const std::vector<std::string> texts{
        Measure(manyNotes + Repeated(3000, [&](int) { return Note("D", Tie("stop")); })),
        Measure(Repeated(3000,
                         [](int n) {
                             return "<attributes><key/><clef/><transpose><diatonic>" +
                                    std::to_string(n) + "</diatonic></transpose></attributes>";
                         })),
        Measure("<note><rest/>" + Repeated(3000, [](int) { return "<notations/><notehead/>"; }) +
                "</note>"),
        "<score-partwise><part-list>" +
            Repeated(3000,
                     [](int) {
                         return "<score-part id=\"P1\"><score-instrument id=\"P1\"/></score-part>";
                     }) +
            "</part-list>" + parts(3000, "", "") + "</score-partwise>",
        "<score-partwise>" + parts(1, "P1", "<measure>" + manyNotes + "</measure>") +
            parts(2000, "P1", "<measure><note><rest/></note></measure>") + "</score-partwise>",
        "<score-partwise>" + parts(2000, "P1", "<measure>" + lyricNote + "</measure>") +
            "</score-partwise>",
    };
    for (const std::string& text : texts) {
        INFO(text.substr(0, 200));
        // Generous, for slow machines and sanitizers: what is not linear takes minutes.
        CHECK(SecondsToImport(text) < 20);
    }
    CHECK_FALSE(MusicXmlParser().parseBytes(Part("<measure>" + deep), nullptr));
}
