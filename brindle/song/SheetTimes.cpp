// SPDX-License-Identifier: MIT
#include "brindle/song/SheetTimes.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/song/CSong.h"
#include "brindle/song/HarmonySymbols.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <map>

namespace brindle {

namespace {

constexpr double kUsualBeatsPerBar = 4.0;
// No song is as long.
constexpr double kEndOfTime = 1e9;

double BarLength(const TMusicXMLTimeSignature& time) {
    if (time.mNumerator < 1 || time.mDenominator < 1) return 0.0;
    return 4.0 * time.mNumerator / time.mDenominator;
}

// The length that most bars have, 0 without bars.
double CommonBarLength(const std::vector<CHarmBarline>& barlines) {
    std::map<double, std::size_t> counts;
    for (std::size_t i = 0; i + 1 < barlines.size(); ++i) {
        ++counts[barlines[i + 1].mPosition - barlines[i].mPosition];
    }
    const auto most = std::max_element(
        counts.begin(), counts.end(),
        [](const auto& one, const auto& other) { return one.second < other.second; });
    return most == counts.end() ? 0.0 : most->first;
}

void AppendTimes(const CSong& song, TMusicXMLDoc& sheet) {
    CSongTime time;
    for (const CSongBar& bar : song.mBars) {
        if (bar.mTime == CSongTime() || bar.mTime == time) continue;
        time = bar.mTime;
        sheet.TimeSignatures.push_back({bar.mPosition, time.mNumerator, time.mDenominator});
    }
}

std::ptrdiff_t BarAt(const CSong& song, double position) {
    const auto bar =
        std::lower_bound(song.mBars.begin(), song.mBars.end(), position,
                         [](const CSongBar& each, double place) { return each.mPosition < place; });
    return bar - song.mBars.begin();
}

}  // namespace

bool HasTimes(const TMusicXMLDoc& sheet) {
    return std::all_of(sheet.Harmonies.begin(), sheet.Harmonies.end(), [](const auto& harmony) {
        return harmony.mPosition >= 0.0 && harmony.mDuration >= 0.0 &&
               harmony.mPosition + harmony.mDuration < kEndOfTime;
    });
}

bool HasTimes(const CSong& song) {
    return std::all_of(song.mChords.begin(), song.mChords.end(), [](const auto& chord) {
        return chord.mPosition >= 0.0 && chord.mPosition < kEndOfTime;
    });
}

TMusicXMLDoc SheetWithoutChords(const CSong& song) {
    TMusicXMLDoc sheet;
    sheet.Title = song.mTitle;
    AppendTimes(song, sheet);
    for (const CSongSection& section : song.mSections) {
        sheet.HarmSections.push_back(
            {.mPosition = section.mPosition, .mIsFirst = sheet.HarmSections.empty()});
    }
    for (const CSongRepeat& repeat : song.mRepeats) {
        const auto back = BarAt(song, repeat.mPosition) - BarAt(song, repeat.mSourcePosition);
        sheet.HarmCopies.push_back({.mTargetPos = repeat.mPosition,
                                    .mSourceOffsetBars = -static_cast<std::int32_t>(back),
                                    .mLengthBars = repeat.mBarCount});
    }
    for (const CSongBar& bar : song.mBars) sheet.HarmBarlines.push_back({bar.mPosition});
    return sheet;
}

double EndOf(const TMusicXMLDoc& sheet) {
    if (sheet.Harmonies.empty()) return 0.0;
    return sheet.Harmonies.back().mPosition + sheet.Harmonies.back().mDuration;
}

CHarmAnlsChords WithRests(const CHarmAnlsChords& chords, const TMusicXMLDoc& sheet) {
    CHarmAnlsChords all;
    auto chord = chords.begin();
    for (const TMusicXMLHarmony& harmony : sheet.Harmonies) {
        if (harmony.IsNoChord()) {
            all.push_back(CHarmAnlsChordWithPos(CHarmAnlsChord(), harmony.mPosition));
        } else if (chord != chords.end()) {
            all.push_back(*chord++);
        }
    }
    if (!all.empty()) all.push_back(CHarmAnlsChordWithPos(CHarmAnlsChord(), EndOf(sheet)));
    return all;
}

double BeatsPerBarOf(const TMusicXMLDoc& sheet) {
    const double length = sheet.TimeSignatures.empty() ? CommonBarLength(sheet.HarmBarlines)
                                                       : BarLength(sheet.TimeSignatures.front());
    return length >= 1.0 / 64 && length <= 1024.0 ? length : kUsualBeatsPerBar;
}

}  // namespace brindle
