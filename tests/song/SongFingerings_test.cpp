// SPDX-License-Identifier: MIT
#include "brindle/song/SongFingerings.h"
#include "brindle/song/ReadSong.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

std::vector<CChordLite> ChordsOf(const char* text) {
    std::vector<CChordLite> chords;
    for (const auto& chord : ReadSong(text).mChords) chords.push_back(chord);
    chords.pop_back();  // the end marker
    return chords;
}

std::string Text(const CFingering& fingering) {
    std::string text;
    for (const int fret : fingering.Frets()) text += fret < 0 ? "x" : std::to_string(fret);
    return text;
}

std::string Texts(const CSongFingerings& song) {
    std::string text;
    for (const CFingering& fingering : song.mFingerings) {
        text += (text.empty() ? "" : " ") + (fingering.mStringCount == 0 ? "-" : Text(fingering));
    }
    return text;
}

TEST_CASE("An easy song keeps its open chords, and a rest has no fingering") {
    const auto song = ChooseFingerings(ChordsOf("C Am N.C. C G"), kGChStandardGuitar);
    CHECK(Texts(song) == "x32010 x02210 - x32010 320003");
    CHECK(song.mHoles == 0);
}

TEST_CASE("Fingerings of a song are near each other") {
    // The same form moves along the neck rather than going back to the nut.
    const auto song = ChooseFingerings(ChordsOf("Ebm7 Fm7 Ebm7 Fm7"), kGChStandardGuitar);
    REQUIRE(song.mFingerings.size() == 4);
    // By itself Abm7 would be 424444.
    CHECK(Texts(ChooseFingerings(ChordsOf("Ebm7 Abm7 Ebm7"), kGChStandardGuitar)) ==
          "xx1322 xx1102 xx1322");
    for (std::size_t i = 1; i < 4; ++i) {
        CHECK(std::abs(song.mFingerings[i].Position() - song.mFingerings[i - 1].Position()) <= 3);
    }
}

TEST_CASE("The easiest capo lets a song be played with open chords") {
    struct CRow {
        const char* mSong;
        std::vector<int> mCapos;
    };
    for (const CRow& row : std::vector<CRow>{{"C Am F G", {0}},
                                             {"G D Em C", {0}},
                                             {"Bb F Gm Eb", {3}},
                                             {"Eb Bb Cm Ab", {1, 3}},
                                             {"F# C# D#m B", {2, 4, 6}},
                                             {"B F# G#m E", {4}},
                                             {"E A B7", {0}},
                                             {"Dm7 G7 Cmaj7", {0}}}) {
        const auto capos = CompareCapos(ChordsOf(row.mSong), kGChStandardGuitar);
        INFO(row.mSong << ": capo " << capos.front().mCapo);
        REQUIRE(capos.size() == 8);
        CHECK(std::count(row.mCapos.begin(), row.mCapos.end(), capos.front().mCapo) == 1);
        CHECK(capos.front().mDifficulty <= 2.5);
    }
}

TEST_CASE("An easy chord is held whole") {
    const auto song = ChooseFingerings(ChordsOf("E A Em G D"), kGChStandardGuitar);
    CHECK(Texts(song) == "022100 x02220 022000 320003 xx0232");
}

TEST_CASE("Each chord of a song sounds under each capo") {
    const auto chords = ChordsOf("Bb13 C/E Dm7b5 G7#9 Am(maj7) F#dim7 C/Bb");
    for (const CSongFingerings& song : CompareCapos(chords, kGChStandardGuitar)) {
        CHECK(song.mHoles == 0);
        for (std::size_t i = 0; i < chords.size(); ++i) {
            const CFingering& fingering = song.mFingerings[i];
            CSemitones sounding;
            for (int string = 0; string < fingering.mStringCount; ++string) {
                const int pitch = fingering.Pitch(string);
                if (pitch >= 0) sounding.AddIntvl(pitch - chords[i].mRootKeyEnh.mKeyNr);
            }
            CSemitones wanted = chords[i].mSemitones - fingering.mOmitted;
            if (chords[i].HasBassNote()) wanted.AddIntvl(chords[i].KeyIntvlFromRootToBass());
            CHECK(sounding == wanted);
        }
    }
}

TEST_CASE("Shapes under a capo are spelled as players call them") {
    const auto shapeOf = [](const char* symbol, int capo) {
        const CChordLite shape = ShapeUnderCapo(ChordsOf(symbol).front(), capo);
        return std::pair(shape.mRootKeyEnh, shape.mBassKeyEnh);
    };
    CHECK(shapeOf("Bb", 3) == std::pair(CKeyEnh{7, TEnh_n}, CKeyEnh_Undef));
    CHECK(shapeOf("C", 0) == std::pair(CKeyEnh{0, TEnh_n}, CKeyEnh_Undef));
    CHECK(shapeOf("A", 1) == std::pair(CKeyEnh{8, TEnh_b}, CKeyEnh_Undef));
    CHECK(shapeOf("Am", 1) == std::pair(CKeyEnh{8, TEnh_s}, CKeyEnh_Undef));
    CHECK(shapeOf("C/E", 12) == std::pair(CKeyEnh{0, TEnh_n}, CKeyEnh{4, TEnh_n}));
    CHECK(shapeOf("C7/E", 3) == std::pair(CKeyEnh{9, TEnh_n}, CKeyEnh{1, TEnh_s}));
    CHECK(shapeOf("G", 1) == std::pair(CKeyEnh{6, TEnh_s}, CKeyEnh_Undef));
}

TEST_CASE("The shapes of a song move by one interval") {
    struct CRow {
        const char* mSong;
        int mCapo;
        std::vector<CKeyEnh> mRoots;
    };
    for (const auto& [song, capo, roots] : std::vector<CRow>{
             {"C E7 Am F#7", 3, {{9, TEnh_n}, {1, TEnh_s}, {6, TEnh_s}, {3, TEnh_s}}},
             {"Bb Gm Eb D7", 3, {{7, TEnh_n}, {4, TEnh_n}, {0, TEnh_n}, {11, TEnh_n}}},
             {"G C D N.C. Am", 2, {{5, TEnh_n}, {10, TEnh_b}, {0, TEnh_n}, {}, {7, TEnh_n}}},
             {"F# C# D#m B", 4, {{2, TEnh_n}, {9, TEnh_n}, {11, TEnh_n}, {7, TEnh_n}}},
             {"Gb Db Ebm Cb", 4, {{2, TEnh_n}, {9, TEnh_n}, {11, TEnh_n}, {7, TEnh_n}}},
         }) {
        std::vector<CKeyEnh> told;
        for (const CChordLite& shape : ShapesUnderCapo(ChordsOf(song), capo)) {
            told.push_back(shape.IsUndef() ? CKeyEnh() : shape.mRootKeyEnh);
        }
        const std::string logged(song);
        INFO(logged);
        CHECK(told == roots);
    }
}

}  // namespace
}  // namespace brindle::test
