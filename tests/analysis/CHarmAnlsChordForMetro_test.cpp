// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsChordForMetro.h"

#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

using TMetro = CHarmAnlsChordForMetro;

/// [root, semitones, bass]
TMetro MetroOf(const json& form) {
    return TMetro(CChordLite(KeyEnhOf(form.at(0)), KeyEnhOf(form.at(2)), SemitonesOf(form.at(1))));
}

json MetroForm(const TMetro& chord) {
    return {FormOf(chord.mRootKeyEnh), chord.mSemitones.Mask(), FormOf(chord.mBassKeyEnh)};
}

/// The places that are 1.
json PlacesForm(std::span<const float> vector) {
    json places = json::array();
    for (std::size_t n = 0; n < vector.size(); ++n) {
        if (vector[n] == 1.0F) places.push_back(n);
    }
    return places;
}

std::vector<float> VectorOf(const json& places) {
    std::vector<float> vector(TMetro::VectorSize, 0.0F);
    for (const json& place : places) vector.at(place.get<std::size_t>()) = 1.0F;
    return vector;
}

json ChromaForm(const json& in) {
    std::array<float, 12> chroma{};
    MetroOf(in.at(0)).GetChromaVector(chroma, in.at(1).get<bool>());
    return PlacesForm(chroma);
}

json FromPlaces(const json& in) {
    TMetro chord;
    chord.SetFromChordVectorRepresentation(VectorOf(in.at(0)));
    return MetroForm(chord);
}

template <class TFunction>
Answer OfChord(TFunction function) {
    return [=](const json& in) { return json((MetroOf(in.at(0)).*function)()); };
}

template <class TFunction>
Answer OfChordAndFlag(TFunction function) {
    return
        [=](const json& in) { return json((MetroOf(in.at(0)).*function)(in.at(1).get<bool>())); };
}

template <class TFunction>
Answer Simplified(TFunction function) {
    return [=](const json& in) {
        return MetroForm((MetroOf(in.at(0)).*function)(in.at(1).get<bool>()));
    };
}

const TMetro kCMinorOverB(CChordLite({0, TEnh_n}, {11, TEnh_n}, CSemitones{0, 3, 7}));

}  // namespace

TEST_CASE("A chord becomes a vector, a name, and its nearest chord of a small vocabulary") {
    CheckExpected(
        "chord_vectors",
        {{"CHarmAnlsChordForMetro::GetChordVectorRepresentation",
          [](const json& in) {
              return PlacesForm(MetroOf(in.at(0)).GetChordVectorRepresentation());
          }},
         {"CHarmAnlsChordForMetro::SetFromChordVectorRepresentation", FromPlaces},
         {"CHarmAnlsChordForMetro::SimplifiedToMajorOrMinor",
          Simplified(&TMetro::SimplifiedToMajorOrMinor)},
         {"CHarmAnlsChordForMetro::SimplifiedToRecognizedMetroChord",
          Simplified(&TMetro::SimplifiedToRecognizedMetroChord)},
         {"CHarmAnlsChordForMetro::IsMajorOrMinor", OfChordAndFlag(&TMetro::IsMajorOrMinor)},
         {"CHarmAnlsChordForMetro::IsCommonChord", OfChordAndFlag(&TMetro::IsCommonChord)},
         {"CHarmAnlsChordForMetro::IsRecognizedMetroChord",
          OfChordAndFlag(&TMetro::IsRecognizedMetroChord)},
         {"CHarmAnlsChordForMetro::GetChromaVector", ChromaForm},
         {"CHarmAnlsChordForMetro::IsSlashChord", OfChord(&TMetro::IsSlashChord)},
         {"CHarmAnlsChordForMetro::IsWildcard", OfChord(&TMetro::IsWildcard)},
         {"CHarmAnlsChordForMetro::IsEADGBE", OfChord(&TMetro::IsEADGBE)},
         {"CHarmAnlsChordForMetro::AppendJSONString",
          [](const json& in) { return JSONStringOf(MetroOf(in.at(0))); }},
         {"CHarmAnlsChordForMetro::NameForMetroExport",
          OfChordAndFlag(&TMetro::NameForMetroExport)}});
}

TEST_CASE("A vector with a wrong place or none for the root leaves the chord as it was") {
    std::vector<float> half = VectorOf({3, 15});
    half[20] = 0.5F;
    for (const std::vector<float>& vector :
         {std::vector<float>(45, 0.0F), std::vector<float>(47, 0.0F), std::vector<float>(), half,
          VectorOf(json::array()), VectorOf({15, 24, 40})}) {
        CAPTURE(vector.size());
        TMetro chord = kCMinorOverB;
        chord.SetFromChordVectorRepresentation(vector);
        CHECK(MetroForm(chord) == MetroForm(kCMinorOverB));
    }
}

TEST_CASE("A vector without a basic chord or a bass keeps those of the chord, and the flag") {
    TMetro chord = kCMinorOverB;
    chord.mWriteVectorRep = true;
    chord.SetFromChordVectorRepresentation(VectorOf({3 + 10, 22 + 9}));
    CHECK(MetroForm(chord) == json({{10, TEnh_b}, 0b1010001001, {11, TEnh_n}}));
    chord.SetFromChordVectorRepresentation(VectorOf({0, 2}));
    CHECK(MetroForm(chord) == json({{15, TEnh_Undef}, 0, {15, TEnh_Undef}}));
    CHECK(chord.mWriteVectorRep);
}

TEST_CASE("Simplified chords write their fields and lose their directions") {
    TMetro chord = kCMinorOverB;
    chord.mWriteVectorRep = true;
    chord.mRootDir = 1;
    chord.mRootDistToHarmCenter = 3;
    for (const CSemitones semitones : {CSemitones{0, 3, 7}, CSemitones(4095), CSemitones{0}}) {
        chord.mSemitones = semitones;
        CAPTURE(semitones);
        for (const TMetro& simple : {chord.SimplifiedToMajorOrMinor(false),
                                     chord.SimplifiedToRecognizedMetroChord(false)}) {
            CHECK_FALSE(simple.mWriteVectorRep);
            CHECK(simple.mRootDistToHarmCenter == -1);
            CHECK(simple.mRootDir == (chord.IsWildcard() ? 1 : 0));
        }
    }
}

TEST_CASE("The JSON text of a chord is read back in both forms") {
    TMetro chord = kCMinorOverB;
    CHECK(JSONStringOf(chord).find("\"Semitones\":137}") != std::string::npos);
    chord.mWriteVectorRep = true;
    const std::string text = JSONStringOf(chord);
    CHECK(text.find("{\"VectorRep\":[  0.00,   0.00,   0.00,   1.00,   0.00, ") == 0);
    TMetro read;
    read.FromDictionary(json::parse(text));
    CHECK(MetroForm(read) == MetroForm(kCMinorOverB));
    chord.mWriteVectorRep = false;
    read.FromDictionary(json::parse(JSONStringOf(chord)));
    CHECK(MetroForm(read) == MetroForm(kCMinorOverB));
}

TEST_CASE("A dictionary with a vector of anything but 46 numbers gives the undefined chord") {
    std::vector<float> floats = VectorOf({3, 15});
    json withText = floats;
    withText.back() = "1";
    json withList = floats;
    withList.front() = json::array();
    for (const json& vector : {json::array(), withText, withList, json::array({1e300})}) {
        TMetro chord = kCMinorOverB;
        chord.FromDictionary({{"VectorRep", vector}});
        CHECK(chord.IsUndef());
        CHECK(chord.mSemitones.IsEmpty());
    }
    TMetro chord = kCMinorOverB;
    chord.FromDictionary(
        {{"VectorRep", "no list"}, {"RootKeyNr", 5}, {"BassKeyNr", 15}, {"Semitones", 145}});
    CHECK(chord.mRootKeyEnh.mKeyNr == 5);
    chord.FromDictionary(json::array());
    CHECK(chord.mSemitones.IsEmpty());
}

TEST_CASE("A chord simplified in place is the simplified chord") {
    for (const CSemitones semitones :
         {CSemitones{0, 3, 7}, CSemitones{0, 4, 7, 10}, CSemitones{0, 3, 6, 9}}) {
        for (const bool dropBass : {false, true}) {
            TMetro chord = kCMinorOverB;
            chord.mSemitones = semitones;
            TMetro plain = chord;
            plain.SimplifyToMajorOrMinor(dropBass);
            CHECK(MetroForm(plain) == MetroForm(chord.SimplifiedToMajorOrMinor(dropBass)));
            TMetro known = chord;
            known.SimplifyToRecognizedMetroChord(dropBass);
            CHECK(MetroForm(known) == MetroForm(chord.SimplifiedToRecognizedMetroChord(dropBass)));
        }
    }
}
