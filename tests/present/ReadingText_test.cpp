// SPDX-License-Identifier: MIT
#include "brindle/present/ReadingText.h"

#include "brindle/present/CBars.h"
#include "brindle/present/Explain.h"
#include "brindle/present/ShownText.h"
#include "brindle/song/ReadSong.h"
#include "brindle/song/ReadSongHarmony.h"

#include <doctest/doctest.h>

#include <sstream>
#include <string>

namespace brindle::test {
namespace {

std::string Shown(const CSong& song, const CReadingTextOptions& options = {}) {
    return ReadingText(song, ReadSongHarmony(song), options, CPaint(false));
}

std::string Shown(std::string_view text, const CReadingTextOptions& options = {}) {
    return Shown(ReadSong(text), options);
}

bool Has(const std::string& text, std::string_view part) {
    return text.find(part) != text.npos;
}

TEST_CASE("Bars beyond all songs are counted without overflow") {
    CSong song = ReadSong("C F G C");
    song.mBeatsPerBar = 5e-324;
    CHECK(Has(Shown(song), "x 999999999999999 |"));
    const CBars bars(song.mBeatsPerBar);
    CHECK(bars.BarOf(1e9) > 1'000'000);
    CHECK(bars.BarOf(-1e9) < -1'000'000);
    CHECK(bars.LastBarBefore(1e9) == bars.BarOf(1e9) - 1);
}

TEST_CASE("A song stands four bars a line, chords over numerals, keys where they change") {
    CHECK(Shown("Dm7 G7 | Cmaj7 | Fm7 Bb7 | Ebmaj7 | Am7b5 D7 | Gm |") ==
          "6 bars\n"
          "\n"
          "Key of the song C major, doubtful (confidence 0.54)\n"
          "\n"
          "    C major               Eb major\n"
          "1 | Dm7      G7 | Cmaj7 | Fm7       Bb7 | Ebmaj7 |\n"
          "  | ii7      V7 | I^7   | ii7       V7  | I^7    |\n"
          "\n"
          "    G minor\n"
          "5 | Am7b5    D7 | Gm    |\n"
          "  | iih7     V7 | i     |\n"
          "\n"
          "Notes\n"
          "  bars 1 to 2: ii V I of C major\n"
          "  bars 3 to 4: ii V I of Eb major\n"
          "  bars 5 to 6: ii V i of G minor\n");
}

TEST_CASE("Parts that begin in one bar are all named") {
    CHECK(Has(Shown("Verse: A D E\nChorus: D A E A"), "\nVerse, Chorus\n1 | A "));
}

TEST_CASE("A line has as many bars as its width holds, and no line is wider") {
    std::string text;
    for (int i = 0; i < 12; ++i) text += "Ebmaj7 Cm7b5 F7b9 Bbmaj7 | ";
    for (const std::size_t width : {200U, 80U, 40U}) {
        const std::string shown = Shown(text, {.mWidth = width});
        std::istringstream lines(shown);
        std::size_t widest = 0;
        for (std::string line; std::getline(lines, line);) {
            if (Has(line, "|")) widest = std::max(widest, CountCharacters(line));
        }
        CAPTURE(shown);
        CHECK(widest <= width);
    }
}

TEST_CASE("A crowded bar narrows no other line") {
    const std::string shown =
        Shown("C | F | G7 | C | Am E7/G# Am/G D7/F# F6 C/E | Dm7 | G7 | C | F | G7 | C | C |",
              {.mWidth = 40});
    CHECK(Has(shown,
              " 1 | C  | F  | G7 | C |\n"
              "   | I  | IV | V7 | I |\n"
              "\n"
              " 5 | Am  E7/G#  Am/G  D7/F#  F6   C/E |\n"
              "   | vi  V7/vi  vi    V7/V   IV6  I   |\n"
              "\n"
              " 6 | Dm7                              |\n"
              "   | ii7                              |\n"
              "\n"
              " 7 | G7 | C |\n"));
    CHECK(Has(shown, "\n 9 | F  | G7 | C  | C |\n"));
    CHECK(Has(Shown("C C C C | F F G G | C . C G7 |"), "1 | C | F   G | C  G7 |\n"));
}

TEST_CASE("What repeats is told in whole bars") {
    const std::string shown =
        Shown("C | Am | F | G | C | Am | Dm | E7 | C | Am | F | G | C | Am | Dm | E7 | Am |");
    CHECK(Has(shown, "  bars 9 to 16 repeat bars 1 to 8\n"));
}

TEST_CASE("Bars that have other numbers in their source are said to be counted anew") {
    const std::string_view word = "counted from 1 as they are played";
    CHECK(!Has(Shown("C | F | G7 | C |"), word));
    CHECK(Has(Shown("|: C | F :| G7 | C |"), "6 bars, counted from 1 as they are played\n"));
    CHECK(Has(Shown("m0 b4 C: V\nm1 I\n"), "2 bars of 4/4, counted from 1 as they are played\n"));
    // A time is told where all bars have it.
    CHECK(Has(Shown("Time Signature: 4/4\nm1 C: I\nTime Signature: 3/4\nm2 V\n"), "2 bars\n"));
}

TEST_CASE("Bars that hold a chord show it, and a long row of them its number") {
    const std::string held = Shown("C | . | F G | . Am | C |");
    CAPTURE(held);
    CHECK(Has(held, "1 | C | . | F   G | .  Am |\n"));
    CSong song = ReadSong("C F G7 C");
    song.mBars.clear();
    song.mChords.back().mPosition = 4000.0;
    CHECK(Has(Shown(song), ". x 999 |"));
}

TEST_CASE("Notes tell ii V I with all its places") {
    const std::string shown = Shown("C | Dm7 G7 | C | F | Dm7 G7 | C |");
    CHECK(Has(shown, "  bars 2 to 3, bars 5 to 6: ii V I of C major\n"));
}

TEST_CASE("A tonic that comes behind other chords is not noted with its ii V") {
    const std::string shown = Shown("C6 A7 | Dm7 G7 | Em7 A7 | Dm7 G7 | C6 |");
    CHECK(Has(shown, "  bar 2: ii V of C major\n"));
    CHECK(Has(shown, "  bars 4 to 5: ii V I of C major\n"));
    CHECK(Has(Shown("C | Dm7 G7sus4 | G7 | C |"), "  bars 2 to 4: ii V I of C major\n"));
}

TEST_CASE("A tonic with the other third is noted by its name") {
    CHECK(Has(Shown("C | Dm7 G7 | Cm | F | G7 | C |"), "  bars 2 to 3: ii V of C major, to Cm\n"));
    CHECK(Has(Shown("Am | Bm7b5 E7 | Am | Bm7b5 E7 | A |"),
              "  bars 4 to 5: ii V of A minor, to A\n"));
}

TEST_CASE("Of seconds and dominants that lead to one tonic the last ones are noted") {
    const std::string shown = Shown("Gm7 C7 | Gm7 C7 | Gm7 C7 | F | Dm7 | Db7 C7 Db7 C7 | F |");
    CHECK(Has(shown, "  bars 3 to 4: ii V I of F major\n"));
    CHECK(Has(shown, "  bar 6: Db7 is a substitute dominant, subV7/V of F major\n"));
}

TEST_CASE("Chains of dominants are noted without other forms of one of them") {
    CHECK(Has(Shown("C E7 | A7 D7 | G7 C |"),
              "  bars 1 to 3: E7 A7 D7 G7: each the dominant of the next\n"));
    CHECK(!Has(Shown("C D7 | G7sus4 G7 | C |"), "each the dominant"));
    CHECK(
        !Has(Shown("G | D7 | G | D7 | G | G | Em | D#dim7 | Em | Am | C7 B | B7 | F#7/C# Em/B B7 | "
                   "Em | B7 | Em | D7 | G | D7 | G |"),
             "each the dominant"));
    CHECK(!Has(Shown("C | G D7 | G7 C | F | G7 | C |"), "each the dominant"));
    CHECK(Has(Shown("Cmaj7 Eb7 | D7 Db7 | Cmaj7 |"),
              "  bars 1 to 2: Eb7 D7 Db7: each the dominant of the next, or its substitute\n"));
}

TEST_CASE("Chords with a name of their own are noted by it, in numbers, too") {
    const CSong song =
        ReadSong("C | D7b5/Ab | G | C | Ab7no5 | G | C | Ab7 | G | C | Db/F | G | Db | G | C");
    const CSongReading plain = ReadSongHarmony(song);
    for (const CNumeralOptions& options :
         {CNumeralOptions{}, CNumeralOptions{.mNashville = true}}) {
        const CSongReading reading = WithNumerals(plain, song.mChords, options);
        const std::string shown = ReadingText(song, reading, {}, CPaint(false));
        CHECK(Has(shown, "D7b5/Ab is the French sixth of C major\n"));
        CHECK(Has(shown, "Ab7no5 is the Italian sixth of C major\n"));
        CHECK(Has(shown, "Ab7 is the German sixth of C major\n"));
        CHECK(Has(shown, "Db/F is the Neapolitan sixth of C major\n"));
        CHECK(Has(shown, "Db is the Neapolitan chord of C major\n"));
        CHECK(Explain(song, reading)[1] ==
              "D7b5/Ab is the French sixth of C major and opens to G.");
    }
}

TEST_CASE("Regions show all their numerals, on as many lines as these take") {
    const CSong song = ReadSong("C | Am | Dm | G7 | C | Am | Dm | G7 | C | F | C |");
    const std::string shown =
        RegionsText(song, ReadSongHarmony(song), {.mWidth = 52}, CPaint(false));
    CHECK(Has(shown,
              "  C major  bars 1 to 11  I vi ii V7 I vi ii V7 I IV\n"
              "                         I\n"));
}

TEST_CASE("Keys that contradict are told") {
    CSong song = ReadSong("C | F | G7 | C | F | G7 | C |");
    CHECK(!Has(Shown(song), "stated"));
    song.mStatedKey = CSignKeyLite({9, TEnh_n}, TSignKeyType_Minor);
    CHECK(Has(Shown(song), "A minor is the stated key; the chords alone would show C major.\n"));
    song.mFormat = TSongFormat_MusicXml;
    CHECK(Has(Shown(song), "The stated key is A minor, but the chords show C major.\n"));
}

TEST_CASE("A key in which no passage is heard is told to be one") {
    const std::string_view word =
        "No passage is heard in C major itself, only in keys around it.\n";
    CHECK(Has(Shown("C D"), word));
    CHECK(!Has(Shown("C F G7 C"), word));
}

TEST_CASE("Well-known forms have one key, the one that musicians name") {
    CHECK(Has(Shown("Am | F | C | G | Am | F | C | G |"), "Key of the song C major"));
    CHECK(Has(Shown("C7 | F7 | C7 | C7 | F7 | F7 | C7 | C7 | G7 | F7 | C7 | G7 |"),
              "Key of the song C major"));
    CHECK(Has(Shown("Bb6 G7 | Cm7 F7 | Bb6 G7 | Cm7 F7 | Bb7 | Eb7 | Bb6 F7 | Bb6 | D7 | . | G7 | "
                    ". | C7 | . | F7 | . |"),
              "Key of the song Bb major"));
}

TEST_CASE("A song without chords, or with chords in no time, is shown as such") {
    CHECK(Shown("") == "No key: no chords\n");
    CSong song = ReadSong("C F G7 C");
    for (CHarmAnlsChordWithPos& chord : song.mChords) chord.mPosition = kPosUndef;
    CHECK(Has(Shown(song), "Key of the song"));
}

}  // namespace
}  // namespace brindle::test
