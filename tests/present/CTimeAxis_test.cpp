// SPDX-License-Identifier: MIT
#include "brindle/present/CTimeAxis.h"

#include <doctest/doctest.h>

#include <vector>

namespace brindle::test {
namespace {

// One chord a bar.
CShownSong SongOfBars(const std::vector<double>& starts, double end) {
    CShownSong song;
    song.mBarStarts = starts;
    song.mEnd = end;
    for (std::size_t bar = 0; bar < starts.size(); ++bar) {
        const double next = bar + 1 < starts.size() ? starts[bar + 1] : end;
        CShownChord chord;
        chord.mRange = {starts[bar], next};
        song.mLooseChords.push_back(chord);
    }
    return song;
}

std::vector<double> BarsWithUpbeat(double upbeat, int bars) {
    std::vector<double> starts{0.0};
    for (int bar = 0; bar < bars; ++bar) starts.push_back(upbeat + 4.0 * bar);
    return starts;
}

TEST_CASE("An upbeat goes with the first line, which has as many whole bars as the others") {
    // Room for four bars of which the shortest chord, the upbeat, would allow.
    CShownSong song = SongOfBars(BarsWithUpbeat(1.0, 8), 33.0);
    song.mLooseChords.front().mRange = {0.0, 4.0};
    const CTimeAxis axis(song, 960.0, 240.0);
    REQUIRE(axis.LineCount() == 2);
    REQUIRE(axis.BarLines(0).size() == 5);
    CHECK(axis.BarLines(0).front().mX == 0.0);
    CHECK(axis.BarLines(0)[1].mX == doctest::Approx(960.0 / 17.0));
    CHECK(axis.BarLines(0)[1].mBar == 2);
    CHECK(axis.BarLines(1).front().mBar == 6);
    CHECK(axis.Line(0).mRight == doctest::Approx(960.0));
    CHECK(axis.Line(1).mRight == doctest::Approx(960.0 * 16.0 / 17.0));
}

TEST_CASE("A range over a line break has a piece on each line") {
    CShownSong song;
    song.mEnd = 32.0;
    for (int bar = 0; bar < 8; ++bar) {
        CShownChord chord;
        chord.mRange = {4.0 * bar, 4.0 * bar + 4.0};
        song.mLooseChords.push_back(chord);
    }
    const CTimeAxis axis(song, 800.0, 200.0);
    const std::vector<CTimeSegment> segments = axis.SegmentsOf({14.0, 18.0});
    REQUIRE(segments.size() == 2);
    CHECK(segments[0].mLine == 0);
    CHECK(segments[0].mLeft == doctest::Approx(700.0));
    CHECK(segments[0].mRight == doctest::Approx(800.0));
    CHECK(segments[1].mLine == 1);
    CHECK(segments[1].mLeft == 0.0);
    CHECK(segments[1].mRight == doctest::Approx(100.0));
}

}  // namespace
}  // namespace brindle::test
