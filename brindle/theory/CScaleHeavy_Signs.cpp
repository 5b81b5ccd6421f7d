// SPDX-License-Identifier: MIT
#include "brindle/theory/CKeyEnhUtil.h"
#include "brindle/theory/CScaleHeavy.h"
#include "brindle/theory/KeyIntervals.h"
#include "brindle/theory/Spelling.h"

#include <algorithm>

namespace brindle {

namespace {

constexpr int kFifth = 7;
constexpr int kMinorToMajor = -9;  // from A down to C
constexpr int kFifthsToSearch = 24;

/// How many fifths up or down from C the key is, by a walk; 25 or -25 when the walk misses it.
int WalkFifthsTo(const CKeyEnh& majorKey) {
    if (majorKey == CKeyEnh_C) return 0;
    const int direction = majorKey.mEnh >= TEnh_n && majorKey != CKeyEnh_F ? 1 : -1;
    CKeyEnh key = CKeyEnh_C;
    for (int count = 1; count <= kFifthsToSearch; ++count) {
        key.AddToThis(direction * kFifth);
        if (key == majorKey) return direction * count;
    }
    return direction * (kFifthsToSearch + 1);
}

/// The results of the walk for every key and every spelling from `TEnh_bbb` to `TEnh_Undef`.
class TFifthsFromC {
public:
    TFifthsFromC() {
        for (int keyNr = 0; keyNr < 12; ++keyNr) {
            for (int enh = TEnh_bbb; enh <= TEnh_Undef; ++enh) {
                const CKeyEnh key{keyNr, static_cast<TEnh>(enh)};
                mFifths[Index(key)] = static_cast<std::int8_t>(WalkFifthsTo(key));
            }
        }
    }

    [[nodiscard]] int To(const CKeyEnh& key) const { return mFifths[Index(key)]; }

    [[nodiscard]] static bool Holds(const CKeyEnh& key) {
        return key.mKeyNr >= 0 && key.mKeyNr < 12 && key.mEnh >= TEnh_bbb && key.mEnh <= TEnh_Undef;
    }

private:
    static constexpr std::size_t kSpellings = TEnh_Undef - TEnh_bbb + 1;

    [[nodiscard]] static std::size_t Index(const CKeyEnh& key) {
        return static_cast<std::size_t>(key.mKeyNr) * kSpellings +
               static_cast<std::size_t>(key.mEnh - TEnh_bbb);
    }

    std::array<std::int8_t, 12 * kSpellings> mFifths{};
};

/// 12 sharps and 12 flats are the same keys, so very many signs are written as fewer.
int FoldSignsCount(int signsCount) {
    if (signsCount >= 19) return signsCount - 12;
    return signsCount < -14 ? signsCount + 12 : signsCount;
}

}  // namespace

int CScaleHeavy::SignsCount() const {
    if (IsUndef()) return 0;
    CKeyEnh majorKey = _SignsCount_MajorKeyToSearch();
    if (majorKey.IsUndef()) return 0;
    if (mRootNote.mEnh == TEnh_Undef) {
        majorKey.mEnh =
            MakeSensefulEnhForKeyNrMajorScaleRootWithLeastSigns(majorKey.mKeyNr, majorKey.mEnh);
    }
    return FoldSignsCount(_SignsCount_DetermineSignsCountBySearchingCycleOfFifths(majorKey));
}

int CScaleHeavy::SignsCountAbs() const {
    return std::abs(SignsCount());
}

CKeyEnh CScaleHeavy::_SignsCount_MajorKeyToSearch() const {
    if (IsModalScale()) return RelatedIonianScaleRootKeyEnh();
    const TScaleMode mode = ScaleRow().mMode;
    const bool isCustom = mScaleType == st_custom && mode == TScaleMode_Custom;
    const bool isMinor = isCustom ? HasIntvl(3) && !HasIntvl(4) : mode == TScaleMode_Minor;
    return isMinor ? RootKeyEnh() + kMinorToMajor : RootKeyEnh();
}

int CScaleHeavy::_SignsCount_DetermineSignsCountBySearchingCycleOfFifths(const CKeyEnh& majorKey) {
    static const TFifthsFromC fifths;
    return TFifthsFromC::Holds(majorKey) ? fifths.To(majorKey) : WalkFifthsTo(majorKey);
}

}  // namespace brindle
