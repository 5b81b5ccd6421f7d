// SPDX-License-Identifier: MIT
#include "brindle/theory/SignKeyStrings.h"

#include "brindle/theory/CKeyEnh.h"
#include "brindle/theory/CSignKeyHeavy.h"
#include "brindle/theory/CSignKeyLite.h"
#include "brindle/theory/CSignKeyNoEnh.h"
#include "brindle/theory/KeyNames.h"
#include "brindle/theory/SetFromStringHelper.h"

#include <string>

namespace brindle {

namespace {

const CKeywordsAndNames& SignKeyTypeWords() {
    static const CKeywordsAndNames rows = {
        {{"major", "maj"}, "major", TSignKeyType_Major},
        {{"minor", "min", "m"}, "minor", TSignKeyType_Minor},
    };
    return rows;
}

}  // namespace

void SetFromString(std::string_view text, CSignKeyLite& signKey, const CChordNamePrefs& prefs) {
    // The signs are folded once, before both readers: what the first consumes counts for the
    // second too.
    std::string folded(text);
    ConvertUtf8SharpAndFlatToAscii(folded);
    int pos = 0;
    signKey.mRootKeyEnh.SetFromString(folded, &pos, prefs);
    signKey.mSignKeyType = _SignKeyTypeFromString(folded, pos);
}

void SetFromString(std::string_view text, CSignKeyNoEnh& signKey, const CChordNamePrefs& prefs) {
    CSignKeyLite read;
    SetFromString(text, read, prefs);
    signKey = read.ToSignKeyNoEnh();
}

void SetFromString(std::string_view text, CSignKeyHeavy& signKey, const CChordNamePrefs& prefs) {
    CSignKeyLite read;
    SetFromString(text, read, prefs);
    signKey = read.ToSignKeyHeavy();
}

TSignKeyType _SignKeyTypeFromString(std::string_view text, int& pos) {
    const auto row = SignKeyTypeWords().FindWholeRemainderAndAdvance(text, pos);
    if (row == SignKeyTypeWords().end()) return TSignKeyType_Major;
    return static_cast<TSignKeyType>(row->mPayload);
}

}  // namespace brindle
