// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/CKeyOfSong.h"
#include "brindle/analysis/internal/KeyChordKinds.h"
#include "brindle/analysis/internal/KeyScores.h"
#include "brindle/analysis/internal/SongTraits.h"

#include <array>
#include <cstdint>
#include <span>
#include <vector>

namespace brindle {

/// The keys of a song, as the numbers of KeyNumbers.h.
struct CSongKeys {
    std::array<double, kKeyCount> mScores{};
    /// By the scores alone.
    int mBestScored = 0;
    CSongTraits mTraits;
    std::vector<TKeyChordKind> mKinds;
    /// The key of each chord.
    std::vector<std::uint8_t> mKeys;
};

/// `chords` has at least one chord. `statedKey` is the number of the key of the song, -1 to find
/// it.
[[nodiscard]] CSongKeys FindSongKeys(std::span<const CKeyChord> chords, const CKeyOptions& options,
                                     int statedKey = -1);

/// The share of a key in the points of all keys, 0 to 1.
[[nodiscard]] double ConfidenceOf(const std::array<double, kKeyCount>& scores, int key);

/// Key numbers as sign keys. Where two spellings have as many signs, F sharp and G flat major, the
/// first chord on the tonic decides. The stated key keeps the spelling in which it is stated.
class CKeySpeller {
public:
    explicit CKeySpeller(const CHarmAnlsChords& chords, const CSignKeyLite& statedKey = {});

    [[nodiscard]] const CSignKeyLite& SignKeyOf(int key) const {
        return mSignKeys[static_cast<std::size_t>(key)];
    }

private:
    std::array<CSignKeyLite, kKeyCount> mSignKeys;
};

/// The passages of one key. `heard` are the chords that `keys` are of.
[[nodiscard]] std::vector<CKeyRegion> KeyRegionsOf(const CHarmAnlsChords& chords,
                                                   std::span<const CKeyChord> heard,
                                                   std::span<const std::uint8_t> keys,
                                                   const CKeySpeller& speller);

}  // namespace brindle
