// SPDX-License-Identifier: MIT
#include "brindle/musicxml/ChordsFromNotes.h"
#include "brindle/platform/Alerts.h"
#include "brindle/platform/AtomicFile.h"
#include "brindle/platform/Error.h"

#include <doctest/doctest.h>

#include <sstream>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

CScoreNotes ScoreOf(const std::string& file) {
    const auto bytes = ReadWholeFile(BRINDLE_SOURCE_DIR "/examples/scores/" + file);
    CScoreNotes score;
    Error error;
    CHECK_MESSAGE(ReadScoreNotes(bytes.value(), score, &error), error.description);
    return score;
}

CScoreNotes FourFour(int bars, const std::vector<CTimedNote>& notes) {
    CScoreNotes score;
    for (int bar = 0; bar < bars; ++bar) score.mBars.push_back({4.0 * bar, 4.0 * bar + 4.0, 1.0});
    score.mNotes = notes;
    return score;
}

std::vector<CTimedNote> Chord(double position, double length, const std::vector<int>& numbers) {
    std::vector<CTimedNote> notes;
    for (const int number : numbers) {
        notes.push_back({position, length, CNote(number, TEnh_Undef)});
    }
    return notes;
}

std::string Text(const CChordsFromNotes& chords) {
    std::ostringstream text;
    for (const CChordFromNotes& chord : chords.mChords) {
        text << chord.mPosition << '+' << chord.mLength << ' ' << chord.mChord.mSymbol << "  ";
    }
    return text.str();
}

TEST_CASE("A prelude of broken chords has the chords that musicians hear in it") {
    const CScoreNotes score = ScoreOf("prelude-in-c.musicxml");
    const std::string bars =
        "0+4 C  4+4 Dm7/C  8+4 G7/B  12+4 C  16+4 Am/C  20+4 D7/C  24+4 G/B  28+4 Cmaj7/B  "
        "32+4 Am7  36+4 D7  40+4 G  ";
    const CChordsFromNotes changes = ChordsFromNotes(score);
    CHECK(Text(changes) == bars);
    CHECK(changes.mKey == CSignKeyLite(CKeyEnh_C, TSignKeyType_Major));
    CHECK(Text(ChordsFromNotes(score, {.mEvery = TChordEvery::Bar, .mKey = {}})) == bars);
    const auto beats = ChordsFromNotes(score, {.mEvery = TChordEvery::Beat, .mKey = {}});
    CHECK(beats.mChords.size() == 44);
    CHECK(beats.mChords[25].mChord.mSymbol == "G/B");
}

TEST_CASE("Passing notes do not make chords, and silence does not end one") {
    std::vector<CTimedNote> notes = Chord(0.0, 2.0, {48, 64, 67});
    notes.push_back({0.0, 0.75, CNote(72, TEnh_n)});
    notes.push_back({0.75, 0.25, CNote(74, TEnh_n)});  // D on the way from C to E
    notes.push_back({1.0, 1.0, CNote(76, TEnh_n)});
    for (const CTimedNote& note : Chord(4.0, 4.0, {43, 59, 62, 65})) notes.push_back(note);
    CHECK(Text(ChordsFromNotes(FourFour(2, notes))) == "0+4 C  4+4 G7  ");
    CHECK(Text(ChordsFromNotes(FourFour(2, notes), {.mEvery = TChordEvery::Beat, .mKey = {}})) ==
          "0+1 C  1+1 C  4+1 G7  5+1 G7  6+1 G7  7+1 G7  ");
}

TEST_CASE("What many parts play in unison counts once, and a high note in front is no bass") {
    std::vector<CTimedNote> notes = Chord(0.0, 4.0, {48, 64, 67});
    for (int part = 0; part < 30; ++part) notes.push_back({0.25, 0.25, CNote(74, TEnh_n)});
    CHECK(Text(ChordsFromNotes(FourFour(1, notes))) == "0+4 C  ");
    // An upbeat to the left hand: the C below comes behind the G.
    notes = Chord(0.0, 0.5, {79});
    for (const CTimedNote& note : Chord(0.5, 3.5, {48, 64, 67})) notes.push_back(note);
    CHECK(Text(ChordsFromNotes(FourFour(1, notes))) == "0+4 C  ");
}

TEST_CASE(
    "The bass of a bar is the lowest note of its first beat, and may be foreign to its chord") {
    std::vector<CTimedNote> notes = Chord(0.0, 4.0, {60, 64, 67});
    notes.push_back({2.0, 2.0, CNote(43, TEnh_n)});
    const auto chordOf = [](const std::vector<CTimedNote>& of) {
        return Text(ChordsFromNotes(FourFour(1, of), {.mEvery = TChordEvery::Bar, .mKey = {}}));
    };
    CHECK(chordOf(notes) == "0+4 C  ");
    CHECK(chordOf(Chord(0.0, 4.0, {42, 55, 60, 64, 67, 72})) == "0+4 C/F#  ");
}

TEST_CASE("A stated key is kept and spells the chords") {
    const CScoreNotes score = FourFour(1, Chord(0.0, 4.0, {54, 58, 61}));
    const CSignKeyLite fSharp(CKeyEnh_Fis, TSignKeyType_Major);
    const CSignKeyLite gFlat(CKeyEnh_Gb, TSignKeyType_Major);
    CHECK(Text(ChordsFromNotes(score, {.mEvery = TChordEvery::Bar, .mKey = fSharp})) == "0+4 F#  ");
    CHECK(Text(ChordsFromNotes(score, {.mEvery = TChordEvery::Bar, .mKey = gFlat})) == "0+4 Gb  ");
}

TEST_CASE("Scores with nothing in them, or with too much, have no chords too many") {
    CHECK(ChordsFromNotes({}).mChords.empty());
    CHECK(ChordsFromNotes({}).mKey.IsUndef());
    CHECK(ChordsFromNotes(FourFour(3, {})).mChords.empty());
    CScoreNotes long64 = FourFour(1, Chord(0.0, 1e9, {60, 64, 67}));
    long64.mBars = {{0.0, 1e9, 1.0 / 16}};
    CHECK(Text(ChordsFromNotes(long64, {.mEvery = TChordEvery::Beat, .mKey = {}})) ==
          "0+1e+09 C  ");
    // Notes beyond the bars are not heard.
    CHECK(ChordsFromNotes(FourFour(1, Chord(8.0, 1.0, {60}))).mChords.empty());
}

TEST_CASE("Notes are read as they sound: ties are one note, grace notes none") {
    const auto pitch = [](const char* step, const char* octave) {
        return std::string("<pitch><step>") + step + "</step><octave>" + octave +
               "</octave></pitch>";
    };
    const std::string xml =
        "<score-partwise><part-list><score-part id='P1'><part-name>C</part-name></score-part>"
        "</part-list><part id='P1'><measure number='1'><attributes><divisions>1</divisions>"
        "<time><beats>4</beats><beat-type>4</beat-type></time>"
        "<transpose><chromatic>-2</chromatic></transpose></attributes>"
        "<note><grace/>" +
        pitch("B", "4") + "</note><note>" + pitch("D", "4") +
        "<duration>4</duration><tie type='start'/></note></measure><measure number='2'><note>" +
        pitch("D", "4") +
        "<duration>4</duration><tie type='stop'/></note></measure></part></score-partwise>";
    CScoreNotes score;
    REQUIRE(ReadScoreNotes(xml, score));
    REQUIRE(score.mNotes.size() == 1);
    CHECK(score.mNotes[0].mNote.mNoteNr == 60);
    CHECK(score.mNotes[0].mNote.mEnh == TEnh_Undef);
    CHECK(score.mNotes[0].mLength == 8.0);
    CHECK(score.mBars.size() == 2);
}

TEST_CASE("What is no score tells why") {
    CScoreNotes score;
    Error error;
    std::vector<std::string> alerts;
    SetAlertHandler([&alerts](const CAlert& alert) { alerts.push_back(alert.informativeText); });
    CHECK_FALSE(ReadScoreNotes("no score", score, &error));
    CHECK_FALSE(error.description.empty());
    CHECK_MESSAGE(alerts.empty(), "who is told the error is not shown an alert, too");
    ShowAlert({.messageText = {}, .informativeText = "another", .button = {}});
    CHECK(alerts == std::vector<std::string>{"another"});
    SetAlertHandler({});
    CHECK_FALSE(ReadScoreNotes("PK\x03\x04", score, &error));
    CHECK(score.mNotes.empty());
}

}  // namespace
}  // namespace brindle::test
