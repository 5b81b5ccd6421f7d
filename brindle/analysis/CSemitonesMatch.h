// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CSemitones.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <initializer_list>
#include <iosfwd>
#include <vector>

namespace brindle {

class CIntvlSet;

/// What a chord pattern says about one semitone above the root.
enum TSemiMatch : std::int32_t {
    TSemiMatch_Absent = 0,   ///< must not sound
    TSemiMatch_Present = 1,  ///< must sound
    TSemiMatch_Any = 2,      ///< does not matter
};

/// A pattern for the quality of a chord: twelve entries, entry n for the tone n semitones above
/// the root. "A major triad with or without more tones" is one pattern.
class CSemitonesMatch {
public:
    /// Any chord at all.
    constexpr CSemitonesMatch() { Reset(); }
    /// Entry n of `entries` for semitone n. The further argument of the second form has no effect.
    constexpr explicit CSemitonesMatch(const std::array<TSemiMatch, 12>& entries) {
        for (unsigned n = 0; n < 12; ++n) SetSemitone(n, entries[n]);
    }
    /// The same.
    constexpr CSemitonesMatch(const std::array<TSemiMatch, 12>& entries, int)
        : CSemitonesMatch(entries) {}
    /// Would read as a list of semitone numbers.
    CSemitonesMatch(std::initializer_list<TSemiMatch>) = delete;
    /// The tones of `present` must sound, the tones of `any` may, all others must not.
    /// The number 12 counts as 0; larger numbers are ignored.
    constexpr CSemitonesMatch(std::initializer_list<unsigned> present) {
        ResetToValue(TSemiMatch_Absent);
        for (const unsigned n : present) SetSemitone(n, TSemiMatch_Present);
    }
    /// The same with the tones of `any`, which win over `present`.
    constexpr CSemitonesMatch(std::initializer_list<unsigned> present,
                              std::initializer_list<unsigned> any)
        : CSemitonesMatch(present) {
        for (const unsigned n : any) SetSemitone(n, TSemiMatch_Any);
    }

    /// The entry of semitone n; entry 0 for 12, `TSemiMatch_Any` above 12 or after `clear`.
    [[nodiscard]] constexpr TSemiMatch Semitone(unsigned n) const {
        return n > 12 || empty() ? TSemiMatch_Any : mEntries[n % 12];
    }
    /// Whether a chord of these semitones fits the pattern. Nothing fits a cleared pattern.
    [[nodiscard]] constexpr bool Matches(CSemitones semitones) const {
        return !mIsCleared && (semitones.Mask() & mPresent) == mPresent &&
               (semitones.Mask() & mAbsent) == 0;
    }

    /// 12, or 0 after `clear`.
    [[nodiscard]] constexpr std::size_t size() const { return mIsCleared ? 0 : mEntries.size(); }
    /// Whether `clear` has taken the entries away; then nothing fits.
    [[nodiscard]] constexpr bool empty() const { return mIsCleared; }

    /// All entries `TSemiMatch_Any`.
    constexpr void Reset() { ResetToValue(TSemiMatch_Any); }
    /// All entries `value`, after `clear` too.
    constexpr void ResetToValue(TSemiMatch value) {
        mIsCleared = false;
        for (unsigned n = 0; n < 12; ++n) SetSemitone(n, value);
    }
    /// Sets the entry of semitone n, 12 counting as 0. Does nothing above 12 or after `clear`.
    constexpr void SetSemitone(unsigned n, TSemiMatch value) {
        if (n > 12 || empty()) return;
        mEntries[n % 12] = value;
        const std::uint64_t bit = std::uint64_t{1} << n % 12;
        mPresent = value == TSemiMatch_Present ? mPresent | bit : mPresent & ~bit;
        mAbsent = value == TSemiMatch_Absent ? mAbsent | bit : mAbsent & ~bit;
    }
    /// The intervals of the set, folded into one octave, must sound; all else may.
    void SetFromIntvlSet(const CIntvlSet& intvls);
    /// Leaves a pattern without entries.
    constexpr void clear() { mIsCleared = true; }

    /// Writes the entries as `[1,x,x,0,...]`.
    void AppendJSONString(std::ostream& stream) const;

    friend constexpr bool operator==(const CSemitonesMatch& a, const CSemitonesMatch& b) {
        return a.mIsCleared == b.mIsCleared && (a.mIsCleared || a.mEntries == b.mEntries);
    }

private:
    std::array<TSemiMatch, 12> mEntries{};
    // The entries once more, as masks: patterns are tried on every chord of a piece.
    std::uint64_t mPresent = 0;
    std::uint64_t mAbsent = 0;
    bool mIsCleared = false;
};

/// Writes the JSON text, for debugging.
std::ostream& operator<<(std::ostream& stream, const CSemitonesMatch& match);

/// Several patterns; a chord fits if it fits one of them.
struct CSemitonesMatches : std::vector<CSemitonesMatch> {
    using vector::vector;

    /// Whether one of them fits; false without patterns.
    [[nodiscard]] bool Matches(CSemitones semitones) const;
    /// Writes a list of the patterns. No strict JSON: it ends with a comma.
    void AppendJSONString(std::ostream& stream) const;
};

/// The five chord qualities of the progression tables.
namespace ChordPattern {

/// The pattern of twelve marks from semitone 0 to 11: `1` must sound, `0` must not, `x` may.
[[nodiscard]] constexpr CSemitonesMatch FromMarks(const char (&marks)[13]) {
    CSemitonesMatch pattern;
    for (unsigned n = 0; n < 12; ++n) {
        if (marks[n] == '0') pattern.SetSemitone(n, TSemiMatch_Absent);
        if (marks[n] == '1') pattern.SetSemitone(n, TSemiMatch_Present);
    }
    return pattern;
}

/// Root, major third, fifth; sevenths and tensions may be there.
inline constexpr CSemitonesMatch Major = FromMarks("1xx01xx1xxxx");
/// Root, minor third, fifth.
inline constexpr CSemitonesMatch Minor = FromMarks("1xx10xx1xxxx");
/// Root, minor third, diminished fifth.
inline constexpr CSemitonesMatch Diminished = FromMarks("1xx10x10xxxx");
/// The same with the minor seventh.
inline constexpr CSemitonesMatch HalfDiminished = FromMarks("1xx10x10xx1x");
/// Exactly root, major third, fifth and minor seventh: no tension at all.
inline constexpr CSemitonesMatch Dominant7 = FromMarks("100010010010");

}  // namespace ChordPattern

}  // namespace brindle
