// SPDX-License-Identifier: MIT
#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/KeyIntervals.h"

#include <array>
#include <cstddef>
#include <optional>
#include <span>

// Adding an interval keeps the spelling musical where it can: C and a minor third is E flat and not
// D sharp. A table for each interval names the keys whose partner the plain rule (black keys follow
// the accidental of the source, white ones are natural) would miss. The moved key of every key in
// every spelling is worked out at compile time.

namespace brindle {

namespace {

/// A key and the key that lies the table's interval above it.
struct CMove {
    CKeyEnh mFrom;
    CKeyEnh mTo;
};

// Some rows do not keep the interval exact: G triple sharp to B sharp and C double flat to G flat.
// They are meant.
// clang-format off
constexpr auto kMovesUp3 = std::to_array<CMove>({
    {CKeyEnh_C, CKeyEnh_Eb},      {CKeyEnh_Db, CKeyEnh_Fb},     {CKeyEnh_Fb, CKeyEnh_Abb},
    {CKeyEnh_F, CKeyEnh_Ab},      {CKeyEnh_Gb, CKeyEnh_Bbb},    {CKeyEnh_G, CKeyEnh_Bb},
    {CKeyEnh_Ab, CKeyEnh_Cb},     {CKeyEnh_Cb, CKeyEnh_Ebb},
});
constexpr auto kMovesUp4 = std::to_array<CMove>({
    {CKeyEnh_Bis, CKeyEnh_Dx},    {CKeyEnh_Cis, CKeyEnh_Eis},   {CKeyEnh_Dis, CKeyEnh_Fx},
    {CKeyEnh_Eis, CKeyEnh_Gx},    {CKeyEnh_Gis, CKeyEnh_Bis},   {CKeyEnh_Ais, CKeyEnh_Cx},
    {CKeyEnh_Cx, CKeyEnh_Ex},     {CKeyEnh_Dx, CKeyEnh_Fxs},    {CKeyEnh_Ex, CKeyEnh_Gxs},
    {CKeyEnh_Gx, CKeyEnh_Bx},     {CKeyEnh_Ax, CKeyEnh_Cxs},    {CKeyEnh_Cbb, CKeyEnh_Ebb},
    {CKeyEnh_Dbb, CKeyEnh_Fb},    {CKeyEnh_Fbb, CKeyEnh_Abb},   {CKeyEnh_Abb, CKeyEnh_Cb},
});
constexpr auto kMovesUp7 = std::to_array<CMove>({
    {CKeyEnh_Ais, CKeyEnh_Eis},   {CKeyEnh_Bis, CKeyEnh_Fx},    {CKeyEnh_Ax, CKeyEnh_Ex},
    {CKeyEnh_Ex, CKeyEnh_Bx},     {CKeyEnh_Bx, CKeyEnh_Fxs},    {CKeyEnh_Fxs, CKeyEnh_Cxs},
    {CKeyEnh_Cxs, CKeyEnh_Gxs},   {CKeyEnh_Gxs, CKeyEnh_Dxs},
});
constexpr auto kMovesDown2 = std::to_array<CMove>({
    {CKeyEnh_C, CKeyEnh_Bb},      {CKeyEnh_Db, CKeyEnh_Cb},     {CKeyEnh_Fb, CKeyEnh_Ebb},
    {CKeyEnh_F, CKeyEnh_Eb},      {CKeyEnh_Gb, CKeyEnh_Fb},     {CKeyEnh_Cb, CKeyEnh_Bbb},
    {CKeyEnh_Cx, CKeyEnh_Bis},    {CKeyEnh_Ex, CKeyEnh_Dx},     {CKeyEnh_Fx, CKeyEnh_Eis},
    {CKeyEnh_Cbb, CKeyEnh_Bbbb},  {CKeyEnh_Dbb, CKeyEnh_Cbb},   {CKeyEnh_Fbb, CKeyEnh_Ebbb},
    {CKeyEnh_Gbb, CKeyEnh_Fbb},
});
constexpr auto kMovesDown3 = std::to_array<CMove>({
    {CKeyEnh_Bis, CKeyEnh_Gx},    {CKeyEnh_Dis, CKeyEnh_Bis},   {CKeyEnh_Eis, CKeyEnh_Cx},
    {CKeyEnh_Gis, CKeyEnh_Eis},   {CKeyEnh_Ais, CKeyEnh_Fx},    {CKeyEnh_Abb, CKeyEnh_Fb},
    {CKeyEnh_Cbb, CKeyEnh_Abb},
});
constexpr auto kMovesDown4 = std::to_array<CMove>({
    {CKeyEnh_Db, CKeyEnh_Bbb},    {CKeyEnh_Eb, CKeyEnh_Cb},     {CKeyEnh_Fb, CKeyEnh_Dbb},
    {CKeyEnh_Gb, CKeyEnh_Ebb},    {CKeyEnh_Ab, CKeyEnh_Fb},     {CKeyEnh_Cb, CKeyEnh_Abb},
    {CKeyEnh_Ex, CKeyEnh_Cx},     {CKeyEnh_Dx, CKeyEnh_Bis},    {CKeyEnh_Gx, CKeyEnh_Eis},
    {CKeyEnh_Ax, CKeyEnh_Fx},     {CKeyEnh_Cbb, CKeyEnh_Gb},    {CKeyEnh_Dbb, CKeyEnh_Bbbb},
    {CKeyEnh_Ebb, CKeyEnh_Cbb},   {CKeyEnh_Fbb, CKeyEnh_Dbbb},  {CKeyEnh_Gbb, CKeyEnh_Ebbb},
    {CKeyEnh_Abb, CKeyEnh_Fbb},
});
constexpr auto kMovesDown5 = std::to_array<CMove>({
    {CKeyEnh_Bis, CKeyEnh_Fx},    {CKeyEnh_Ais, CKeyEnh_Eis},   {CKeyEnh_Ex, CKeyEnh_Bx},
    {CKeyEnh_Ax, CKeyEnh_Ex},     {CKeyEnh_Bx, CKeyEnh_Fxs},    {CKeyEnh_Cbb, CKeyEnh_Gbb},
    {CKeyEnh_Fbb, CKeyEnh_Cbb},   {CKeyEnh_Bbb, CKeyEnh_Fb},
});
constexpr auto kMovesDown7 = std::to_array<CMove>({
    {CKeyEnh_Fb, CKeyEnh_Bbb},    {CKeyEnh_F, CKeyEnh_Bb},      {CKeyEnh_Gb, CKeyEnh_Cb},
    {CKeyEnh_Gbb, CKeyEnh_Cbb},   {CKeyEnh_Cbb, CKeyEnh_Fbb},   {CKeyEnh_Ex, CKeyEnh_Ax},
    {CKeyEnh_Fx, CKeyEnh_Bis},    {CKeyEnh_Fbb, CKeyEnh_Bbbb},  {CKeyEnh_Bbbb, CKeyEnh_Ebbb},
    {CKeyEnh_Ebbb, CKeyEnh_Abbb}, {CKeyEnh_Abbb, CKeyEnh_Dbbb},
});
constexpr auto kMovesDown9 = std::to_array<CMove>({
    {CKeyEnh_Db, CKeyEnh_Fb},     {CKeyEnh_Eb, CKeyEnh_Gb},     {CKeyEnh_Fb, CKeyEnh_Abb},
    {CKeyEnh_Gb, CKeyEnh_Bbb},    {CKeyEnh_Ab, CKeyEnh_Cb},     {CKeyEnh_Cb, CKeyEnh_Ebb},
    {CKeyEnh_Cx, CKeyEnh_Eis},    {CKeyEnh_Ex, CKeyEnh_Gx},     {CKeyEnh_Gx, CKeyEnh_Bis},
    {CKeyEnh_Gxs, CKeyEnh_Bis},   {CKeyEnh_Cbb, CKeyEnh_Ebbb},  {CKeyEnh_Dbb, CKeyEnh_Fbb},
    {CKeyEnh_Fbb, CKeyEnh_Abbb},  {CKeyEnh_Gbb, CKeyEnh_Bbbb},  {CKeyEnh_Abb, CKeyEnh_Cbb},
});
constexpr auto kMovesDown11 = std::to_array<CMove>({
    {CKeyEnh_Db, CKeyEnh_Ebb},    {CKeyEnh_Eb, CKeyEnh_Fb},     {CKeyEnh_Fb, CKeyEnh_Gbb},
    {CKeyEnh_Gb, CKeyEnh_Abb},    {CKeyEnh_Ab, CKeyEnh_Bbb},    {CKeyEnh_Bb, CKeyEnh_Cb},
    {CKeyEnh_Cb, CKeyEnh_Dbb},    {CKeyEnh_Bx, CKeyEnh_Cx},     {CKeyEnh_Dx, CKeyEnh_Eis},
    {CKeyEnh_Ex, CKeyEnh_Fx},     {CKeyEnh_Ax, CKeyEnh_Bis},    {CKeyEnh_Cbb, CKeyEnh_Dbbb},
    {CKeyEnh_Dbb, CKeyEnh_Ebbb},  {CKeyEnh_Ebb, CKeyEnh_Fbb},   {CKeyEnh_Fbb, CKeyEnh_Gbbb},
    {CKeyEnh_Gbb, CKeyEnh_Abbb},  {CKeyEnh_Abb, CKeyEnh_Bbbb},
});
// clang-format on

constexpr std::span<const CMove> MovesBy(int r) {
    switch (r) {
        case 3:
            return kMovesUp3;
        case 4:
            return kMovesUp4;
        case 7:
            return kMovesUp7;
        case -2:
            return kMovesDown2;
        case -3:
            return kMovesDown3;
        case -4:
            return kMovesDown4;
        case -5:
            return kMovesDown5;
        case -7:
            return kMovesDown7;
        case -9:
            return kMovesDown9;
        case -11:
            return kMovesDown11;
        default:
            return {};
    }
}

/// The spelling that the interval asks of this source on this target, where it asks for one.
constexpr std::optional<TEnh> CandidateEnh(const CKeyEnh& source, int r, bool targetIsBlack) {
    const bool fromWhite = source.IsWhiteKey();
    const TEnh enh = source.mEnh;
    const bool whiteToBlack = fromWhite && targetIsBlack;
    switch (r) {
        case 1:
            if (fromWhite && enh == TEnh_b) return TEnh_bb;
            break;
        case 2:
            if (enh == TEnh_s) return fromWhite ? TEnh_ss : TEnh_s;
            break;
        case -1:
            if (fromWhite && enh == TEnh_s) return TEnh_ss;
            break;
        case -11:
        case -4:
            if (whiteToBlack && enh == TEnh_n) return TEnh_b;
            break;
        case -9:
            if (whiteToBlack && (enh == TEnh_n || enh == TEnh_Undef)) return TEnh_b;
            break;
        default:
            break;
    }
    return std::nullopt;
}

/// The spelling of the target when neither the interval nor its table has one.
constexpr TEnh PlainEnh(const CKeyEnh& source, bool targetIsBlack) {
    if (targetIsBlack) return source.mEnh >= TEnh_n ? TEnh_s : TEnh_b;
    // Kept: from white to white the accidental stays, even where that makes no sense.
    return source.IsBlackKey() ? TEnh_n : source.mEnh;
}

/// A defined key moved by r, which is -11 to 11 and not 0.
constexpr CKeyEnh MovedByRules(const CKeyEnh& source, int r) {
    const int target = FoldIntoOctave(std::int64_t{source.mKeyNr} + r);
    const bool targetIsBlack = IsBlackKey(target);
    if (const auto enh = CandidateEnh(source, r, targetIsBlack)) return {target, *enh};
    for (const CMove& move : MovesBy(r)) {
        if (move.mFrom == source) return move.mTo;
    }
    return {target, PlainEnh(source, targetIsBlack)};
}

constexpr int kEnhCount = TEnh_Undef - TEnh_bbb + 1;
constexpr int kRange = 11;

/// Two bytes instead of eight, so that all moves lie in 5 KiB.
struct CMovedKey {
    std::int8_t mKeyNr;
    TEnh mEnh;
};

// For r = -11 to 11, key 0 to 11 and each spelling, -1 to 7.
using TMovedKeys = std::array<std::array<std::array<CMovedKey, kEnhCount>, 12>, 2 * kRange + 1>;

constexpr TMovedKeys kMovedKeys = [] {
    TMovedKeys moved{};
    for (int r = -kRange; r <= kRange; ++r) {
        for (int keyNr = 0; keyNr < 12; ++keyNr) {
            for (int enh = 0; enh < kEnhCount; ++enh) {
                const CKeyEnh source{keyNr, static_cast<TEnh>(enh + TEnh_bbb)};
                const CKeyEnh target = r == 0 ? source : MovedByRules(source, r);
                moved[static_cast<std::size_t>(r + kRange)][static_cast<std::size_t>(keyNr)]
                     [static_cast<std::size_t>(enh)] = {static_cast<std::int8_t>(target.mKeyNr),
                                                        target.mEnh};
            }
        }
    }
    return moved;
}();

constexpr bool IsInMovedKeys(const CKeyEnh& source) {
    return source.mKeyNr >= 0 && source.mKeyNr < 12 && source.mEnh >= TEnh_bbb &&
           source.mEnh <= TEnh_Undef;
}

}  // namespace

void CKeyEnh::AddToThis(int intvl) {
    const int r = intvl % 12;
    if (r == 0 || IsUndef()) return;
    if (!IsInMovedKeys(*this)) {
        *this = MovedByRules(*this, r);
        return;
    }
    const CMovedKey& target =
        kMovedKeys[static_cast<std::size_t>(r + kRange)][static_cast<std::size_t>(mKeyNr)]
                  [static_cast<std::size_t>(mEnh - TEnh_bbb)];
    mKeyNr = target.mKeyNr;
    mEnh = target.mEnh;
}

CKeyEnh CKeyEnh::Add(int intvl) const {
    CKeyEnh moved = *this;
    moved.AddToThis(intvl);
    return moved;
}

CKeyEnh CKeyEnh::operator-(int intvl) const {
    // Only the remainder by 12 counts, and it can be negated for every interval.
    return Add(-(intvl % 12));
}

}  // namespace brindle
