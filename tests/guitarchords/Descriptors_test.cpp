// SPDX-License-Identifier: MIT
#include "tests/guitarchords/GridForms.h"
#include "tests/support/Expected.h"

#include "brindle/guitarchords/GChChordDescr.h"
#include "brindle/guitarchords/GChDisplayOptions.h"
#include "brindle/guitarchords/GChFilterParameter.h"
#include "brindle/guitarchords/GChHarmonyStrings.h"
#include "brindle/guitarchords/GChTuningDescr.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

GChTuningDescr TuningDescrOf(const json& capodaster, const json& pitches) {
    GChTuningDescr tuning;
    tuning.setCapodasterOffset(capodaster);
    tuning.setNumberOfStrings(static_cast<int>(pitches.size()));
    for (std::size_t i = 0; i < pitches.size(); ++i) {
        tuning.setOpenStringPitch(pitches.at(i), static_cast<int>(i));
    }
    return tuning;
}

json ChordDescrOf(const json& in) {
    const GChTuningDescr tuning = TuningDescrOf(in.at(3), in.at(0));
    GChChordDescr chord;
    const int muteBits = in.at(1);
    for (int i = 0; i < kGChMaxStrings; ++i) chord.setMuted((muteBits >> i & 1) != 0, i);
    for (const json& elem : in.at(2)) {
        chord.addFingerNum(elem.at(0), elem.at(1), elem.at(2), elem.at(3),
                           elem.at(4).get<std::uint8_t>());
    }
    json pitches = json::array();
    for (int i = 0; i < tuning.numberOfStrings(); ++i) {
        pitches.push_back(chord.pitchForStringIndex1(i, tuning));
    }
    const int root = tuning.openStringPitchForStringIndex(0) % 12;
    return {
        {"pitchForStringIndex1", pitches},
        {"lowestAbsFretIndex", chord.lowestAbsFretIndex()},
        {"numberOfElements", chord.numberOfElements()},
        {"GChHarmonyStringFromChordDescr",
         GChHarmonyStringFromChordDescr(&chord, &tuning, root, -1).value_or("nothing")},
        {"GChHarmonyCommaSeparatedStringFromChordDescr",
         GChHarmonyCommaSeparatedStringFromChordDescr(&chord, &tuning, root, -1)
             .value_or("nothing")},
        {"GChProposedRootNoteFromChordDescr", GChProposedRootNoteFromChordDescr(&chord, &tuning)}};
}

json FormOf(const GChFilterParameter& filter) {
    return {{"rootNoteToFilter", filter.rootNoteToFilter()},
            {"bassNoteToFilter", filter.bassNoteToFilter()},
            {"chordTypeToFilter", filter.chordTypeToFilter()},
            {"difficultyToFilter", filter.difficultyToFilter()},
            {"isFavoriteToFilter", filter.isFavoriteToFilter()}};
}

json FilterAfter(const json& calls) {
    GChFilterParameter filter;
    for (const json& call : calls) {
        const auto setter = call.at(0).get<std::string>();
        const std::int64_t value = call.at(1);
        if (setter == "setRootNoteToFilter") filter.setRootNoteToFilter(value, call.at(2));
        if (setter == "setBassNoteToFilter") filter.setBassNoteToFilter(value, call.at(2));
        if (setter == "setChordTypeToFilter") filter.setChordTypeToFilter(value);
        if (setter == "setDifficultyToFilter") filter.setDifficultyToFilter(value);
        if (setter == "setIsFavoriteToFilter") filter.setIsFavoriteToFilter(value);
    }
    return FormOf(filter);
}

}  // namespace

TEST_CASE("Detached tunings and fingerings know their pitches, their lowest fret and their name") {
    CheckExpected("guitar_descriptors",
                  {{"GChTuningDescr::isValid",
                    [](const json& in) { return TuningDescrOf(in.at(0), in.at(1)).isValid(); }},
                   {"openStringPitchForStringIndex",
                    [](const json& in) {
                        const GChTuningDescr tuning = TuningDescrOf(in.at(0), in.at(1));
                        json pitches = json::array();
                        for (int i = -1; i <= 17; ++i) {
                            pitches.push_back(tuning.openStringPitchForStringIndex(i));
                        }
                        return pitches;
                    }},
                   {"GChChordDescr", ChordDescrOf}});
}

TEST_CASE("A filter keeps root, bass, type, difficulty and favorites apart") {
    CheckExpected("guitar_filters",
                  {{"setNoRestrictions", [](const json&) { return FormOf(GChFilterParameter()); }},
                   {"GChFilterParameter", [](const json& in) { return FilterAfter(in.at(0)); }}});
}

TEST_CASE("A filter accepts the fingerings that have its values") {
    const auto chord = BasicChordOf({52, 57, 62, 67, 71, 76}, 0, {{1, 0, 0, 0, 0}});
    chord->setRootNote(9);
    chord->setChordType(11);
    GChFilterParameter filter;
    CHECK(filter.Accepts(*chord));
    filter.setRootNoteToFilter(9, 0);
    filter.setChordTypeToFilter(11);
    CHECK(filter.Accepts(*chord));
    filter.setIsFavoriteToFilter(5);
    CHECK_FALSE(filter.Accepts(*chord));
    chord->setIsFavorite(true, 0);
    CHECK(filter.Accepts(*chord));
    filter.setRootNoteToFilter(12, 0);
    CHECK_FALSE(filter.Accepts(*chord));
    filter.setNoRestrictions();
    filter.setChordTypeToFilter(-1);
    CHECK_FALSE(filter.Accepts(*chord));
}

TEST_CASE("A detached fingering holds 15 elements that can exist") {
    GChChordDescr chord;
    CHECK_FALSE(chord.addFingerNum(6, 0, 0));
    CHECK_FALSE(chord.addFingerNum(1, 32, 0));
    CHECK_FALSE(chord.addFingerNum(1, 0, 2, 1));
    for (int i = 0; i < 15; ++i) CHECK(chord.addFingerNum(1, 20 - i, i));
    CHECK_FALSE(chord.addFingerNum(1, 0, 0));
    CHECK(chord.numberOfElements() == 15);
    CHECK(chord.lowestAbsFretIndex() == 6);
    CHECK(FormOf(chord.chordElemsSortedByFret().front()) == json{1, 6, 14, 14, 0});
    chord.setMuted(true, 15);
    chord.setMuted(true, 16);
    CHECK(chord.isMutedForStringIndex(15));
    CHECK_FALSE(chord.isMutedForStringIndex(16));
    chord.clearDataFields();
    CHECK(chord.numberOfElements() == 0);
    CHECK(chord.rootNote() == -1);
}

TEST_CASE("A capodaster of 255 is none") {
    const GChTuningDescr tuning(kGChStandardGuitar, 255);
    CHECK(tuning.isValid());
    CHECK(GChChordDescr().pitchForStringIndex1(0, tuning) == 52);
    CHECK_FALSE(GChTuningDescr(kGChStandardGuitar, 32).isValid());
    CHECK(tuning.isEqualToTuningStrings(GChTuningDescr(kGChStandardGuitar)));
    CHECK_FALSE(tuning.isEqualToTuningDescr(GChTuningDescr(kGChStandardGuitar)));
}

TEST_CASE("Display options are not set at first") {
    GChDisplayOptions options;
    CHECK(options.mirrorStrings() == -1);
    options.setMirrorStrings(false);
    CHECK(options.mirrorStrings() == 0);
    CHECK(options.numberOfFrets() == -1);
}

TEST_CASE("A detached fingering is named over its root, and copied with all that it says") {
    const GChTuningDescr guitar = TuningDescrOf(0, {52, 57, 62, 67, 71, 76});
    GChChordDescr chord;
    chord.setMuted(true, 0);
    // Index 0 is the first fret: the open C major chord.
    chord.addFingerNum(3, 2, 1, 1, 0);
    chord.addFingerNum(2, 1, 2, 2, 0);
    chord.addFingerNum(1, 0, 4, 4, 0);
    chord.setRootNote(0);
    CHECK(chord.chordNameWithTuningDescr(guitar) == "C");
    chord.setRootNote(12);
    CHECK(chord.chordNameWithTuningDescr(guitar) == std::nullopt);

    chord.setRootNote(9);
    chord.setTransposeRange(5);
    GChChordDescr copy;
    copy.setToChordDescr(chord);
    CHECK(copy.chordNameWithTuningDescr(guitar) == chord.chordNameWithTuningDescr(guitar));
    CHECK(copy.transposeRange() == 5);
    CHECK(copy.numberOfElements() == 3);
    GChTuningDescr tuning;
    tuning.setToTuningDescr(guitar);
    CHECK(tuning.isEqualToTuningDescr(guitar));
}
