// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/chords/NameNotes.h"
#include "brindle/chords/internal/NamingTypes.h"

#include <array>
#include <compare>
#include <cstddef>
#include <span>

namespace brindle {

/// The number of a spelled-out chord, behind those of all types.
inline constexpr int kSpelledOutType = static_cast<int>(kNamingTypes.size());

/// Some notes as the search sees them. Bit n of a mask is key n.
struct CNoteKeys {
    TToneMask mAll = 0;
    /// Of all notes but the lowest one.
    TToneMask mAbove = 0;
    /// The key of the lowest one.
    int mBass = 0;
};

[[nodiscard]] CNoteKeys NoteKeysOf(std::span<const CNote> notes);

/// A name that notes can have. The lowest cost is the best; then it is better if the root is the
/// bass, if it is a type of the table, if that stands higher, and if the root is nearer above the
/// bass.
struct CNamingCandidate {
    int mCost = 0;
    bool mIsInverted = false;
    int mType = kSpelledOutType;
    int mRootAboveBass = 0;
    int mRoot = 0;
    /// That sound, above the root.
    TToneMask mTones = 0;

    [[nodiscard]] bool IsSpelledOut() const { return mType == kSpelledOutType; }
    /// All tones of the type, also those that are left out.
    [[nodiscard]] TToneMask TonesOfType() const {
        return IsSpelledOut() ? mTones : kNamingTypes[static_cast<std::size_t>(mType)].mTones;
    }
    [[nodiscard]] TNamingFamily Family() const { return NamingFamilyOf(TonesOfType()); }
    /// Semitones from the root up to the bass.
    [[nodiscard]] int BassAboveRoot() const { return (12 - mRootAboveBass) % 12; }

    friend auto operator<=>(const CNamingCandidate&, const CNamingCandidate&) = default;
};

/// The best name over each root, the best one first.
class CNamingCandidates {
public:
    CNamingCandidates() = default;
    CNamingCandidates(const CNoteKeys& keys, const CNamingOptions& options);

    [[nodiscard]] std::span<const CNamingCandidate> List() const {
        return {mCandidates.data(), mCount};
    }

private:
    std::array<CNamingCandidate, 12> mCandidates{};
    std::size_t mCount = 0;
};

/// What a step of the root from one chord to the next costs, as each of both sees it.
[[nodiscard]] int NextRootCost(const CNamingCandidate& chord, int nextRoot);
[[nodiscard]] int PreviousRootCost(const CNamingCandidate& chord, int previousRoot);

}  // namespace brindle
