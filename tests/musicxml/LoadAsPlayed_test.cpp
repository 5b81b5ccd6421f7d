// SPDX-License-Identifier: MIT
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/platform/Error.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <string>
#include <string_view>
#include <vector>

using namespace brindle;

namespace {

std::string Score(std::string_view measures) {
    return fmt::format("<score-partwise><part id='P1'>{}</part></score-partwise>", measures);
}

// One mark of a bar: "|:" and ":|", ":|3" for three times, "[1,2" and "]" for an ending, "$" for
// the segno, "@" for the coda sign, "=word=" for words, "{attributes}" for a sound instruction.
std::string MarkXml(const std::string& mark) {
    const auto barline = [](std::string_view place, std::string_view content) {
        return fmt::format("<barline location='{}'>{}</barline>", place, content);
    };
    const auto direction = [](std::string_view content) {
        return fmt::format("<direction><direction-type>{}</direction-type></direction>", content);
    };
    if (mark == "|:") return barline("left", "<repeat direction='forward'/>");
    if (mark == ":|") return barline("right", "<repeat direction='backward'/>");
    if (mark.compare(0, 2, ":|") == 0) {
        return barline("right",
                       fmt::format("<repeat direction='backward' times='{}'/>", mark.substr(2)));
    }
    if (mark == "]") return barline("right", "<ending number='1' type='stop'/>");
    if (mark[0] == '[') {
        return barline("left", fmt::format("<ending number='{}' type='start'/>", mark.substr(1)));
    }
    if (mark == "$") return direction("<segno/>");
    if (mark == "@") return direction("<coda/>");
    if (mark[0] == '=') {
        return direction(fmt::format("<words>{}</words>", mark.substr(1, mark.size() - 2)));
    }
    REQUIRE(mark[0] == '{');
    return fmt::format("<sound {}/>", mark.substr(1, mark.size() - 2));
}

// Bars of one quarter, each a chord on its letter: "A |:; B :|".
std::string Bars(std::string_view text) {
    std::string xml;
    std::size_t at = 0;
    while (at < text.size()) {
        std::string marks;
        const char root = text[at++];
        while (at < text.size() && text[at] != ';') {
            if (text[at] == ' ') {
                ++at;
                continue;
            }
            const char close = text[at] == '=' ? '=' : text[at] == '{' ? '}' : ' ';
            std::size_t end =
                text.find_first_of(close == ' ' ? " ;" : std::string(1, close), at + 1);
            if (close != ' ') ++end;
            marks += MarkXml(std::string(text.substr(at, std::min(end, text.size()) - at)));
            at = std::min(end, text.size());
        }
        at = std::min(text.size(), text.find_first_not_of("; ", at));
        xml += fmt::format(
            "<measure><attributes><divisions>1</divisions></attributes><harmony><root><root-step>{}"
            "</root-step></root><kind>major</kind></harmony><note><duration>1</duration></note>{}"
            "</measure>",
            root, marks);
    }
    return Score(xml);
}

std::string Roots(const TMusicXMLDoc& doc) {
    std::string roots;
    for (const TMusicXMLHarmony& harmony : doc.Harmonies) roots += harmony.mRoot.mStep;
    return roots;
}

TMusicXMLDoc Loaded(std::string_view score) {
    TMusicXMLDoc doc;
    Error error;
    CHECK_MESSAGE(doc.LoadAsPlayedFromBytes(score, &error), error.description);
    return doc;
}

// Root, kind, position and length of each harmony: "C major 0+4".
std::string Shown(const TMusicXMLDoc& doc) {
    std::string text;
    for (const TMusicXMLHarmony& harmony : doc.Harmonies) {
        if (!text.empty()) text += ", ";
        text +=
            fmt::format("{} {:g}+{:g}", harmony.mRoot.mStep, harmony.mPosition, harmony.mDuration);
    }
    return text;
}

}  // namespace

TEST_CASE("Repeats, endings and jumps are played as musicians play them") {
    struct CRow {
        std::string mBars;
        const char* mPlayed;
    };
    const CRow rows[] = {
        // Repeats go back to their sign, to the start, or behind the repeat before.
        {"A; B |:; C :|; D", "ABCBCD"},
        {"A; B :|; C; D :|; E", "ABABCDCDE"},
        {"A |: :|3; B", "AAAB"},
        {"A |:; B :| =3x=; C", "ABABABC"},
        {"A |: =play 3 times=; B :|; C", "ABABABC"},
        {"A |:; B :| =3 repeats=; C", "ABABABABC"},
        {"A |: {tempo='120'}; B :|1; C", "ABC"},
        {"A |: =play 3 times= :|; B :|; C", "AAABBC"},
        {"A; B {forward-repeat='yes'}; C :|", "ABCBC"},
        // Endings.
        {"A |:; B [1 ] :|; C [2 ]; D", "ABACD"},
        {"A |:; B [1,2 ] :|; C [3 ]; D", "ABABACD"},
        {"A |:; B [1-3 :|; C [4 ]; D", "ABABABACD"},
        {"A |:; B [1 ] :|; C [2 ] :|; D [3 ]; E", "ABACADE"},
        {"A |:; B [1 ] :|; C [2 ] :|; D", "ABACD"},
        {"A |:; B [1 ] :|; C; D", "ABACD"},
        {"A |:; B [1; C ] :|; D [2; E ]; F", "ABCADEF"},
        {"A |:; B [1 ]; C :|; D [2 ]; E", "ABCADE"},
        {"A |:; B [1 ] :|; C [3 ]; D", "ABACD"},
        {"A |:; B [1 ]; C [2 ]; D", "ABACD"},
        {"A |:; B [1 ] :|; C [2 ]; D |:; E [1 ] :|; F [2 ]", "ABACDEDF"},
        {"A |:; B [1 ] :|; C [2 ]; D |:; E [2 ] :|; F [2 ]; G", "ABACDEDFG"},
        // Jumps come after the last pass; repeats are then left out, and the last endings taken.
        {"A; B =Fine=; C; D =D.C. al Fine=", "ABCDAB"},
        {"A; B $; C =Fine=; D =D.S. al Fine=; E", "ABCDBC"},
        {"A |:; B :|; C =D.C.=; D", "ABABCABCD"},
        {"A |:; B :| =D.C.=; C", "ABABABC"},
        {"A |:; B =D.C.=; C :|; D", "ABCABABCD"},
        {"A |:; B [1 ] :|; C [2 ]; D =Da Capo=; E", "ABACDACDE"},
        {"A |:; B [1 ] :|; C; D =D.C.=; E", "ABACDACDE"},
        {"A |:; B [1 ] =Fine= :|; C [2 ]; D =D.C. al Fine=; E", "ABACDAB"},
        {"A; B $; C [1 ] {dalsegno='x'}; D [2 ] {fine='yes'}; E", "ABCBD"},
        {"A; B =To Coda=; C =D.C. al Coda=; D =Coda=; E", "ABCABDE"},
        {"A; B $; C =To= @; D =D.S. al Coda=; E @; F", "ABCDBCEF"},
        {"A; B @; C =D.C. al Coda=; D @; E |: :|", "ABCABDEE"},
        {"A; B; C =D.C. al Coda=; D @; E", "ABCABCDE"},
        {"A {segno='s'}; B {tocoda='c'}; C {dalsegno='s'}; D {coda='c'}; E", "ABCABDE"},
        {"A {segno='s'}; B {segno='t'}; C {dalsegno='s'}; D", "ABCABCD"},
        {"A {tocoda='b'}; B {dacapo='yes'}; C {coda='a'}; D {coda='b'}; E", "ABADE"},
        {"A; B =D.S.=; C", "ABABC"},
        {"A {fine='no'}; B {dacapo='yes'}; C", "ABABC"},
        {"A =Fine=; B =D.C. al Fine=; C", "ABA"},
        {"A =Fine=; B =D.C. al Coda=; C", "ABABC"},
        {"A =Fine=; B =D.C.=; C", "ABA"},
        // Words in every dress, and words that mean nothing here.
        {"A; B =(fine)=; C =D.C.alfine=; D", "ABCAB"},
        {"A; B =FINE=; C =DC al fine=; D", "ABCAB"},
        {"A; B =fine=; C =2 repeats then D.C.al fine= :|; D", "ABCABCABCAB"},
        {"A; B =A fine romance=; C =Da capo al Fine=; D", "ABCABCD"},
        {"A; B =Second coda=; C =rapid changes=; D", "ABCD"},
        {"A |:; B =x=; C =4th x: tacet= :|", "ABCABC"},
    };
    for (const CRow& row : rows) {
        INFO(row.mBars);
        CHECK(Roots(Loaded(Bars(row.mBars))) == row.mPlayed);
    }
}

TEST_CASE("Harmonies stand where the notes are and last to the next one") {
    const TMusicXMLDoc doc = Loaded(
        Score("<measure><attributes><divisions>2</divisions><time><beats>3+1</beats><beat-type>4"
              "</beat-type></time></attributes>"
              "<harmony><root><root-step>C</root-step></root><kind/></harmony>"
              "<note><grace/><duration>5</duration></note><note><duration>2</duration></note>"
              "<note><chord/><duration>2</duration></note>"
              "<harmony><root><root-step>D</root-step></root><kind/><offset>1</offset></harmony>"
              "<note><duration>4</duration></note><backup><duration>4</duration></backup>"
              "<harmony><root><root-step>E</root-step></root><kind/></harmony>"
              "<forward><duration>6</duration></forward></measure>"
              "<measure><barline><repeat direction='backward'/></barline></measure>"
              "<measure><harmony><root><root-step>F</root-step></root><kind/><offset>-1</offset></"
              "harmony>"
              "<note><duration>2</duration></note></measure>"));
    CHECK(Shown(doc) == "C 0+1, E 1+0.5, D 1.5+6.5, C 8+1, E 9+0.5, D 9.5+6, F 15.5+1.5");
    CHECK(doc.HarmBarlines.size() == 5);
    CHECK(doc.HarmBarlines[3].mPosition == 12.0);
    CHECK(doc.TimeSignatures == std::vector<TMusicXMLTimeSignature>{{0.0, 4, 4}});
    CHECK(doc.HarmCopies == CHarmCopies{{8.0, -2, 2, 0}});
}

TEST_CASE("The chords come from the first part that has any, the marks from all") {
    const std::string attributes = "<attributes><divisions>1</divisions></attributes>";
    const std::string harmony = "<harmony><root><root-step>G</root-step></root><kind/></harmony>";
    const std::string note = "<note><duration>3</duration></note>";
    const std::string back = "<barline><repeat direction='backward'/></barline>";
    CHECK(Shown(Loaded("<score-partwise><part id='a'><measure>" + attributes + note + back +
                       "</measure></part><part id='b'><measure>" + attributes + harmony +
                       "</measure></part></score-partwise>")) == "G 0+3, G 3+3");
    CHECK(Shown(Loaded("<score-timewise><measure><part id='a'>" + attributes + note +
                       "</part></measure><measure><part id='a'>" + note + "</part><part id='b'>" +
                       harmony + "</part></measure></score-timewise>")) == "G 3+3");
}

TEST_CASE("Times and keys stand where they begin to hold") {
    const std::string chord = "<harmony><root><root-step>A</root-step></root><kind/></harmony>";
    const TMusicXMLDoc doc = Loaded(
        "<score-partwise><work><work-title>Song</work-title></work><part>"
        "<measure>" +
        chord +
        "<note><duration>8</duration></note></measure>"
        "<measure><attributes><divisions>4</divisions><key><fifths>-3</fifths></key><time><beats>2"
        "</beats><beat-type>4</beat-type></time></attributes></measure><measure><attributes><key>"
        "<fifths>1</fifths><mode>aeolian</mode></key><key number=\"2\"><fifths>3</fifths></key>"
        "</attributes></measure></part></score-partwise>");
    CHECK(doc.Title == "Song");
    CHECK(Shown(doc) == "A 0+6");
    CHECK(doc.TimeSignatures == std::vector<TMusicXMLTimeSignature>{{2.0, 2, 4}});
    REQUIRE(doc.HarmSignKeys.size() == 3);
    CHECK(doc.HarmSignKeys[0].mPosition == 0.0);
    CHECK(doc.HarmSignKeys[0].IsUndef());
    CHECK(doc.HarmSignKeys[1].mPosition == 2.0);
    CHECK(doc.HarmSignKeys[1].mSignKey.mRootKeyEnh == CKeyEnh{3, TEnh_b});
    CHECK(doc.HarmSignKeys[1].mSignKey.mSignKeyType == TSignKeyType_Undef);
    CHECK(doc.HarmSignKeys[2].mPosition == 4.0);
    CHECK(doc.HarmSignKeys[2].mSignKey.mRootKeyEnh == CKeyEnh{4, TEnh_n});
    CHECK(doc.HarmSignKeys[2].mSignKey.mSignKeyType == TSignKeyType_Minor);
}

TEST_CASE("Kinds in other words are put into the words of the library") {
    struct CRow {
        const char* mXml;
        const char* mKind;
    };
    const CRow rows[] = {
        {"<kind/>", "major"},
        {"<kind text='m7'/>", "minor-seventh"},
        {"<kind> minor </kind>", "minor"},
        {"<kind text='mMaj7'>minor-major</kind>", "major-minor"},
        {"<kind text='M7'/>", "major-seventh"},
        {"<kind text='o7'>other</kind>", "diminished-seventh"},
        {"<kind text=' 7'>other</kind>", "dominant"},
        {"<kind text=' '/>", "major"},
        {"<kind text='\u00F8'>other</kind>", "half-diminished"},
        {"<kind>German</kind>", "dominant"},
        {"<kind>Neapolitan</kind>", "Neapolitan"},
        {"<kind text='7sus4'>other</kind>", "suspended-fourth +7"},
        {"<kind text='m7b5'>strange</kind>", "half-diminished"},
        {"<kind>other</kind><degree><degree-value>5</degree-value><degree-alter>0</degree-alter>"
         "<degree-type>add</degree-type></degree>",
         "pedal +5"},
        {"<kind text='N.C.'>none</kind>", "none"},
        {"<kind>augmented-ninth</kind>", "augmented-seventh +add 9"},
        {"<kind text='9+'>augmented-ninth</kind>", "augmented-seventh +add 9"},
        {"<kind text='9+'>other</kind>", "augmented-seventh +add 9"},
    };
    for (const CRow& row : rows) {
        INFO(row.mXml);
        const TMusicXMLDoc doc = Loaded(Score(fmt::format(
            "<measure><harmony><root><root-step>C</root-step></root>{}</harmony></measure>",
            row.mXml)));
        REQUIRE(doc.Harmonies.size() == 1);
        std::string kind = doc.Harmonies[0].mKind;
        for (const TMusicXMLDegree& degree : doc.Harmonies[0].mDegrees)
            kind += " +" + degree.mValue;
        CHECK(kind == row.mKind);
    }
}

TEST_CASE("A song that does not end is cut, and the load says so") {
    for (const char* const bars : {"A |:; B :|2147483647", "A |:; B :|; C :| =9999999x="}) {
        TMusicXMLDoc doc;
        Error error;
        CHECK_FALSE(doc.LoadAsPlayedFromBytes(Bars(bars), &error));
        CHECK(doc.HarmBarlines.size() == kMinPlayedMeasures);
        CHECK(error.description == "the song is too long to be played");
    }
    CHECK(Roots(Loaded(Bars("A |:; B :|; C :| =4x="))) == "ABABCCCC");
}

TEST_CASE("What is played is bounded by what is written") {
    // Each of the measures goes back to the beginning: 980,700 would be played.
    std::string measures;
    for (int i = 0; i < 1'400; ++i) {
        measures +=
            "<measure><sound dacapo='yes'/><harmony><root><root-step>C</root-step></root>"
            "<kind>major</kind></harmony></measure>";
    }
    TMusicXMLDoc doc;
    Error error;
    CHECK_FALSE(doc.LoadAsPlayedFromBytes(Score(measures), &error));
    CHECK(doc.HarmBarlines.size() == 64 * 1'400);
    CHECK(doc.Harmonies.size() == 64 * 1'400);
    CHECK(error.description == "the song is too long to be played");

    // What is written is played in any case.
    std::string many;
    for (std::size_t i = 0; i < kMaxPlayedMeasures + 10; ++i) many += "<measure/>";
    CHECK(doc.LoadAsPlayedFromBytes(Score(many), &error));
    CHECK(doc.HarmBarlines.size() == kMaxPlayedMeasures + 10);
}

TEST_CASE("Bars of many harmonies are bounded by these, and by their room") {
    struct CRow {
        std::size_t mWritten;  // in one bar
        int mTimes;
        std::string mDegreeValue;
        std::size_t mPlayed;
        bool mIsWhole;
    };
    const std::string longValue(1 << 20, '9');
    const CRow rows[] = {
        {100, 100, "7", 10'000, true},
        {100, 101, "7", 10'000, false},
        {1'000, 64, "7", 64'000, true},
        {1'000, 65, "7", 64'000, false},
        {3'000, 34, "7", 99'000, false},
        {kMaxPlayedHarmonies + 10, 1, "7", kMaxPlayedHarmonies + 10, true},
        {kMaxPlayedHarmonies + 10, 2, "7", kMaxPlayedHarmonies + 10, false},
        {1, 60, longValue, 60, true},
        {1, 70, longValue, 63, false},
    };
    for (const CRow& row : rows) {
        INFO(row.mWritten << " times " << row.mTimes);
        const std::string harmony =
            "<harmony><root><root-step>C</root-step></root><kind>major</"
            "kind><degree><degree-value>" +
            row.mDegreeValue + "</degree-value></degree></harmony>";
        std::string bar;
        for (std::size_t i = 0; i < row.mWritten; ++i) bar += harmony;
        TMusicXMLDoc doc;
        Error error;
        CHECK(doc.LoadAsPlayedFromBytes(
                  Score(fmt::format("<measure>{}<barline><repeat direction='backward' times='{}'/>"
                                    "</barline></measure>",
                                    bar, row.mTimes)),
                  &error) == row.mIsWhole);
        CHECK(doc.Harmonies.size() == row.mPlayed);
        CHECK(error.description == (row.mIsWhole ? "" : "the song is too long to be played"));
    }
}

TEST_CASE("Hostile scores reach nothing outside and take bounded time and room") {
    const auto repeated = [](std::string_view text, std::size_t count) {
        std::string all;
        for (std::size_t i = 0; i < count; ++i) all += text;
        return all;
    };
    std::string bomb = "<!DOCTYPE x [<!ENTITY a0 'aaaaaaaaaa'>";
    for (int i = 1; i < 12; ++i) {
        bomb += fmt::format("<!ENTITY a{} '{}'>", i, repeated(fmt::format("&a{};", i - 1), 10));
    }
    bomb += "]>";
    const std::string title =
        "<score-partwise><movement-title>{}</movement-title></score-partwise>";
    const auto titled = [&](const std::string& text) {
        return fmt::format(fmt::runtime(title), text);
    };
    for (const std::string& score : {
             bomb + titled("&a11;"),
             "<!DOCTYPE x [<!ENTITY e SYSTEM '" BRINDLE_TEST_DATA "/leadsheets/SOURCE.txt'>]>" +
                 titled("&e;"),
             Score(repeated("<a>", 100'000) + repeated("</a>", 100'000)),
             titled(repeated("0123456789", 1'000'001)),
             Score(repeated("<measure/>", kMaxWrittenMeasures + 1)),
         }) {
        TMusicXMLDoc doc;
        Error error;
        CHECK_FALSE(doc.LoadAsPlayedFromBytes(score, &error));
        CHECK(doc.Title.empty());
        CHECK_FALSE(error.description.empty());
    }
    CHECK(Loaded("<!DOCTYPE x SYSTEM '" BRINDLE_TEST_DATA "/leadsheets/SOURCE.txt'>" + titled("A"))
              .Title == "A");
    CHECK_FALSE(TMusicXMLDoc().LoadFromMusicXML(
        Score("<voice>" + repeated("0123456789", 1'000'001) + "</voice>")));
    // Each of many endings is for one more pass.
    std::string endings;
    for (int i = 1; i < 12'000; ++i) {
        endings +=
            "<measure><barline><ending type='start' number=''/><ending type='stop'/>"
            "<repeat direction='backward'/></barline></measure>";
    }
    TMusicXMLDoc doc;
    CHECK(doc.LoadAsPlayedFromBytes(Score(endings)));
    CHECK(doc.HarmBarlines.size() == 11'999);
}

TEST_CASE("Scores in any encoding are read, and what is no score is told") {
    const std::string latin1 =
        "<?xml version='1.0' encoding='{}'?><score-partwise><movement-title>"
        "F\xFCr</movement-title></score-partwise>";
    for (const char* const encoding : {"ISO-8859-1", "UTF-8"}) {
        CHECK(Loaded(fmt::format(fmt::runtime(latin1), encoding)).Title == "F\xC3\xBCr");
    }
    const std::string plain =
        "<score-partwise><movement-title>F\xC3\xBCr</movement-title>"
        "</score-partwise>";
    CHECK(Loaded("\xEF\xBB\xBF" + plain).Title == "F\xC3\xBCr");
    CHECK(Loaded("\n " + plain).Title == "F\xC3\xBCr");
    std::string utf16 = "\xFF\xFE";
    for (const char c : std::string("<score-partwise><movement-title>A</movement-title>"
                                    "</score-partwise>")) {
        utf16 += c;
        utf16 += '\0';
    }
    CHECK(Loaded(utf16).Title == "A");

    struct CRow {
        std::string mBytes;
        const char* mFault;
    };
    const CRow rows[] = {
        {"", "1:1: Document is empty"},
        {"<html/>", "1:1: no MusicXML score"},
        {"<part><measure><note/></measure></part>", "1:1: no MusicXML score"},
        {"<score-partwise>\n<part></measure>",
         "2:17: Opening and ending tag mismatch: part line 2 "
         "and measure"},
        {"PK\x03\x04", "the container cannot be unpacked"},
        {"PK\x05\x06" + std::string(18, '\0'), "no score in the container"},
    };
    for (const CRow& row : rows) {
        TMusicXMLDoc doc;
        Error error;
        CHECK_FALSE(doc.LoadAsPlayedFromBytes(row.mBytes, &error));
        CHECK(error.description == row.mFault);
    }
    CHECK_FALSE(TMusicXMLDoc().LoadAsPlayed("/nowhere/song.xml"));
}
