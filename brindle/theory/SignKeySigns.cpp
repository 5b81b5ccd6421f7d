// SPDX-License-Identifier: MIT
#include "brindle/theory/SignKeySigns.h"

#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyIntervals.h"

#include <array>
#include <cstddef>
#include <cstdlib>

namespace brindle {

namespace {

// Signs by key number, C to B; sharps are positive.
// clang-format off
constexpr std::array<int, 12> kMinimalSignsMajor{ 0, -5,  2, -3, 4, -1, 6,  1, -4, 3, -2, 5};
constexpr std::array<int, 12> kMinimalSignsMinor{-3,  4, -1,  6, 1, -4, 3, -2,  5, 0, -5, 2};
// clang-format on

}  // namespace

int SignsCountForSignKeyWithKeyEnhAndSignKeyType(CKeyEnh root, TSignKeyType type) {
    if (type == TSignKeyType_Major) return CScaleHeavy(root, st_maj).SignsCount();
    if (type == TSignKeyType_Minor) return CScaleHeavy(root, st_min).SignsCount();
    return 0;
}

int SignsCountAbsForSignKeyWithKeyEnhAndSignKeyType(CKeyEnh root, TSignKeyType type) {
    return std::abs(SignsCountForSignKeyWithKeyEnhAndSignKeyType(root, type));
}

int MinimalSignsCountForSignKeyWithKeyNrAndSignKeyType(int keyNr, TSignKeyType type) {
    if (keyNr == kKeyNrUndef) return 0;
    const auto ix = static_cast<std::size_t>(FoldIntoOctave(keyNr));
    if (type == TSignKeyType_Major) return kMinimalSignsMajor[ix];
    if (type == TSignKeyType_Minor) return kMinimalSignsMinor[ix];
    return 0;
}

}  // namespace brindle
