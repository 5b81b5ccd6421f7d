// SPDX-License-Identifier: MIT
#include "tests/guitarchords/GridForms.h"
#include "tests/support/Expected.h"

#include "brindle/guitarchords/GChPitches.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

TEST_CASE("Tunings an octave apart are equal, and each is an array of its open strings") {
    CheckExpected(
        "guitar_short_tunings",
        {{"GChIsEqualShortTuning",
          [](const json& in) {
              return GChIsEqualShortTuning(ShortTuningOf(in.at(0)), ShortTuningOf(in.at(1)));
          }},
         {"GChIsValidShortTuning",
          [](const json& in) { return GChIsValidShortTuning(ShortTuningOf(in.at(0))); }},
         {"GChNumberOfStringsInShortTuning",
          [](const json& in) { return GChNumberOfStringsInShortTuning(ShortTuningOf(in.at(0))); }},
         {"GChPitchArrayFromShortTuning",
          [](const json& in) { return GChPitchArrayFromShortTuning(ShortTuningOf(in.at(0))); }},
         {"GChPitchArrayToShortTuning", [](const json& in) { return ShortTuningOf(in.at(0)); }},
         {"GChSetDefaultGuitarShortTuning", [](const json&) {
              GChShortTuning tuning;
              GChSetDefaultGuitarShortTuning(tuning);
              return tuning;
          }}});
}

TEST_CASE("A pitch is named with its octave and read back from the name") {
    CheckExpected(
        "guitar_pitches",
        {{"GChMidiPitchDefaultName",
          [](const json& in) { return GChMidiPitchDefaultName(in.at(0)); }},
         {"GChOctPitchDefaultName",
          [](const json& in) { return GChOctPitchDefaultName(in.at(0)); }},
         {"GChEnhPitchName", [](const json& in) { return GChEnhPitchName(in.at(0)); }},
         {"GChStandardGuitarOpenStringPitch",
          [](const json& in) { return GChStandardGuitarOpenStringPitch(in.at(0)); }},
         {"GChMidiPitchForPitchString",
          [](const json& in) { return GChMidiPitchForPitchString(in.at(0).get<std::string>()); }},
         {"stringByConvertingMusicalSymbols", [](const json& in) {
              return stringByConvertingMusicalSymbols(in.at(0).get<std::string>());
          }}});
}

TEST_CASE("An octave is one digit, and what stands behind it is not read") {
    CHECK(GChMidiPitchForPitchString("C10") == 36);
    CHECK(GChMidiPitchForPitchString("C3 and more") == 60);
    CHECK(GChMidiPitchForPitchString("C 3") == -1);
    CHECK(GChMidiPitchForPitchString("\tC3") == -1);
    CHECK(GChMidiPitchDefaultName(-1) == "B-2");
}

TEST_CASE("A string as far above 0 as two tunings lie apart counts as the end of one") {
    CHECK(GChIsEqualShortTuning({64, 12}, {52}));
}

TEST_CASE("A long text of flats is converted in a time that grows with its length") {
    const std::string flats(std::size_t{1} << 20, 'b');
    CHECK(stringByConvertingMusicalSymbols(flats).size() == 3 * flats.size());
}
