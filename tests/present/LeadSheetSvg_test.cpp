// SPDX-License-Identifier: MIT
#include "brindle/present/LeadSheetSvg.h"

#include "brindle/analysis/ReadHarmony.h"
#include "brindle/platform/XmlDocument.h"
#include "brindle/present/internal/SheetDrawing.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/ReadSongHarmony.h"
#include "tests/support/Transcript.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <cstring>
#include <filesystem>
#include <fstream>
#include <limits>
#include <map>
#include <variant>

namespace brindle::test {
namespace {

namespace fs = std::filesystem;
using namespace LeadSheet;

CSong EvenSong(std::string_view text) {
    CSongOptions prefs;
    prefs.mEven = true;
    return ReadSong(text, prefs);
}

CSheetScore ScoreOf(const CSong& song, double width = 700.0, std::size_t barsPerLine = 4) {
    const CSongReading reading = ReadHarmony(song.mChords);
    CSheetScore score;
    score.mSheet = MakeSheet(song);
    score.mTexts = MakeChordTexts(song, reading);
    score.mLines = BreakLines(score.mSheet, score.mTexts, width, barsPerLine);
    score.mMarks =
        MakeMarks(score.mLines, score.mTexts, reading, MakeLinks(song, reading, score.mSheet));
    return score;
}

/// The songs that ship with the program, and some with long symbols, many chords and repeats.
std::map<std::string, CSong> ManySongs() {
    std::map<std::string, CSong> songs;
    for (const char* folder : {"/tests/data/leadsheets", "/examples/songs", "/examples/scores"}) {
        for (const auto& file : fs::directory_iterator(BRINDLE_SOURCE_DIR + std::string(folder))) {
            const std::string name = file.path().string();
            if (name.find("SOURCE") == name.npos) songs[name] = ReadSongFile(name);
        }
    }
    songs["long symbols"] = EvenSong(
        "C7#9b13/Bb F#m7b5add11 Bbmaj13#11/C G7sus4b9b13 Ebm(maj7) | Ab7alt Dbmaj7#5 | C D E F G "
        "A");
    songs["one bar"] = EvenSong(
        "C7#9b13 F#m7b5add11 Bbmaj13#11 G7sus4b9b13 Ebm7 Ab7alt Dbmaj7#5 "
        "Cm11b5 F#m7b5add11 Bbmaj13#11 G7sus4b9b13 Ebm7 Ab7alt C F G7 C |");
    songs["repeats"] = EvenSong("|: Dm7 G7 | Em7 A7 :| Dm7 G7 | C");
    return songs;
}

/// "|: C G7 | ... [1. C :|", with x3 for the times and (5) for a rest of five bars.
std::string Shown(const CSong& song) {
    const CSheet sheet = MakeSheet(song);
    std::string text;
    for (const CSheetBar& bar : sheet.mBars) {
        text += bar.mBeginsRepeat ? "|: " : "| ";
        if (bar.mBeginsSection) text += "<" + bar.mSection + "> ";
        if (!bar.mEnding.empty()) text += "[" + bar.mEnding + " ";
        if (!bar.mRemark.empty()) text += "{" + bar.mRemark + "} ";
        if (bar.mSign == TSongSign_Segno) text += "$ ";
        if (bar.mSign == TSongSign_Coda) text += "@ ";
        if (bar.mHeld != kNone) text += "(" + song.mSymbols[bar.mHeld] + ") ";
        for (std::size_t i = bar.mBegin; i < bar.mEnd; ++i) text += song.mSymbols[i] + " ";
        if (bar.mBarCount > 1) text += fmt::format("({}) ", bar.mBarCount);
        if (!bar.mWords.empty()) text += "(" + bar.mWords + ") ";
        if (bar.mEndsRepeat) text += ":";
        if (bar.mTimes > 2) text += fmt::format("x{} ", bar.mTimes);
    }
    return text;
}

/// "B ^b 'm ^7": each run, raised ones behind ^, smaller ones behind '.
std::string Shown(const CTextRuns& runs) {
    std::string text;
    for (const CTextRun& run : runs) {
        if (!text.empty()) text += ' ';
        text += (run.mRaise > 0.2 ? "^" : run.mSize < 0.9 ? "'" : "") + run.mText;
    }
    return text;
}

TEST_CASE("Chord symbols and numerals are set as publishers set them") {
    const std::pair<const char*, const char*> symbols[] = {
        {"C", "C"},
        {"Bbm7b5/Ab", "B ♭ 'm ^7♭5 '/ 'A '♭"},
        {"F#maj7#11", "F ♯ ^maj7♯11"},
        {"A-7", "A '− ^7"},
        {"G^7", "G ^△7"},
        {"Eo7", "E ^°7"},
        {"Bh7", "B ^ø7"},
        {"C6/9", "C ^6/9"},
        {"Dm(maj7)", "D 'm ^(maj7)"},
        {"Dadd9", "D ^add9"},
        {"Cisdim", "Cis ^dim"},
        {"Esus4", "E ^sus4"},
        {"Solm7", "Sol 'm ^7"},
        {"Fa#m7", "Fa ♯ 'm ^7"},
        {"Fadd9", "F ^add9"},
        {"Faug7", "F ^aug7"},
        {"bVII7", "♭ VII ^7"},
        {"subV7/V", "subV ^7 / V"},
        {"2-7", "2 '− ^7"},
        {"57", "5 ^7"},
        {"b2o7/4", "♭ 2 ^°7 / 4"},
        {"1^7", "1 ^maj7"},
        {"1sus4", "1 ^sus4"},
        {"violin", "violin"},
        {"I'm", "I'm"},
        {"8va", "8va"},
        {"N.C.", "N.C."},
        {"?", "?"},
        {"Cdom7sus4add9omit5no3longer", "C ^dom7sus4add9omit5no3lo…"},
    };
    for (const auto& [typed, set] : symbols) CHECK(Shown(SetSymbol(typed)) == set);
    const std::pair<const char*, const char*> numerals[] = {
        {"V7/ii", "V ^7 / ii"},
        {"subV7/I", "subV ^7 / I"},
        {"bVII^7", "♭ VII ^maj7"},
        {"viio7/V", "vii ^°7 / V"},
        {"iih7", "ii ^ø7"},
        {"Ger6", "Ger ^6"},
        {"#ivo7", "♯ iv ^°7"},
        {"N6", "N ^6"},
        {"V+7", "V ^+7"},
        {"V7b9/bIII", "V ^7♭9 / ♭ III"},
        {"", ""},
    };
    for (const auto& [numeral, set] : numerals) CHECK(Shown(SetNumeral(numeral)) == set);
}

TEST_CASE("What is cut fits") {
    CHECK(CutToWidth("short", 100.0) == "short");
    for (const double width : {1.0, 3.0, 7.7}) {
        const std::string cut = CutToWidth("a very long name ♭ of a section", width);
        CHECK(WidthOf(cut) <= std::max(width, WidthOf("…")));
        CHECK(cut.ends_with("…"));
    }
}

TEST_CASE("Repeated passages stand once between their signs") {
    const std::pair<const char*, const char*> songs[] = {
        {"C | F | G | C", "| C | F | G | C "},
        {"|: C | F :| G", "|: C | F :| G "},
        {"C |: F | G :| C", "| C |: F | G :| C "},
        {"|: C | F :| |: G | Am :|", "|: C | F :|: G | Am :"},
        // What was not written as a repeat is none.
        {"C | F | C | F", "| C | F | C | F "},
    };
    for (const auto& [text, shown] : songs) CHECK(Shown(EvenSong(text)) == shown);
}

TEST_CASE("What a jump plays again stands once, with the words and signs of the song") {
    const std::pair<const char*, const char*> songs[] = {
        {"C | F Fine | G | D.C. al Fine", "| C | F (Fine) | G (D.C. al Fine) "},
        {"C | Segno F | To Coda | G | D.S. al Coda | Coda Am",
         "| C | $ F (To Coda) | G (D.S. al Coda) | @ Am "},
        // Repeats around a jump, and one that is not taken again behind it.
        {"|: C | F [1 G :| [2 Am | D.C.", "|: C | F | [1. G :| [2. Am (D.C.) "},
        {"|: C | F :| G | Fine | |: Dm | Em :| D.C. al Fine",
         "|: C | F :| G (Fine) |: Dm | Em (D.C. al Fine) :"},
        {"C | F | |: G | To Coda | Am :| D.C. al Coda | Coda Dm | C",
         "| C | F |: G (To Coda) | Am (D.C. al Coda) :| @ Dm | C "},
    };
    for (const auto& [text, shown] : songs) CHECK(Shown(EvenSong(text)) == shown);
}

TEST_CASE("Words for jumps are drawn whole, and a coda begins with the chord that sounds on") {
    CSong song = EvenSong("Dm | F To Coda | G7 | C D.C. al Coda | Coda . | Am");
    const std::string svg = LeadSheetSvg(song, ReadHarmony(song.mChords));
    for (const char* words : {">To Coda<", ">D.C. al Coda<"}) {
        CHECK(svg.find(words) != std::string::npos);
    }
    const auto count = [&](const std::string& text) {
        std::size_t found = 0;
        for (std::size_t at = svg.find(text); at != std::string::npos;
             at = svg.find(text, at + 1)) {
            ++found;
        }
        return found;
    };
    // F in its own bar and in that of the coda.
    CHECK(count(">F<") == 2);
    CHECK(count(">G<") == 1);
}

TEST_CASE("A part begins with its chord anew") {
    const std::pair<const char*, const char*> songs[] = {
        {"|: Am . . . | E7 . . . :| |: . . . . | D7 . . . :|", "|: Am | E7 :|: (E7) | D7 :"},
        {"|: Am . . . | [1 E7 . . . | . . . . :| [2 . . . . | F . . .",
         "|: Am | [1. E7 | :| [2. (Am) | F "},
    };
    for (const auto& [text, shown] : songs) CHECK(Shown(ReadSong(text)) == shown);
    CSong sections = ReadSong("C . . . | . . . . | . . . . | G . . .");
    sections.mSections = {{"A", 8.0}, {"B", 12.0}};
    CHECK(Shown(sections) == "| C | | <A> (C) | <B> G ");
    CHECK(Shown(ReadSong("Verse: A D E Chorus: D | G")) == "| <Verse, Chorus> A D E D | G ");
    // A chord that comes later in the bar has its own place behind.
    const CSong song = ReadSong("C . . . |: . . G . :|");
    const CSheetScore score = ScoreOf(song);
    const CPlacedBar& bar = score.mLines.mLines.back().mBars.back();
    REQUIRE(bar.mChords.size() == 2);
    CHECK(bar.mChords[0].mIsHeld);
    CHECK(bar.mChords[0].mX + bar.mWidth / 3 < bar.mChords[1].mX);
}

TEST_CASE("A jump without words is labelled wherever it leads to") {
    CSong song = EvenSong("C | F | G | Am | Dm | F | G | Am");
    for (std::size_t i = 0; i < song.mBars.size(); ++i) song.mBars[i].mWritten = i < 5 ? i : i - 4;
    CHECK(Shown(song) == "| C | F | G | Am | Dm | {= bars 2–4} F | G | Am ");
}

/// "C | D | ": bars with the chords of `letters`.
std::string BarsOf(std::string_view letters) {
    std::string text;
    for (const char letter : letters) text += std::string(1, letter) + " | ";
    return text;
}

// A song of bars with a chord each, with repeats as pairs of bars and a count.
CSong SongOfBars(std::string_view chords, const std::vector<std::array<std::size_t, 3>>& repeats) {
    CSong song = EvenSong(BarsOf(chords));
    for (const auto& [source, again, count] : repeats) {
        song.mRepeats.push_back({song.mBars[again].mPosition, song.mBars[source].mPosition, count});
    }
    return song;
}

TEST_CASE("Endings, several times, jumps and nonsense") {
    struct CRow {
        const char* mBars;
        std::vector<std::array<std::size_t, 3>> mRepeats;  // source, again, count
        const char* mShown;
    };
    const CRow rows[] = {
        {"CFGCFA", {{0, 3, 2}}, "|: C | F | [1. G :| [2. A "},
        {"CFCFCF", {{0, 2, 2}, {0, 4, 2}}, "|: C | F :x3 "},
        {"CFCFCF", {{0, 2, 2}, {2, 4, 2}}, "|: C | F :x3 "},
        {"CFGCFACFB", {{0, 3, 2}, {0, 6, 2}}, "|: C | F | [1. G :| [2. A :| [3. B "},
        {"CFGCFGCFA", {{0, 3, 3}, {0, 6, 2}}, "|: C | F | [1. 2. G :| [3. A "},
        // A jump to the begin from far behind.
        {"CFGABDCFE", {{0, 6, 2}}, "| C | F | G | A | B | D | {= bars 1–2} C | F | E "},
        // A passage in a passage that is played twice: the inner signs are those that stay.
        {"CFFCFF", {{1, 2, 1}, {0, 3, 3}, {4, 5, 1}}, "| C |: F :| {= bars 1–2} C |: F :"},
        // What is not the same, does not exist or looks ahead is no repeat.
        {"CFGA", {{0, 2, 2}}, "| C | F | G | A "},
        {"CFCF", {{2, 2, 2}, {3, 2, 1}}, "| C | F | C | F "},
        {"CFCF", {{0, 2, 1'000'000}}, "|: C | F :"},
    };
    for (const CRow& row : rows) {
        INFO(row.mBars);
        CHECK(Shown(SongOfBars(row.mBars, row.mRepeats)) == row.mShown);
    }
    CSong odd = SongOfBars("CFCF", {});
    odd.mRepeats = {{std::nan(""), 0.0, 2}, {1e300, 0.0, 2}, {8.0, -5.0, 2}};
    CHECK(Shown(odd) == "| C | F | C | F ");
}

TEST_CASE("Written endings stand as they are, however long they are") {
    for (const std::size_t body : {1U, 2U, 3U, 5U, 12U}) {
        for (const std::size_t first : {1U, 2U, 4U, 5U, 9U, 20U}) {
            for (const std::size_t second : {1U, 2U, 5U, 20U}) {
                INFO(body << " " << first << " " << second);
                const std::string common(body, 'C');
                const std::string endOne(first, 'D');
                const std::string endTwo(second, 'E');
                const CSong song = EvenSong("|: " + BarsOf(common) + "[1 " + BarsOf(endOne) +
                                            ":| [2 " + BarsOf(endTwo));
                const CSheet sheet = MakeSheet(song);
                REQUIRE(sheet.mBars.size() == body + first + second);
                for (std::size_t i = 0; i < sheet.mBars.size(); ++i) {
                    const CSheetBar& bar = sheet.mBars[i];
                    CHECK(bar.mWritten == i);
                    CHECK(bar.mBeginsRepeat == (i == 0));
                    CHECK(bar.mEndsRepeat == (i + 1 == body + first));
                    CHECK(bar.mEnding == (i == body ? "1." : i == body + first ? "2." : ""));
                    CHECK(bar.mRemark.empty());
                }
            }
        }
    }
    const std::pair<const char*, const char*> songs[] = {
        {"|: C | [1 D | D :| [2 E | E | E :| [3 F", "|: C | [1. D | D :| [2. E | E | E :| [3. F "},
        // The last ending ends before the next repeat.
        {"|: C | [1 D | D | D :| [2 E | |: F | G :| A",
         "|: C | [1. D | D | D :| [2. E |: F | G :| A "},
    };
    for (const auto& [text, shown] : songs) CHECK(Shown(EvenSong(text)) == shown);
    const CSheet sheet = MakeSheet(EvenSong("|: C | [1 D | D | D :| [2 E | |: F | G :| A"));
    CHECK(sheet.mBars[4].mIsInEnding);
    CHECK(!sheet.mBars[5].mIsInEnding);
    // It ends where the song says so, else it is as long as the first.
    const auto barsOfLastEnding = [](std::size_t told) {
        CSong song = EvenSong("|: C | [1 D | D :| [2 E | E | E | F | G");
        for (CSongBar& bar : song.mBars) bar.mEndsEnding = told > 0 && bar.mWritten == 2 + told;
        std::size_t count = 0;
        for (const CSheetBar& bar : MakeSheet(song).mBars) count += bar.mIsInEnding ? 1 : 0;
        return count - 2;
    };
    CHECK(barsOfLastEnding(0) == 2);
    CHECK(barsOfLastEnding(1) == 1);
    CHECK(barsOfLastEnding(3) == 3);
}

TEST_CASE("A long rest is one bar, and bars are counted where a song has none") {
    CSongOptions prefs;
    prefs.mBeatsPerChord = 2.0;
    CHECK(Shown(ReadSong("C F G", prefs)) == "| C F | G ");
    CHECK(Shown(ReadSong("(48,C);(4,F)")) == "| C | (11) | F ");
    CHECK(Shown(ReadSong("(4000000000,C);(4,F)")).size() < 60);
}

// Whether a chord is written like the one before it in its bar.
bool GoesOnInBar(const CSheetScore& score, std::size_t chord) {
    const auto beginsBar = [&](const CSheetBar& bar) { return bar.mBegin == chord; };
    const auto& bars = score.mSheet.mBars;
    return chord > 0 && std::none_of(bars.begin(), bars.end(), beginsBar) &&
           score.mTexts[chord].mSymbol == score.mTexts[chord - 1].mSymbol &&
           score.mTexts[chord].mNumeral == score.mTexts[chord - 1].mNumeral;
}

TEST_CASE("Equal neighbours in a bar are written once, and arrows leave from where they stand") {
    const CSheetScore score = ScoreOf(EvenSong("C C G7 G7 | C C/E C C | C G7 G7 G7"), 700.0);
    std::string drawn;
    for (const CPlacedBar& bar : score.mLines.mLines.at(0).mBars) {
        for (const CPlacedChord& chord : bar.mChords) drawn += fmt::format("{} ", chord.mChord);
        drawn += "| ";
    }
    CHECK(drawn == "0 2 | 4 5 6 | 8 9 | ");
    for (const std::size_t again : {1U, 3U, 7U, 10U, 11U}) {
        CHECK(score.mLines.mPlaces[again].mLine == 0);
        CHECK(score.mLines.mPlaces[again].mX == score.mLines.mPlaces[again - 1].mX);
    }
    REQUIRE(score.mMarks.at(0).mArrows.size() == 1);
    CHECK(score.mMarks[0].mArrows[0].mBegin > score.mLines.mPlaces[2].mX);
    CHECK(score.mMarks[0].mArrows[0].mBegin < score.mLines.mPlaces[4].mX);
}

TEST_CASE("Every chord stands once, between its bar lines, and no two texts touch") {
    for (const auto& [name, song] : ManySongs()) {
        for (const double width : {700.0, 500.0, 150.0}) {
            const std::string logged(name);
            INFO(logged << " " << width);
            const CSheetScore score = ScoreOf(song, width);
            std::vector<std::size_t> drawn;
            for (const CSheetLine& line : score.mLines.mLines) {
                CHECK(line.Width() <= width + 0.01);
                double free = 0.0;
                for (const CPlacedBar& bar : line.mBars) {
                    CHECK(bar.mX == doctest::Approx(free));
                    for (const CPlacedChord& chord : bar.mChords) {
                        CHECK(chord.mX >= free);
                        free = chord.mX + score.mLines.mScale * score.mTexts[chord.mChord].Width();
                        CHECK(free <= bar.End() + 0.01);
                        if (!chord.mIsHeld) drawn.push_back(chord.mChord);
                    }
                    free = bar.End();
                }
            }
            CHECK(std::is_sorted(drawn.begin(), drawn.end()));
            for (std::size_t i = 0; i < score.mTexts.size(); ++i) {
                const auto place = std::equal_range(drawn.begin(), drawn.end(), i);
                const bool isDrawn = score.mSheet.mDrawnAs[i] == i && !GoesOnInBar(score, i);
                CHECK(place.second - place.first == (isDrawn ? 1 : 0));
            }
        }
    }
}

TEST_CASE("Arrows and brackets lead from a chord that is drawn to a later one") {
    for (const auto& [name, song] : ManySongs()) {
        const std::string logged(name);
        INFO(logged);
        const CSongReading reading = ReadHarmony(song.mChords);
        const CSheet sheet = MakeSheet(song);
        const CSheetLinks links = MakeLinks(song, reading, sheet);
        const auto isDrawn = [&](std::size_t chord) { return sheet.mDrawnAs[chord] == chord; };
        std::map<std::size_t, int> arrivals;
        for (const CSheetLink& arrow : links.mArrows) {
            CHECK(isDrawn(arrow.mFrom));
            if (arrow.mTo == kNone) continue;
            CHECK(arrow.mTo > arrow.mFrom);
            CHECK(isDrawn(arrow.mTo));
            CHECK(++arrivals[arrow.mTo] == 1);
        }
        for (const CSheetLink& bracket : links.mBrackets) {
            CHECK(isDrawn(bracket.mFrom));
            CHECK(bracket.mTo > bracket.mFrom);
            CHECK(reading.mChords[bracket.mTo].mFunction != THarmFunction_Tonic);
        }
        // The marks of all lines are these links, those that cross the end of a line in two parts.
        std::size_t parts = 0;
        std::size_t crossing = 0;
        for (const CLineMarks& marks : ScoreOf(song).mMarks) {
            parts += marks.mArrows.size();
            for (const CLinkMark& arrow : marks.mArrows) crossing += arrow.mGoesOn ? 1 : 0;
        }
        CHECK(parts == links.mArrows.size() + crossing);
    }
}

/// "0>1 1>2~": arrows, dotted ones with ~; brackets in [].
std::string Links(std::string_view text) {
    const CSong song = EvenSong(text);
    const CSheetLinks links = MakeLinks(song, ReadHarmony(song.mChords), MakeSheet(song));
    std::string shown;
    for (const CSheetLink& link : links.mBrackets) {
        shown += fmt::format("[{}-{}]{} ", link.mFrom, link.mTo, link.mIsDotted ? "~" : "");
    }
    for (const CSheetLink& link : links.mArrows) {
        const std::string to = link.mTo == kNone ? "back" : fmt::format("{}", link.mTo);
        shown += fmt::format("{}>{}{} ", link.mFrom, to, link.mIsDotted ? "~" : "");
    }
    return shown;
}

TEST_CASE("Seconds have brackets, dominants arrows, and substitutes dotted ones") {
    CHECK(Links("Dm7 | G7 | C | C") == "[0-1] 1>2 ");
    CHECK(Links("C | Dm7 Db7 | C | C") == "[1-2]~ 2>3~ ");
    CHECK(Links("C | G7 | Am | C") == "");
    // What else stands for a dominant has no arrow: a sixth chord, wherever it leads, and the way
    // home from the other side.
    CHECK(Links("Am | C F7 | Em E7 | Am | Am | Dm | E7 | Am") == "4>5 8>9 ");
    CHECK(Links("Am | Dm | F7 | E7 | Am | E7 | Am") == "3>4 5>6 ");
    CHECK(Links("C | Fm7 Bb7 | C | F | G7 | C") == "[1-2]~ 5>6 ");
    CHECK(Links("C | G7 | G7 | C") == "2>3 ");
    CHECK(Links("C | G7sus4 | G7 | C") == "2>3 ");
    CHECK(Links("C | E7 | Am | D7 | G7 | C") == "[2-3] 1>2 3>4 4>5 ");
    CHECK(Links("C | F#dim7 | G7 | C") == "1>2 2>3 ");
    CHECK(Links("Eb | Edim | Bb7 | Eb") == "2>3 ");
    CHECK(Links("C | D7 | C/G | G7 | C") == "1>2 3>4 ");
    CHECK(Links("|: C | Dm7 G7 :|") == "[1-2] 2>back ");
    CHECK(Links("|: C | Dm7 G7 :| C") == "[1-2] 2>6 ");
}

TEST_CASE("The legend explains each sign that is used, inside the page, at any width") {
    // Dm7 G7 and Dm7 Db7: every sign there is.
    const CSong all = EvenSong("Dm7 G7 | C | Dm7 Db7 | C");
    const CSong few = EvenSong("C | G7 | C");
    const char* texts[] = {"a dominant resolves", "a substitute resolves", "ii and V",
                           "ii and a substitute for V", "color of the key"};
    for (const TSheetPage page : {TSheetPage_Endless, TSheetPage_A4}) {
        for (const double width : {200.0, 260.0, 400.0, 560.0, 800.0, 2000.0}) {
            INFO(width);
            CLeadSheetOptions options;
            options.mWidth = width;
            options.mPage = page;
            const std::string svg = LeadSheetSvg(all, ReadHarmony(all.mChords), options);
            const double pageWidth = page == TSheetPage_A4 ? 793.7 : width;
            const auto at = svg.find("viewBox=\"0 0 ");
            const double height = std::stod(svg.substr(svg.find(' ', at + 13) + 1));
            for (const char* text : texts) {
                INFO(text);
                const auto end = svg.find(fmt::format(">{}</text>", text));
                REQUIRE(end != svg.npos);
                const std::string tag = svg.substr(svg.rfind("<text", end), 120);
                const auto value = [&](const char* name) {
                    return std::stod(tag.substr(tag.find(name) + std::strlen(name) + 2));
                };
                const double size = value("font-size");
                CHECK(value(" x") + size * 0.85 * WidthOf(text) < pageWidth);
                CHECK(value(" y") < height - 8);
            }
        }
    }
    const std::string svg = LeadSheetSvg(few, ReadHarmony(few.mChords), {});
    for (const char* text : {"a substitute resolves", "ii and V", "ii and a substitute for V"}) {
        CHECK(svg.find(fmt::format(">{}<", text)) == svg.npos);
    }
}

void CheckIsFile(const std::string& svg) {
    CHECK(std::holds_alternative<XmlDocument>(XmlDocument::FromBytes(svg)));
    CHECK(svg.find("role=\"img\"") != svg.npos);
}

std::string SvgOf(const CSong& song, const CLeadSheetOptions& options = {}) {
    return LeadSheetSvg(song, ReadHarmony(song.mChords), options);
}

TEST_CASE("Keys that contradict are told under the title and in the description") {
    CSong song = ReadSong("C | F | G | C");
    song.mStatedKey = CSignKeyLite("A minor");
    CReadingOptions options;
    options.mStatedKey = *song.mStatedKey;
    const std::string note = "A minor is the stated key; the chords alone would show C major.";
    const std::string svg = LeadSheetSvg(song, ReadSongHarmony(song, options));
    CHECK(svg.find(note + "</text>") != std::string::npos);
    CHECK(svg.find(note + " Chords: C F G C</desc>") != std::string::npos);
    song.mStatedKey = CSignKeyLite("C major");
    options.mStatedKey = *song.mStatedKey;
    CHECK(LeadSheetSvg(song, ReadSongHarmony(song, options)).find("stated") == std::string::npos);
}

TEST_CASE("Hostile songs give whole files of bounded size") {
    CSong song = EvenSong("C | F");
    song.mTitle = "<script>&\"\x01\xFF" + std::string(100'000, 'x');
    song.mMakers = std::string(100'000, '&');
    song.mStyle = "]]>";
    song.mSymbols[0] = "<" + std::string(100'000, 'C');
    song.mSections = {{std::string(100'000, 'm'), 0.0}, {"<&>", 4.0}, {"x", -1.0}, {"y", 1e300}};
    song.mBars[0].mNumber = std::string(100'000, '9');
    song.mBars[0].mTime = {2'000'000'000, 1'000'000'000};
    const std::string svg = SvgOf(song);
    CheckIsFile(svg);
    CHECK(svg.find("<script") == svg.npos);
    CHECK(svg.size() < 12'000);

    const double nan = std::nan("");
    CSong odd = EvenSong("C | F | G");
    odd.mBars[1].mPosition = nan;
    odd.mChords[1].mPosition = nan;
    odd.mChords[2].mPosition = -1e300;
    odd.mBeatsPerBar = nan;
    odd.mTempo = nan;
    CheckIsFile(SvgOf(odd));
    odd.mChords.back().mPosition = std::numeric_limits<double>::infinity();
    CheckIsFile(SvgOf(odd, {-5, nan, TSheetPage_A4, TSheetTheme_Dark}));
    CheckIsFile(LeadSheetSvg(odd, CSongReading{}));
    CheckIsFile(SvgOf(CSong{}));
}

TEST_CASE("A hundred times the chords make a hundred times the file") {
    std::string text;
    for (int i = 0; i < 250; ++i) text += "Dm7 G7 | C A7 | ";
    const std::size_t once = SvgOf(EvenSong(text)).size();
    std::string much;
    for (int i = 0; i < 100; ++i) much += text;
    CHECK(SvgOf(EvenSong(much)).size() < 110 * once);
}

TEST_CASE("Pages have the size of their paper, and a rag fits two") {
    CLeadSheetOptions options;
    options.mPage = TSheetPage_A4;
    for (const char* name :
         {"maple_leaf_rag.musicxml", "the_entertainer.mxl", "we_three_kings.mxl"}) {
        INFO(name);
        const CSong song =
            ReadSongFile(BRINDLE_SOURCE_DIR "/tests/data/leadsheets/" + std::string(name));
        const auto pages = LeadSheetPages(song, ReadHarmony(song.mChords), options);
        CHECK(pages.size() <= 2);
        for (const std::string& page : pages) {
            CheckIsFile(page);
            CHECK(page.find("width=\"210mm\" height=\"297mm\"") != page.npos);
        }
    }
    std::string text;
    for (int i = 0; i < 500; ++i) text += "C | ";
    const CSong song = EvenSong(text);
    const auto pages = LeadSheetPages(song, ReadHarmony(song.mChords), options);
    CHECK(pages.size() > 6);
    std::size_t symbols = 0;
    for (const std::string& page : pages) {
        for (auto at = page.find("\"sym ink\""); at != page.npos;
             at = page.find("\"sym ink\"", at + 1)) {
            ++symbols;
        }
    }
    CHECK(symbols == 500);
}

TEST_CASE("Whole lead sheets are as they were looked at") {
    CSong changes = EvenSong(
        "Fmaj7 | Em7b5 A7 | Dm7 G7 | Cm7 F7 | Bb7 | Bbm7 Eb7 | Am7 | Abm7 Db7 | "
        "Gm7 | C7 | Fmaj7 | Fmaj7");
    changes.mTitle = "Changes & more";
    changes.mMakers = "Nobody";
    CSong repeats = ReadSong("|: C . Am . | F . G7 . :| C . . . | % | D7 . G . |");
    const std::pair<const char*, std::string> sheets[] = {
        {"changes-light.svg", SvgOf(changes, {.mTheme = TSheetTheme_Light})},
        {"repeats-narrow.svg", SvgOf(repeats, {.mWidth = 400.0})},
    };
    for (const auto& [name, svg] : sheets) {
        const std::string logged(name);
        INFO(logged);
        const std::string path = BRINDLE_SOURCE_DIR "/tests/data/sheets/" + std::string(name);
        if (std::getenv("BRINDLE_RENEW_GOLDEN") != nullptr) std::ofstream(path) << svg;
        CHECK(ReadFile(path) == svg);
    }
}

}  // namespace
}  // namespace brindle::test
