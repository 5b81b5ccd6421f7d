// SPDX-License-Identifier: MIT
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/Spelling.h"

#include <algorithm>

namespace brindle {

namespace {

using TSpellings = std::array<TEnh, 12>;

constexpr std::size_t IndexOfKey(std::int64_t keyNr) {
    return static_cast<std::size_t>(FoldIntoOctave(keyNr));
}

// By semitone above the root, where the neighbour lies that spells a key between the seven
// letters: 1 above, -1 below. In C major C sharp is spelled from C and E flat from E, while minor
// scales prefer D flat.
constexpr std::array<int, 12> kNeighbourInMinor{0, 1, 0, 0, -1, 0, -1, 0, 0, -1, 0, -1};
constexpr std::array<int, 12> kNeighbourInMajor{0, -1, 0, 1, 0, 0, -1, 0, 1, 0, 1, 0};

constexpr bool StaysWithinOctave(const std::array<int, 12>& neighbours) {
    for (int step = 0; step < 12; ++step) {
        const int neighbour = step + neighbours[static_cast<std::size_t>(step)];
        if (neighbour < 0 || neighbour > 11) return false;
    }
    return true;
}
static_assert(StaysWithinOctave(kNeighbourInMinor) && StaysWithinOctave(kNeighbourInMajor));

constexpr bool IsOfMinorColour(TScaleType type) {
    return type == st_min || type == st_min_harm || type == st_min_melo || type == st_min_pent ||
           type == st_dorian;
}

// The row of fifths, F C G D A E B and then the same letters one sharp higher, or before them one
// flat lower. C is 0. A scale with n signs has seven neighbours of it: those from F to B (-1 to 5)
// moved up by n, which gives F and the letters after it a sharp, or B and those before it a flat.
constexpr int kFewestSigns = -14;
constexpr int kMostSigns = 18;
constexpr int kFirstFifth = kFewestSigns - 1;
constexpr auto kKeysInFifths = [] {
    std::array<CKeyEnh, kMostSigns - kFewestSigns + 7> keys{};
    for (std::size_t n = 0; n < keys.size(); ++n) {
        const int fifth = kFirstFifth + static_cast<int>(n);
        const int timesRound = (fifth + 1 + 21) / 7 - 3;  // rounded down
        keys[n] = {FoldIntoOctave(7 * fifth), static_cast<TEnh>(TEnh_n + timesRound)};
    }
    return keys;
}();
static_assert(kKeysInFifths[0 - kFirstFifth] == CKeyEnh_C);
static_assert(kKeysInFifths.front() == CKeyEnh_Fbb && kKeysInFifths.back() == CKeyEnh_Dxs);

/// By semitone above the root, the seven letters under the signs; the others stay undefined.
constexpr TSpellings DiatonicSpellings(int rootKeyNr, int signsCount) {
    TSpellings spellings{};
    spellings.fill(TEnh_Undef);
    const auto first = static_cast<std::size_t>(signsCount - kFewestSigns);
    for (std::size_t n = first; n < first + 7; ++n) {
        const CKeyEnh& key = kKeysInFifths[n];
        spellings[IndexOfKey(key.mKeyNr - rootKeyNr)] = key.mEnh;
    }
    return spellings;
}

/// The spelling of a key whose neighbour at `distance` is spelled `neighbour`.
constexpr TEnh SpellFromNeighbour(TEnh neighbour, int distance) {
    // Kept: one accidental too far turns back, so that a triple flat comes out as a single one.
    const int difference = neighbour - distance;
    const int value = difference < 0 ? -difference : difference;
    const int folded = value < 5 ? value : 8 - value;
    return static_cast<TEnh>(std::clamp<int>(folded, TEnh_bb, TEnh_ss));
}

constexpr void AddChromaticSpellings(TSpellings& spellings, const std::array<int, 12>& neighbours) {
    for (std::size_t step = 0; step < 12; ++step) {
        if (spellings[step] != TEnh_Undef) continue;
        const int distance = neighbours[step];
        const TEnh neighbour =
            spellings[static_cast<std::size_t>(static_cast<int>(step) + distance)];
        if (neighbour != TEnh_Undef) spellings[step] = SpellFromNeighbour(neighbour, distance);
    }
}

/// The spelling of each key number.
constexpr TSpellings SpellingsByKey(int rootKeyNr, int signsCount, bool isMinorColour) {
    TSpellings byStep = DiatonicSpellings(rootKeyNr, signsCount);
    AddChromaticSpellings(byStep, isMinorColour ? kNeighbourInMinor : kNeighbourInMajor);
    TSpellings byKey{};
    std::rotate_copy(byStep.begin(), byStep.end() - rootKeyNr, byStep.end(), byKey.begin());
    return byKey;
}

// Everything that can come out, since scales are spelled very often.
constexpr auto kSpellings = [] {
    std::array<std::array<std::array<TSpellings, kMostSigns - kFewestSigns + 1>, 12>, 2> all{};
    for (std::size_t colour = 0; colour < 2; ++colour) {
        for (int rootKeyNr = 0; rootKeyNr < 12; ++rootKeyNr) {
            for (int signs = kFewestSigns; signs <= kMostSigns; ++signs) {
                all[colour][static_cast<std::size_t>(rootKeyNr)]
                   [static_cast<std::size_t>(signs - kFewestSigns)] =
                       SpellingsByKey(rootKeyNr, signs, colour == 1);
            }
        }
    }
    return all;
}();

}  // namespace

void CScaleHeavy::CalcEnh() {
    if (IsUndef() || ScaleRow().mMode == TScaleMode_Custom) {
        mEnhOfKeyNr.fill(TEnh_Undef);
        return;
    }
    const auto& ofRoot = kSpellings[IsOfMinorColour(mScaleType)][IndexOfKey(RootKeyNr())];
    mEnhOfKeyNr = ofRoot[static_cast<std::size_t>(SignsCount() - kFewestSigns)];
}

TEnh CScaleHeavy::EnhForKeyNr(int keyNr) const {
    return mEnhOfKeyNr[IndexOfKey(keyNr)];
}

TEnh CScaleHeavy::EnhForChromStep(int step) const {
    return mEnhOfKeyNr[IndexOfKey(std::int64_t{RootKeyNr()} + step)];
}

TEnh CScaleHeavy::EnhForNote(const CNote& note) const {
    return EnhForKeyNr(note.KeyNr());
}

void CScaleHeavy::SetEnhForKeyNr(int keyNr, TEnh enh) {
    const std::size_t index = IndexOfKey(keyNr);
    mEnhOfKeyNr[index] = MakeSensefulEnhForKeyNrAssumingCMajor(static_cast<int>(index), enh);
}

void CScaleHeavy::SetEnhForChromStep(int step, TEnh enh) {
    SetEnhForKeyNr(FoldIntoOctave(std::int64_t{RootKeyNr()} + step), enh);
}

void CScaleHeavy::SetEnhForNote(const CNote& note, TEnh enh) {
    SetEnhForKeyNr(note.KeyNr(), enh);
}

void CNote::AdjustEnhToScale(const CScaleHeavy& scale) {
    SetEnhAndDontMakeSenseful(scale.EnhForNote(*this));
}

}  // namespace brindle
