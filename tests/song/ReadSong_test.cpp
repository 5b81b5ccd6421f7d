// SPDX-License-Identifier: MIT
#include "SongForms.h"

#include "brindle/analysis/TChordStringParse.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/song/AnalyseSong.h"
#include "brindle/song/ParseSong.h"
#include "brindle/song/ReadSongHarmony.h"
#include "brindle/song/SheetTimes.h"
#include "brindle/song/TransposeSong.h"
#include "brindle/song/internal/ChartLinks.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <cmath>
#include <filesystem>
#include <sstream>
#include <string>

using namespace brindle;
using namespace brindle::test;

namespace {

const std::string kLeadSheets = BRINDLE_TEST_DATA "/leadsheets";

/// As a link needs it.
std::string Escaped(std::string_view text) {
    std::string escaped;
    for (const char c : text) {
        const bool isPlain = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') || c == '=';
        escaped +=
            isPlain ? std::string(1, c) : fmt::format("%{:02X}", static_cast<unsigned>(c) & 0xFFu);
    }
    return escaped;
}

std::string ScrambledSong(std::string_view title, std::string_view key, std::string_view chart) {
    return fmt::format("{}=Writer Some==Medium Swing={}==1r34LbKcu7{}==140=3", title, key,
                       ChartLinks::Unscrambled(chart));
}

const char* const kBlues =
    "*A[T44F7   |Bb7   |F7   |C-7 F7 |Bb7   |Bo7   |F7   |Ah7 D7b9 |G-7   |C7   |F7 D7 |G-7 C7 Z";

}  // namespace

TEST_CASE("A source is read as what it looks like") {
    struct CRow {
        TSongFormat mFormat;
        const char* mSource;
    };
    const CRow rows[] = {
        {TSongFormat_ChordText, "Dm7 G7 | C . . . |"},
        {TSongFormat_ChordText, "C F Hello"},
        {TSongFormat_ChordText, "Hello | C"},
        {TSongFormat_ChordText, "Verse: C F G\nChorus: Am G"},
        {TSongFormat_ChordText, "(C) F G"},
        {TSongFormat_ChordText, "|: A [1. D :| [2. E |"},
        {TSongFormat_ChordText, ""},
        {TSongFormat_ChordStrings, "(4,C);(2,U);(2,G7)"},
        {TSongFormat_ChordStrings, "(1e999,C);(4,F)"},
        {TSongFormat_ChordText, "(9) C, F"},
        {TSongFormat_RomanText, "Composer: Somebody\n\nm1 C: I b3 V\nm2 I"},
        {TSongFormat_RomanText, "m0 b4 f#: V7\nm1 i"},
        {TSongFormat_RomanText, "m1 E flat: I b3 V"},
        {TSongFormat_ChordText, "m1 C F\nm2 G"},
        {TSongFormat_ChordPro, "{title: x}\nC"},
        {TSongFormat_ChordPro, "{Meta: artist x}\nOh [C]my"},
        {TSongFormat_ChordPro, "A[G]Mazing [D]Grace"},
        {TSongFormat_ChordPro, "[Am] [F] [C]"},
        {TSongFormat_Chart, "{*AT44C^7 |A-7 D7 }"},
        {TSongFormat_Chart, "Song=Writer=Swing=Eb=n=T34F-7 |x Z"},
        {TSongFormat_ChartLink, "irealb://Song%3D"},
        {TSongFormat_ChartPage, "<!DOCTYPE html><a href=\"irealb://\">x</a>"},
        {TSongFormat_MusicXml, "\xEF\xBB\xBF <?xml version=\"1.0\"?><score-partwise/>"},
        {TSongFormat_ChordsAboveLyrics, "G       C\nAmazing grace how sweet"},
        {TSongFormat_ChordsAboveLyrics, "[Verse 1]\nG C D\n[A]\nEm"},
        {TSongFormat_ChordsAboveLyrics, "Am\nGo Down\nAm   E\nAm I blue\n"},
        {TSongFormat_ChordsAboveLyrics, "e|--3--5--|\nB|--0--0--|\n\nC\nDown by the river"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mSource);
        CHECK(SongFormatOf(row.mSource) == row.mFormat);
    }
    for (const char* song :
         {"after-youve-gone", "amazing-grace", "auld-lang-syne", "greensleeves", "rising-sun"}) {
        const CSong read =
            ReadSongFile(fmt::format("{}/examples/songs/{}.txt", BRINDLE_SOURCE_DIR, song));
        CAPTURE(song);
        CHECK(read.mFormat == TSongFormat_ChordText);
        CHECK(read.mFaults.empty());
        CHECK(read.mChords.size() > 8);
    }
}

TEST_CASE("Chords above lyrics are read with what the sheet tells") {
    const CSong song = ReadSong(
        "Down the Line\nby Some Body\n\nKey: Em\nCapo: 2nd fret\nTempo: 92\nTime: 3/4\n\n"
        "[Intro] G D x2\n\n[Verse 1]\nG        D\nA line of song\nA\nAm I blue\nEm\nA\n"
        "Chorus:\nC  (N.C.)  G/B\nDo go down\ne|--0--2--|\n");
    CHECK(song.mFormat == TSongFormat_ChordsAboveLyrics);
    CHECK(song.mTitle == "Down the Line");
    CHECK(song.mMakers == "Some Body");
    CHECK(song.mCapo == 2);
    CHECK(song.mTempo == 92.0);
    CHECK(song.mBeatsPerBar == 3.0);
    CHECK(song.mStatedKey == CSignKeyLite("E minor"));
    CHECK(song.mFaults.empty());
    // The last A has chords above it and no lyrics below: it is sung.
    CHECK(Shown(song) == "G@0 D@1 G@2 D@3 G@4 D@5 A@6 Em@7 C@8 (N.C.)@9 G/B@10 end@11");
    CHECK(ShownSections(song) == "Intro@0, Verse 1@4, Chorus@8");
    CHECK(ShownSections(ReadSong("[Verse 1]\nG C D\n[A]\nEm C")) == "Verse 1@0, A@3");
    // A verse in front of the chords is no title.
    CHECK(ReadSong("La la\nDown low\nOh why\nHey ho\n\nC G\nla la la").mTitle.empty());
    CHECK(Shown(ReadSong("C Hmaj9x G\nla la la")) == R"(1:8: Hmaj9x: "x" at 6 is not understood)");
}

TEST_CASE("Directives of lyrics with chords are kept") {
    const CSong song = ReadSong(
        "{title: One}\n{title: Other}\n{subtitle: Two}\n{artist: Some Body}\n{composer: Any "
        "One}\n{key: G}\n"
        "{tempo: 120}\n{time: 3/4}\n{capo: 3}\n{transpose: -2}\n{album: Three}\n"
        "{meta: lyricist No One}\n{soc}\n[G]La [C]la\n{eoc}\n{sov: Verse 1}\n{key: Am}\n[Am]Oh\n"
        "{chorus}\n{comment: D.C.}\n");
    CHECK(song.mTitle == "One");
    CHECK(song.mMakers == "Some Body, Any One, No One");
    CHECK(song.mRemarks == std::vector<CSongRemark>{{"subtitle", "Two"}, {"album", "Three"}});
    CHECK(song.mTempo == 120.0);
    CHECK(song.mCapo == 3);
    CHECK(song.mTranspose == -2);
    REQUIRE(song.mStatedKeys.size() >= 2);
    CHECK(song.mStatedKeys[0].mSignKey == CSignKeyLite("G major"));
    CHECK(song.mStatedKeys[1].mSignKey == CSignKeyLite("A minor"));
    CHECK(song.mStatedKeys[1].mPosition == 2.0);
    CHECK(Shown(song) == "G@0 C@1 Am@2 G@3 C@4 G@5 C@6 Am@7 G@8 C@9 end@10");
    const CSong labelled = ReadSong(
        "{start_of_verse: label=\"Verse 1\"}\n[C]x\n{start_of_solo: label='Lead'}\n[F]x\n"
        "{start_of_abc}\nX:1 [G]a\n{end_of_abc}\n{sob}\n[Am]x");
    CHECK(ShownSections(labelled) == "Verse 1@0, Lead@1, Bridge@2");
    CHECK(Shown(labelled) == "C@0 F@1 Am@2 end@3");
    CHECK(Shown(ReadSong("{soc}\n[C]a\n{eoc}\n[F]b\n{eoc}\n{chorus}")) == "C@0 F@1 C@2 end@3");
    CHECK(Shown(ReadSong("{time: 3/4}\n| [C] | [G] . . |\n{time: 4/4}\n| [F] | [C] |")) ==
          "C@0 G@3 F@6 C@10 end@14");
    const CSong notes = ReadSong("{title: x}\n{time: often}\n{tempo: slow}\n{chorus}\n[C]x");
    CHECK(Faults(notes) ==
          "2:8: a time is written as in 3/4; 3:9: a tempo is a number of beats a minute; "
          "4:8: there is no chorus before this one");
    CHECK_FALSE(notes.HasFault());
    CHECK(Shown(notes) == "C@0 end@1");
}

TEST_CASE("A ChordPro text may hold many songs") {
    const std::string text =
        "{new_song}\n{title: One}\n[C]x [F]y\n{ns}\n{title: Two}\n[G]x\n[Gzz]\n{New_Song}\n";
    const std::vector<CSong> songs = ReadSongs(text, {.mLenient = true});
    REQUIRE(songs.size() == 2);
    CHECK(songs[0].mTitle == "One");
    CHECK(Shown(songs[0]) == "C@0 F@1 end@2");
    CHECK(songs[1].mTitle == "Two");
    CHECK(Faults(songs[1]) == "7:3: Gzz: \"zz\" at 2 is not understood");
    CHECK(Faults(ReadSong(text)) == "0:0: one more song of this source is left out");
}

TEST_CASE("Typed songs are played as scores are") {
    struct CRow {
        const char* mText;
        const char* mShown;
    };
    const CRow rows[] = {
        {"C | F Fine | G | D.C. al Fine", "C F G C F"},
        {"C | F Fine | G | D C al Fine", "C F G C F"},
        {"C | F Fine | G | D. C.", "C F G C F"},
        {"G D C G", "G D C G"},
        {"C | Segno F | G | D.S.", "C F G F G"},
        {"C | \U0001D10B F | To Coda | G | D.S. al Coda | Coda Am |", "C F G F Am"},
        {"C | F \U0001D10C | G | D.C. al Coda | \U0001D10C Am |", "C F G C F Am"},
        {"C | F | \U0001D10C G | D.C. | \U0001D10C Am |", "C F G C F Am"},
        // Where words tell the one, all signs are the other.
        {"C | F To Coda | G | D.C. al Coda | \U0001D10C Am | D | \U0001D10C Em |",
         "C F G C F Am D Em"},
        {"|: C | F :| (3x) G", "C F C F C F G"},
        {"|: C | F :| [3x]\nG", "C F C F C F G"},
        {"[Verse]\n|: C | F :| x3\nHere is a line of words", "C F C F C F"},
        {"C $ F G @ D.S. al Coda @ Am", "C F G F G Am"},
        {"|: C [2. F :| [2. G", "C F C G"},
        {"|: C [1 F :| [1 G | Am", "C F C G Am"},
        {"|: C :| [1 F | G", "C C F G"},
        {"|: C [1 F :| [2 G Fine :| Am | D.C. al Fine", "C F C G Am C G"},
        {"Verse: C F To Coda G D.C. al Coda Coda: Am", "C F G C F Am"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        CHECK(Played(ReadSong(row.mText)) == row.mShown);
    }
    CHECK(Played(ReadSong("*A[T44C |F <Fine>|<D.C. al Fine>G Z")) == "C F G C F");
    CHECK(Played(ReadSong("{*AT44C |SF Q|G |<*12D.S. al Coda>E-Z QA-Z")) == "C F G E- F A-");
    const CSong repeated = ReadSong("C | F |: G | Am :|");
    CHECK(repeated.mRepeats == std::vector<CSongRepeat>{{16, 8, 2}});
    CHECK(ShownBars(repeated) == "1@0+4 2@4+4 3@8+4 4@12+4 3@16+4 4@20+4");
    CHECK(ShownBars(ReadSong("C F G")) == "");
}

TEST_CASE("Words that lead nowhere are told with their place, and the song is played") {
    struct CRow {
        const char* mText;
        const char* mPlayed;
        const char* mFaults;
    };
    const CRow rows[] = {
        {"C | F |\nG | D.S.", "C F G C F G",
         "2:5: D.S.: there is no segno to go back to, so the song begins again"},
        {"C | F | To Coda | D.C.", "C F C F", "1:9: To Coda: there is no coda to go to"},
        {"C | To Coda F | Coda G", "C F G",
         "1:5: To Coda: no D.C. or D.S. plays this again, so nothing goes to the coda from here"},
        {"C | F | D.C. al Coda | Coda G", "C F C F G",
         "1:9: D.C. al Coda: nothing tells where to leave for a coda, or there is none"},
        {"C | F | D.C. al Fine", "C F C F", "1:9: D.C. al Fine: there is no Fine to stop at"},
        {"C | F x3 | G", "C F G", "1:7: x3: this stands behind no repeat and no line of chords"},
        {"C | F\nChorus: x2", "C F", "2:1: there are no chords on this line to play again"},
        {"Do | Fa", "Do Fa", "1:1: Do and Fa are D diminished and F augmented, not C and F"},
        {"Do | Fa | G", "Do Fa G", ""},
        {"*A[T44C |F <D.S. al Fine>Z", "C F C F",
         "1:13: D.S. al Fine: there is no segno to go back to, so the song begins again; "
         "1:13: D.S. al Fine: there is no Fine to stop at"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        const CSong song = ReadSong(row.mText);
        CHECK(Played(song) == row.mPlayed);
        CHECK(Faults(song) == row.mFaults);
        CHECK_FALSE(song.HasFault());
    }
    // What is there is not told, and nothing twice.
    CHECK(Faults(ReadSong("|: C x3 | F :| $ G | To Coda | D.S. al Coda | Coda Am")) == "");
    CHECK(ReadSong("C | D.S. | F | D.S.").mFaults.size() == 1);
}

TEST_CASE("Links and pages with charts are read") {
    const std::string twelve =
        "F7@0 Bb7@4 F7@8 C-7@12 F7@14 Bb7@16 Bo7@20 F7@24 Ah7@28 D7b9@30 "
        "G-7@32 C7@36 F7@40 D7@42 G-7@44 C7@46 end@48";
    const std::string link =
        "irealb://" + Escaped(ScrambledSong("Blues: One", "F", kBlues) + "===" +
                              ScrambledSong("Two", "A-", "{T34A-7 LZE7 Kcl }Z") + "===My List");
    const std::vector<CSong> songs = ReadSongs(link);
    REQUIRE(songs.size() == 2);
    CHECK(songs[0].mTitle == "Blues: One");
    CHECK(songs[0].mMakers == "Writer Some");
    CHECK(songs[0].mStyle == "Medium Swing");
    CHECK(songs[0].mTempo == 140.0);
    CHECK(songs[0].mStatedKey == CSignKeyLite("F major"));
    CHECK(songs[0].mFormat == TSongFormat_ChartLink);
    CHECK(songs[0].mRemarks == std::vector<CSongRemark>{{"list", "My List"}});
    CHECK(Shown(songs[0]) == twelve);
    CHECK(songs[1].mStatedKey == CSignKeyLite("A minor"));
    CHECK(Played(songs[1]) == "A-7 E7 E7 A-7 E7 E7");
    CHECK(Faults(ReadSong(link)) == "0:0: one more song of this source is left out");
    CHECK(Shown(ReadSong(link)) == twelve);

    const std::string plain = "irealbook://" + Escaped(fmt::format("Three=W=Swing=F=n={}", kBlues));
    CHECK(Shown(ReadSong(plain)) == twelve);
    const std::string page = fmt::format(
        "<!DOCTYPE html><html><body>\n<p><a href=\"{}\">2 songs</a>\n<a href='{}'>x</a></html>",
        link, plain);
    REQUIRE(ReadSongs(page).size() == 3);
    CHECK(ReadSongs(page)[2].mTitle == "Three");
    CHECK(ReadSongs(page)[2].mFormat == TSongFormat_ChartPage);
    CHECK(Faults(ReadSong("<html>nothing</html>")) == "1:1: no chart stands here");
    const std::string faulty = "\nirealb://" + Escaped(ScrambledSong("X", "C", "[T44C |?Z"));
    CHECK(Faults(ReadSong(faulty)) == "2:1: X, character 8 of the chart: \"?\" is not understood");
}

TEST_CASE("Blocks of fifty characters are scrambled, and scrambling twice changes nothing") {
    std::string text;
    for (int i = 0; i < 101; ++i) text += static_cast<char>('0' + i % 64);
    const std::string scrambled = ChartLinks::Unscrambled(text);
    CHECK(scrambled.substr(0, 6) == "a`_^]5");
    CHECK(scrambled.substr(45, 5) == "43210");
    CHECK(scrambled[10] == text[39]);
    CHECK(scrambled[24] == text[24]);
    // One character behind the last block: that block is as it was.
    CHECK(scrambled.substr(50) == text.substr(50));
    for (std::size_t size = 0; size <= text.size(); ++size) {
        const std::string part = text.substr(0, size);
        CHECK(ChartLinks::Unscrambled(ChartLinks::Unscrambled(part)) == part);
    }
}

TEST_CASE("Chord strings are put one behind the other, and their faults are told") {
    const CSong song = ReadSong("(4,C);(2,U);(2,F\u266F7/C#)\n(1.5, Gm(maj7))\n");
    CHECK(Shown(song) == "C@0 U@4 F\u266F7/C#@6 Gm(maj7)@8 end@9.5");
    CHECK(song.mChords[1].IsUndef());
    CHECK(song.mChords[3].mSemitones == CSemitones{0, 3, 7, 11});
    CHECK(ShownSections(song) == "@8");
    struct CRow {
        const char* mText;
        const char* mFault;
    };
    const CRow rows[] = {
        {"(4,C)\n(2,G);(x,F)", "2:7: \"(x,F)\" is no length and chord, as in (4,C)"},
        {"(4,C);(0,G)", "1:7: \"(0,G)\" is no length and chord, as in (4,C)"},
        {"(4,C);(4,)", "1:7: \"(4,)\" is no length and chord, as in (4,C)"},
        {"(4,C);(4,Cm7x9)", "1:13: Cm7x9: \"x\" at 4 is not understood"},
        {"(4,C);(4,%)", "1:10: a chord is wanted with its length, and no repeat"},
        {"(1e308,C);(1e308,F)", "1:1: the song is too long"},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mText);
        CHECK(Shown(ReadSong(row.mText)) == row.mFault);
    }
}

TEST_CASE("An analysis in Roman numerals is a song in the keys that it states") {
    const std::string analysis =
        "Title: Piece\nComposer: Somebody\nAnalyst: Another\nTime Signature: 3/4\n"
        "m0 b3 C: V\nm1 I b3 V65/V\nm2 V b2 G: I\nm3 NC b2 vi6\n";
    const CSong song = ReadSong(analysis);
    CHECK(song.mFormat == TSongFormat_RomanText);
    CHECK(song.mTitle == "Piece");
    CHECK(song.mMakers == "Somebody");
    CHECK(song.mRemarks == std::vector<CSongRemark>{{"analyst", "Another"}});
    CHECK(song.mBeatsPerBar == 3.0);
    CHECK(Shown(song) == "G@0 C@1 D7/F#@3 G@4 G@5 N.C.@7 Em/G@8 end@10");
    REQUIRE(song.mBars.size() == 4);
    CHECK(song.mBars[0].mNumber == "0");
    CHECK(song.mBars[0].mLength == 1.0);
    CHECK(song.mBars[3].mPosition == 7.0);
    CHECK(song.mBars[3].mTime == CSongTime{3, 4});
    REQUIRE(song.mStatedKeys.size() == 2);
    CHECK(song.mStatedKey == CSignKeyLite({0, TEnh_n}, TSignKeyType_Major));
    CHECK(song.mStatedKeys[1].mPosition == 5.0);

    // Nothing sounds before the first numeral.
    CHECK(Shown(ReadSong("m1 b2 C: I")) == "N.C.@0 C@1 end@4");
    // A numeral that is none takes the song, unless the reading is lenient.
    const std::string wrong = "m1 C: I b3 Q\nm2 V";
    CHECK(ReadSong(wrong).mChords.empty());
    CHECK(Faults(ReadSong(wrong)).substr(0, 5) == "1:12:");
    CHECK(ReadSong(wrong, {.mLenient = true}).mChords.size() > 2);
    // What is understood and left out is a note.
    const CSong noted = ReadSong("m1 C: I\nm1var1 vi\n");
    CHECK_FALSE(noted.HasFault());
    CHECK(noted.mFaults.size() == 1);
    CHECK(Shown(noted) == "C@0 end@4");
}

TEST_CASE("Numerals tell how a seventh is written, which tells a German sixth from a substitute") {
    const auto numeral = [](std::string_view text, std::size_t ix) {
        const CSong song = ReadSong(text);
        return ReadSongHarmony(song).mChords.at(ix).mNumeral;
    };
    CHECK(numeral("m1 C: I b3 Ger65/V\nm2 V/V b3 V\nm3 I b3 V\nm4 I", 1) == "Ger6/V");
    CHECK(numeral("m1 C: I b3 Ger65\nm2 V b3 V7\nm3 I b3 V\nm4 I", 1) == "Ger6");
    CHECK(numeral("m1 C: I b3 V7/bII\nm2 V b3 V7\nm3 I b3 V\nm4 I", 1) == "subV7/V");
}

TEST_CASE("A sixth that is written as one makes an augmented sixth, in chord texts and in scores") {
    const auto numeral = [](const CSong& song) {
        REQUIRE(song.mFaults.empty());
        return ReadSongHarmony(song).mChords.at(2).mNumeral;
    };
    // In jazz C7 before B7 is a substitute, unless it is written with an A sharp.
    const auto text = [&](std::string_view symbol) {
        return numeral(ReadSong(fmt::format("Em7 | F#m7b5 | {} | B7 | Em7", symbol)));
    };
    CHECK(text("C7") == "subV7/V");
    CHECK(text("C(#6)") == "Ger6");
    CHECK(text("C(#6)no5") == "It6");
    CHECK(text("C7(#6)") == "subV7/V");
    const auto score = [&](std::string_view kind) {
        std::string measures;
        const std::pair<std::string_view, std::string_view> chords[] = {{"E", "minor-seventh"},
                                                                        {"A", "minor-seventh"},
                                                                        {"C", kind},
                                                                        {"B", "dominant"},
                                                                        {"E", "minor-seventh"}};
        for (const auto& [root, word] : chords) {
            measures += fmt::format(
                "<measure><harmony><root><root-step>{}</root-step></root><kind>{}</kind></harmony>"
                "<note><rest/><duration>4</duration></note></measure>",
                root, word);
        }
        return numeral(
            ReadSong("<score-partwise><part-list><score-part id=\"P\"/></part-list>"
                     "<part id=\"P\">" +
                     measures + "</part></score-partwise>"));
    };
    CHECK(score("German") == "Ger6");
    CHECK(score("Italian") == "It6");
    CHECK(score("French") == "Fr6");
    CHECK(score("dominant") != "Ger6");
}

TEST_CASE("Bars tell what is written about jumps, each time that they are played") {
    const auto signs = [](const CSong& song) {
        std::string text;
        for (const CSongBar& bar : song.mBars) {
            text += fmt::format("{}{}{}{} ", bar.mWritten, bar.mSign == TSongSign_Segno ? "$" : "",
                                bar.mSign == TSongSign_Coda ? "@" : "",
                                bar.mWords.empty() ? "" : "(" + bar.mWords + ")");
        }
        return text;
    };
    CHECK(signs(ReadSong("C | Segno F | To Coda | G | D.S. al Coda | Coda Am")) ==
          "0 1$(To Coda) 2(D.S. al Coda) 1$(To Coda) 3@ ");
    // Where a coda is left it does not begin.
    CHECK(signs(ReadSong("C | Coda F To Coda | D.C. al Coda | Coda Am")) ==
          "0 1(To Coda, D.C. al Coda) 0 1(To Coda, D.C. al Coda) 2@ ");
    const CSong score = ReadSongFile(kLeadSheets + "/beautiful_dreamer.musicxml");
    REQUIRE(score.mBars.size() > 40);
    std::string words;
    for (const CSongBar& bar : score.mBars) {
        if (!bar.mWords.empty()) words += bar.mNumber + ": " + bar.mWords + "; ";
    }
    CHECK(words.starts_with("27: D.C. al Coda; "));
}

TEST_CASE("A parsed song has the chords that hosts get and the symbols that were typed") {
    TChordStringParse parse;
    parse.mBeatsPerBar = 3.0;
    const CSong song = ParseSong("B♭ E♭/G . | {x} Dm-7 (C) |", parse);
    CHECK(song.mSymbols == std::vector<std::string>{"B♭", "E♭/G", "x", "Dm7", "(C)"});
    REQUIRE(song.mChords.size() == 6);
    CHECK(song.mChords[0].mRootKeyEnh == CKeyEnh_Bb);
    CHECK(song.mChords[1].mBassKeyEnh == CKeyEnh_G);
    CHECK(song.mChords[2].IsUndef());
    CHECK(song.mChords[3].mPosition == 4.0);
    CHECK(song.mChords[5].mPosition == 6.0);
    CHECK(song.mBeatsPerBar == 3.0);
    CHECK(song.mFaults.empty());
}

TEST_CASE("What cannot be read is a fault and no song") {
    CHECK(Faults(ReadSongFile("/no/such/file")) == "0:0: there is no such file");
    CHECK(ReadSongFile("/no/such/file").mFormat == TSongFormat_ChordText);
    CHECK(Faults(ReadSongFile("/")) == "0:0: the file cannot be read, or is larger than 256 MiB");
    CHECK(Faults(ReadSong("<score-partwise>\n <part></parts>")).substr(0, 2) == "2:");
    std::string archive = "PK\x03\x04";
    archive.resize(100);
    CHECK(Faults(ReadSong(archive)) == "0:0: the container cannot be unpacked");
}

TEST_CASE("A text in UTF-16 is read, and what is no text is told from letters of old encodings") {
    const std::string_view littleEndian(
        "\xFF\xFE"
        "C\0 \0G\0b\0",
        10);
    const std::string_view withoutMark("\0C\0 \0G\0b", 8);
    for (const std::string_view bytes : {littleEndian, littleEndian.substr(2), withoutMark}) {
        const CSong song = ReadSong(bytes);
        CHECK(song.mFaults.empty());
        CHECK(song.mSymbols == std::vector<std::string>{"C", "Gb"});
    }
    const std::string_view score("\xFF\xFE<\0?\0x\0m\0l\0", 12);
    CHECK_FALSE(SongTextFromUtf16(score));
    CHECK_FALSE(SongTextFromUtf16("C Gb"));
    const std::string noText = "0:0: this is neither a text nor a score in MusicXML";
    CHECK(Faults(ReadSong("C G " + std::string(100, '\x05'))) == noText);
    CHECK(Faults(ReadSong("MThd" + std::string(100, '\0'))) == noText);
    CHECK(ReadSong("C    G\n" + std::string(100, '\xE9') + "\n").mFaults.empty());
}

TEST_CASE("Lead sheets become songs with the bars that are printed") {
    const CSong song = ReadSongFile(kLeadSheets + "/what_child_is_this.musicxml");
    CHECK(song.mFaults.empty());
    REQUIRE(song.mBars.size() == 35);
    // An upbeat of an eighth.
    CHECK(song.mBars[0].mLength == 0.5);
    CHECK(song.mBars[1].mPosition == 0.5);
    CHECK(song.mBars[1].mTime == CSongTime{6, 8});
    CHECK(song.mBeatsPerBar == 3.0);
    CHECK(song.mChords.back().mPosition == 102.5);
    CHECK(song.mRepeats.size() == 1);
    CHECK(song.mBars[19].mNumber == song.mBars[3].mNumber);
}

TEST_CASE("A score of odd times is a song with usual bars, and lasts as long as its last chord") {
    const auto song = [](const char* time, const char* offset) {
        return ReadSong(fmt::format(
            "<score-partwise><part-list><score-part id=\"P\"/></part-list><part id=\"P\"><measure>"
            "<attributes><divisions>1</divisions><time>{}</time></attributes><harmony><root>"
            "<root-step>C</root-step></root><kind>major</kind></harmony><harmony><root><root-step>G"
            "</root-step></root><kind>major</kind><offset>{}</offset></harmony><note><rest/>"
            "<duration>4</duration></note></measure></part></score-partwise>",
            time, offset));
    };
    CHECK(Shown(song("<beats>4</beats><beat-type>4</beat-type>", "6")) == "C@0 G@6 end@6");
    CHECK(song("<beats>6</beats><beat-type>8</beat-type>", "1").mBeatsPerBar == 3.0);
    CHECK(song("<beats>1</beats><beat-type>512</beat-type>", "1").mBeatsPerBar == 4.0);
    CHECK(song("<beats>5000</beats><beat-type>4</beat-type>", "1").mBeatsPerBar == 4.0);
}

TEST_CASE("A song that lasts longer than anybody plays has no times") {
    for (const double position : {0.0, 999'999'999.0}) {
        CSong song = ReadSong("C");
        song.mChords.back().mPosition = position;
        CHECK(HasTimes(song));
    }
    for (const double position : {-1.0, 1e9, std::nan("")}) {
        CSong song = ReadSong("C");
        song.mChords.back().mPosition = position;
        CHECK_FALSE(HasTimes(song));
    }
}

TEST_CASE("A song moves into the key that has its kind of signs") {
    const auto moved = [](const char* text, int semitones) {
        return Played(TransposeSong(ReadSong(text), semitones));
    };
    CHECK(moved("{key: Db}\n[Db] [Gbm] [Ab7]", 5) == "Gb Cbm Db7");
    CHECK(moved("{key: E}\n[E] [Am] [B7]", 2) == "F# Bm C#7");
    CHECK(moved("{key: C}\n[C] [Fm/Ab]", 12) == "C Fm/Ab");
}

TEST_CASE("A song of a score is analysed as the score itself is") {
    for (const auto& entry : std::filesystem::directory_iterator(kLeadSheets)) {
        if (entry.path().extension() == ".txt") continue;
        const std::string path = entry.path().string();
        CAPTURE(path);
        TMusicXMLDoc doc;
        REQUIRE(doc.LoadAsPlayed(path));
        CHarmonicAnalyse analyse;
        analyse.AnalyseFromMusicXMLDoc(doc, TAnalyse_TonicProgressions);
        const CSong song = ReadSongFile(path);
        CHECK(song.mFaults.empty());
        CHECK(song.mTitle == doc.Title);
        const CSongAnalysis found = AnalyseSong(song);
        CHECK(found.mAnalyse.mSignKeys == analyse.mSignKeys);
        CHECK(found.mNumerals.size() == song.mChords.size());
    }
}

TEST_CASE("A song is analysed in the key that it states, or in the one that is given") {
    CSong song = ReadSong("{key: A minor}\n[Am] [Dm] [E7] [Am] [Am] [Dm] [E7] [Am]");
    CAnalyseSongOptions options;
    options.mReadings = options.mCopies = true;
    const CSongAnalysis stated = AnalyseSong(song, options);
    REQUIRE_FALSE(stated.mAnalyse.mSignKeys.empty());
    CHECK(stated.mAnalyse.mSignKeys[0].mSignKey == CSignKeyLite("A minor"));
    CHECK(stated.mKeys.mKey == CSignKeyLite("A minor"));
    CHECK(stated.mNumerals[2] == "V7");
    CHECK(stated.mCopies.size() == 1);
    CHECK_FALSE(stated.mReadings.empty());
    StateKey(CSignKeyLite_Undef, song);
    CHECK(song.mStatedKey == CSignKeyLite("A minor"));
    StateKey(CSignKeyLite("E major"), song);
    CHECK(song.mStatedKey == CSignKeyLite("E major"));
    CHECK(AnalyseSong(song, options).mAnalyse.mSignKeys[0].mSignKey == CSignKeyLite("E major"));
    CHECK(AnalyseSong(CSong()).mNumerals.empty());
}
