// SPDX-License-Identifier: MIT
#include "brindle/present/MarkovMidi.h"
#include "brindle/present/MarkovText.h"

#include "brindle/markov/MarkovChords.h"

#include <doctest/doctest.h>

#include <cstdlib>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

/// A sequence of a model that knows nothing else.
class CTypedSequence {
public:
    explicit CTypedSequence(std::string_view text) {
        std::vector<CMarkovObject> objects;
        MarkovObjectsVectorForHarmChords(HarmChordsFromChordString(text), objects);
        mSequence = mModel.IteratorSequenceForObjects(objects);
    }

    [[nodiscard]] const MarkovSequence& Sequence() const { return mSequence; }

private:
    VariableLengthMarkovModel mModel;
    MarkovSequence mSequence;
};

std::string Spelled(std::string_view text) {
    const CTypedSequence typed(text);
    return ChordString(typed.Sequence(), CMarkovSpelling(typed.Sequence()));
}

TEST_CASE("A sequence is spelled in its key, whatever songs its chords come from") {
    // Db major, with an F sharp from a song in sharps.
    CHECK(Spelled("(4,Ebm7);(4,Ab7);(4,F#7);(8,Db)") == "(4,Ebm7);(4,Ab7);(4,Gb7);(8,Db)");
    // A minor: its leading tone is a G sharp, its Neapolitan a B flat.
    // A bass that the chord does not have is a seventh all the same.
    CHECK(Spelled("(4,Eb);(4,Cm/A#);(4,Ab);(4,Bb7);(8,Eb)") ==
          "(4,Eb);(4,Cm/Bb);(4,Ab);(4,Bb7);(8,Eb)");
    CHECK(Spelled("(4,Am);(4,A#);(4,Abdim7);(4,E7);(8,Am)") ==
          "(4,Am);(4,Bb);(4,G#dim7);(4,E7);(8,Am)");
    // A bass goes with its root: the third of D is F sharp also in flats.
    CHECK(Spelled("(4,F);(2,Bb);(2,D/Gb);(4,Gm);(4,C7);(8,F)") ==
          "(4,F);(2,Bb);(2,D/F#);(4,Gm);(4,C7);(8,F)");
}

TEST_CASE("A sequence has one name for each key, also behind a slash") {
    // Foreign to the chord, so that it is no raised ninth.
    CHECK(Spelled("(4,Bb);(4,F7/G#);(4,Eb);(4,Bb)") == "(4,Bb);(4,F7/Ab);(4,Eb);(4,Bb)");
    CHECK(Spelled("(4,Ab);(4,Db/B);(4,Eb7);(4,Ab)") == "(4,Ab);(4,Db/Cb);(4,Eb7);(4,Ab)");
    // The third of A, but beside a Db it has the name of that.
    CHECK(Spelled("(4,C);(4,A7/Db);(4,Dm);(4,G7);(4,C)") == "(4,C);(4,A7/C#);(4,Dm);(4,G7);(4,C)");
    CHECK(Spelled("(4,C);(4,A7/C#);(4,Dm);(4,C#7);(4,C)") ==
          "(4,C);(4,A7/Db);(4,Dm);(4,Db7);(4,C)");
    // Diminished chords lead upwards.
    CHECK(Spelled("(4,C);(4,Dbdim7);(4,Dm);(4,G7);(4,C)") ==
          "(4,C);(4,C#dim7);(4,Dm);(4,G7);(4,C)");
    CHECK(Spelled("(4,C);(4,C#dim7);(4,C#7);(4,G7);(4,C)") ==
          "(4,C);(4,Dbdim7);(4,Db7);(4,G7);(4,C)");
}

TEST_CASE("Roots of keys with many signs are those that people type") {
    const auto rootsIn = [](const char* key) {
        const CMarkovSpelling spelling{CSignKeyLite(key)};
        std::string roots;
        for (int keyNr = 0; keyNr < 12; ++keyNr) {
            CMarkovObject object;
            object.mType = TMarkovObjectType_Chord;
            object.mChord.mRootKeyEnh = {keyNr, TEnh_Undef};
            object.mChord.mSemitones = {0, 4, 7};
            roots += (roots.empty() ? "" : " ") + spelling.SymbolOf(object);
        }
        return roots;
    };
    CHECK(rootsIn("C major") == "C Db D Eb E F F# G Ab A Bb B");
    CHECK(rootsIn("Eb major") == "C Db D Eb E F Gb G Ab A Bb B");
    CHECK(rootsIn("Ab major") == "C Db D Eb E F Gb G Ab A Bb B");
    CHECK(rootsIn("Gb major") == "C Db D Eb E F Gb G Ab A Bb Cb");
    CHECK(rootsIn("Ab minor") == "C Db D Eb Fb F Gb G Ab A Bb Cb");
    CHECK(rootsIn("Cb major") == "C Db D Eb Fb F Gb G Ab A Bb Cb");
    CHECK(rootsIn("C# major") == "B# C# D D# E E# F# G G# A A# B");
    CHECK(rootsIn("E major") == "C C# D D# E F F# G G# A A# B");
    CHECK(rootsIn("F# major") == "C C# D D# E E# F# G G# A A# B");
    CHECK(rootsIn("D# minor") == "C C# D D# E E# F# G G# A A# B");
}

TEST_CASE("Chords are named as people type them, and gaps are U") {
    CHECK(Spelled("(4,Gmmaj7);(2.5,U);(4,D9sus4)") == "(4,Gm(maj7));(2.5,U);(4,D9sus4)");
}

TEST_CASE("Bars hold chords with dots, and go over into chord strings where beats are broken") {
    const CTypedSequence song("(3,C);(1,G7);(4,Am);(2,F);(2,G)");
    const CMarkovSpelling spelling(song.Sequence());
    CHECK(BarsText(song.Sequence(), spelling, 4, 0) == "C . . G7 | Am | F . G");
    const CTypedSequence broken("(1.5,C);(2.5,G)");
    CHECK(BarsText(broken.Sequence(), CMarkovSpelling(broken.Sequence()), 4, 0) ==
          "(1.5,C);(2.5,G)");
}

std::vector<int> NotesAt(const CMidiTrack& track, std::int64_t tick) {
    std::vector<int> notes;
    for (const CMidiNote& note : track.mNotes) {
        if (note.mTick == tick) notes.push_back(note.mNoteNr);
    }
    return notes;
}

TEST_CASE("The voices of chords stay where they are and do not jump from root to root") {
    const CTypedSequence song("(4,C);(4,F);(4,G);(4,B)");
    const CMidiPiece piece = MidiPieceOf(song.Sequence(), 100.0, 4);
    REQUIRE(piece.mTracks.size() == 2);
    const CMidiTrack& chords = piece.mTracks[0];
    for (int bar = 0; bar < 4; ++bar) {
        const std::vector<int> notes = NotesAt(chords, bar * 1920);
        REQUIRE(notes.size() == 3);
        INFO("bar " << bar);
        // The upper voice within a third of the G above middle C.
        CHECK(std::abs(notes.back() - 67) <= 4);
    }
    // The bass plays the roots.
    CHECK(NotesAt(piece.mTracks[1], 0).front() % 12 == 0);
    CHECK(NotesAt(piece.mTracks[1], 1920).front() % 12 == 5);
}

TEST_CASE("Rounded lengths neither overlap nor drift: each chord ends where the next begins") {
    // Ninths of a beat are 53 and a third ticks.
    std::string chords;
    for (int n = 0; n < 9; ++n) chords += n % 2 == 0 ? "(0.1111,C);" : "(0.1111,F);";
    const CTypedSequence song((chords + "(1,C)").c_str());
    const CMidiPiece piece = MidiPieceOf(song.Sequence(), 100.0, 4);
    const std::vector<CMidiNote>& bass = piece.mTracks[1].mNotes;
    REQUIRE(bass.size() == 10);
    for (std::size_t n = 1; n < bass.size(); ++n) {
        CHECK(bass[n].mTick == bass[n - 1].mTick + bass[n - 1].mDuration);
    }
    CHECK(bass.back().mTick == 480);
    CHECK(bass.back().mDuration == 480);
}

}  // namespace
}  // namespace brindle::test
