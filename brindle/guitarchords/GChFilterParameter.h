// SPDX-License-Identifier: MIT
#pragma once

#include <cstdint>

namespace brindle {

class GChBasicChord;

/// Which fingerings of a list a user wants to see. A field that is -1 lets all pass; each other
/// field asks for its value.
class GChFilterParameter {
public:
    /// No restrictions.
    GChFilterParameter() = default;
    /// Lets all fingerings pass.
    void setNoRestrictions() { *this = {}; }

    /// How the host spells the root that was asked for; Accepts does not read it.
    [[nodiscard]] std::int64_t rootEnhType() const { return mRootEnhType; }
    /// The same of the bass.
    [[nodiscard]] std::int64_t bassEnhType() const { return mBassEnhType; }
    /// Key number that the root must have; -1 for any, -2 for what no chord of a file has.
    [[nodiscard]] std::int64_t rootNoteToFilter() const { return mRootNoteToFilter; }
    /// The same of the bass.
    [[nodiscard]] std::int64_t bassNoteToFilter() const { return mBassNoteToFilter; }
    /// The CChordTypeId that the chord must have; -1 for any.
    [[nodiscard]] std::int64_t chordTypeToFilter() const { return mChordTypeToFilter; }
    /// The difficulty that it must have; -1 for any.
    [[nodiscard]] std::int64_t difficultyToFilter() const { return mDifficultyToFilter; }
    /// 1 for favorites, 0 for all others, -1 for any.
    [[nodiscard]] std::int64_t isFavoriteToFilter() const { return mIsFavoriteToFilter; }

    // For root and bass, -1 is no restriction, and all that is below is kept as -2.

    /// setRootNoteToFilter:enhType: Kept: a root of 12 or more asks for the bass 0 and leaves the
    /// root as it was.
    void setRootNoteToFilter(std::int64_t root, std::int64_t enhType);
    /// setBassNoteToFilter:enhType: a bass of 12 or more asks for 0.
    void setBassNoteToFilter(std::int64_t bass, std::int64_t enhType);

    // Here -1 asks for 0, the empty value, and all that is below is no restriction.

    /// Asks for a CChordTypeId.
    void setChordTypeToFilter(std::int64_t chordType);
    /// Asks for exactly this difficulty.
    void setDifficultyToFilter(std::int64_t difficulty);
    /// Any value above 0 asks for favorites.
    void setIsFavoriteToFilter(std::int64_t isFavorite);

    /// Whether the chord has the value of each field that restricts; favorites at transpose index
    /// 0.
    [[nodiscard]] bool Accepts(const GChBasicChord& chord) const;

private:
    std::int64_t mRootEnhType = 0;
    std::int64_t mBassEnhType = 0;
    std::int64_t mRootNoteToFilter = -1;
    std::int64_t mBassNoteToFilter = -1;
    std::int64_t mChordTypeToFilter = -1;
    std::int64_t mDifficultyToFilter = -1;
    std::int64_t mIsFavoriteToFilter = -1;
};

}  // namespace brindle
