// SPDX-License-Identifier: MIT
// 600 sets of notes, with key, neighbours and bass or without, and the first three names of each:
// cost, symbol, exact symbol and the spelled keys from C up.
#include "brindle/chords/NameNotes.h"
#include "brindle/chords/ReadChordText.h"
#include "brindle/chords/WriteChordSymbol.h"
#include "brindle/chords/internal/KeySpelling.h"
#include "brindle/chords/internal/NamingTypes.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <fstream>
#include <map>
#include <sstream>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

std::vector<std::string> Split(const std::string& text, char separator) {
    std::vector<std::string> pieces;
    std::istringstream stream(text);
    for (std::string piece; std::getline(stream, piece, separator);) pieces.push_back(piece);
    return pieces;
}

CKeyEnh KeyFromText(const std::string& text) {
    int signs = 0;
    for (const char sign : text.substr(1)) {
        signs += sign == '#' ? 1 : sign == 'b' ? -1 : sign == 'x' ? 2 : 0;
    }
    const auto letter = static_cast<int>(std::string("CDEFGAB").find(text.front()));
    return {FoldIntoOctave(KeyNrOfLetter(letter) + signs), SemitoneToEnh(signs)};
}

CNote NoteFromText(const std::string& text) {
    if (text.front() <= '9') {
        CNote note;
        note.mNoteNr = std::stoi(text);
        return note;
    }
    const std::size_t octave = text.find_first_of("-0123456789");
    const CKeyEnh key = KeyFromText(text.substr(0, octave));
    CNote note;
    note.mEnh = key.mEnh;
    // A C flat is numbered with the octave of its letter.
    note.mNoteNr = KeyNrOfLetter(LetterOf(key)) + EnhToSemitone(key.mEnh) +
                   12 * (std::stoi(text.substr(octave)) + 1);
    return note;
}

std::vector<CNote> NotesFromText(const std::string& text) {
    std::vector<CNote> notes;
    for (const std::string& word : Split(text, ' ')) notes.push_back(NoteFromText(word));
    return notes;
}

CNamingOptions OptionsFromText(const std::string& text) {
    CNamingOptions options;
    for (const std::string& word : Split(text, ' ')) {
        const std::size_t equals = word.find('=');
        const std::string name = word.substr(0, equals);
        const std::string value = word.substr(equals + 1);
        if (name == "previous") options.mPreviousRoot = KeyFromText(value).mKeyNr;
        if (name == "next") options.mNextRoot = KeyFromText(value).mKeyNr;
        if (value == "only") options.mBass = TBassUse::Only;
        if (value == "none") options.mBass = TBassUse::None;
        if (name != "key") continue;
        const auto parts = Split(value, ':');
        options.mKey = {KeyFromText(parts[0]),
                        parts[1] == "minor" ? TSignKeyType_Minor : TSignKeyType_Major};
    }
    return options;
}

std::string KeysFromC(const CNamedChord& chord) {
    std::map<int, CKeyEnh> keys;
    for (const CNote& note : chord.mNotes) keys[note.KeyNr()] = note.KeyEnh();
    std::string text;
    for (const auto& [keyNr, key] : keys) {
        if (!text.empty()) text += '-';
        text += WriteNoteName(key);
    }
    return text;
}

std::string AnswerText(const std::vector<CNamedChord>& names, std::size_t ix) {
    if (ix >= names.size()) return "";
    const CNamedChord& name = names[ix];
    return std::to_string(name.mCost) + ' ' + name.mSymbol + ' ' + name.mExactSymbol + ' ' +
           KeysFromC(name);
}

TEST_CASE("Notes are named by how common chord types are over their bass, in key and progression") {
    std::ifstream file(BRINDLE_TEST_DATA "/chord-naming/golden.tsv");
    std::string line;
    std::getline(file, line);
    int count = 0;
    while (std::getline(file, line)) {
        auto cells = Split(line, '\t');
        cells.resize(5);
        const auto names = NameNotes(NotesFromText(cells[0]), OptionsFromText(cells[1]));
        INFO(cells[0], "   ", cells[1]);
        for (std::size_t ix = 0; ix < 3; ++ix) CHECK(AnswerText(names, ix) == cells[ix + 2]);
        ++count;
    }
    CHECK(count == 600);
}

// All keys that a named chord tells: its tones and its bass.
unsigned KeysOf(const CChordLite& chord) {
    unsigned keys = 0;
    for (int tone = 0; tone < 12; ++tone) {
        if (!chord.mSemitones.HasIntvl(tone)) continue;
        keys |= 1U << (chord.mRootKeyEnh.mKeyNr + tone) % 12;
    }
    if (chord.HasBassNote()) keys |= 1U << chord.mBassKeyEnh.mKeyNr;
    return keys;
}

TEST_CASE("The exact symbol of every set of keys is read back as exactly these keys") {
    int wrong = 0;
    for (unsigned keys = 1; keys < 4096; ++keys) {
        std::vector<CNote> notes;
        for (int key = 0; key < 12; ++key) {
            if ((keys >> key & 1U) != 0) notes.emplace_back(48 + key, TEnh_Undef);
        }
        for (const CNamedChord& name : NameNotes(notes)) {
            const CChordTextReading read = ReadChordText(name.mExactSymbol);
            const bool isSame = read.mKind == TChordText_Chord &&
                                read.mChord.mRootKeyEnh == name.mRoot &&
                                KeysOf(read.mChord) == keys && KeysOf(name.mChord) == keys;
            if (isSame) continue;
            if (++wrong <= 10) FAIL_CHECK(name.mExactSymbol, " is read back as other notes");
        }
    }
    CHECK(wrong == 0);
}

TEST_CASE("The tables of chord types and of the context hold what their files hold") {
    const std::string folder = BRINDLE_SOURCE_DIR "/data/chord-naming/";
    std::ifstream types(folder + "types.tsv");
    std::string line;
    std::getline(types, line);
    std::size_t ix = 0;
    for (; std::getline(types, line); ++ix) {
        REQUIRE(ix < kNamingTypes.size());
        const auto cells = Split(line, '\t');
        INFO(line);
        CHECK(std::stoul(cells[0]) == ix);
        CHECK(kNamingTypeRows[ix].mSuffix == cells[1]);
        CHECK(kNamingTypeRows[ix].mDegrees == cells[2]);
        CHECK(kNamingTypes[ix].mTones == std::stoul(cells[3]));
        CHECK(kNamingTypes[ix].mOptional == std::stoul(cells[4]));
        CHECK(kNamingTypeRows[ix].mCost == std::stoi(cells[5]));
        for (std::size_t bass = 0; bass < 12; ++bass) {
            CHECK(kNamingTypeRows[ix].mCostOverBass[bass] == std::stoi(cells[6 + bass]));
        }
    }
    CHECK(ix == kNamingTypes.size());

    const std::map<std::string, const TNamingContextTable*> tables{
        {"next", &kNextRootCosts},
        {"previous", &kPreviousRootCosts},
        {"major", &kMajorKeyCosts},
        {"minor", &kMinorKeyCosts}};
    const std::vector<std::string> families{"dominant", "major", "minor", "diminished", "other"};
    std::ifstream context(folder + "context.tsv");
    std::getline(context, line);
    int rows = 0;
    for (; std::getline(context, line); ++rows) {
        const auto cells = Split(line, '\t');
        const auto family = std::find(families.begin(), families.end(), cells[1]);
        const auto row = static_cast<std::size_t>(family - families.begin());
        for (std::size_t up = 0; up < 12; ++up) {
            CHECK((*tables.at(cells[0]))[row][up] == std::stoi(cells[2 + up]));
        }
    }
    CHECK(rows == 20);
}

}  // namespace
}  // namespace brindle::test
