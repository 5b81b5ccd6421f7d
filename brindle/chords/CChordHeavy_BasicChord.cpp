// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/KeyIntervals.h"

#include <algorithm>
#include <array>
#include <optional>

namespace brindle {

namespace {

/// What decides the skeleton: the intervals in any octave, and the one that only the bass has.
struct CHeardIntvls {
    const CIntvlSet& intvls;
    int bassAloneIntvl;

    [[nodiscard]] bool Has(int intvl) const { return intvls.HasIntvlInAnyOctave(intvl); }
    [[nodiscard]] bool BassAloneOn(int intvl) const { return bassAloneIntvl == intvl; }
};

std::optional<TBasicChord> WithMajorThird(const CHeardIntvls& heard) {
    // Cm over E: the major third is only the bass.
    if (heard.BassAloneOn(4) && heard.Has(3)) return std::nullopt;
    if (!heard.Has(8)) return TBasicChord::Major;
    if (heard.BassAloneOn(7)) return TBasicChord::Augmented;
    return heard.Has(7) ? TBasicChord::Major : TBasicChord::Augmented;
}

TBasicChord WithMinorThirdAndFlatFifth(const CHeardIntvls& heard) {
    if (heard.Has(7) && !heard.BassAloneOn(7)) return TBasicChord::Minor;
    if (heard.BassAloneOn(10)) return TBasicChord::Diminished;
    return heard.Has(10) ? TBasicChord::Minor : TBasicChord::Diminished;
}

std::optional<TBasicChord> WithMinorThird(const CHeardIntvls& heard) {
    if (heard.Has(6)) return WithMinorThirdAndFlatFifth(heard);
    if (heard.Has(7) || heard.BassAloneOn(8) || !heard.Has(8)) return TBasicChord::Minor;
    return std::nullopt;
}

TBasicChord WithoutThird(const CHeardIntvls& heard) {
    if (!heard.Has(7)) return TBasicChord::None;
    if (heard.Has(5)) return TBasicChord::Sus4;
    if (heard.Has(2)) return TBasicChord::Sus2;
    if (!heard.Has(0) || heard.Has(3) || heard.Has(4) || heard.Has(5)) return TBasicChord::None;
    return TBasicChord::Drone;
}

struct CXGRow {
    CSemitones intvls;
    int index;
};

// clang-format off
constexpr auto kXGRows = std::to_array<CXGRow>({
    {CSemitones{0, 4, 7},         0},   {CSemitones{0, 3, 7},         8},
    {CSemitones{0, 4, 7, 9},      1},   {CSemitones{0, 3, 7, 9},      9},
    {CSemitones{0, 4, 7, 11},     2},   {CSemitones{0, 3, 7, 10},    10},
    {CSemitones{0, 4, 7, 11, 6},  3},   {CSemitones{0, 3, 6, 10},    11},
    {CSemitones{0, 4, 7, 2},      4},   {CSemitones{0, 3, 7, 2},     12},
    {CSemitones{0, 4, 7, 11, 2},  5},   {CSemitones{0, 3, 7, 10, 2}, 13},
    {CSemitones{0, 4, 7, 9, 2},   6},   {CSemitones{0, 3, 7, 10, 5}, 14},
    {CSemitones{0, 4, 7, 10},    19},   {CSemitones{0, 3, 7, 11},    15},
    {CSemitones{0, 4, 6, 10},    21},   {CSemitones{0, 3, 7, 11, 2}, 16},
    {CSemitones{0, 4, 7, 10, 2}, 22},   {CSemitones{0, 4, 8},         7},
    {CSemitones{0, 4, 7, 10, 6}, 23},   {CSemitones{0, 4, 8, 11},    28},
    {CSemitones{0, 4, 7, 10, 9}, 24},   {CSemitones{0, 4, 8, 10},    29},
    {CSemitones{0, 4, 7, 10, 1}, 25},   {CSemitones{0, 3, 6},        17},
    {CSemitones{0, 4, 7, 10, 8}, 26},   {CSemitones{0, 3, 6, 9},     18},
    {CSemitones{0, 4, 7, 10, 3}, 27},   {CSemitones{0, 5, 7},        32},
    {CSemitones{0, 5, 7, 10},    20},   {CSemitones{0, 2, 7},        33},
    {CSemitones{0, 7},           31},   {CSemitones{0},              30},
});
// clang-format on

int XGChordIxOf(TBasicChord basicChord) {
    switch (basicChord) {
        case TBasicChord::Major:
            return 0;
        case TBasicChord::Minor:
            return 8;
        case TBasicChord::Augmented:
            return 7;
        case TBasicChord::Diminished:
            return 17;
        case TBasicChord::Sus4:
            return 32;
        case TBasicChord::Sus2:
            return 33;
        case TBasicChord::Drone:
            return 31;
        case TBasicChord::None:
            return 34;
    }
    return 34;
}

/// The set as a mask, if it keeps within one octave; a ninth at 14 is not a second.
std::optional<CSemitones> WithinOctave(const CIntvlSet& intvls) {
    if (!intvls.empty() && (*intvls.begin() < 0 || *intvls.rbegin() > 11)) return std::nullopt;
    return intvls.ToSemitones();
}

}  // namespace

TBasicChord CChordHeavy::BasicChord() const {
    const CIntvlSet& intvls = IntvlSet();
    const CHeardIntvls heard{intvls, BassNoteHasIntvlAlone() ? _BassIntvl() : kIntvlUndef};
    if (heard.Has(4)) {
        if (const auto basicChord = WithMajorThird(heard)) return *basicChord;
    }
    if (heard.Has(3)) {
        if (const auto basicChord = WithMinorThird(heard)) return *basicChord;
    }
    return WithoutThird(heard);
}

CSemitones CChordHeavy::BasicChordSemitones() const {
    CSemitones semitones;
    semitones.SetFromBasicChord(BasicChord());
    return semitones;
}

int CChordHeavy::XGChordIx() const {
    const auto intvls = WithinOctave(IntvlSet());
    const auto row = std::find_if(kXGRows.begin(), kXGRows.end(),
                                  [&](const CXGRow& xgRow) { return xgRow.intvls == intvls; });
    return row != kXGRows.end() ? row->index : XGChordIxOf(BasicChord());
}

}  // namespace brindle
