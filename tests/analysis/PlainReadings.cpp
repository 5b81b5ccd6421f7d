// SPDX-License-Identifier: MIT
#include "tests/analysis/PlainHarmony.h"
#include "tests/analysis/PlainRoutes.h"

#include <vector>

namespace brindle::test {

namespace {

/// A reading of one center over the chords from `begin` to before `end`.
struct CReading {
    double probability;
    CHarmCenterLite center;
    std::size_t begin;
    std::size_t end;

    std::size_t Count() const { return end - begin; }
    bool HasInside(std::size_t place) const { return begin <= place && place <= end; }
    bool IsLongerAndContains(const CReading& other) const {
        return Count() > other.Count() && HasInside(other.begin) && HasInside(other.end);
    }
    bool IsSimultaneousWith(const CReading& other) const {
        return begin == other.begin && end == other.end;
    }
    bool IsEqualTo(const CReading& other) const {
        return IsSimultaneousWith(other) && center == other.center;
    }
};

using TReadings = std::vector<CReading>;

void Erase(TReadings& readings, std::size_t place) {
    readings.erase(readings.begin() + static_cast<std::ptrdiff_t>(place));
}

TReadings ReadSingleChord(const CHarmAnlsChords& chords) {
    const CHarmAnlsChord& chord = chords.front();
    const bool isMinor = ChordPattern::Minor.Matches(chord.mSemitones) ||
                         ChordPattern::Diminished.Matches(chord.mSemitones);
    return {{1.0, {chord.mRootKeyEnh, CSemitones(isMinor ? 1453 : 2741)}, 0, 1}};
}

TReadings ReadSeveralChords(const CHarmAnlsChords& chords) {
    TReadings readings;
    const auto& table = CHarmAnlsProgressions::TonicProgressions();
    for (std::size_t n = 0; n < chords.size(); ++n) {
        const auto it = chords.begin() + static_cast<std::ptrdiff_t>(n);
        const auto best =
            table.FindAndSortForwardMatchingProgressions(it, chords).GetBestMatchingProgressions();
        for (const auto& row : best) {
            CReading reading{
                1.0 / static_cast<double>(best.size()),
                row.HarmCenterCalculatedFromFoundProgressionNthChord(row.size() - 1, it, chords), n,
                n + row.size()};
            while (reading.begin > 0 &&
                   PlainIsCompatible(chords[reading.begin - 1], reading.center)) {
                --reading.begin;
            }
            while (reading.end < chords.size() - 1 &&
                   PlainIsCompatible(chords[reading.end], reading.center)) {
                ++reading.end;
            }
            readings.push_back(reading);
        }
    }
    return readings;
}

void RecalculateProbabilities(TReadings& readings) {
    for (std::size_t a = 0; a < readings.size(); ++a) {
        std::vector<CReading*> partners;
        for (std::size_t b = 0; b < readings.size(); ++b) {
            if (a != b && readings[b].IsSimultaneousWith(readings[a])) {
                partners.push_back(&readings[b]);
            }
        }
        for (CReading* partner : partners) {
            partner->probability = 1.0 / (static_cast<double>(partners.size()) + 1.0);
        }
    }
}

void RemoveShorterContained(TReadings& readings) {
    bool isAnyErased = false;
    for (std::size_t a = 0; a < readings.size();) {
        bool isContained = false;
        for (std::size_t b = 0; b < readings.size(); ++b) {
            if (a != b && readings[b].IsLongerAndContains(readings[a])) isContained = true;
        }
        if (isContained) {
            Erase(readings, a);
            isAnyErased = true;
        } else {
            ++a;
        }
    }
    if (isAnyErased) RecalculateProbabilities(readings);
}

void Deduplicate(TReadings& readings) {
    for (std::size_t a = 0; a < readings.size(); ++a) {
        for (std::size_t b = a + 1; b < readings.size();) {
            if (readings[b].IsEqualTo(readings[a])) {
                readings[a].probability += readings[b].probability;
                Erase(readings, b);
            } else {
                ++b;
            }
        }
    }
    RecalculateProbabilities(readings);
}

void RemoveNonSure(TReadings& readings) {
    for (std::size_t a = 0; a < readings.size(); ++a) {
        if (readings[a].probability != 1.0) continue;
        for (std::size_t b = a + 1; b < readings.size();) {
            if (readings[b].IsSimultaneousWith(readings[a])) {
                Erase(readings, b);
            } else {
                ++b;
            }
        }
    }
}

CHarmAnlsCenter CenterOf(const CReading& reading, const CHarmAnlsChords& chords) {
    CHarmAnlsCenter center;
    center.mProbability = reading.probability;
    if (reading.center.mRootKeyEnh.mKeyNr == 15) return center;
    center.mPosition = chords[reading.begin].mPosition;
    center.mHarmCenter = reading.center;
    for (std::size_t n = reading.begin; n < reading.end; ++n) center.mChords.push_back(chords[n]);
    return center;
}

}  // namespace

CHarmAnlsCenters PlainBestResults(const CHarmAnlsChords& chords) {
    TReadings readings = chords.CountDifferentNonUndefChords() == 1 ? ReadSingleChord(chords)
                                                                    : ReadSeveralChords(chords);
    RemoveShorterContained(readings);
    Deduplicate(readings);
    RemoveNonSure(readings);
    CHarmAnlsCenters centers;
    for (const CReading& reading : readings) centers.push_back(CenterOf(reading, chords));
    return centers;
}

}  // namespace brindle::test
