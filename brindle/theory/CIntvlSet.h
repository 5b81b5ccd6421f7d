// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/CMySet.h"

#include <array>
#include <concepts>
#include <span>

namespace brindle {

class CSemitones;

/// A set of intervals above a root that may span more than an octave: a ninth (14) is not a
/// second (2). The wrap interval is the span in which the set is described, 24 for chords and 12
/// for sets of pitch classes.
///
/// Lists of intervals, written out or as a span, end at the first value that is negative or above
/// 127, so `CIntvlSet(0, 4, 7)` and `CIntvlSet(0, 4, 7, -1)` are the same set.
class CIntvlSet : public CMySet<int> {
public:
    /// Two octaves: where a ninth and a second are told apart.
    static constexpr int kDefaultWrapIntvl = 24;

    CIntvlSet() = default;
    // Doxygen takes this constructor for other members.
    /// @cond
    template <std::same_as<int>... Rest>
    explicit(sizeof...(Rest) == 0) CIntvlSet(int first, Rest... rest) {
        SetIntvls(first, rest...);
    }
    /// @endcond
    /// The listed intervals in semitones, with the default wrap interval.
    explicit CIntvlSet(std::span<const int> intvls) { SetIntvls(intvls); }
    /// The set as it is, whatever its members.
    explicit CIntvlSet(const CMySet<int>& intvls, int wrapIntvl = kDefaultWrapIntvl)
        : CMySet<int>(intvls), mWrapIntvl(wrapIntvl) {}

    /// The span in semitones in which the set is described; 24 by default.
    [[nodiscard]] int WrapIntvl() const { return mWrapIntvl; }

    /// Exact member test; `kIntvlUndef` gives false.
    [[nodiscard]] bool HasIntvl(int intvl) const;
    /// Whether the interval is here in some octave below the wrap interval: 14 finds a 2.
    /// `kIntvlUndef` gives false.
    [[nodiscard]] bool HasIntvlInAnyOctave(int intvl) const;

    /// Whether all listed values are members.
    [[nodiscard]] bool HasIntvls(std::span<const int> intvls) const;
    /// The same for values written out. A first value that ends the list gives true.
    template <std::same_as<int>... Rest>
    [[nodiscard]] bool HasIntvls(int first, Rest... rest) const {
        return HasIntvls(std::to_array({first, rest...}));
    }
    /// Whether the listed values are the members and nothing else is. A listed value at or above
    /// the wrap interval makes it false.
    [[nodiscard]] bool HasExactTheseIntvls(std::span<const int> intvls) const;
    /// The same for values written out.
    template <std::same_as<int>... Rest>
    [[nodiscard]] bool HasExactTheseIntvls(int first, Rest... rest) const {
        return HasExactTheseIntvls(std::to_array({first, rest...}));
    }
    /// Whether each listed value is here in some octave and each member is listed in some octave.
    [[nodiscard]] bool HasExactlyTheseIntvlsInAnyOctave(std::span<const int> intvls) const;
    /// The same for values written out.
    template <std::same_as<int>... Rest>
    [[nodiscard]] bool HasExactlyTheseIntvlsInAnyOctave(int first, Rest... rest) const {
        return HasExactlyTheseIntvlsInAnyOctave(std::to_array({first, rest...}));
    }
    /// Whether some member, reduced into the octave, is neither the root, a third, the fifth nor
    /// `option` (which is not reduced).
    [[nodiscard]] bool HasOtherStackedThirdsOptionThan(int option) const;

    /// The n-th member in order, from 0; `kIntvlUndef` when there is none.
    [[nodiscard]] int Intvl(int n) const;
    /// The set seen from its n-th member (n modulo the size), which becomes 0; lower members go up
    /// by the fewest octaves that span the set. {0, 4, 7} on 1 is {0, 3, 8}. A set of fewer than
    /// two members stays as it is; any other result has the default wrap interval.
    [[nodiscard]] CIntvlSet Inversion(int n) const;
    /// One bit for each member, reduced into the octave.
    [[nodiscard]] CSemitones ToSemitones() const;

    /// Replaces the members; the wrap interval stays.
    void SetIntvls(std::span<const int> intvls);
    /// The same for values written out.
    template <std::same_as<int>... Rest>
    void SetIntvls(int first, Rest... rest) {
        SetIntvls(std::to_array({first, rest...}));
    }
    /// Replaces the members; the wrap interval stays.
    void SetFromSemitones(CSemitones semitones);
    /// Reduces each member modulo `wrapIntvl`. With 0 or less the members stay as they are.
    void SetWrapIntvl(int wrapIntvl);
    /// Erases the interval and each one whole octaves above it, up to the wrap interval.
    void EraseIntvlInAnyOct(int intvl);
    /// Replaces the set by its first inversion.
    void Invert() { *this = Inversion(1); }

    /// Compares the members; the wrap interval does not matter.
    friend bool operator==(const CIntvlSet& a, const CIntvlSet& b) {
        return std::equal(a.begin(), a.end(), b.begin(), b.end());
    }

private:
    int mWrapIntvl = kDefaultWrapIntvl;
};

/// The intervals of the keys above `root`, 0 to 11. Empty for an undefined root.
[[nodiscard]] CIntvlSet ConvertKeyNrSetToIntvlSet(const CMySet<int>& keyNrs, int root);
/// The keys that stand the intervals above `root`, 0 to 11. Empty for an undefined root.
[[nodiscard]] CMySet<int> ConvertIntvlSetToKeyNrSet(const CIntvlSet& intvls, int root);

}  // namespace brindle
