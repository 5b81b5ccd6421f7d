// SPDX-License-Identifier: MIT
#include "brindle/song/SheetTimes.h"

#include "brindle/musicxml/TMusicXMLDoc.h"
#include "brindle/song/HarmonySymbols.h"

#include <algorithm>
#include <map>

namespace brindle {

namespace {

constexpr double kUsualBeatsPerBar = 4.0;

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

}  // namespace

bool HasTimes(const TMusicXMLDoc& sheet) {
    return std::all_of(sheet.Harmonies.begin(), sheet.Harmonies.end(), [](const auto& harmony) {
        return harmony.mPosition >= 0.0 && harmony.mDuration >= 0.0 &&
               harmony.mPosition + harmony.mDuration < 1e9;
    });
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
