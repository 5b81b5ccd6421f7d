// SPDX-License-Identifier: MIT
#include "tests/support/Expected.h"
#include "tests/support/Forms.h"

#include "brindle/analysis/CAnalyseHarmCenterAlternatives.h"
#include "brindle/analysis/TChordStringParse.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

json FormOf(const CHarmAnlsCenter& center) {
    json chords = json::array();
    for (const auto& chord : center.mChords) {
        chords.push_back({chord.mPosition, test::FormOf(chord.mRootKeyEnh),
                          test::FormOf(chord.mBassKeyEnh), chord.mSemitones.Mask()});
    }
    return {{"mProbability", center.mProbability},
            {"mPosition", center.mPosition == kPosUndef ? json("Undef") : json(center.mPosition)},
            {"mHarmCenter",
             {test::FormOf(center.mHarmCenter.mRootKeyEnh), center.mHarmCenter.mSemitones.Mask()}},
            {"mChords", chords}};
}

json BestResults(const json& in) {
    const CHarmAnlsChords chords(in.at(0).get<std::string>(), TChordStringParse{});
    json centers = json::array();
    for (const auto& center : CAnalyseHarmCenterAlternatives(chords).BestResults()) {
        centers.push_back(FormOf(center));
    }
    return centers;
}

/// Readings of a list of twelve chords, written as index ranges.
class CReadings {
public:
    CHarmAnlsCenterInChords Center(int begin, int end, int key = 0) const {
        return {CHarmCenterLite({key, TEnh_n}, kSemitonesMajor), mChords.begin() + begin,
                mChords.begin() + end};
    }
    CHarmAnlsCenterAlternatives mReadings;
    CHarmAnlsChords mChords = CHarmAnlsChords(12);

    /// Each reading as [probability, [begin, end, key] of each center].
    json Form() const {
        json form = json::array();
        for (const auto& reading : mReadings) {
            json entry = {reading.mProbability};
            for (const auto& center : reading.mCenters) {
                entry.push_back({center.mBegin - mChords.begin(), center.mEnd - mChords.begin(),
                                 center.mCenter.mRootKeyEnh.mKeyNr});
            }
            form.push_back(entry);
        }
        return form;
    }
};

}  // namespace

TEST_CASE("All readings that the tonic progressions allow are found in a chord text") {
    CheckExpected("center_alternatives",
                  {{"CAnalyseHarmCenterAlternatives::BestResults", BestResults}});
}

TEST_CASE("Readings inside a longer one go, and the rest share the probability") {
    CReadings readings;
    readings.mReadings = {{1.0, {readings.Center(0, 4)}},     // as long as the next
                          {1.0, {readings.Center(0, 4, 7)}},  //
                          {1.0, {readings.Center(1, 4)}},     // inside 0 to 4
                          {0.25, {readings.Center(3, 7)}},    // overlaps only
                          {1.0, {readings.Center(4, 7)}}};    // inside 3 to 7
    readings.mReadings.RemoveShorterContainedAlternatives();
    CHECK(readings.Form() ==
          json::parse("[[0.5, [0, 4, 0]], [0.5, [0, 4, 7]], [0.25, [3, 7, 0]]]"));
}

TEST_CASE("A reading that is gone contains nothing any more") {
    // Each reading would take the next one with it; the first is gone before the second is tried.
    CReadings readings;
    readings.mReadings = {{1.0, {readings.Center(0, 2), readings.Center(6, 9)}},
                          {1.0, {readings.Center(6, 8), readings.Center(4, 5)}},
                          {1.0, {readings.Center(3, 6), readings.Center(0, 3)}}};
    readings.mReadings.RemoveShorterContainedAlternatives();
    CHECK(readings.Form() == json::parse("[[1.0, [3, 6, 0], [0, 3, 0]]]"));

    // Here the second one goes for the sake of the first, so the third is spared.
    readings.mReadings = {{1.0, {readings.Center(0, 4)}},
                          {1.0, {readings.Center(1, 2), readings.Center(5, 9)}},
                          {1.0, {readings.Center(6, 8)}}};
    readings.mReadings.RemoveShorterContainedAlternatives();
    CHECK(readings.Form() == json::parse("[[1.0, [0, 4, 0]], [1.0, [6, 8, 0]]]"));
}

TEST_CASE("Equal readings are added up, without a cap, unless others share their range") {
    CReadings readings;
    readings.mReadings = {{1.0, {readings.Center(0, 4)}},
                          {0.5, {readings.Center(2, 6)}},
                          {1.0, {readings.Center(0, 4)}},
                          {0.5, {readings.Center(2, 6)}},
                          {0.5, {readings.Center(2, 6, 7)}}};
    readings.mReadings.Deduplication();
    CHECK(readings.Form() == json::parse("[[2.0, [0, 4, 0]], [0.5, [2, 6, 0]], [0.5, [2, 6, 7]]]"));
}

TEST_CASE("A sure reading removes those of the same ranges behind it") {
    CReadings readings;
    readings.mReadings = {{0.5, {readings.Center(0, 4)}},
                          {1.0, {readings.Center(0, 4, 7)}},
                          {0.5, {readings.Center(0, 4, 2)}},
                          {1.0, {readings.Center(0, 2), readings.Center(2, 4)}},
                          {0.5, {readings.Center(0, 3), readings.Center(3, 4)}},
                          {2.0, {readings.Center(6, 9)}},  // added up, which is not sure
                          {0.5, {readings.Center(6, 9, 7)}}};
    readings.mReadings.RemoveNonSureAlternativesWithSameRangeAsSureAlternative();
    CHECK(readings.Form() == json::parse("[[0.5, [0, 4, 0]], [1.0, [0, 4, 7]],"
                                         " [1.0, [0, 2, 0], [2, 4, 0]],"
                                         " [0.5, [0, 3, 0], [3, 4, 0]],"
                                         " [2.0, [6, 9, 0]], [0.5, [6, 9, 7]]]"));
}

TEST_CASE("A center grows over what it tolerates, but never over the last chord") {
    const CHarmAnlsChords chords("F# Dm G7 C Bb nochord F", TChordStringParse{});
    CHarmAnlsCenterInChords center{CHarmCenterLite({0, TEnh_n}, kSemitonesMajor),
                                   chords.begin() + 2, chords.begin() + 4};
    center.ExtendForAdjacentDiatonicOrAllowedOutlierChords(chords);
    CHECK(center.mBegin - chords.begin() == 1);
    CHECK(chords.end() - center.mEnd == 1);
}

TEST_CASE("Lists of centers answer for their longest and for their first center") {
    const CReadings readings;
    const CHarmAnlsCentersInChords centers{readings.Center(2, 4), readings.Center(0, 3),
                                           readings.Center(5, 9, 7)};
    CHECK(centers.HasCenterThatIsLongerAndContains(readings.Center(6, 8)));
    CHECK_FALSE(centers.HasCenterThatIsLongerAndContains(readings.Center(5, 9)));
    CHECK(centers.ContainsSameCenterWithSameOrLongerChords(readings.Center(2, 3)));
    CHECK_FALSE(centers.ContainsSameCenterWithSameOrLongerChords(readings.Center(2, 4)));
    CHECK_FALSE(centers.ContainsSameCenterWithSameOrLongerChords(readings.Center(0, 1)));
    const auto [begin, end] = centers.OverallBeginAndEndInputChord();
    CHECK(begin - readings.mChords.begin() == 0);
    CHECK(end - readings.mChords.begin() == 9);
    CHECK(CHarmAnlsCentersInChords{}.OverallBeginAndEndInputChord().first ==
          CHarmAnlsCentersInChords::chord_iterator{});
}

TEST_CASE("Readings over one range are simultaneous, and a longer one around them contains them") {
    CReadings readings;
    readings.mReadings = {{1.0, {readings.Center(0, 4)}},
                          {1.0, {readings.Center(0, 4, 7)}},
                          {1.0, {readings.Center(1, 3)}},
                          {1.0, {readings.Center(5, 9)}}};
    auto& list = readings.mReadings;
    const auto others = list.FindSimultaneousAlternatives(list.begin());
    REQUIRE(others.size() == 1);
    CHECK(&others[0].get() == &list[1]);
    CHECK(list.FindSimultaneousAlternatives(list.begin() + 2).empty());
    CHECK(list.HasLongerContainingAlternernative(list.begin() + 2));
    CHECK_FALSE(list.HasLongerContainingAlternernative(list.begin()));
    CHECK_FALSE(list.HasLongerContainingAlternernative(list.begin() + 3));
}

TEST_CASE("A center that a longer one contains is seen") {
    const CReadings place;
    const CHarmAnlsCentersInChords centers{place.Center(0, 6), place.Center(1, 4),
                                           place.Center(5, 8), place.Center(0, 6, 7)};
    const auto hasLonger = [&](int ix) {
        return centers.HasLongerContainingHarmCenter(centers.begin() + ix);
    };
    CHECK_FALSE(hasLonger(0));
    CHECK(hasLonger(1));
    CHECK_FALSE(hasLonger(2));
    CHECK_FALSE(hasLonger(3));
}
