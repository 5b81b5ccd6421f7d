// SPDX-License-Identifier: MIT
#include "brindle/analysis/CHarmAnlsSignKeys.h"

#include "brindle/analysis/internal/MergeAdjacent.h"
#include "brindle/analysis/internal/NativeText.h"

#include <iterator>

namespace brindle {

namespace {

void MoveCenters(CHarmAnlsSignKey& first, CHarmAnlsSignKey& second) {
    first.mHarmCenters.insert(first.mHarmCenters.end(),
                              std::make_move_iterator(second.mHarmCenters.begin()),
                              std::make_move_iterator(second.mHarmCenters.end()));
}

}  // namespace

void CHarmAnlsSignKey::IfUndefFillWithHarmAnlsCenter(const CHarmAnlsCenter& center) {
    if (!IsUndef()) return;
    mSignKey = {center.mHarmCenter.mRootKeyEnh,
                SignKeyTypeFromSemitones(center.mHarmCenter.mSemitones)};
    if (mPosition == kPosUndef) mPosition = center.mPosition;
}

void CHarmAnlsSignKey::AppendJSONString(std::ostream& stream) const {
    PlainText::Write(stream, R"({"Probability":)");
    NativeText::WriteProbability(stream, mProbability);
    PlainText::Write(stream, R"(, "Position":)");
    PlainText::WriteFixed(stream, mPosition);
    PlainText::Write(stream, R"(, "SignKey":)");
    mSignKey.AppendJSONString(stream);
    PlainText::Write(stream, ", ");
    PlainText::EndLine(stream);
    PlainText::Write(stream, R"("HarmCenters":)");
    PlainText::EndLine(stream);
    mHarmCenters.AppendJSONString(stream);
    PlainText::Write(stream, "}");
}

void CHarmAnlsSignKeys::MergeAdjacentSameSignKeys() {
    MergeAdjacent(
        *this,
        [](const CHarmAnlsSignKey& a, const CHarmAnlsSignKey& b) {
            return a.mSignKey == b.mSignKey;
        },
        MoveCenters);
}

CHarmAnlsSignKeys::iterator CHarmAnlsSignKeys::_MergeSignKeysAndEraseSecond(iterator first,
                                                                            iterator second) {
    MoveCenters(*first, *second);
    return erase(second);
}

void CHarmAnlsSignKeys::MergeAdjacentSameHarmCenters() {
    for (CHarmAnlsSignKey& signKey : *this) signKey.mHarmCenters.MergeAdjacentSameHarmCenters();
}

void CHarmAnlsSignKeys::AppendJSONString(std::ostream& stream) const {
    NativeText::WriteList(stream, *this);
}

}  // namespace brindle
