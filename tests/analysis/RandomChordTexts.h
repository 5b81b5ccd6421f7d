// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CHarmAnlsSignKeys.h"
#include "brindle/analysis/TChordStringParse.h"

#include <cstddef>
#include <cstdint>
#include <random>
#include <span>
#include <string>

namespace brindle::test {

/// Random numbers that are the same with every standard library.
class CChance {
public:
    explicit CChance(std::uint32_t seed) : mGenerator(seed) {}

    /// 0 to count - 1.
    std::size_t Below(std::size_t count) { return mGenerator() % count; }
    /// Once in `count` times.
    bool OneIn(std::size_t count) { return Below(count) == 0; }
    template <class T>
    const T& Of(std::span<const T> values) {
        return values[Below(values.size())];
    }

private:
    std::mt19937 mGenerator;
};

/// A chord text of up to 60 chords: diatonic in keys that change, or quite random, or of very few
/// chords, or a string of known progressions; some with bars, holds and tokens that are no chord.
[[nodiscard]] std::string RandomChordText(CChance& chance);
/// `count` chords of all kinds, some with a bass, and places without one. Their lengths are of
/// their own, so that no two keys have equal points by chance.
[[nodiscard]] CHarmAnlsChords RandomChords(CChance& chance, std::size_t count);
/// The same a number of semitones higher.
[[nodiscard]] CKeyEnh Transposed(const CKeyEnh& keyEnh, int up);
[[nodiscard]] CHarmAnlsChords Transposed(CHarmAnlsChords chords, int up);
/// Usual beats, or those that are hard to add up, or none at all.
[[nodiscard]] TChordStringParse RandomBeats(CChance& chance);
/// None, one or several sign keys, defined or not.
[[nodiscard]] CHarmAnlsSignKeys RandomSignKeys(CChance& chance);
/// Sign keys that already hold centers with these chords, as a host fills them by hand: mostly in
/// the order of time, sometimes with odd positions.
[[nodiscard]] CHarmAnlsSignKeys RandomFilledSignKeys(CChance& chance,
                                                     const CHarmAnlsChords& chords);

}  // namespace brindle::test
