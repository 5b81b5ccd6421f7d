// SPDX-License-Identifier: MIT
#include "MarkovForms.h"

#include "tests/support/Expected.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

json FormOfChord(const CHarmAnlsChordWithLength& chord) {
    return {
        chord.mLength,           test::FormOf(chord.mRootKeyEnh), test::FormOf(chord.mBassKeyEnh),
        chord.mSemitones.Mask(), chord.mRootDistToHarmCenter,     chord.mBassDistToHarmCenter};
}

void Move(std::int32_t& distance, int intvl) {
    if (distance >= 0) distance = (distance + intvl) % 12;
}

/// "(2,C)", or "(2,C)+5" to move both distances
CHarmAnlsChordWithLength ChordOf(const json& in) {
    const auto text = in.get<std::string>();
    const std::size_t plus = text.rfind(")+");
    CHarmAnlsChordWithLength chord =
        HarmChordsFromChordString(text.substr(0, plus == text.npos ? plus : plus + 1)).at(0);
    const int intvl = plus == text.npos ? 0 : std::stoi(text.substr(plus + 2));
    Move(chord.mRootDistToHarmCenter, intvl);
    Move(chord.mBassDistToHarmCenter, intvl);
    return chord;
}

json ChordsIn(const json& in) {
    auto form = json::array();
    for (const auto& chord : HarmChordsFromChordString(in.at(0).get<std::string>())) {
        form.push_back(FormOfChord(chord));
    }
    return form;
}

json SymbolsIn(const json& in) {
    auto form = json::array();
    for (const CMarkovObject& symbol : SymbolsOf(in.at(0).get<std::string>())) {
        form.push_back({symbol.mType, symbol.mChord.mLength});
    }
    return form;
}

json NotesOf(const json& in) {
    std::vector<unsigned char> notes;
    CHarmAnlsChordWithLengthToMidiNotes(ChordOf(in.at(0)), notes, in.at(1).get<bool>());
    return notes;
}

json NotesWithBass(const json& in) {
    auto notes = in.at(1).get<std::vector<unsigned char>>();
    AddBassNoteToMidiNotes(ChordOf(in.at(0)), notes, in.at(2).get<bool>());
    return notes;
}

json NotesNear(const json& in) {
    auto notes = in.at(0).get<std::vector<unsigned char>>();
    TransposeChordBasedOnPreviousChords(notes, in.at(1).get<int>());
    return notes;
}

}  // namespace

TEST_CASE("Chord strings become symbols, and chords the notes that sound them") {
    CheckExpected("markov_chords", {
                                       {"HarmChordsFromChordString", ChordsIn},
                                       {"MarkovObjectsVectorForHarmChords", SymbolsIn},
                                       {"CHarmAnlsChordWithLengthToMidiNotes", NotesOf},
                                       {"AddBassNoteToMidiNotes", NotesWithBass},
                                       {"TransposeChordBasedOnPreviousChords", NotesNear},
                                       {"CHarmAnlsChordWithLength::SimplifyChord",
                                        [](const json& in) {
                                            CHarmAnlsChordWithLength chord = ChordOf(in.at(0));
                                            chord.SimplifyChord();
                                            return FormOfChord(chord);
                                        }},
                                   });
}
