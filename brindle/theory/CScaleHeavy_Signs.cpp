// SPDX-License-Identifier: MIT
#include "brindle/theory/CKeyEnhUtil.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/Spelling.h"

#include <cstdlib>

// The signs of a scale are those of a major scale: its own, the one with the same notes, or the
// one a minor third above a minor root. How many sharps or flats that major scale has is found by
// walking the cycle of fifths from C. Scales are spelled so often (24 keys for each chord, when a
// key is looked for) that all answers are worked out once, for each root and each named scale.

namespace brindle {

namespace {

constexpr int kFifthUp = 7;
constexpr int kFifthsToSearch = 24;
constexpr int kMinorToMajor = -9;  // from A down to C

/// 12 sharps more or less are the same keys, so very many signs are written as fewer.
int FoldSignsCount(int signsCount) {
    if (signsCount >= 19) return signsCount - 12;
    return signsCount < -14 ? signsCount + 12 : signsCount;
}

CKeyEnh MajorKeyToSearch(const CKeyEnh& root, TScaleType type) {
    if (IsScaleTypeModal(type)) return CKeyEnhUtil::RelatedIonianScaleRootKeyEnh(root, type);
    const bool isMinor = CScaleHeavy::GetModeForScaleType(type) == TScaleMode_Minor;
    return isMinor ? root + kMinorToMajor : root;
}

/// How many fifths up (or down, negative) from C the key is; 25 or -25 when the walk misses it.
int FifthsFromC(const CKeyEnh& majorKey) {
    if (majorKey == CKeyEnh_C) return 0;
    const int direction = majorKey.mEnh >= TEnh_n && majorKey != CKeyEnh_F ? 1 : -1;
    CKeyEnh key = CKeyEnh_C;
    for (int count = 1; count <= kFifthsToSearch; ++count) {
        key.AddToThis(direction * kFifthUp);
        if (key == majorKey) return direction * count;
    }
    return direction * (kFifthsToSearch + 1);
}

int CountSigns(const CKeyEnh& root, TScaleType type) {
    CKeyEnh majorKey = MajorKeyToSearch(root, type);
    if (majorKey.IsUndef()) return 0;
    if (root.mEnh == TEnh_Undef) {
        majorKey.mEnh =
            MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns(majorKey.mKeyNr, majorKey.mEnh);
    }
    return FoldSignsCount(FifthsFromC(majorKey));
}

/// The signs of every named scale on every root, spelled `TEnh_bbb` to `TEnh_Undef`.
class CSignsOfScales {
public:
    CSignsOfScales() {
        for (int type = 0; type < st_Count; ++type) {
            for (int root = 0; root < kRoots; ++root) {
                mSigns[static_cast<std::size_t>(type * kRoots + root)] =
                    static_cast<std::int8_t>(CountSigns(Root(root), static_cast<TScaleType>(type)));
            }
        }
    }

    [[nodiscard]] static bool Holds(const CKeyEnh& root, TScaleType type) {
        return type >= 0 && type < st_Count && root.mKeyNr >= 0 && root.mKeyNr < 12 &&
               root.mEnh >= TEnh_bbb && root.mEnh <= TEnh_Undef;
    }
    [[nodiscard]] int Of(const CKeyEnh& root, TScaleType type) const {
        const int ix = root.mKeyNr * kSpellings + (root.mEnh - TEnh_bbb);
        return mSigns[static_cast<std::size_t>(type * kRoots + ix)];
    }

private:
    static constexpr int kSpellings = TEnh_Undef - TEnh_bbb + 1;
    static constexpr int kRoots = 12 * kSpellings;

    [[nodiscard]] static CKeyEnh Root(int ix) {
        return {ix / kSpellings, static_cast<TEnh>(ix % kSpellings + TEnh_bbb)};
    }

    std::array<std::int8_t, st_Count * kRoots> mSigns{};
};

}  // namespace

int CScaleHeavy::SignsCount() const {
    if (IsUndef()) return 0;
    static const CSignsOfScales signs;
    const CKeyEnh root = RootKeyEnh();
    const TScaleType type = _SignsCount_NamedType();
    return CSignsOfScales::Holds(root, type) ? signs.Of(root, type) : CountSigns(root, type);
}

int CScaleHeavy::SignsCountAbs() const {
    return std::abs(SignsCount());
}

TScaleType CScaleHeavy::_SignsCount_NamedType() const {
    if (mScaleType != st_custom) return mScaleType;
    return HasIntvl(3) && !HasIntvl(4) ? st_min_harm : st_chrom;
}

}  // namespace brindle
