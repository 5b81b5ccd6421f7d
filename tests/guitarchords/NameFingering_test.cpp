// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/NameFingering.h"

#include "brindle/guitarchords/Tunings.h"
#include "brindle/neural/RootCostsByNet.h"

#include <doctest/doctest.h>

#include <algorithm>
#include <string>
#include <vector>

namespace brindle::test {
namespace {

constexpr GChShortTuning kUkulele{67, 60, 64, 69};

std::string NameOf(const std::vector<int>& frets, const GChShortTuning& tuning) {
    std::vector<int> pitches;
    for (std::size_t string = 0; string < frets.size(); ++string) {
        pitches.push_back(frets[string] < 0 ? -1 : tuning[string] + frets[string]);
    }
    const auto names = NameFingering(pitches, tuning);
    return names.empty() ? "" : names.front().mSymbol;
}

TEST_CASE("Fingerings of a guitar are named over the root that guitarists hear") {
    constexpr int x = -1;
    struct CRow {
        std::vector<int> mFrets;
        const char* mSymbol;
    };
    for (const CRow& row : std::vector<CRow>{
             {{x, 0, 2, 0, 1, 0}, "Am7"},
             {{x, 2, 0, 2, 0, 2}, "Bm7"},
             {{0, 2, 2, 0, 3, 0}, "Em7"},
             {{2, 0, 0, 2, 3, 2}, "D/F#"},
             {{3, 3, 2, 0, 1, 0}, "C/G"},
             {{x, 3, 2, 0, 1, 0}, "C"},
             {{x, 3, 2, 3, 1, 0}, "C7"},
             {{x, x, 0, 2, 3, 3}, "Dsus4"},
             {{x, 0, 2, 4, 5, 3}, "Em/A"},
             {{4, x, 3, 5, 4, 3}, "Fm9/Ab"},
             {{x, 4, 4, 6, 4, 4}, "Dbsus24"},
             {{8, x, 8, 9, 10, x}, "C13"},
             {{x, 3, 2, 3, 3, 5}, "C13"},
             {{x, 2, 0, 2, 0, 1}, "Bm7b5"},
             {{x, 0, 2, 0, 3, 0}, "A7sus4"},
             {{x, 0, 2, 2, 1, 3}, "Am7"},
             {{x, x, x, x, x, x}, ""},
         }) {
        CHECK(NameOf(row.mFrets, kGChStandardGuitar) == row.mSymbol);
    }
}

TEST_CASE("The lowest note of a re-entrant tuning and of a small instrument is no bass") {
    CHECK(IsReentrant(kUkulele));
    CHECK_FALSE(IsReentrant(kGChStandardGuitar));
    CHECK(NameOf({0, 0, 0, 0}, kUkulele) == "C6");  // as the tuning is called
    CHECK(NameOf({0, 0, 0, 3}, kUkulele) == "C");
    CHECK(NameOf({0, 2, 3, 2}, kUkulele) == "G");
    CHECK(NameOf({0, 2, 0, 1}, kUkulele) == "Gm6");  // not Em7b5
    CHECK(NameOf({0, 0, 0, 3}, *TuningOfName("ukulele-low-g")) == "C");
    CHECK(NameOf({0, 2, 3, 0}, *TuningOfName("mandolin")) == "C");
    CHECK(NameOf({0, 3, 2, 0}, *TuningOfName("bass")) == "C/E");
}

TEST_CASE("The net doubts least the root of a triad, in all keys and inversions") {
    CHECK(RootCostsByNet({}) == std::array<int, 12>{});
    for (int root = 0; root < 12; ++root) {
        for (const std::vector<int>& shape :
             std::vector<std::vector<int>>{{0, 4, 7}, {4, 7, 12}, {7, 12, 16}, {0, 16, 43}}) {
            std::vector<CNote> notes;
            for (const int tone : shape) notes.emplace_back(48 + root + tone, TEnh_Undef);
            const auto costs = RootCostsByNet(notes);
            CHECK(std::min_element(costs.begin(), costs.end()) - costs.begin() == root);
        }
    }
}

}  // namespace
}  // namespace brindle::test
