// SPDX-License-Identifier: MIT
#include "brindle/present/internal/Sheet.h"

#include "brindle/present/internal/SheetRepeats.h"

#include <fmt/format.h>

#include <algorithm>
#include <cmath>
#include <numeric>

namespace brindle::LeadSheet {
namespace {

// More bars than this without a chord are drawn as one rest.
constexpr std::size_t kMostEmptyBars = 8;

std::vector<double> TidyPositions(const CSong& song) {
    std::vector<double> positions(CountChords(song));
    double before = 0.0;
    for (std::size_t i = 0; i < positions.size(); ++i) {
        const double position = song.mChords[i].mPosition;
        if (std::isfinite(position) && position < 1e15) before = std::max(before, position);
        positions[i] = before;
    }
    return positions;
}

// The bars of a song that has none of its own, as far as chords begin in them.
std::vector<CSheetBar> CountedBars(const CSong& song, const std::vector<double>& positions) {
    const bool isSane = song.mBeatsPerBar >= 1.0 / 1024 && song.mBeatsPerBar < 1e6;
    const double length = isSane ? song.mBeatsPerBar : 4.0;
    const auto barOf = [&](double position) {
        return static_cast<std::size_t>((position + kTolerance) / length);
    };
    const double end = song.mChords.empty() ? 0.0 : song.mChords.back().mPosition;
    std::vector<CSheetBar> bars;
    std::size_t next = 0;
    const auto add = [&](std::size_t count) {
        CSheetBar& bar = bars.emplace_back();
        bar.mNumber = fmt::format("{}", next + 1);
        bar.mPosition = static_cast<double>(next) * length;
        bar.mLength = static_cast<double>(count) * length;
        bar.mBarCount = count;
        next += count;
    };
    const auto addUpTo = [&](std::size_t bar) {
        if (bar > next + kMostEmptyBars) add(bar - next);
        while (next < bar) add(1);
    };
    for (const double position : positions) {
        if (bars.empty() || barOf(position) >= next) {
            addUpTo(barOf(position));
            add(1);
        }
    }
    if (!bars.empty() && std::isfinite(end) && end < 1e15) {
        addUpTo(static_cast<std::size_t>(std::ceil(std::max(0.0, end - kTolerance) / length)));
    }
    return bars;
}

bool AreInOrder(const std::vector<CSongBar>& bars) {
    double end = -1e15;
    for (const CSongBar& bar : bars) {
        if (!(bar.mPosition >= end) || !(bar.mLength >= 0.0) || !(bar.mPosition < 1e15))
            return false;
        end = bar.mPosition;
    }
    return true;
}

std::vector<CSheetBar> GivenBars(const CSong& song) {
    std::vector<CSheetBar> bars;
    bars.reserve(song.mBars.size());
    CSongTime time;
    for (const CSongBar& given : song.mBars) {
        CSheetBar& bar = bars.emplace_back();
        bar.mNumber = given.mNumber;
        bar.mPosition = given.mPosition;
        bar.mLength = given.mLength;
        bar.mSign = given.mSign;
        bar.mWords = given.mWords;
        bar.mWritten = given.mWritten;
        bar.mEndsEnding = given.mEndsEnding;
        if (!given.mTime.IsUndef() && !(given.mTime == time)) bar.mTime = time = given.mTime;
    }
    const double usual = bars.size() > 1 ? bars[1].mLength : 0.0;
    if (!bars.empty()) bars[0].mIsUpbeat = bars[0].mLength < usual - kTolerance;
    return bars;
}

// Deals the chords out to the bars; those outside of all go to the first or the last.
void PlaceChords(const std::vector<double>& positions, std::vector<CSheetBar>& bars) {
    std::size_t chord = 0;
    for (std::size_t i = 0; i < bars.size(); ++i) {
        bars[i].mBegin = chord;
        const bool isLast = i + 1 == bars.size();
        while (chord < positions.size() &&
               (isLast || positions[chord] < bars[i + 1].mPosition - kTolerance)) {
            ++chord;
        }
        bars[i].mEnd = chord;
    }
}

void PlaceSections(const CSong& song, std::vector<CSheetBar>& bars) {
    for (const CSongSection& section : song.mSections) {
        const auto behind = std::upper_bound(
            bars.begin(), bars.end(), section.mPosition + kTolerance,
            [](double position, const CSheetBar& bar) { return position < bar.mPosition; });
        if (behind == bars.begin()) continue;
        CSheetBar& bar = *std::prev(behind);
        bar.mBeginsSection = true;
        if (!bar.mSection.empty() && !section.mName.empty()) bar.mSection += ", ";
        bar.mSection += section.mName;
    }
}

// Whether a reader comes to this bar from elsewhere, or looks for it.
bool BeginsPart(const CSheetBar& bar) {
    return bar.mBeginsSection || bar.mBeginsRepeat || !bar.mEnding.empty() ||
           !bar.mRemark.empty() || bar.mSign != TSongSign_None;
}

// A part begins with a chord, also where that sounded before.
void HoldChords(const CSong& song, CSheet& sheet) {
    for (CSheetBar& bar : sheet.mBars) {
        if (!BeginsPart(bar) || bar.mBegin == 0) continue;
        const bool hasChord =
            bar.mBegin < bar.mEnd && sheet.mPositions[bar.mBegin] <= bar.mPosition + kTolerance;
        if (!hasChord && !song.mChords[bar.mBegin - 1].IsUndef()) bar.mHeld = bar.mBegin - 1;
    }
}

bool IsPlain(const CSheetBar& bar) {
    return bar.mBegin == bar.mEnd && !bar.mBeginsSection && !bar.mBeginsRepeat &&
           !bar.mEndsRepeat && !bar.mIsInEnding && bar.mRemark.empty() && bar.mTime.IsUndef() &&
           bar.mSign == TSongSign_None && bar.mWords.empty();
}

// Joins each long row of bars without chords to one rest.
void JoinEmptyBars(std::vector<CSheetBar>& bars) {
    std::vector<CSheetBar> joined;
    for (std::size_t begin = 0; begin < bars.size();) {
        std::size_t end = begin;
        while (end < bars.size() && IsPlain(bars[end])) ++end;
        if (end - begin > kMostEmptyBars) {
            CSheetBar& rest = joined.emplace_back(bars[begin]);
            rest.mBarCount = 0;
            for (std::size_t i = begin; i < end; ++i) rest.mBarCount += bars[i].mBarCount;
            begin = end;
        } else {
            joined.push_back(std::move(bars[begin++]));
        }
    }
    bars = std::move(joined);
}

}  // namespace

std::size_t CountChords(const CSong& song) {
    return song.mChords.empty() ? 0 : song.mChords.size() - 1;
}

CSheet MakeSheet(const CSong& song) {
    CSheet sheet;
    sheet.mPositions = TidyPositions(song);
    sheet.mDrawnAs.resize(sheet.mPositions.size());
    std::iota(sheet.mDrawnAs.begin(), sheet.mDrawnAs.end(), std::size_t{0});
    const bool hasBars = !song.mBars.empty() && AreInOrder(song.mBars);
    sheet.mBars = hasBars ? GivenBars(song) : CountedBars(song, sheet.mPositions);
    PlaceChords(sheet.mPositions, sheet.mBars);
    PlaceSections(song, sheet.mBars);
    FoldRepeats(song, sheet);
    HoldChords(song, sheet);
    JoinEmptyBars(sheet.mBars);
    return sheet;
}

}  // namespace brindle::LeadSheet
