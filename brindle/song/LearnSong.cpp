// SPDX-License-Identifier: MIT
#include "brindle/song/LearnSong.h"

#include "brindle/markov/VariableLengthMarkovModel.h"

#include <cmath>

namespace brindle {
namespace {

using TSequences = std::vector<CHarmAnlsChordsWithLength>;

void CutSequence(TSequences& sequences) {
    if (!sequences.back().empty()) sequences.emplace_back();
}

void AddToSequence(TSequences& sequences, const CChordLite& chord, double length) {
    const double rounded = std::round(length * 100.0) / 100.0;
    if (!(rounded > 0.0) || !std::isfinite(rounded)) return;
    const int bass = chord.HasBassNote() ? chord.mBassKeyEnh.mKeyNr : -1;
    sequences.back().emplace_back(CHarmAnlsChord(chord, chord.mRootKeyEnh.mKeyNr, bass), rounded);
}

}  // namespace

std::vector<CHarmAnlsChordsWithLength> ChordSequencesOf(const CSong& song) {
    TSequences sequences{{}};
    // The lines of chord strings do not go on from each other.
    auto section = song.mSections.begin();
    const bool isCut = song.mFormat == TSongFormat_ChordStrings;
    const CHarmAnlsChords& chords = song.mChords;
    for (std::size_t ix = 0; ix + 1 < chords.size(); ++ix) {
        while (isCut && section != song.mSections.end() &&
               section->mPosition <= chords[ix].mPosition) {
            CutSequence(sequences);
            ++section;
        }
        if (chords[ix].IsUndef()) {
            CutSequence(sequences);
        } else {
            AddToSequence(sequences, chords[ix], chords[ix + 1].mPosition - chords[ix].mPosition);
        }
    }
    if (sequences.back().empty()) sequences.pop_back();
    return sequences;
}

bool HasEndlessChord(const CSong& song) {
    for (std::size_t ix = 0; ix + 1 < song.mChords.size(); ++ix) {
        const double length = song.mChords[ix + 1].mPosition - song.mChords[ix].mPosition;
        if (!song.mChords[ix].IsUndef() && !std::isfinite(length)) return true;
    }
    return false;
}

void LearnChords(VariableLengthMarkovModel& model, const CHarmAnlsChordsWithLength& chords) {
    std::vector<CMarkovObject> symbols;
    MarkovObjectsVectorForHarmChords(chords, symbols);
    model.StartSequence();
    for (const CMarkovObject& symbol : symbols) model.LearnAddSymbol(symbol);
    model.EndSequence();
}

std::size_t LearnSong(VariableLengthMarkovModel& model, const CSong& song) {
    std::size_t count = 0;
    for (const CHarmAnlsChordsWithLength& chords : ChordSequencesOf(song)) {
        LearnChords(model, chords);
        count += chords.size();
    }
    return count;
}

}  // namespace brindle
