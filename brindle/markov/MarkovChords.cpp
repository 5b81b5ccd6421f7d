// SPDX-License-Identifier: MIT
#include "brindle/markov/MarkovChords.h"

#include "brindle/chords/CChordSetFromStringHelper.h"
#include "brindle/platform/ReadNumber.h"
#include "brindle/theory/CChordNamePrefs.h"

#include <algorithm>
#include <cstdlib>
#include <string>

namespace brindle {
namespace {

constexpr int kLowestChordNote = 48;
constexpr int kLowestBassNote = 40;
constexpr int kHighestNote = 255;

/// Calls `function` with each piece between separators; with none for an empty text.
template <class Function>
void ForEachPiece(std::string_view text, char separator, Function function) {
    while (!text.empty()) {
        const std::size_t end = text.find(separator);
        function(text.substr(0, end));
        if (end == text.npos) return;
        text.remove_prefix(end + 1);
        if (text.empty()) function(text);
    }
}

/// One element; brackets may stand anywhere in it.
CHarmAnlsChordWithLength ChordFromElement(std::string_view text) {
    std::string element(text);
    std::erase_if(element, [](char c) { return c == '(' || c == ')'; });
    const std::string_view parts(element);
    const std::size_t comma = parts.find(',');
    const double length = ReadDecimal(parts.substr(0, comma));
    const CHarmAnlsChordWithLength undefined(CHarmAnlsChord_Undef, length);
    if (comma == parts.npos) return undefined;
    const std::string_view behind = parts.substr(comma + 1);
    const std::string_view symbol = behind.substr(0, behind.find(','));
    if (symbol == "U") return undefined;
    CChordLite chord;
    CChordSetFromStringHelper::SetFromString(symbol, chord, CChordNamePrefs());
    const int bassDist = chord.HasBassNote() ? chord.mBassKeyEnh.mKeyNr : -1;
    return CHarmAnlsChordWithLength(CHarmAnlsChord(chord, chord.mRootKeyEnh.mKeyNr, bassDist),
                                    length);
}

bool IsNoDistance(int distance) {
    return distance == kKeyNrUndef || distance < 0;
}

bool HasNote(const std::vector<unsigned char>& notes, int note) {
    return std::find(notes.begin(), notes.end(), note) != notes.end();
}

std::int64_t Distance(int note, int center) {
    return std::abs(std::int64_t{note} - center);
}

void RaiseLowest(std::vector<unsigned char>& notes, int center) {
    while (notes.front() + 12 <= kHighestNote && !HasNote(notes, notes.front() + 12) &&
           Distance(notes.front() + 12, center) < Distance(notes.back(), center)) {
        notes.front() = static_cast<unsigned char>(notes.front() + 12);
        std::sort(notes.begin(), notes.end());
    }
}

void LowerTop(std::vector<unsigned char>& notes, int center) {
    while (notes.size() > 1 && notes.back() > center &&
           Distance(notes.back(), center) > Distance(notes[notes.size() - 2], center) &&
           notes.back() >= 52 && !HasNote(notes, notes.back() - 12)) {
        notes.back() = static_cast<unsigned char>(notes.back() - 12);
        std::sort(notes.begin(), notes.end());
    }
}

}  // namespace

CHarmAnlsChordsWithLength HarmChordsFromChordString(std::string_view text) {
    CHarmAnlsChordsWithLength chords;
    ForEachPiece(text, ';',
                 [&](std::string_view piece) { chords.push_back(ChordFromElement(piece)); });
    return chords;
}

bool IsUndefinedForMarkov(const CHarmAnlsChordWithLength& chord) {
    return IsNoDistance(chord.mRootDistToHarmCenter) && IsNoDistance(chord.mBassDistToHarmCenter);
}

void MarkovObjectsVectorForHarmChords(const CHarmAnlsChordsWithLength& chords,
                                      std::vector<CMarkovObject>& out) {
    for (const CHarmAnlsChordWithLength& chord : chords) {
        CMarkovObject object;
        if (IsUndefinedForMarkov(chord)) {
            object = CMarkovObject_Gap;
            object.mChord.mLength = chord.mLength;
        } else {
            object.mChord = chord;
        }
        out.push_back(object);
    }
}

void CHarmAnlsChordWithLengthToMidiNotes(const CHarmAnlsChordWithLength& chord,
                                         std::vector<unsigned char>& out, bool relative) {
    out.clear();
    const int root = relative ? chord.mRootDistToHarmCenter : chord.mRootKeyEnh.mKeyNr;
    for (int intvl = 0; intvl < 12; ++intvl) {
        if (!chord.mSemitones.HasIntvl(intvl)) continue;
        // In unsigned arithmetic, since a record from outside may hold any distance.
        out.push_back(static_cast<unsigned char>(static_cast<unsigned>(kLowestChordNote) +
                                                 static_cast<unsigned>(root) +
                                                 static_cast<unsigned>(intvl)));
    }
    std::sort(out.begin(), out.end());
}

void AddBassNoteToMidiNotes(const CHarmAnlsChordWithLength& chord,
                            std::vector<unsigned char>& notes, bool relative) {
    const std::int64_t root = relative ? chord.mRootDistToHarmCenter : chord.mRootKeyEnh.mKeyNr;
    std::int64_t bass = relative ? chord.mBassDistToHarmCenter : chord.mBassKeyEnh.mKeyNr;
    if (bass == kKeyNrUndef || bass == -1 || bass == -2) bass = root;
    const auto ofRoot = std::find_if(notes.begin(), notes.end(),
                                     [root](unsigned char note) { return note % 12 == root; });
    const int shift = (ofRoot == notes.end() ? 0 : *ofRoot / 12 * 12) - 48;
    std::int64_t note = bass + shift + 36;
    // No step of its own for each octave: the distance of a record may be any number.
    if (note < kLowestBassNote) note += (kLowestBassNote - note + 11) / 12 * 12;
    while (note <= kHighestNote && HasNote(notes, static_cast<int>(note))) note += 12;
    notes.push_back(static_cast<unsigned char>(note));
}

void TransposeChordBasedOnPreviousChords(std::vector<unsigned char>& notes, int center) {
    if (notes.empty()) return;
    std::sort(notes.begin(), notes.end());
    if (notes.back() <= center) RaiseLowest(notes, center);
    if (notes.back() > center) LowerTop(notes, center);
}

}  // namespace brindle
