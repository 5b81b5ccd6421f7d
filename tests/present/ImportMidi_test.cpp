// SPDX-License-Identifier: MIT
#include "brindle/present/ImportMidi.h"

#include "brindle/musicxml/MusicXmlParser.h"
#include "brindle/platform/Error.h"
#include "brindle/present/ImportText.h"

#include <doctest/doctest.h>

#include <memory>
#include <string>

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

std::string Pitched(const std::string& tie) {
    return "<note><pitch><step>C</step><octave>4</octave></pitch><duration>1</duration>" + tie +
           "<voice>1</voice></note>";
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

TEST_CASE("A note whose tie does not end sounds as long as it is written, and is told") {
    const CImportedScore score =
        Import("", Pitched("<tie type='start'/>") +
                       Pitched("<tie type='stop'/><tie type='start'/>") + Drum(""));
    const CMidiPiece piece = MidiPieceOf(score);
    const auto& notes = piece.mTracks[0].mNotes;
    REQUIRE(notes.size() == 2);
    CHECK(notes[1].mNoteNr == 60);
    CHECK(notes[1].mTick == 0);
    CHECK(notes[1].mDuration == 1920);
    CHECK(notes[1].mChannel == 0);
    CHECK(ImportText(score, CPaint(false))
              .find("The tie of C4 at 0 does not end; it is played for "
                    "2 quarters\n") != std::string::npos);
    const CImportedScore shorter = Import("", Pitched("<tie type='start'/>"));
    CHECK(ImportText(shorter, CPaint(false)).ends_with("it is played for 1 quarter\n"));
}

TEST_CASE("A tie that ends is one note and nothing is told") {
    const CImportedScore score =
        Import("", Pitched("<tie type='start'/>") + Pitched("<tie type='stop'/>"));
    const CMidiPiece piece = MidiPieceOf(score);
    REQUIRE(piece.mTracks[0].mNotes.size() == 1);
    CHECK(piece.mTracks[0].mNotes[0].mDuration == 1920);
    CHECK(ImportText(score, CPaint(false)).find("does not end") == std::string::npos);
}

TEST_CASE("Parts without a channel go around that of drums") {
    CImportedScore score;
    score.mParts.resize(17);
    for (CImportedPart& part : score.mParts) {
        CImportedEvent note;
        note.mIsNote = true;
        note.mLength = 960;
        note.mNoteNr = 60;
        part.mEvents.push_back(note);
    }
    const CMidiPiece piece = MidiPieceOf(score);
    CHECK(piece.mTracks[8].mNotes[0].mChannel == 8);
    CHECK(piece.mTracks[9].mNotes[0].mChannel == 10);
    CHECK(piece.mTracks[14].mNotes[0].mChannel == 15);
    CHECK(piece.mTracks[15].mNotes[0].mChannel == 0);
}

}  // namespace
}  // namespace brindle::test
