// SPDX-License-Identifier: MIT
#include "brindle/guitarchords/GChShortTuning.h"

#include <algorithm>

namespace brindle {

namespace {

constexpr int kFewestStrings = 3;
constexpr int kHighestOpenPitch = 127;

}  // namespace

void GChClearShortTuning(GChShortTuning& tuning) {
    tuning.fill(0);
}

void GChCopyShortTuning(const GChShortTuning& source, GChShortTuning& target) {
    target = source;
}

void GChSetDefaultGuitarShortTuning(GChShortTuning& tuning) {
    tuning = kGChStandardGuitar;
}

int GChNumberOfStringsInShortTuning(const GChShortTuning& tuning) {
    return static_cast<int>(std::find(tuning.begin(), tuning.end(), 0) - tuning.begin());
}

int GChPitchForStringIndexInShortTuning(int index, const GChShortTuning& tuning) {
    return tuning[static_cast<std::size_t>(index)];
}

int GChStandardGuitarOpenStringPitch(int index) {
    if (index < 0 || index >= kGChMaxStrings) return 0;
    return GChPitchForStringIndexInShortTuning(index, kGChStandardGuitar);
}

bool GChIsEqualShortTuning(const GChShortTuning& a, const GChShortTuning& b) {
    const int distance = a[0] - b[0];
    if (distance % 12 != 0) return false;
    return std::equal(a.begin() + 1, a.end(), b.begin() + 1, [&](int pitchA, int pitchB) {
        return (pitchA == 0 && pitchB == 0) || pitchA - distance == pitchB;
    });
}

bool GChIsValidShortTuning(const GChShortTuning& tuning) {
    const int strings = GChNumberOfStringsInShortTuning(tuning);
    return strings >= kFewestStrings &&
           std::all_of(tuning.begin(), tuning.begin() + strings,
                       [](std::uint8_t pitch) { return pitch <= kHighestOpenPitch; });
}

std::vector<int> GChPitchArrayFromShortTuning(const GChShortTuning& tuning) {
    return {tuning.begin(), tuning.begin() + GChNumberOfStringsInShortTuning(tuning)};
}

void GChPitchArrayToShortTuning(const std::vector<int>& pitches, GChShortTuning& tuning) {
    tuning.fill(0);
    const std::size_t count = std::min(pitches.size(), tuning.size());
    std::transform(pitches.begin(), pitches.begin() + static_cast<std::ptrdiff_t>(count),
                   tuning.begin(), [](int pitch) { return static_cast<std::uint8_t>(pitch); });
}

}  // namespace brindle
