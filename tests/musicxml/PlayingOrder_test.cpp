// SPDX-License-Identifier: MIT
// The order in which lead sheets are played, counted by hand in the scores.

#include "brindle/musicxml/internal/PlayingOrder.h"
#include "brindle/musicxml/ScoreContainer.h"
#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/musicxml/internal/ScoreReader.h"
#include "brindle/platform/AtomicFile.h"

#include <doctest/doctest.h>
#include <fmt/format.h>

#include <string>

using namespace brindle;

namespace {

// The measures counted from 1, "1-16 1-9 17-23".
std::string Shown(const CPlayingOrder& order) {
    std::string text;
    const auto& measures = order.mMeasures;
    for (std::size_t i = 0; i < measures.size();) {
        std::size_t end = i + 1;
        while (end < measures.size() && measures[end] == measures[end - 1] + 1) ++end;
        if (!text.empty()) text += ' ';
        text += fmt::format("{}", measures[i] + 1);
        if (end > i + 1) text += fmt::format("-{}", measures[end - 1] + 1);
        i = end;
    }
    return text;
}

}  // namespace

TEST_CASE("Lead sheets are played through as their signs and words say") {
    struct CRow {
        const char* mFile;
        const char* mOrder;
        double mQuarters;
    };
    const CRow rows[] = {
        // An upbeat of an eighth, a repeat with a second ending that is numbered 3.
        {"what_child_is_this.musicxml", "1-19 4-18 20", 102.5},
        // First and second ending; D.C. al Coda runs into the coda, whose sign stands alone.
        {"beautiful_dreamer.musicxml", "1-12 1-9 13-27 1-9 13-36", 207},
        // D.S. al Coda: eight bars of blues, and the four of the coda make twelve.
        {"west_end_blues.musicxml", "1-35 2-9 36-39", 188},
        // D.S. al Fine.
        {"smilin_through.musicxml", "1-37 6-20", 156},
        // "3 repeats then D.C.al fine": four verses, and the chorus once more.
        {"the_skye_boat_song.xml", "1-32 1-32 1-32 1-32 1-16", 432},
        // Two repeats with endings of several bars.
        {"down_by_the_riverside.mxl", "1-9 2-5 10-37 30-32 38-42", 196},
        // Two signs of the coda and no "To Coda": a song of 32 bars.
        {"ain_t_we_got_fun.musicxml", "1-16 1-9 17-23", 128},
        // After D.S. the repeat is left out, and the ending with the Fine is taken.
        {"joshua_fit_the_battle_of_jericho.musicxml", "1-16 1-24 9-23 25", 224},
        // "(fine)" in words only.
        {"la_cumparsita.musicxml", "1-34 1-18", 208},
        // The Fine stands in a first ending, which D.C. al Fine therefore takes.
        {"maple_leaf_rag.musicxml", "1-16 1-15 17-33 18-32 34 1-16", 160},
        {"makin_whoopee.mxl", "1-9 1-7 10-27", 131},
        {"hungarian_dance_no_5_in_f_minor.xml", "1-16 1-34", 100},
        {"sometimes_i_feel_like_a_motherless_child.xml", "1-20 1-40 21-40", 320},
        {"coventry_carol.xml", "1-16", 48},
        {"what_shall_we_do_with_a_drunken_sailor.xml", "1-8", 32},
    };
    for (const CRow& row : rows) {
        INFO(std::string(row.mFile));
        const std::string path = std::string(BRINDLE_TEST_DATA) + "/leadsheets/" + row.mFile;
        std::string bytes = ReadWholeFile(path).value();
        if (IsScoreContainer(bytes)) bytes = ScoreInContainer(bytes).value();
        CHECK(Shown(PlayInOrder(ReadScore(bytes).mScore.mMarks)) == row.mOrder);

        TMusicXMLDoc doc;
        REQUIRE(doc.LoadAsPlayed(path));
        const TMusicXMLHarmony& last = doc.Harmonies.back();
        CHECK(last.mPosition + last.mDuration == doctest::Approx(row.mQuarters));
    }
}

TEST_CASE("A bar that sends to the coda is not the coda, though it has its sign") {
    std::vector<CPlayMarks> bars(6);
    bars[1].mToCoda.Set();
    bars[2].mToCoda.Set();
    bars[2].mCoda.Set();
    bars[3].mDaCapo = bars[3].mAlCoda = true;
    bars[4].mCoda.Set();
    CHECK(Shown(PlayInOrder(bars)) == "1-4 1-2 5-6");
}
