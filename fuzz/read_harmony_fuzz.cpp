// SPDX-License-Identifier: MIT
// Each six bytes are a chord: root, bass, tones and length. The reading of any such list holds
// together.

#include "brindle/analysis/CHarmAnlsChords.h"
#include "brindle/analysis/ReadHarmony.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <limits>
#include <vector>

namespace {

using namespace brindle;

constexpr std::size_t kChordBytes = 6;
constexpr std::size_t kMostChords = 200;

void Require(bool holds) {
    if (!holds) std::abort();
}

// Any key number from 0 to 11, or none, under any spelling.
CKeyEnh KeyOf(std::uint8_t byte) {
    const int keyNr = byte % 16;
    return {keyNr < 12 ? keyNr : kKeyNrUndef, static_cast<TEnh>(byte / 16 % 9 - 1)};
}

double LengthOf(std::uint8_t byte) {
    if (byte == 255) return std::numeric_limits<double>::quiet_NaN();
    if (byte == 254) return std::numeric_limits<double>::infinity();
    if (byte == 253) return -1.0;
    return byte / 4.0;
}

CHarmAnlsChords ChordsOf(const std::uint8_t* data, std::size_t count) {
    CHarmAnlsChords chords;
    double position = 0.0;
    for (std::size_t i = 0; i < count; ++i, data += kChordBytes) {
        const CSemitones tones(data[2] | static_cast<std::uint64_t>(data[3] & 15) << 8);
        chords.emplace_back(CChordLite(KeyOf(data[0]), KeyOf(data[1]), tones), position);
        position += LengthOf(data[4]);
    }
    if (count > 0) chords.emplace_back(CChordLite(), position);
    return chords;
}

void CheckChord(const CChordReading& chord, std::ptrdiff_t index, std::ptrdiff_t count) {
    Require(chord.mResolvesTo >= -1 && chord.mResolvesTo < count);
    Require(chord.mUnder == -1 || (chord.mUnder > index && chord.mUnder < count));
    Require(chord.mKey.IsUndef() == (chord.mRelation == TChordRelation_Undef));
    Require(chord.mServes.mSemitones >= -1 && chord.mServes.mSemitones < 12);
    Require(NameOf(chord.mRelation).empty() == (chord.mRelation == TChordRelation_Undef));
}

// Regions follow one another, and no two arcs of the tree cross.
void CheckWhole(const CSongReading& reading) {
    for (std::size_t i = 1; i < reading.mRegions.size(); ++i) {
        Require(reading.mRegions[i - 1].mEnd == reading.mRegions[i].mBegin);
    }
    std::vector<std::ptrdiff_t> ends;
    for (std::size_t i = 0; i < reading.mChords.size(); ++i) {
        while (!ends.empty() && ends.back() <= static_cast<std::ptrdiff_t>(i)) ends.pop_back();
        const std::ptrdiff_t end = reading.mChords[i].mUnder;
        if (end < 0) continue;
        Require(ends.empty() || end <= ends.back());
        ends.push_back(end);
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 1 || size > kMostChords * kChordBytes) return 0;
    CReadingOptions options;
    if ((data[0] & 1) != 0) options.mStatedKey = CSignKeyLite("F# minor");
    if ((data[0] & 2) != 0) options.mKeys.mBeatsPerBar = LengthOf(data[0]);
    const CHarmAnlsChords chords = ChordsOf(data + 1, (size - 1) / kChordBytes);
    const CSongReading reading = ReadHarmony(chords, options);
    Require(reading.mChords.size() == chords.size());
    const auto count = static_cast<std::ptrdiff_t>(chords.size());
    for (std::ptrdiff_t i = 0; i < count; ++i) {
        CheckChord(reading.mChords[static_cast<std::size_t>(i)], i, count);
    }
    CheckWhole(reading);
    return 0;
}
