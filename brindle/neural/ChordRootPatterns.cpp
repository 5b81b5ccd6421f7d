// SPDX-License-Identifier: MIT
// Many chords share their notes with another: C6 and Am7, Csus2 and Gsus4. For each set of inputs
// all readings are collected, and the best one by these rules counts:
//   - a full chord before one with a note left out; then without fifth, third, root;
//   - minor b13 after all others (its notes are those of a major seventh: Cm b13 is A flat maj7);
//   - the reading whose root is the lowest note, which also settles the augmented triad and the
//     diminished seventh, where every note can be the root;
//   - sus4 before sus2, minor 7 before 6, minor 7 b5 before minor 6;
//   - the reading whose root is the fewest semitones above the lowest note.

#include "brindle/neural/ChordRootPatterns.h"

#include <algorithm>
#include <array>
#include <iterator>
#include <tuple>

namespace brindle {

namespace {

// clang-format off
constexpr auto kChordShapes = std::to_array<CChordShape>({
    //  name          tones                   catalogue second reading
    // Triads and fewer.
    {"major",         CSemitones{0, 4, 7},            true,  false},
    {"minor",         CSemitones{0, 3, 7},            true,  false},
    {"sus2",          CSemitones{0, 2, 7},            true,  true},
    {"sus4",          CSemitones{0, 5, 7},            true,  false},
    // Dominants.
    {"7",             CSemitones{0, 4, 7, 10},        true,  false},
    {"7 b9",          CSemitones{0, 1, 4, 7, 10},     true,  false},
    {"7 #9",          CSemitones{0, 3, 4, 7, 10},     true,  false},
    {"7 11",          CSemitones{0, 4, 5, 7, 10},     true,  false},
    {"7 13",          CSemitones{0, 4, 7, 9, 10},     true,  false},
    {"7 b13",         CSemitones{0, 4, 7, 8, 10},     true,  false},
    {"9",             CSemitones{0, 2, 4, 7, 10},     true,  false},
    // Major chords.
    {"add9",          CSemitones{0, 2, 4, 7},         true,  false},
    {"6",             CSemitones{0, 4, 7, 9},         true,  true},
    {"6 add9",        CSemitones{0, 2, 4, 7, 9},      true,  false},
    {"maj7",          CSemitones{0, 4, 7, 11},        true,  false},
    {"maj7 b5",       CSemitones{0, 4, 6, 11},        true,  false},
    {"maj7 b9",       CSemitones{0, 1, 4, 7, 11},     true,  false},
    {"maj7 b5 #9",    CSemitones{0, 3, 4, 6, 11},     true,  false},
    {"maj7 13",       CSemitones{0, 4, 7, 9, 11},     true,  false},
    // Minor chords.
    {"minor 7",       CSemitones{0, 3, 7, 10},        true,  false},
    {"minor 7 b5",    CSemitones{0, 3, 6, 10},        true,  false},
    {"minor maj7",    CSemitones{0, 3, 7, 11},        true,  false},
    {"minor add9",    CSemitones{0, 2, 3, 7},         true,  false},
    {"minor 6",       CSemitones{0, 3, 7, 9},         true,  true},
    {"minor 6 add9",  CSemitones{0, 2, 3, 7, 9},      true,  false},
    {"minor b13",     CSemitones{0, 3, 7, 8},         true,  true},
    // Diminished and augmented chords.
    {"dim",           CSemitones{0, 3, 6},            true,  false},
    {"dim 7",         CSemitones{0, 3, 6, 9},         true,  false},
    {"aug",           CSemitones{0, 4, 8},            true,  false},
    {"aug 7",         CSemitones{0, 4, 8, 10},        true,  false},
    // The open fifth.
    {"drone",         CSemitones{0, 7},               true,  false},
    // Further shapes.
    {"maj9",          CSemitones{0, 2, 4, 7, 11},     false, false},
    {"m9",            CSemitones{0, 2, 3, 7, 10},     false, false},
    {"13",            CSemitones{0, 2, 4, 7, 9, 10},  false, false},
    {"7sus4",         CSemitones{0, 5, 7, 10},        false, false},
    {"9sus4",         CSemitones{0, 2, 5, 7, 10},     false, false},
    {"m11",           CSemitones{0, 2, 3, 5, 7, 10},  false, false},
    {"7b5",           CSemitones{0, 4, 6, 10},        false, false},
    {"7#11",          CSemitones{0, 4, 6, 7, 10},     false, false},
    {"maj7#11",       CSemitones{0, 4, 6, 7, 11},     false, false},
    {"aug maj7",      CSemitones{0, 4, 8, 11},        false, false},
    {"dim maj7",      CSemitones{0, 3, 6, 11},        false, false},
});
// clang-format on

constexpr auto kMinorB13 = CSemitones{0, 3, 7, 8};
constexpr int kFewestTonesToLeaveOneOut = 4;

/// The tone that has the role in this chord, -1 if none: the fifth is 7, else 6 or 8; the third is
/// 4, else 3 (which beside 4 is a sharp ninth).
int ToneWithRole(const CSemitones& tones, TOmission role) {
    const auto firstOf = [&](std::initializer_list<int> candidates) {
        const auto* found = std::find_if(candidates.begin(), candidates.end(),
                                         [&](int intvl) { return tones.HasIntvl(intvl); });
        return found == candidates.end() ? -1 : *found;
    };
    switch (role) {
        case TOmission_None:
            break;
        case TOmission_Fifth:
            return firstOf({7, 6, 8});
        case TOmission_Third:
            return firstOf({4, 3});
        case TOmission_Root:
            return 0;
    }
    return -1;
}

/// The tones other than the lowest, in semitones 1 to 11 above it.
std::vector<int> UpperTones(const CSemitones& tones, int lowest) {
    std::vector<int> result;
    for (int intvl = 1; intvl < 12; ++intvl) {
        if (tones.HasIntvl((lowest + intvl) % 12)) result.push_back(intvl);
    }
    return result;
}

/// Adds the pattern in every voicing: each upper tone from `tone` on in the first octave, the
/// second or both.
void AddVoicings(std::span<const int> upperTones, CChordRootPattern pattern,
                 std::vector<CChordRootPattern>& result) {
    if (upperTones.empty()) {
        result.push_back(pattern);
        pattern.mInputs |= 1U << 12U;
        result.push_back(pattern);
        return;
    }
    const std::uint32_t before = pattern.mInputs;
    const std::uint32_t low = 1U << static_cast<unsigned>(upperTones.front());
    const std::uint32_t high = low << 12U;
    for (const std::uint32_t notes : {low, high, low | high}) {
        pattern.mInputs = before | notes;
        AddVoicings(upperTones.subspan(1), pattern, result);
    }
}

void AddReadings(std::size_t shape, const CSemitones& tones, TOmission omission,
                 std::vector<CChordRootPattern>& result) {
    const bool isOfCatalogue = kChordShapes[shape].mIsOfCatalogue && omission == TOmission_None;
    for (int lowest = 0; lowest < 12; ++lowest) {
        if (!tones.HasIntvl(lowest)) continue;
        AddVoicings(UpperTones(tones, lowest),
                    {1U, (12 - lowest) % 12, shape, omission, isOfCatalogue}, result);
    }
}

std::vector<CChordRootPattern> AllReadings() {
    std::vector<CChordRootPattern> result;
    for (std::size_t shape = 0; shape < kChordShapes.size(); ++shape) {
        const CSemitones& tones = kChordShapes[shape].mTones;
        AddReadings(shape, tones, TOmission_None, result);
        if (tones.size() < kFewestTonesToLeaveOneOut) continue;
        for (const TOmission omission : {TOmission_Fifth, TOmission_Third, TOmission_Root}) {
            const int omitted = ToneWithRole(tones, omission);
            if (omitted < 0) continue;
            CSemitones rest = tones;
            rest.SetSemitone(omitted, false);
            AddReadings(shape, rest, omission, result);
        }
    }
    return result;
}

/// Orders readings of the same inputs, the one that counts first.
auto Rank(const CChordRootPattern& reading) {
    const CChordShape& shape = kChordShapes[reading.mShape];
    return std::tuple(reading.mInputs, reading.mOmission, shape.mTones == kMinorB13,
                      reading.mRootIntvl != 0, shape.mIsSecondReading, reading.mRootIntvl,
                      reading.mShape);
}

}  // namespace

std::span<const CChordShape> ChordShapes() {
    return kChordShapes;
}

std::vector<CChordRootPattern> ChordRootPatterns() {
    std::vector<CChordRootPattern> readings = AllReadings();
    std::sort(readings.begin(), readings.end(),
              [](const auto& a, const auto& b) { return Rank(a) < Rank(b); });
    std::vector<CChordRootPattern> result;
    for (const CChordRootPattern& reading : readings) {
        if (result.empty() || result.back().mInputs != reading.mInputs) {
            result.push_back(reading);
        } else {
            result.back().mIsOfCatalogue |= reading.mIsOfCatalogue;
        }
    }
    return result;
}

}  // namespace brindle
