// SPDX-License-Identifier: MIT
#pragma once

#include "brindle/theory/SetFromStringHelper.h"
#include "brindle/theory/TBasicChord.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <string_view>

/// The words that the reader of chord symbols knows.
namespace brindle::ChordSymbol {

/// The keywords of one thing, in the order in which they are tried.
class CKeywords {
public:
    template <class... T>
    /// One to six keywords; text literals, which live as long as the program.
    consteval explicit CKeywords(T... texts) : mTexts{texts...}, mCount(sizeof...(texts)) {}

    /// The first keyword.
    [[nodiscard]] constexpr const std::string_view* begin() const { return mTexts.data(); }
    /// One behind the last keyword.
    [[nodiscard]] constexpr const std::string_view* end() const { return mTexts.data() + mCount; }

private:
    std::array<std::string_view, 6> mTexts;
    std::size_t mCount;
};

/// Intervals of a chord as a mask with bits 0 to 23: a ninth is bit 14, a second bit 2.
using TIntvls = std::uint32_t;

template <class... T>
/// The mask of intervals of 0 to 23 semitones: `Intvls(4, 14)` is a third and a ninth.
[[nodiscard]] consteval TIntvls Intvls(T... intvls) {
    return (TIntvls{0} | ... | (TIntvls{1} << intvls));
}

/// For the undefined chord.
inline constexpr CKeywords kUndefKeywords("undef", "-");
/// For "No Chord Force".
inline constexpr CKeywords kNoChordForceKeywords("nochordforce");
/// For "No Chord Yield".
inline constexpr CKeywords kNoChordYieldKeywords("nochordyield", "nochord");

/// A second in place of the third.
inline constexpr CKeywords kSus2Keywords("sus 2", "sus2", "s 2", "s2");
/// A fourth in place of the third.
inline constexpr CKeywords kSus4Keywords("sus 4", "sus4", "sus", "s 4", "s4");
/// A major seventh.
inline constexpr CKeywords kMaj7Keywords("maj 7", "maj7", "ma 7", "ma7", "j 7", "j7");
/// A major seventh with its ninth.
inline constexpr CKeywords kMaj9Keywords("maj 9", "maj9", "ma 9", "ma9", "j 9", "j9");

/// The words of a basic chord.
struct CBasicChordRow {
    CKeywords mKeywords;      ///< the longer one first
    TBasicChord mBasicChord;  ///< what they mean
};

/// The basic chords behind the root. There is no word for major: it is what remains.
inline constexpr auto kBasicChordRows = std::to_array<CBasicChordRow>({
    {CKeywords("min", "mi", "m", "-"), TBasicChord::Minor},
    {CKeywords("aug"), TBasicChord::Augmented},
    {CKeywords("dim"), TBasicChord::Diminished},
    {kSus2Keywords, TBasicChord::Sus2},
    {kSus4Keywords, TBasicChord::Sus4},
    {CKeywords("drone"), TBasicChord::Drone},
});

/// The words of an option and what it does to the tones of the chord, in semitones above the root.
struct COptionRow {
    CKeywords mKeywords;  ///< the longer one first
    /// Tones that the option always brings.
    TIntvls mAdd;
    /// Added too when no option before this one has added anything: C9 and C13 bring the sevenths
    /// and ninths below them, C6 9 does not.
    TIntvls mAddIfFirst;
    /// Tones that it takes away.
    TIntvls mErase;
    /// Added in place of `mAdd` to a diminished chord.
    TIntvls mAddIfDiminished = mAdd;
};

/// The thirds, which a suspension and the bare fifth take away.
inline constexpr TIntvls kThirds = Intvls(3, 4);

/// The options in the order in which they are tried at each place of the symbol.
/// Kept: "b9" brings a minor seventh even as "add b9", "5" takes the thirds away, and "b13" leaves
/// the fifth alone where "#5" removes it.
// clang-format off
inline constexpr auto kOptionRows = std::to_array<COptionRow>({
    // keywords                                     add             if first        erase
    {CKeywords("b5"),                               Intvls(6),      0,              Intvls(7)},
    {CKeywords("5"),                                Intvls(7),      0,              kThirds},
    {CKeywords("b13"),                              Intvls(8),      0,              0},
    {CKeywords("#5"),                               Intvls(8),      0,              Intvls(7)},
    {CKeywords("6"),                                Intvls(9),      0,              0},
    {CKeywords("seventh", "7"),                     Intvls(10),     0,              0, Intvls(9)},
    {kMaj7Keywords,                                 Intvls(11),     0,              0},
    {CKeywords("add b9", "addb9", "b9"),            Intvls(10, 13), 0,              0},
    {CKeywords("9"),                                Intvls(14),     Intvls(10),     0},
    {CKeywords("add 9", "add 2", "add9", "add2"),   Intvls(14),     0,              0},
    {kMaj9Keywords,                                 Intvls(11, 14), 0,              0},
    {CKeywords("#9"),                               Intvls(15),     0,              0},
    {CKeywords("b3"),                               Intvls(3),      0,              0},
    {CKeywords("3"),                                Intvls(4),      0,              0},
    {CKeywords("11"),                               Intvls(17),     Intvls(10, 14), 0},
    {CKeywords("#11"),                              Intvls(18),     Intvls(10, 14), 0},
    {CKeywords("add 11", "add11", "add 4", "add4"), Intvls(17),     0,              0},
    {CKeywords("add #11", "add#11", "add #4", "add#4"),
                                                    Intvls(18),     0,              0},
    {CKeywords("13"),                               Intvls(21),     Intvls(10, 14, 17), 0},
    {CKeywords("omit 3", "omit3", "no 3", "no3"),   0,              0,              kThirds},
    {kSus2Keywords,                                 Intvls(2),      0,              kThirds},
    {kSus4Keywords,                                 Intvls(5),      0,              kThirds},
});
// clang-format on

/// Whether the keywords of each row keep the rules of SetFromStringHelper.
template <class TRows>
consteval bool KeywordListsAreWellFormed(const TRows& rows) {
    for (const auto& row : rows) {
        if (!SetFromStringHelper::AreNotEmptyAndSortedBySizeAndLowerCase(row.mKeywords)) {
            return false;
        }
    }
    return true;
}
static_assert(KeywordListsAreWellFormed(kBasicChordRows));
static_assert(KeywordListsAreWellFormed(kOptionRows));

}  // namespace brindle::ChordSymbol
