// SPDX-License-Identifier: MIT
#include "tests/analysis/PlainHarmony.h"

#include "brindle/analysis/CSemitonesMatch.h"
#include "brindle/chords/CChordHeavy.h"
#include "brindle/theory/CSignKeyHeavy.h"

#include <array>
#include <map>

namespace brindle::test {

namespace {

/// Root, bass and semitones of a chord, then root and mode of what it is held against.
using TQuestion = std::array<std::int64_t, 8>;

template <class Ask>
bool Remembered(std::map<TQuestion, bool>& answers, const CChordLite& chord, const CKeyEnh& key,
                std::int64_t mode, Ask ask) {
    const auto mask = static_cast<std::int64_t>(chord.mSemitones.Mask());
    const TQuestion question = {chord.mRootKeyEnh.mKeyNr,
                                chord.mRootKeyEnh.mEnh,
                                chord.mBassKeyEnh.mKeyNr,
                                chord.mBassKeyEnh.mEnh,
                                mask,
                                key.mKeyNr,
                                key.mEnh,
                                mode};
    const auto known = answers.find(question);
    if (known != answers.end()) return known->second;
    return answers[question] = ask();
}

bool StandsOnFifthDegree(const CChordLite& chord, const CScaleHeavy& scale) {
    for (int degree = 0; degree < scale.DegreesPerOctave(); ++degree) {
        if (scale.IsUndef()) return false;
        if (scale.DegreeNrToKeyNr(degree) == chord.mRootKeyEnh.mKeyNr) return degree == 4;
    }
    return false;
}

bool IsOutlier(const CChordLite& chord, const CHarmCenterLite& center) {
    if (center.mSemitones.Mask() != 2741) return false;
    if (chord.mRootKeyEnh.mKeyNr == 15 || center.mRootKeyEnh.mKeyNr == 15) return false;
    const int intvl = (chord.mRootKeyEnh.mKeyNr - center.mRootKeyEnh.mKeyNr + 12) % 12;
    if (intvl == 3 || intvl == 10) return ChordPattern::Major.Matches(chord.mSemitones);
    return intvl == 5 && ChordPattern::Minor.Matches(chord.mSemitones);
}

}  // namespace

bool PlainIsCompatible(const CChordLite& chord, const CHarmCenterLite& center) {
    static std::map<TQuestion, bool> answers;
    const auto mode = static_cast<std::int64_t>(center.mSemitones.Mask());
    return Remembered(answers, chord, center.mRootKeyEnh, mode, [&] {
        CScaleHeavy scale;
        scale.SetFromRootKeyEnhAndCustomScaleSemitones_ResetCustomScaleData(center.mRootKeyEnh,
                                                                            center.mSemitones);
        const bool isOnFifthDegree = StandsOnFifthDegree(chord, scale);
        const bool isOutlier = IsOutlier(chord, center);
        const bool isDiatonic = scale.ChordIsDiatonicInScaleDisregardingEnh(chord.ToChordHeavy(24));
        return isOnFifthDegree || isOutlier || isDiatonic;
    });
}

bool PlainIsInSignKey(const CChordLite& chord, const CSignKeyLite& signKey) {
    static std::map<TQuestion, bool> answers;
    return Remembered(answers, chord, signKey.mRootKeyEnh, signKey.mSignKeyType, [&] {
        const auto type = signKey.mSignKeyType == TSignKeyType_Minor ? TSignKeyTypeNoUndef{1}
                                                                     : TSignKeyTypeNoUndef{0};
        return chord.ToChordHeavy(24).IsInSignKeyRegardlessOfEnh(
            CSignKeyHeavy(signKey.mRootKeyEnh, type));
    });
}

}  // namespace brindle::test
