// SPDX-License-Identifier: MIT
#include "brindle/musicxml/CMuxmlSignTime.h"

#include "brindle/musicxml/MuxmlLimits.h"
#include "brindle/musicxml/internal/ReadMuxml.h"

namespace brindle {

void CMuxmlSignTime::ReadFromAttributes(const CMuxmlAttributes& attributes) {
    CMuxmlXYColor::ReadFromAttributes(attributes);
    CMuxmlFont::ReadFromAttributes(attributes);
    muxml::ReadAttribute(attributes, "symbol", mSymbol);
    muxml::ReadAttribute(attributes, "number", mStaffNumber);
    muxml::ReadAttribute(attributes, "print-object", mPrintObject);
}

void CMuxmlSignTime::_SetBeats(std::string_view text) {
    std::size_t plus = text.find('+');
    if (plus == text.npos) {
        mNomAkaBeats = ReadInteger(text);
        return;
    }
    mNomAkaBeats = 0;
    while (true) {
        const std::int32_t summand = ReadInteger(text.substr(0, plus));
        if (mCompoundNomsAkaBeats.size() < kMuxmlMaxSummands) {
            mCompoundNomsAkaBeats.push_back(summand);
        }
        mNomAkaBeats = muxml::WrappedSum(mNomAkaBeats, summand);
        if (plus == text.npos) return;
        text.remove_prefix(plus + 1);
        plus = text.find('+');
    }
}

void CMuxmlSignTime::SetElementFromString(std::string_view element, std::string_view text) {
    if (element == "senza-misura") {
        mSenzaMisura = true;
    } else if (element == "beat-type") {
        mDenomAkaBeatTypeAsInt = ReadInteger(text);
    } else if (element == "beats") {
        _SetBeats(text);
    }
}

double CMuxmlSignTime::BarLengthFromDivisisionsPQNAsDuration(std::uint64_t divisions) const {
    return mNomAkaBeats * static_cast<double>(divisions) * 4.0 / mDenomAkaBeatTypeAsInt;
}

}  // namespace brindle
