// SPDX-License-Identifier: MIT
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/Spelling.h"

#include <algorithm>

namespace brindle {

namespace {

// The keys of F C G D A E B, the order in which sharps come; flats come in the reverse order.
constexpr std::array<int, 7> kNaturalKeysInFifths{5, 0, 7, 2, 9, 4, 11};

// By semitone above the root, where the neighbour lies that spells a key between the seven
// letters: 1 above, -1 below. In C major C sharp is spelled from C and E flat from E, while minor
// scales prefer D flat. Steps of 0 are letters in the scales that the tables were made for.
constexpr std::array<int, 12> kNeighbourInMinor{0, 1, 0, 0, -1, 0, -1, 0, 0, -1, 0, -1};
constexpr std::array<int, 12> kNeighbourInMajor{0, -1, 0, 1, 0, 0, -1, 0, 1, 0, 1, 0};

constexpr bool IsOfMinorColour(TScaleType type) {
    return type == st_min || type == st_min_harm || type == st_min_melo || type == st_min_pent ||
           type == st_dorian;
}

constexpr int FloorDivide(int value, int divisor) {
    return (value - (value % divisor + divisor) % divisor) / divisor;
}

/// The spelling of the key whose neighbour at `distance` is spelled `neighbour`.
TEnh SpellFromNeighbour(TEnh neighbour, int distance) {
    // Kept: one accidental too far turns back, so that a triple flat comes out as a single one.
    const int value = std::abs(neighbour - distance);
    const int folded = value < 5 ? value : 8 - value;
    return static_cast<TEnh>(std::clamp<int>(folded, TEnh_bb, TEnh_ss));
}

std::size_t IndexOfKey(std::int64_t keyNr) {
    return static_cast<std::size_t>(FoldIntoOctave(keyNr));
}

}  // namespace

void CScaleHeavy::CalcEnh() {
    mEnhOfKeyNr.fill(TEnh_Undef);
    if (IsUndef() || ScaleRow().mMode == TScaleMode_Custom) return;
    _CalcEnh_DiatonicNotes();
    _CalcEnh_ChromaticNotes();
}

void CScaleHeavy::_CalcEnh_DiatonicNotes() {
    const int signsCount = SignsCount();
    for (int letter = 0; letter < 7; ++letter) {
        // Each sharp raises the next letter of the row, round and round; each flat lowers one.
        const int accidental = FloorDivide(signsCount + 6 - letter, 7);
        const int naturalKey = kNaturalKeysInFifths[static_cast<std::size_t>(letter)];
        mEnhOfKeyNr[IndexOfKey(naturalKey + accidental)] = static_cast<TEnh>(TEnh_n + accidental);
    }
}

void CScaleHeavy::_CalcEnh_ChromaticNotes() {
    const auto& neighbours = IsOfMinorColour(mScaleType) ? kNeighbourInMinor : kNeighbourInMajor;
    const int rootKeyNr = RootKeyNr();
    for (int step = 0; step < 12; ++step) {
        TEnh& enh = mEnhOfKeyNr[IndexOfKey(rootKeyNr + step)];
        if (enh != TEnh_Undef) continue;
        const int distance = neighbours[static_cast<std::size_t>(step)];
        const TEnh neighbour = mEnhOfKeyNr[IndexOfKey(rootKeyNr + step + distance)];
        if (neighbour != TEnh_Undef) enh = SpellFromNeighbour(neighbour, distance);
    }
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
