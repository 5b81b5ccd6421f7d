// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/theory/KeyNames.h"

#include <doctest/doctest.h>

#include <chrono>
#include <string>

using namespace brindle;
using nlohmann::json;

namespace {

constexpr CKeyEnh kNoBass = CKeyEnh_Undef;

CChordLite Read(std::string_view symbol, const CChordNamePrefs& prefs = {}) {
    return CChordLite(symbol, prefs);
}

}  // namespace

TEST_CASE("A chord symbol gives root, bass and tones") {
    test::CheckExpected("chord_symbols", {{"CChordLite::SetFromString", [](const json& in) {
                                               CChordLite chord;
                                               chord.SetFromString(in.at(0).get<std::string>(),
                                                                   test::NamePrefsOf(in.at(1)));
                                               return test::FormOf(chord);
                                           }}});
}

TEST_CASE("Options of a symbol build on what stands before them") {
    struct CRow {
        const char* mSymbol;
        CSemitones mSemitones;
    };
    const CRow rows[] = {
        {"", {0, 4, 7}},
        {"C", {0, 4, 7}},
        {"Cmin7", {0, 3, 7, 10}},
        {"C maj 7", {0, 4, 7, 11}},
        {"Cmaj9", {0, 2, 4, 7, 11}},
        // A bare "maj" is read by its "m".
        {"Cmaj", {0, 3, 7}},
        {"C9", {0, 2, 4, 7, 10}},
        {"C6 9", {0, 2, 4, 7, 9}},
        {"C11", {0, 2, 4, 5, 7, 10}},
        {"C13", {0, 2, 4, 5, 7, 9, 10}},
        {"C7 13", {0, 4, 7, 9, 10}},
        {"Cdim7", {0, 3, 6, 9}},
        {"Cm7b5", {0, 3, 6, 10}},
        {"C7#5", {0, 4, 8, 10}},
        {"C7 b13", {0, 4, 7, 8, 10}},
        // A flat nine brings a seventh, even as an added tone.
        {"C add b9", {0, 1, 4, 7, 10}},
        // What is taken away stays away, wherever it stands.
        {"C5 3", {0, 7}},
        {"C no 3", {0, 7}},
        {"C7sus", {0, 5, 7, 10}},
        {"C7xyz9", {0, 2, 4, 7, 10}},
        {"Cdrone", {0, 7}},
        // The bass is scanned for options too.
        {"C/b5", {0, 4, 6}},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mSymbol);
        CHECK(Read(row.mSymbol).mSemitones == row.mSemitones);
    }
}

TEST_CASE("The last slash of a symbol tells the bass") {
    CHECK(Read("C/E").mBassKeyEnh == CKeyEnh_E);
    CHECK(Read("C/E/Gb").mBassKeyEnh == CKeyEnh_Gb);
    CHECK(Read("C/E♭").mBassKeyEnh == CKeyEnh_Eb);
    CHECK(Read("C/").mBassKeyEnh == kNoBass);
    CHECK(Read("/G").IsUndef());
    CHECK(Read("/G").mBassKeyEnh == CKeyEnh_G);
    CHECK(Read("C|E", {.mSlashText = "/|"}).mBassKeyEnh == CKeyEnh_E);
    CHECK(Read("C/E", {.mSlashText = ""}).mBassKeyEnh == kNoBass);
}

TEST_CASE("A sign in UTF-8 behind the root hides the word for minor") {
    CHECK(Read("C#m7").mSemitones == CSemitones{0, 3, 7, 10});
    CHECK(Read("C♯m7").mRootKeyEnh == CKeyEnh_Cis);
    CHECK(Read("C♯m7").mSemitones == CSemitones{0, 4, 7, 10});
    CHECK(Read("C7♭5♯9").mSemitones == CSemitones{0, 3, 4, 6, 10});
}

TEST_CASE("Words for no chord need no more than the start of a text") {
    for (const char* text : {"undef", "undefined", "-", "-7"}) {
        CAPTURE(text);
        CHECK(Read(text) == CChordLite_Undef);
    }
    CHECK(Read("NoChord") == CChordLite_NoChordYield);
    CHECK(Read("nochordyieldxyz") == CChordLite_NoChordYield);
    CHECK(Read("NoChordForce/C") == CChordLite_NoChordForce);
    // A blank before it makes it a text like any other, here without a note letter.
    CHECK(Read(" undef").mSemitones == CSemitones{0, 4, 7});
}

TEST_CASE("Reading a symbol replaces the whole record") {
    CChordLite chord(CKeyEnh_D, CKeyEnh_A, CSemitones{0, 3});
    chord.mRootDir = 1;
    chord.mBassDir = -1;
    chord.SetFromString("G", {});
    CHECK(chord == CChordLite(CKeyEnh_G, kNoBass, CSemitones{0, 4, 7}));
    CHECK(chord.mRootDir == 0);
    CHECK(chord.mBassDir == 0);
}

TEST_CASE("Long texts read in time that grows with their length") {
    const auto seconds = [](std::size_t length) {
        std::string text = "C";
        while (text.size() < length) text += "add ♯11 sus maj x/";
        const auto start = std::chrono::steady_clock::now();
        const CChordLite chord = Read(text);
        const std::chrono::duration<double> taken = std::chrono::steady_clock::now() - start;
        CHECK(chord.mRootKeyEnh == CKeyEnh_C);
        return taken.count();
    };
    constexpr std::size_t kLength = 64 * 1024;
    seconds(kLength);
    CHECK(seconds(16 * kLength) < 0.5 + 64 * seconds(kLength));
}
