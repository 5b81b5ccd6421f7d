// SPDX-License-Identifier: MIT
#include "brindle/present/MarkovMidi.h"

#include "brindle/markov/MarkovChords.h"
#include "brindle/present/internal/PianoAndBass.h"

#include <algorithm>
#include <cmath>

namespace brindle {
namespace {

constexpr int kMarkovTicksPerQuarter = 480;
// Where the highest voice of the chords stays, the G above middle C.
constexpr int kTopVoiceCenter = 67;

std::int64_t TickAt(double beats) {
    return static_cast<std::int64_t>(std::min(std::round(beats * kMarkovTicksPerQuarter), 1e9));
}

}  // namespace

CMidiPiece MidiPieceOf(MarkovSequenceView sequence, double tempo, int beatsPerBar) {
    CMidiPiece piece;
    piece.mTicksPerQuarter = kMarkovTicksPerQuarter;
    piece.mTempos = {{0, tempo}};
    piece.mTimeSignatures = {{0, beatsPerBar, 4}};
    piece.mTracks = PianoAndBass();
    double beats = 0.0;
    std::vector<unsigned char> notes;
    for (const MarkovIterator symbol : sequence) {
        if (!symbol->HasBeats()) continue;
        const CHarmAnlsChordWithLength& chord = symbol->mChord;
        const std::int64_t begin = TickAt(beats);
        beats += chord.mLength;
        const std::int64_t length = TickAt(beats) - begin;
        if (symbol->IsGap() || chord.IsUndef()) continue;
        CHarmAnlsChordWithLengthToMidiNotes(chord, notes, false);
        AddBassNoteToMidiNotes(chord, notes, false);
        piece.mTracks[1].mNotes.push_back({begin, length, kBassChannel, notes.back(), 90});
        notes.pop_back();
        TransposeChordBasedOnPreviousChords(notes, kTopVoiceCenter);
        for (const unsigned char note : notes) {
            piece.mTracks[0].mNotes.push_back({begin, length, kPianoChannel, note, 75});
        }
    }
    return piece;
}

}  // namespace brindle
