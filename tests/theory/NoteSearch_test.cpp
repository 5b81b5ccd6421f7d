// SPDX-License-Identifier: MIT
#include "brindle/theory/NoteSearch.h"

#include "brindle/theory/CNote.h"
#include "brindle/theory/CompingRange.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

#include <limits>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

constexpr std::int64_t kFarBelow = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kFarAbove = std::numeric_limits<std::int64_t>::max();

Answer SearchBy(std::int64_t (*search)(int, std::int64_t)) {
    return [search](const json& in) {
        return search(in.at(0).get<int>(), in.at(1).get<std::int64_t>());
    };
}

Answer SearchByModel(std::int64_t (*search)(std::int64_t, std::int64_t)) {
    return [search](const json& in) {
        return search(in.at(0).get<std::int64_t>(), in.at(1).get<std::int64_t>());
    };
}

/// The move into the range step by step.
std::int64_t WalkIntoRange(std::int64_t noteNr, int wrapIntvl) {
    for (bool isReached = false; !isReached; noteNr += wrapIntvl) isReached = noteNr >= 53;
    do {
        noteNr -= wrapIntvl;
    } while (noteNr > 53 + wrapIntvl);
    return noteNr;
}

}  // namespace

TEST_CASE("The notes of a key around a note are found, and those of the comping range") {
    test::CheckExpected(
        "theory-note-search",
        {
            {"NoteNrOfKeyNrLargerOrEqualTo", SearchBy(NoteNrOfKeyNrLargerOrEqualTo)},
            {"NoteNrOfKeyNrLargerThan", SearchBy(NoteNrOfKeyNrLargerThan)},
            {"NoteNrOfKeyNrSmallerOrEqualTo", SearchBy(NoteNrOfKeyNrSmallerOrEqualTo)},
            {"NoteNrOfKeyNrSmallerThan", SearchBy(NoteNrOfKeyNrSmallerThan)},
            {"NoteNrWithSameKeyNrLargerOrEqualTo",
             SearchByModel(NoteNrWithSameKeyNrLargerOrEqualTo)},
            {"NoteNrWithSameKeyNrLargerThan", SearchByModel(NoteNrWithSameKeyNrLargerThan)},
            {"IsNoteNrInCompingRange",
             [](const json& in) { return IsNoteNrInCompingRange(in.at(0).get<std::int64_t>()); }},
            {"ToCompingRangeNoteNr",
             [](const json& in) { return ToCompingRangeNoteNr(in.at(0).get<std::int64_t>()); }},
            {"NoteNrToCompingPlusWrapIntvlRange",
             [](const json& in) {
                 return NoteNrToCompingPlusWrapIntvlRange(in.at(0).get<std::int64_t>(),
                                                          in.at(1).get<int>());
             }},
            {"NoteNrAddIntvlToCompingPlusWrapIntvlRange",
             [](const json& in) {
                 return NoteNrAddIntvlToCompingPlusWrapIntvlRange(
                     in.at(0).get<std::int64_t>(), in.at(1).get<int>(), in.at(2).get<int>());
             }},
            {"KeyNrAddIntvlToCompingPlusWrapIntvlRange",
             [](const json& in) {
                 return KeyNrAddIntvlToCompingPlusWrapIntvlRange(
                     in.at(0).get<int>(), in.at(1).get<int>(), in.at(2).get<int>());
             }},
        });
}

TEST_CASE("A note comes into the comping range where walking there in steps would end") {
    for (int wrapIntvl = 1; wrapIntvl <= 40; ++wrapIntvl) {
        for (std::int64_t noteNr = -150; noteNr <= 300; ++noteNr) {
            CAPTURE(wrapIntvl);
            CAPTURE(noteNr);
            CHECK(NoteNrToCompingPlusWrapIntvlRange(noteNr, wrapIntvl) ==
                  WalkIntoRange(noteNr, wrapIntvl));
        }
    }
    CHECK(NoteNrToCompingPlusWrapIntvlRange(200, 0) == 200);
    CHECK(NoteNrToCompingPlusWrapIntvlRange(200, -12) == 200);
}

TEST_CASE("An F has two places in the comping range: the nearer end") {
    CHECK(ToCompingRangeNoteNr(41) == 53);
    CHECK(ToCompingRangeNoteNr(77) == 65);
}

TEST_CASE("Searches from far off the keyboard end at its limits") {
    for (int keyNr = 0; keyNr < 12; ++keyNr) {
        CAPTURE(keyNr);
        CHECK(NoteNrOfKeyNrLargerOrEqualTo(keyNr, kFarBelow) == 0);
        CHECK(NoteNrOfKeyNrLargerOrEqualTo(keyNr, kFarAbove) == 127);
        CHECK(NoteNrOfKeyNrSmallerOrEqualTo(keyNr, kFarBelow) == 0);
        CHECK(NoteNrOfKeyNrSmallerOrEqualTo(keyNr, kFarAbove) == 127);
    }
    for (const std::int64_t noteNr : {kFarBelow, kFarAbove}) {
        CHECK(IsNoteNrInCompingRange(ToCompingRangeNoteNr(noteNr)));
        CHECK(KeyNrOfNoteNr(ToCompingRangeNoteNr(noteNr)) == KeyNrOfNoteNr(noteNr));
    }
}
