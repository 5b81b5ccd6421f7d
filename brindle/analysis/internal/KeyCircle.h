// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/analysis/internal/KeyChordKinds.h"
#include "brindle/analysis/internal/KeyNumbers.h"
#include "brindle/analysis/internal/KeyTables.h"

#include <array>
#include <cstddef>

namespace brindle {

// Points of the 24 keys in the order of the circle of fifths. All is inline: it is the inner loop
// of the search for the keys of a song.

inline constexpr std::size_t kFifths = 12;

using TFifths = std::array<double, kFifths>;
using TTwiceFifths = std::array<double, 2 * kFifths>;

/// Where a pitch class stands on the circle of fifths, counted from C.
constexpr std::size_t PlaceOnCircle(int keyNr) {
    return static_cast<std::size_t>(FoldIntoOctave(7 * keyNr));
}

/// The place of the signature of a key on the circle: C major and A minor are 0.
constexpr std::size_t SignatureOf(int key) {
    return PlaceOnCircle(TonicOfKey(key) + 3 * ModeOfKey(key));
}

/// The key whose points stand there: the major keys by their signatures, then the minor ones.
constexpr int KeyAtPlace(int place) {
    const int signature = FoldIntoOctave(7 * place);
    return place < static_cast<int>(kFifths) ? signature
                                             : FoldIntoOctave(signature - 3) + kKeyCount / 2;
}

/// Points of the keys, by the places of their signatures on the circle.
struct CPointsOfKeys {
    TFifths mMajor;
    TFifths mMinor;

    [[nodiscard]] double& Of(int key) {
        return (IsMinorKey(key) ? mMinor : mMajor)[SignatureOf(key)];
    }
    [[nodiscard]] double Of(int key) const {
        return (IsMinorKey(key) ? mMinor : mMajor)[SignatureOf(key)];
    }
};

constexpr double LargerPoints(double a, double b) {
    return a > b ? a : b;
}

/// The points of a chord for each key, to be weighed. In a row a key stands as far behind 12 as its
/// signature behind the root on the circle.
class CGainTable {
public:
    CGainTable() {
        for (std::size_t kind = 0; kind < kKeyChordKindCount; ++kind) {
            for (int i = 0; i < 2 * static_cast<int>(kFifths); ++i) {
                const auto at = static_cast<std::size_t>(i);
                mRows[0][kind][at] = kKeyLocalTable[0][kind][PlaceOnCircle(-i)];
                mRows[1][kind][at] = kKeyLocalTable[1][kind][PlaceOnCircle(-i - 3)];
            }
        }
    }

    [[nodiscard]] const double* RowOf(int mode, TKeyChordKind kind, int root) const {
        return mRows[static_cast<std::size_t>(mode)][kind].data() + kFifths - PlaceOnCircle(root);
    }

private:
    std::array<std::array<TTwiceFifths, kKeyChordKindCount>, 2> mRows;
};

}  // namespace brindle
