// SPDX-License-Identifier: MIT
#include "brindle/present/ImportMidi.h"

#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/platform/Error.h"
#include "brindle/present/ImportText.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <algorithm>
#include <memory>
#include <sstream>
#include <string>
#include <tuple>
#include <vector>

namespace brindle::test {
namespace {

CImportedScore Import(const std::string& midiInstruments, const std::string& notes) {
    const std::string bytes =
        "<score-partwise><part-list><score-part id='P1'><part-name>Kit</part-name>"
        "<score-instrument id='I36'><instrument-name>Bass Drum</instrument-name></score-instrument>"
        "<score-instrument id='I42'><instrument-name>Hi-Hat</instrument-name></score-instrument>" +
        midiInstruments +
        "</score-part></part-list><part id='P1'><measure number='1'><attributes>"
        "<divisions>1</divisions></attributes>" +
        notes + "</measure></part></score-partwise>";
    CImportedScore score;
    MusicXmlParser parser;
    parser.MidiTicksPerQuarter = kImportTicksPerQuarter;
    Error error;
    const auto host = std::make_shared<MusicXmlParserDelegate>(HostFor(score));
    INFO(error.description);
    REQUIRE(parser.parseBytes(bytes, host, &error));
    return score;
}

std::string Instrument(const std::string& id, int key, const std::string& channel = "") {
    return "<midi-instrument id='" + id + "'>" + channel + "<midi-unpitched>" +
           std::to_string(key + 1) + "</midi-unpitched></midi-instrument>";
}

std::string Drum(const std::string& instrument) {
    const std::string named =
        instrument.empty() ? std::string() : "<instrument id='" + instrument + "'/>";
    return "<note><unpitched><display-step>F</display-step><display-octave>4</display-octave>"
           "</unpitched><duration>1</duration>" +
           named + "<voice>1</voice></note>";
}

TEST_CASE("A drum sounds with the key of its instrument, on the channel of drums") {
    const CMidiPiece piece = MidiPieceOf(
        Import(Instrument("I36", 36) + Instrument("I42", 42), Drum("I36") + Drum("I42")));
    REQUIRE(piece.mTracks.size() == 1);
    const auto& notes = piece.mTracks[0].mNotes;
    REQUIRE(notes.size() == 2);
    CHECK(notes[0].mNoteNr == 36);
    CHECK(notes[1].mNoteNr == 42);
    CHECK(notes[0].mChannel == 9);
    CHECK(notes[1].mTick == 960);
}

TEST_CASE(
    "A score that tells a channel for its drums is obeyed, and staff places are the last resort") {
    const std::string fifth = "<midi-channel>5</midi-channel>";
    const CMidiPiece told =
        MidiPieceOf(Import(Instrument("I36", 36, fifth) + Instrument("I42", 42), Drum("I36")));
    CHECK(told.mTracks[0].mNotes.at(0).mChannel == 4);
    // An only instrument plays the notes that name none.
    const CMidiPiece only = MidiPieceOf(Import(Instrument("I36", 36), Drum("")));
    CHECK(only.mTracks[0].mNotes.at(0).mNoteNr == 36);
    const CMidiPiece untold = MidiPieceOf(Import("", Drum("")));
    CHECK(untold.mTracks[0].mNotes.at(0).mNoteNr == 65);
    CHECK(untold.mTracks[0].mNotes.at(0).mChannel == 9);
    const CMidiPiece placeless =
        MidiPieceOf(Import("", "<note><unpitched/><duration>2</duration></note>" + Drum("")));
    REQUIRE(placeless.mTracks[0].mNotes.size() == 2);
    CHECK(placeless.mTracks[0].mNotes[0].mNoteNr == 38);
    CHECK(placeless.mTracks[0].mNotes[0].mChannel == 9);
    CHECK(placeless.mTracks[0].mNotes[0].mDuration == 1920);
}

TEST_CASE(
    "Parts with one identifier share no instruments, so that no score takes quadratic memory") {
    const CImportedScore score =
        Import(Instrument("I36", 36),
               Drum("") + "</measure></part><part id='P1'><measure number='1'>" + Drum(""));
    REQUIRE(score.mParts.size() == 2);
    CHECK(score.mParts[0].mInstruments.size() == 1);
    CHECK(score.mParts[1].mInstruments.empty());
}

TEST_CASE("Numbers that MIDI does not have are as not told") {
    for (const char* const number : {"0", "-3", "129", "99999999999", "abc", ""}) {
        INFO(number);
        const std::string unpitched = fmt::format("<midi-unpitched>{}</midi-unpitched>", number);
        const CMidiPiece piece = MidiPieceOf(
            Import("<midi-instrument id='I36'><midi-channel>17</midi-channel><midi-program>0"
                   "</midi-program>" +
                       unpitched + "</midi-instrument>",
                   Drum("I36")));
        REQUIRE(piece.mTracks[0].mNotes.size() == 1);
        CHECK(piece.mTracks[0].mNotes[0].mNoteNr == 65);
        CHECK(piece.mTracks[0].mNotes[0].mChannel == 9);
        CHECK(piece.mTracks[0].mPrograms.empty());
    }
    const CMidiPiece last = MidiPieceOf(Import(Instrument("I36", 127), Drum("I36")));
    CHECK(last.mTracks[0].mNotes.at(0).mNoteNr == 127);
}

TEST_CASE("Of several instruments the first that tells a key plays drums that name none") {
    const std::string silent =
        "<midi-instrument id='I35'><midi-channel>3</midi-channel></midi-instrument>";
    const std::string notes = Drum("") + Drum("I99") + Drum("I36");
    const auto keys = [&](const std::string& instruments) {
        std::vector<int> all;
        const CMidiPiece piece = MidiPieceOf(Import(instruments, notes));
        for (const CMidiNote& note : piece.mTracks[0].mNotes) all.push_back(note.mNoteNr);
        return all;
    };
    CHECK(keys(silent + Instrument("I42", 42) + Instrument("I36", 36)) ==
          std::vector<int>{42, 42, 36});
    CHECK(keys(silent + "<midi-instrument id='I42'/>") == std::vector<int>{38, 38, 38});
}

// Notes of a part as "key begin-end" in quarters, and behind them those whose ties are told.
std::string Played(const std::string& notes) {
    const CImportedScore score = Import("", notes);
    std::vector<CMidiNote> all = MidiPieceOf(score).mTracks[0].mNotes;
    std::sort(all.begin(), all.end(), [](const CMidiNote& a, const CMidiNote& b) {
        return std::tie(a.mTick, a.mNoteNr) < std::tie(b.mTick, b.mNoteNr);
    });
    std::string text;
    for (const CMidiNote& note : all) {
        text += fmt::format("{} {}-{}, ", note.mNoteNr, note.mTick / 960,
                            (note.mTick + note.mDuration) / 960);
    }
    for (const CImportedEvent& note : score.mParts[0].mNotesLeftOpen) {
        text += fmt::format("open {} {}, ", note.mWhat, note.mPosition / 960);
    }
    return text;
}

// "C4" with the ties "(" for its start and ")" for its end, "+" for a note of the chord before, and
// the length in quarters behind ":".
std::string Written(const std::string& words) {
    std::string xml;
    std::istringstream stream(words);
    for (std::string word; stream >> word;) {
        const bool isOfChord = word[0] == '+';
        if (isOfChord) word.erase(0, 1);
        const auto has = [&word](char c) { return word.find(c) != std::string::npos; };
        const char length = has(':') ? word[word.find(':') + 1] : '1';
        xml += fmt::format(
            "<note>{}<pitch><step>{}</step><octave>{}</octave></pitch><duration>{}</duration>{}{}"
            "<voice>1</voice></note>",
            isOfChord ? "<chord/>" : "", word[0], word[1], length,
            has(')') ? "<tie type='stop'/>" : "", has('(') ? "<tie type='start'/>" : "");
    }
    return xml;
}

TEST_CASE("A tie leads to the note that adjoins, and all notes that are written are heard") {
    struct CRow {
        const char* mWritten;
        const char* mPlayed;
    };
    const CRow rows[] = {
        {"C4( C4)", "60 0-2, "},
        {"C4( C4)( C4):2", "60 0-4, "},
        {"C4( D4 C4( C4)", "60 0-1, 62 1-2, 60 2-4, open C4 0, "},
        {"C4( D4 C4(:2 C4):2", "60 0-1, 62 1-2, 60 2-6, open C4 0, "},
        {"C4( D4 C4)", "60 0-1, 62 1-2, 60 2-3, open C4 0, "},
        {"C4( C4 C4)", "60 0-1, 60 1-2, 60 2-3, open C4 0, "},
        {"C4) D4", "60 0-1, 62 1-2, "},
        {"C4):2 C4( E4(", "60 0-2, 60 2-3, 64 3-4, open C4 2, open E4 3, "},
        {"C4)( C4) C4(", "60 0-2, 60 2-3, open C4 2, "},
        {"C4( +E4( C4) +E4)", "60 0-2, 64 0-2, "},
        {"C4( +E4 C4) +G4", "60 0-2, 64 0-1, 67 1-2, "},
        {"C4 +E4( D4 +E4) F4", "60 0-1, 64 0-2, 62 1-2, 65 2-3, "},
    };
    for (const CRow& row : rows) {
        INFO(row.mWritten);
        CHECK(Played(Written(row.mWritten)) == row.mPlayed);
    }
}

TEST_CASE("A tie that does not end is told with how long it is played") {
    const CImportedScore score = Import("", Written("C4( C4)( D4"));
    CHECK(ImportText(score, CPaint(false))
              .find("The tie of C4 at 0 does not end; it is played for "
                    "2 quarters\n") != std::string::npos);
    const CImportedScore shorter = Import("", Written("C4("));
    CHECK(ImportText(shorter, CPaint(false)).ends_with("it is played for 1 quarter\n"));
    const CImportedScore whole = Import("", Written("C4( C4)"));
    CHECK(ImportText(whole, CPaint(false)).find("does not end") == std::string::npos);
}

TEST_CASE("Pitched notes keep their pitch where the instrument has a drum key") {
    const CMidiPiece piece = MidiPieceOf(Import(Instrument("I36", 36), Written("C4") + Drum("")));
    REQUIRE(piece.mTracks[0].mNotes.size() == 2);
    CHECK(piece.mTracks[0].mNotes[0].mNoteNr == 60);
    CHECK(piece.mTracks[0].mNotes[1].mNoteNr == 36);
}

TEST_CASE("The key of a clarinet in B flat is that which sounds") {
    const CMidiPiece piece =
        MidiPieceOf(Import("",
                           "<attributes><key><fifths>3</fifths></key><transpose>"
                           "<diatonic>-1</diatonic><chromatic>-2</chromatic></transpose>"
                           "</attributes>" +
                               Written("A4")));
    REQUIRE(piece.mKeySignatures.size() == 1);
    CHECK(piece.mKeySignatures[0].mSharps == 1);
    CHECK(piece.mTracks[0].mNotes.at(0).mNoteNr == 67);
}

TEST_CASE("Parts without a channel go around that of drums") {
    CImportedScore score;
    score.mParts.resize(17);
    for (CImportedPart& part : score.mParts) {
        CPlayedNote& note = part.mPlayedNotes.emplace_back();
        note.mLength = 960;
        note.mNoteNr = 60;
    }
    const CMidiPiece piece = MidiPieceOf(score);
    CHECK(piece.mTracks[8].mNotes[0].mChannel == 8);
    CHECK(piece.mTracks[9].mNotes[0].mChannel == 10);
    CHECK(piece.mTracks[14].mNotes[0].mChannel == 15);
    CHECK(piece.mTracks[15].mNotes[0].mChannel == 0);
}

}  // namespace
}  // namespace brindle::test
