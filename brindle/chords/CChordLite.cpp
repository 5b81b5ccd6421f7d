// SPDX-License-Identifier: MIT
#include "brindle/chords/CChordLite.h"

#include "brindle/platform/PlainText.h"

#include <ostream>

namespace brindle {

bool CChordLite::IsNoChordYield() const {
    return mRootKeyEnh == CChordLite_NoChordYield.mRootKeyEnh;
}

bool CChordLite::IsNoChordForce() const {
    return mRootKeyEnh == CChordLite_NoChordForce.mRootKeyEnh;
}

void CChordLite::SetUndef() {
    mRootKeyEnh = CChordLite_Undef.mRootKeyEnh;
}

void CChordLite::SetNoChordYield() {
    mRootKeyEnh = CChordLite_NoChordYield.mRootKeyEnh;
}

void CChordLite::SetNoChordForce() {
    mRootKeyEnh = CChordLite_NoChordForce.mRootKeyEnh;
}

void CChordLite::AppendJSONClassSubstring(std::ostream& stream) const {
    stream << R"("RootKeyEnh":)";
    mRootKeyEnh.AppendJSONString(stream);
    stream << R"(, "BassKeyEnh":)";
    mBassKeyEnh.AppendJSONString(stream);
    PlainText::Write(stream, R"(, "Semitones":)");
    PlainText::WriteUnsigned(stream, mSemitones.Mask());
}

void CChordLite::AppendJSONString(std::ostream& stream) const {
    stream << '{';
    AppendJSONClassSubstring(stream);
    stream << '}';
}

}  // namespace brindle
