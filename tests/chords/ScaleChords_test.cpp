// SPDX-License-Identifier: MIT
#include "tests/chords/ChordForms.h"

#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/CScaleLite.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

constexpr CKeyEnh kC{0, TEnh_n};
constexpr CKeyEnh kG{7, TEnh_n};
constexpr CSemitones kMajorTriad{0, 4, 7};

CScaleHeavy CMajor() {
    return {kC, st_maj};
}

CChordHeavy Chord(const char* symbol) {
    return CChordHeavy(symbol, CurrentChordNamePrefs);
}

}  // namespace

TEST_CASE("The steps of a scale make chords on a root in the comping range") {
    const CChordHeavy triad = CMajor().ChordTriadForScale();
    CHECK(triad.RootNote().mNoteNr == 60);
    CHECK(NoteNrsOf(triad) == json({60, 64, 67}));
    CHECK(LiteOf(triad) == CChordLite(kC, {}, kMajorTriad));

    const CScaleHeavy gDoubleSharp(CKeyEnh{9, TEnh_ss}, st_maj);
    CHECK(gDoubleSharp.ChordFromScaleStepSet({6}).RootNote().mEnh == TEnh_sss);

    const CChordHeavy seventh = CMajor().ChordFromScaleStepSet({4, 6, 8, 10});
    CHECK(seventh.RootNote().mNoteNr == 55);
    CHECK(NoteNrsOf(seventh) == json({55, 71, 74, 77}));

    CHECK(CScaleHeavy_Undef.ChordTriadForScale() == CChordHeavy_Undef());
    CHECK(CMajor().ChordFromScaleStepSet({}).Notes().empty());
    CHECK(CScaleLite({9, TEnh_n}, kSemitonesNaturalMinor).ChordTriadForScale() ==
          CChordLite({9, TEnh_n}, {}, CSemitones{0, 3, 7}));
}

TEST_CASE("A chord is in a scale with all its keys, or with its skeleton and bass") {
    struct CRow {
        const char* mSymbol;
        bool mAllKeys;
        bool mSkeletonAndBass;
    };
    const CRow rows[] = {
        {"G7", true, true},    {"E7", false, false}, {"G7 b9", false, true},
        {"F#m", false, false}, {"Dm/G", true, true}, {"Dm/G#", false, false},
        {"", true, true},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mSymbol);
        const CChordHeavy chord = *row.mSymbol != 0 ? Chord(row.mSymbol) : CChordHeavy_Undef();
        CHECK(CMajor().ChordIsDiatonicInScaleDisregardingEnh(chord) == row.mAllKeys);
        CHECK(CMajor().ChordBasicChordAndBassNoteIsDiatonicInScaleDisregardingEnh(chord) ==
              row.mSkeletonAndBass);
    }
}

TEST_CASE("A chord takes the degrees that it leaves open from the scale around it") {
    const CScaleHeavy gMajor(kG, st_maj);
    struct CRow {
        const char* mSymbol;
        CScaleHeavy mIn;
        CSemitones mScale;
        TScaleType mType;
    };
    const CRow rows[] = {
        {"C", CScaleHeavy_Undef, {0, 2, 4, 5, 7, 9, 11}, st_maj},
        {"C7", CScaleHeavy_Undef, {0, 2, 4, 5, 7, 9, 10}, st_mixolydian},
        {"Cm", CScaleHeavy_Undef, {0, 2, 3, 5, 7, 8, 10}, st_min},
        {"Cdim", CScaleHeavy_Undef, {0, 2, 3, 5, 6, 8, 10}, LocrianMaj2},
        {"C", gMajor, {0, 2, 4, 6, 7, 9, 11}, st_lydian},
        {"Em", CMajor(), {0, 1, 3, 5, 7, 8, 10}, st_phrygian},
        {"Caug", CScaleHeavy_Undef, {0, 2, 4, 5, 8, 9, 11}, st_custom},
        {"Dm/B", CMajor(), {0, 2, 3, 5, 7, 9, 10}, st_dorian},
    };
    for (const CRow& row : rows) {
        CAPTURE(row.mSymbol);
        const CScaleHeavy scale = row.mIn.ConstructScaleForChord(Chord(row.mSymbol));
        CHECK(scale.ToSemitones() == row.mScale);
        CHECK(scale.ScaleType() == row.mType);
        CHECK(scale.RootKeyEnh() == Chord(row.mSymbol).RootKeyEnh());
    }
    CHECK(CMajor().ConstructScaleForChord(CChordHeavy_Undef()) == CScaleHeavy_Undef);
    // A root without a spelling gets its usual one.
    CHECK(CScaleLite_Undef.ConstructScaleForChord(CChordLite({10, TEnh_Undef}, {}, kMajorTriad)) ==
          CScaleLite({10, TEnh_b}, kSemitonesMajor));
}
